#pragma once

#include "core/mender.h"

namespace kindrel::desktop {

/// The finding's words for a report that leaves the office: names of people, families, projects and workstations and
/// giving numbers are left out.
[[nodiscard]] QString discreet(const core::Finding& finding);
/// What a lock or marker is, without what it is on and who holds it.
[[nodiscard]] QString discreet_lock(const QString& line);

} // namespace kindrel::desktop
