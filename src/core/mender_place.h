#pragma once

#include "core/mender.h"
#include "core/startup.h"

namespace kindrel::core {

/// Where a church of the workstation lies, or of its network where it has one. `local` is start-up's first.
[[nodiscard]] Paths church_paths(const Paths& local, int church);
/// Of 1 to 7.
[[nodiscard]] std::vector<int> churches_in_use(const Paths& local);

/// Finds the church that start-up would take, and opens it where that goes: neither markers nor a damaged settings
/// file keep the mender out. Throws FileError when there is no data folder, no network, or a church must be named.
[[nodiscard]] MenderPlace find_church_to_mend(const StartRequest& request, Workstation& workstation, Clock& clock);

} // namespace kindrel::core
