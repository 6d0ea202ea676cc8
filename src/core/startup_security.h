#pragma once

#include "core/startup_steps.h"

namespace kindrel::core::startup_steps {

/// Lets the person in by password where the church asks for one.
[[nodiscard]] bool ask_password(State& state);
/// Offers to release what this workstation left locked when it last ended.
[[nodiscard]] bool release_left_locks(State& state);

} // namespace kindrel::core::startup_steps
