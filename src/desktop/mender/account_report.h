#pragma once

#include "desktop/mender/account.h"

#include <QDateTime>

namespace kindrel::desktop {

/// The account as a text to send to whoever helps, without names of people, workstations and folders. `church` is the
/// church's number.
[[nodiscard]] QByteArray report_of(const Account& account, int church, const QDateTime& time);

} // namespace kindrel::desktop
