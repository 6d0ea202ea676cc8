#pragma once

#include "people/fusion.h"

namespace kindrel::people {

/// Brings the stored fusions to `fusions` in one transaction: those that differ from `known`, as they were read, are
/// written, those that are no longer there go with their entries, and what others stored meanwhile is kept. New ones
/// get their keys. Throws core::DatabaseError, and then nothing is written.
void save_fusions(core::Session& session, std::vector<Fusion> fusions, std::span<const Fusion> known);

} // namespace kindrel::people
