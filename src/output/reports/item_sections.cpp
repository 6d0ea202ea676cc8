#include "output/reports/item_sections.h"

#include <QHash>

#include <algorithm>
#include <iterator>
#include <utility>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

/// Who of the lent people carries which item. A family comes once, however many of its people are on the list.
QString carriers_statement(const people::SetupList& list)
{
    const bool has_types = list.kind == people::SetupKind::ministries;
    const auto type = has_types ? u"l.[ministry_type]"_s : u"0"_s;
    const auto grouped_type = has_types ? u',' + type : QString();
    return u"SELECT l.[%1] AS [item],%2 AS [type],MIN(w.[person_id]) AS [person],MIN(w.[surname_id]) AS [family],"
           "MIN(w.[place]) AS [first_place] FROM [work_people] w "
           "INNER JOIN [%3] l ON l.[%4]=w.[%4] GROUP BY l.[%1]%5,w.[%4] ORDER BY [item],[type],[first_place];"_s.arg(
               QString::fromLatin1(list.carriers.item), type, QString::fromLatin1(list.carriers.table),
               QString::fromLatin1(list.carriers.owner), grouped_type);
}

/// The sections of each item, without the item's text.
using SectionsByItem = QHash<int, std::vector<ItemSection>>;

SectionsByItem read_carriers(core::Session& session, const people::SetupList& list)
{
    auto rows = session.select(carriers_statement(list));
    const auto item = rows.column(u"item");
    const auto type = rows.column(u"type");
    const auto person = rows.column(u"person");
    const auto family = rows.column(u"family");
    SectionsByItem found;
    for (const core::Row& row : rows) {
        auto& sections = found[row.integer(item)];
        if (sections.empty() || sections.back().type != row.integer(type))
            sections.push_back({{}, row.integer(type), {}});
        sections.back().members.push_back({row.integer(person), row.integer(family)});
    }
    return found;
}

/// Empty but for ministries.
QString state_of(const ItemSection& section)
{
    switch (static_cast<people::MinistryState>(section.type)) {
    case people::MinistryState::active:
        return u" (Active)"_s;
    case people::MinistryState::potential:
        return u" (Potential)"_s;
    }
    return {};
}

} // namespace

std::vector<ItemSection> read_item_sections(core::Session& session, const people::WorkingList& list,
                                            people::SetupKind kind)
{
    people::lend(session, list);
    auto carriers = read_carriers(session, people::setup_list(kind));
    std::vector<ItemSection> sections;
    for (const auto& item : people::read_setup_items(session, kind)) {
        for (auto& section : carriers[item.key]) {
            section.item = item;
            sections.push_back(std::move(section));
        }
    }
    return sections;
}

QString title_of(const ItemSection& section)
{
    return section.item.text + state_of(section) + u" - "_s + QString::number(section.members.size());
}

std::vector<people::Member> members_of(std::span<const ItemSection> sections)
{
    std::vector<people::Member> members;
    for (const auto& section : sections)
        std::ranges::copy(section.members, std::back_inserter(members));
    return members;
}

const ItemSection& SectionCursor::at(std::size_t place)
{
    m_moved_on = !std::exchange(m_started, true);
    while (place >= m_first + m_sections[m_index].members.size()) {
        m_first += m_sections[m_index++].members.size();
        m_moved_on = true;
    }
    return m_sections[m_index];
}

} // namespace kindrel::output
