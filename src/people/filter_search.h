#pragma once

#include "core/dialogue.h"
#include "people/filter.h"
#include "people/working_list.h"

namespace kindrel::people {

/// What a filter is told and asked with.
struct FilterDay
{
    QDate today;
    core::DayOrder order = core::DayOrder::day_first;
};

/// Whether the filter names the families it asks for; otherwise says so.
[[nodiscard]] bool complete(core::Dialogue& dialogue, const Filter& filter);

/// The chosen people, families by surname and first name, people by their place in the family. One statement, and a
/// few more where the filter holds fusions. Throws core::DatabaseError, as all here do.
[[nodiscard]] WorkingList find_people(core::Session& session, const Filter& filter, const FilterDay& day);
[[nodiscard]] int count_people(core::Session& session, const Filter& filter, const FilterDay& day);

/// The filter in plain English, as the working list carries it.
[[nodiscard]] QString sentence(core::Session& session, const Filter& filter, const FilterDay& day);
/// The first criterion, in the order of the screen, that leaves nobody; nullopt where people are found.
[[nodiscard]] std::optional<QString> emptying_criterion(core::Session& session, const Filter& filter,
                                                        const FilterDay& day);
/// A sentence for each item and fusion that the church no longer has. Nobody carries a lost item of the filter itself;
/// a lost item of a fusion is left out.
[[nodiscard]] QStringList lost_items(core::Session& session, const Filter& filter);

/// The values that people carry in a flexi field, for choosing one of them.
[[nodiscard]] QStringList flexi_values(core::Session& session, int flexi_id);

} // namespace kindrel::people
