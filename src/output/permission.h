#pragma once

#include "core/office.h"

namespace kindrel::output {

/// Whether the person may enter the area; otherwise says which right is missing.
[[nodiscard]] bool permitted(core::Office& office, core::Area area);

} // namespace kindrel::output
