#pragma once

#include "core/upgrade.h"

namespace kindrel::core {

/// The files of the schema folder, made part of the program when it is built.
[[nodiscard]] std::span<const char* const> schema_scripts();
[[nodiscard]] std::span<const Upgrade> upgrade_scripts();

} // namespace kindrel::core
