#pragma once

#include "core/office.h"

#include <optional>

namespace kindrel::people {

/// Adds one occupation at the end of its list, at once and for all workstations. The key of the new item, or of the
/// one that is there already; nullopt when the text was refused. Throws core::DatabaseError.
[[nodiscard]] std::optional<int> add_occupation(core::Office& office, const QString& text);
/// The same for a suburb; another postcode makes another suburb.
[[nodiscard]] std::optional<int> add_new_suburb(core::Office& office, const QString& suburb, const QString& postcode);

} // namespace kindrel::people
