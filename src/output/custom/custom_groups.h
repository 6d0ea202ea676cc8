#pragma once

#include "output/custom/custom_fields.h"

namespace kindrel::output {

/// The entries of a grouped report, group by group, and within a group as the list has them. One that has several
/// values stands in several groups.
template <class Key>
struct GroupedKeys
{
    std::vector<Key> keys;
    std::vector<int> groups; ///< Of each key: the place of its heading.
    QStringList headings;
};

/// The groups of the layout's grouping, by the values that the reader may see. Nullopt when cancelled.
[[nodiscard]] std::optional<GroupedKeys<int>> groups_of_families(const CustomLayout& layout, const ReportInput& input,
                                                                 const RunFacts& facts, core::Progress& progress);
[[nodiscard]] std::optional<GroupedKeys<people::Member>>
groups_of_people(const CustomLayout& layout, const ReportInput& input, const RunFacts& facts, core::Progress& progress);

} // namespace kindrel::output
