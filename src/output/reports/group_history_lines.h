#pragma once

#include "people/working_list.h"

namespace kindrel::output {

enum class HistoryOrder { people, groups };

/// A person's time in a group. The group is told by its key: one that was removed may bear another's name.
struct HistoryLine
{
    people::Member member;
    int group_id = 0;
    QString group;
    std::optional<core::Date> date_in, date_out;
};

/// All entries of the list's people, in one statement: people in the order of the list, or groups in the order of
/// theirs, those removed from it last. Either way by the day of joining; entries without one come first. Throws
/// core::DatabaseError.
[[nodiscard]] std::vector<HistoryLine> read_history_lines(core::Session& session, const people::WorkingList& list,
                                                          HistoryOrder order);

} // namespace kindrel::output
