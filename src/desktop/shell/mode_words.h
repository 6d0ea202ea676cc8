#pragma once

#include "core/office.h"

namespace kindrel::desktop {

/// What the status bar says of where the program works.
[[nodiscard]] QString mode_words(const core::Office& office);

} // namespace kindrel::desktop
