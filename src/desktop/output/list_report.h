#pragma once

#include "desktop/shell/desk.h"

class QAbstractItemModel;

namespace kindrel::desktop {

/// Shows any list of the screen as a printable table in a preview of its own.
void print_list(Desk& desk, const QString& title, const QAbstractItemModel& model);

} // namespace kindrel::desktop
