#pragma once

#include "core/dialogue.h"
#include "core/ordered_list.h"
#include "people/setup_lists.h"

#include <QDate>

namespace kindrel::people {

/// One row of a setup table.
struct SetupRow
{
    SetupItem item;
    int position = 0;

    friend bool operator==(const SetupRow&, const SetupRow&) = default;
};

/// In the list's order; users are not counted.
[[nodiscard]] std::vector<SetupRow> read_setup_rows(core::Session& session, const SetupList& list);
void insert_setup_rows(core::Session& session, const SetupList& list, std::span<const SetupRow> rows);

/// Brings the stored list to `items` in one transaction and a handful of statements, and returns it as it is stored
/// then: with its new keys, and behind it the items that were added elsewhere since it was read. What refers to removed
/// items goes with them; a removed group's members leave it `today` in their history. Throws core::DatabaseError.
[[nodiscard]] std::vector<SetupItem> save_setup_list(core::Session& session, const SetupList& list,
                                                     const core::OrderedList<SetupItem>& items, const QDate& today);

/// Nullopt when text and postcode fit into their fields.
[[nodiscard]] std::optional<core::Message> too_long(const SetupItem& item);

} // namespace kindrel::people
