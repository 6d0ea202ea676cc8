#include "output/custom/custom_groups.h"

#include "people/sort_key.h"

#include <QHash>

#include <algorithm>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

/// Where a group stands among the others.
struct GroupPlace
{
    int rank = 0;
    std::optional<core::Date> day;
    QString sort_key;
    QString heading;

    friend auto operator<=>(const GroupPlace& one, const GroupPlace& other)
    {
        return std::tie(one.rank, one.day, one.sort_key, one.heading) <=>
               std::tie(other.rank, other.day, other.sort_key, other.heading);
    }
    friend bool operator==(const GroupPlace&, const GroupPlace&) = default;
};

template <class Key>
struct Entry
{
    GroupPlace group;
    Key key;
};

/// Gives each value of the grouping's field its place.
class Grouping
{
public:
    Grouping(const LayoutGrouping& grouping, core::Session& session)
        : m_grouping(grouping), m_field(*find_custom_field(grouping.field.name))
    {
        if (!m_field.list)
            return;
        int rank = 0;
        for (const auto& item : people::read_setup_items(session, *m_field.list))
            m_ranks.insert(item.key, ++rank);
    }

    [[nodiscard]] people::Extent extent() const { return m_field.extent; }

    /// No groups at all for those who are to be left out.
    [[nodiscard]] std::vector<GroupPlace> groups_of(const FieldSource& source) const
    {
        std::vector<GroupPlace> groups;
        for (const auto& value : values_of(m_field, m_grouping.field.item, source))
            groups.push_back({rank_of(value), value.day, people::sort_key(value.text), value.text});
        std::ranges::sort(groups);
        groups.erase(std::ranges::unique(groups).begin(), groups.end());
        if (groups.empty() && !m_grouping.leave_out_others)
            groups.push_back({std::numeric_limits<int>::max(), {}, {}, u"Others"_s});
        return groups;
    }

private:
    [[nodiscard]] int rank_of(const FieldValue& value) const
    {
        return m_field.list ? m_ranks.value(value.place) : value.place;
    }

    const LayoutGrouping& m_grouping;
    const CustomField& m_field;
    QHash<int, int> m_ranks; ///< Of the items of a setup list.
};

template <class Key>
GroupedKeys<Key> sorted(std::vector<Entry<Key>> entries)
{
    std::ranges::stable_sort(entries, {}, &Entry<Key>::group);
    GroupedKeys<Key> grouped;
    const GroupPlace* group = nullptr;
    for (const auto& entry : entries) {
        if (!group || !(*group == entry.group))
            grouped.headings += entry.group.heading;
        group = &entry.group;
        grouped.keys.push_back(entry.key);
        grouped.groups.push_back(int(grouped.headings.size()) - 1);
    }
    return grouped;
}

} // namespace

std::optional<GroupedKeys<int>> groups_of_families(const CustomLayout& layout, const ReportInput& input,
                                                   const RunFacts& facts, core::Progress& progress)
{
    const Grouping grouping(*layout.grouping, *input.office.session);
    std::vector<Entry<int>> entries;
    const auto note = [&](const ListedFamily& listed) {
        for (auto& group : grouping.groups_of({facts, &listed.family, &listed.household}))
            entries.push_back({std::move(group), listed.family.family().Surname_ID});
    };
    if (!for_each_family(input, progress, note, grouping.extent()))
        return std::nullopt;
    return sorted(std::move(entries));
}

std::optional<GroupedKeys<people::Member>> groups_of_people(const CustomLayout& layout, const ReportInput& input,
                                                            const RunFacts& facts, core::Progress& progress)
{
    const Grouping grouping(*layout.grouping, *input.office.session);
    std::vector<Entry<people::Member>> entries;
    const auto on_list = sorted_people(input.list);
    const auto note = [&](const ListedMember& listed) {
        const auto household = listed_household(listed.family, on_list);
        const people::Member member{listed.person.person_id, listed.family.family().Surname_ID};
        for (auto& group : grouping.groups_of({facts, &listed.family, &household, &listed.person}))
            entries.push_back({std::move(group), member});
    };
    if (!for_each_person(input, progress, note, grouping.extent()))
        return std::nullopt;
    return sorted(std::move(entries));
}

} // namespace kindrel::output
