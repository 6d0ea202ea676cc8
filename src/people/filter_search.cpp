#include "people/filter_search.h"

#include "people/filter_criteria.h"
#include "people/filter_texts.h"

#include <QSet>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::Session;

std::vector<Criterion> criteria(Session& session, const Filter& filter, const FilterDay& day)
{
    if (filter.fusions.empty())
        return criteria_of(filter, {}, day);
    return criteria_of(filter, read_fusions(session, filter.fusions), day);
}

/// "SELECT what FROM … WHERE" over the first criteria.
Condition statement(const QString& what, std::span<const Criterion> criteria)
{
    Condition whole{u"SELECT %1 FROM [qry_filter1_all]"_s.arg(what)};
    for (bool first = true; const auto& criterion : criteria) {
        whole += first ? u" WHERE "_s : u" AND "_s;
        whole += criterion.where;
        first = false;
    }
    return whole;
}

QString in_words(std::span<const Criterion> criteria)
{
    QStringList words;
    for (const auto& criterion : criteria)
        words += criterion.words;
    return words.join(u"; "_s);
}

bool finds_somebody(Session& session, std::span<const Criterion> criteria)
{
    auto any = statement(u"[person_id]"_s, criteria);
    any += u" LIMIT 1;"_s;
    auto rows = session.select_with(any.text, any.values);
    return rows.first() != nullptr;
}

} // namespace

bool complete(core::Dialogue& dialogue, const Filter& filter)
{
    if (!filter.families)
        dialogue.show({no_families_chosen.toString()});
    return filter.families.has_value();
}

WorkingList find_people(Session& session, const Filter& filter, const FilterDay& day)
{
    const auto all = criteria(session, filter, day);
    auto select = statement(u"[person_id],[Surname_ID]"_s, all);
    select += u" ORDER BY [family_sort_key],[Primary_name],[Surname_ID],[position],[Name],[person_id];"_s;
    auto rows = session.select_with(select.text, select.values);
    WorkingList list{{}, in_words(all)};
    for (const core::Row& row : rows)
        list.members.push_back({row.integer(core::Column{0}), row.integer(core::Column{1})});
    return list;
}

int count_people(Session& session, const Filter& filter, const FilterDay& day)
{
    const auto count = statement(u"COUNT(*)"_s, criteria(session, filter, day));
    auto rows = session.select_with(count.text + u';', count.values);
    return rows.first()->integer(core::Column{0});
}

QString sentence(Session& session, const Filter& filter, const FilterDay& day)
{
    return in_words(criteria(session, filter, day));
}

std::optional<QString> emptying_criterion(Session& session, const Filter& filter, const FilterDay& day)
{
    const auto all = criteria(session, filter, day);
    if (finds_somebody(session, all))
        return std::nullopt;
    for (std::size_t count = 1; count < all.size(); ++count) {
        if (!finds_somebody(session, std::span(all).first(count)))
            return all[count - 1].words;
    }
    return all.back().words;
}

QStringList flexi_values(Session& session, int flexi_id)
{
    auto rows = session.select(u"SELECT DISTINCT [flexi_field] FROM [tbl_flexi] WHERE [flexi_id]=? "
                               "AND [flexi_field] IS NOT NULL ORDER BY [flexi_field];"_s,
                               flexi_id);
    QStringList values;
    for (const core::Row& row : rows)
        values += row.text(core::Column{0});
    return values;
}

} // namespace kindrel::people
