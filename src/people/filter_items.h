#pragma once

#include "people/filter.h"
#include "people/filter_condition.h"

namespace kindrel::people {

/// Who carries a row that answers one of the included items and none of the excluded ones. With excluded items alone
/// also who carries nothing of the kind. All items are of one kind, and there is at least one.
[[nodiscard]] Condition carried(std::span<const FilterItem> items);
/// Who carries no row that answers the item.
[[nodiscard]] Condition never_carried(const FilterItem& item);

/// "in the group Choir or Band", "in a group other than Prospect, or in none".
[[nodiscard]] QString carried_words(std::span<const FilterItem> items);

} // namespace kindrel::people
