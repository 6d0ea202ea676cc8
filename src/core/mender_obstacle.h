#pragma once

#include "core/mender.h"

namespace kindrel::core {

/// The finding with its remedy, for where there is room for a sentence alone.
[[nodiscard]] QString in_one_line(const Finding& finding);
/// Why nothing is known of the database's state, in one line; empty where out_of_sight() does not hold.
[[nodiscard]] QString obstacle_among(const Findings& findings);

} // namespace kindrel::core

/// Why a database or a part of it cannot be looked at, as findings.
namespace kindrel::core::mender_checks {

[[nodiscard]] Finding in_use();
[[nodiscard]] Finding forbidden();
[[nodiscard]] Finding missing(const Paths& paths);
/// Of a database that does not open.
[[nodiscard]] Finding closed(const DatabaseError& error);
[[nodiscard]] Finding closed(const FileError& error);
/// Of one that is open.
[[nodiscard]] Finding unreadable(const DatabaseError& error, Session& session);

/// The words for a database that is damaged as a whole.
[[nodiscard]] QString backup_or_recover();

} // namespace kindrel::core::mender_checks
