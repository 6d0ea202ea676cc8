#pragma once

#include "people/fusion.h"

namespace kindrel::desktop {

/// What the fusion asks for, as one plain sentence.
[[nodiscard]] QString fusion_sentence(const people::Fusion& fusion);

} // namespace kindrel::desktop
