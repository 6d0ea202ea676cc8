#pragma once

#include "core/session.h"

#include <span>

namespace kindrel::core {

/// Deletes these entities with every row that goes with them, however deep: a roster duty's person takes their absences
/// along. What is to outlive them stays. Call inside the transaction that removes them. A handful of statements for
/// each table concerned, whatever the number of keys.
void remove_entities(Session& session, Entity entity, std::span<const int> keys);

} // namespace kindrel::core
