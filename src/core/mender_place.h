#pragma once

#include "core/mender.h"
#include "core/startup.h"

namespace kindrel::core {

/// Finds the church that start-up would take, and opens it where that goes: neither markers nor a damaged settings
/// file keep the mender out. Throws FileError when there is no data folder, no network, or a church must be named.
[[nodiscard]] MenderPlace find_church_to_mend(const StartRequest& request, Workstation& workstation, Clock& clock);

} // namespace kindrel::core
