#pragma once

#include "core/paths.h"
#include "core/session.h"

namespace kindrel::core {

/// The statements that lead from the version before to version `to`.
struct Upgrade
{
    int to;
    const char* script;
};

/// The upgrades of this program, oldest first.
[[nodiscard]] std::span<const Upgrade> upgrades();

/// True when `chain` leads from version `from` to version `to` without a gap.
[[nodiscard]] bool leads(std::span<const Upgrade> chain, int from, int to);

/// Runs the upgrades from `from` to `to` in one transaction, after keeping a verified copy of the old content in the
/// church folder. The caller holds the busy marker. Throws DatabaseError or FileError with the database unharmed.
void upgrade_church(Session& session, const Paths& paths, std::span<const Upgrade> chain, int from, int to);

} // namespace kindrel::core
