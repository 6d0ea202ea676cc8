#pragma once

#include "core/entity.h"

#include <span>

namespace kindrel::core {

/// What becomes of a referring row when the entity it names goes: `owned` rows go with it, `link` rows go once their
/// number was told, `keep` rows stay (past totals, logs).
enum class Bond { owned, link, keep };

/// One field that holds another entity's key. Removal, booking, moving a church, copying, mending and the schema's
/// own test all read this table.
struct Reference
{
    const char* table;
    const char* field;
    Entity to;
    Bond bond;
};

[[nodiscard]] std::span<const Reference> references();

/// The table in which an entity has its own rows, and the field that is its key. A user has a row for each area of
/// access; the three kinds of Wardline layouts share one entity.
struct Home
{
    Entity entity;
    const char* table;
    const char* field;
};

[[nodiscard]] std::span<const Home> homes();

} // namespace kindrel::core
