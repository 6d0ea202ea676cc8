#pragma once

#include "people/records.h"
#include "people/setup_lists.h"

#include <QHash>

namespace kindrel::people {

/// What a family carries of each setup list, each item once. The keys are those of the church it comes from.
using CarriedItems = std::array<std::vector<SetupItem>, setup_list_count>;

[[nodiscard]] CarriedItems carried_items(core::Session& here, FamilyFile file);
/// Those that the lists of the other church do not hold. A statement for each list concerned.
[[nodiscard]] CarriedItems missing_items(core::Session& there, const CarriedItems& items);

/// The keys of a list's items by their sameness.
using ItemKeys = QHash<QString, int>;

/// Turns the item keys of a family into those of the other church; items that its lists do not hold are added at their
/// ends. Call inside the transaction that writes the family. Returns the keys of all groups there.
[[nodiscard]] ItemKeys translate_items(core::Session& there, const CarriedItems& items, FamilyFile& file);

} // namespace kindrel::people
