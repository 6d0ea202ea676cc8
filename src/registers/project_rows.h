#pragma once

#include "registers/project_setup.h"

namespace kindrel::registers {

/// The projects of a register with all that is set up about them, in order.
[[nodiscard]] std::vector<ProjectItem> read_project_items(core::Session& session, Kind kind);

/// Gives keys to what has none. Stands before the transaction that writes.
void give_keys(core::Session& session, Kind kind, std::vector<ProjectItem>& items);

/// Brings the stored projects from what they were to what they are: places from 1 on, set-up rows and categories.
/// Removed projects and categories go with their records, locks and remembered places. Call inside a transaction.
void write_project_items(core::Office& office, Kind kind, const std::vector<ProjectItem>& stored,
                         const std::vector<ProjectItem>& items);

} // namespace kindrel::registers
