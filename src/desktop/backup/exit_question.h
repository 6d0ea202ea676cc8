#pragma once

#include "core/restore.h"

#include <optional>

namespace kindrel::desktop {

/// Asks whether to make a backup before the program ends; nothing: the person stays. Whoever may not make backups is
/// not asked.
[[nodiscard]] std::optional<bool> wants_backup_before_exit(const core::Office& office);

/// What is told after a restore, with the way to take it back.
[[nodiscard]] core::Message restored_message(const core::RestoreReport& report, core::DayOrder order);

} // namespace kindrel::desktop
