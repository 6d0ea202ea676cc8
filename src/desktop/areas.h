#pragma once

#include "desktop/shell/area.h"

#include <span>

namespace kindrel::desktop {

/// The areas that the program has, in the order of the rail; the first is home.
[[nodiscard]] std::span<const AreaDefinition> all_areas();

} // namespace kindrel::desktop
