#pragma once

#include "core/mender.h"

namespace kindrel::people {

/// What the mender looks for in families and people: names that do not follow, and photographs and notebook pages of
/// nobody.
[[nodiscard]] std::span<const core::Check> mender_checks();

} // namespace kindrel::people
