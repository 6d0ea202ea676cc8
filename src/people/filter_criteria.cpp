#include "people/filter_criteria.h"

#include "people/filter_items.h"
#include "people/filter_words.h"
#include "people/sort_key.h"

#include <algorithm>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

const auto nobody = u"1=0"_s;

/// What a family list asks of the family's row, in the order of FamilyList; empty asks nothing.
constexpr std::array<QStringView, family_list_count> family_conditions{u"",
                                                                       u"[Condition]=0",
                                                                       u"[Condition]=1",
                                                                       u"[Condition] IN (0,1)",
                                                                       u"[Condition]=2",
                                                                       u"[Condition]=3",
                                                                       u"[active_in_book]=-1",
                                                                       u"[booked_out]=-1"};

/// Where a date lies; a null table is the person's own row.
struct DateField
{
    const char* table;
    const char* owner;
    const char* item;
    const char* date;
};
constexpr std::array<DateField, 5> date_fields{{
    {nullptr, nullptr, nullptr, "birthdate"},
    {"tbl_individual_date", "person_id", "in_date_id", "in_date"},
    {"tbl_family_date", "surname_id", "family_date_id", "family_date"},
    {"tbl_events", "surname_id", nullptr, "event_date"},
    {"tbl_visitation", "surname_id", nullptr, "date"},
}};

Condition families_condition(const std::optional<FamilyList>& list)
{
    if (!list)
        return {nobody};
    const auto asked = family_conditions[static_cast<std::size_t>(*list)];
    return {asked.isEmpty() ? u"1=1"_s : asked.toString()};
}

Condition states_condition(const PersonStates& states)
{
    QStringList none, chosen;
    for (const auto& row : person_states()) {
        const auto column = QString::fromLatin1(row.column);
        none += u"[%1]=0"_s.arg(column);
        if (states.*row.on)
            chosen += u" OR [%1]<>0"_s.arg(column);
    }
    return {u"((%1)%2)"_s.arg(none.join(u" AND "_s), chosen.join(QString()))};
}

/// "03-01": orders as the month times 100 plus the day does.
QString any_year(int month, int day)
{
    return u"%1-%2"_s.arg(month, 2, 10, QChar(u'0')).arg(day, 2, 10, QChar(u'0'));
}

Condition span_condition(const DateCriterion& criterion, const QString& date)
{
    const auto& [from, to] = std::tie(criterion.from, criterion.to);
    const auto day = u"substr(%1,6,5)"_s.arg(date);
    switch (criterion.span) {
    case DateSpan::days:
        return condition(u"(%1>=? AND %1<=?)"_s.arg(date), from, to);
    case DateSpan::anniversaries: {
        const auto first = any_year(from.month, from.day);
        const auto last = any_year(to.month, to.day);
        return condition((first <= last ? u"(%1>=? AND %1<=?)"_s : u"(%1>=? OR %1<=?)"_s).arg(day), first, last);
    }
    case DateSpan::month:
        return condition(u"substr(%1,6,2)=?"_s.arg(date), any_year(criterion.month, 0).left(2));
    }
    return {nobody};
}

Condition date_condition(const DateCriterion& criterion)
{
    const auto& field = date_fields[static_cast<std::size_t>(criterion.source)];
    auto span = span_condition(criterion, u"[%1]"_s.arg(QString::fromLatin1(field.date)));
    if (!field.table)
        return span;
    Condition rows{u"[%1] IN (SELECT [%1] FROM [%2] WHERE "_s.arg(QString::fromLatin1(field.owner),
                                                                  QString::fromLatin1(field.table))};
    rows += span;
    if (field.item && criterion.item != 0)
        rows += condition(u" AND [%1]=?"_s.arg(QString::fromLatin1(field.item)), criterion.item);
    return rows += QString(u')');
}

Condition surname_condition(const SurnameRange& range)
{
    const auto letter = range.own_surname ? u"substr([sort_key],1,1)"_s : u"[Alpha_sort]"_s;
    std::vector<Condition> ends;
    if (const auto first = sort_key(range.first).left(1); !first.isEmpty())
        ends.push_back(condition(letter + u">=?"_s, first));
    if (const auto last = sort_key(range.last).left(1); !last.isEmpty())
        ends.push_back(condition(letter + u"<=?"_s, last));
    return ends.empty() ? Condition{u"1=1"_s} : joined(ends, u" AND ");
}

/// Born in one of the years that give the ages, which the stored text tells by its order. Ages below 1 do not exist.
Condition age_condition(const Ages& ages, const QDate& today)
{
    const int year = ages.on.value_or(core::Date::from(today)).year;
    const core::Date first{std::clamp(year - ages.oldest, 1, 9999), 1, 1};
    const core::Date last{std::clamp(year - std::max(ages.youngest, 1), 1, 9999), 12, 31};
    if (ages.oldest < 1 || first > last)
        return {nobody};
    return condition(u"([birthdate]>=? AND [birthdate]<=? AND ([birthdate]<? OR [birthdate]>?))"_s, first, last,
                     core::Date{core::Date::unknown_year, 1, 1}, core::Date{core::Date::unknown_year, 12, 31});
}

Condition type_condition(FamilyType type)
{
    QStringList codes;
    for (const int code : family_type(type).codes)
        codes += QString::number(code);
    return {u"[Marital] IN (%1)"_s.arg(codes.join(u','))};
}

/// One entry for itself.
Condition entry_condition(const FusionEntry& entry)
{
    auto item = entry.item;
    item.exclude = entry.mode == FusionMode::or_minus;
    return entry.mode == FusionMode::and_minus ? never_carried(item) : carried(std::span(&item, 1));
}

Condition fusion_condition(const Fusion& fusion)
{
    std::vector<Condition> all, any;
    for (const auto& entry : fusion.entries) {
        if (entry.lost)
            continue;
        const bool alternative = entry.mode == FusionMode::or_plus || entry.mode == FusionMode::or_minus;
        (alternative ? any : all).push_back(entry_condition(entry));
    }
    if (!any.empty())
        all.push_back(joined(any, u" OR "));
    if (all.empty())
        return {fusion.entries.empty() ? u"1=1"_s : nobody};
    return joined(all, u" AND ");
}

/// Collects the criteria in the order of the screen.
class Collector
{
public:
    explicit Collector(const FilterDay& day) : m_day(day) {}

    void whom(const Filter& filter)
    {
        const auto name = filter.families ? family_list_name(*filter.families) : u"no families"_s;
        add(families_condition(filter.families), name);
        add(states_condition(filter.states), words_of(filter.states));
        for (const auto& kind : filter_kinds()) {
            std::vector<FilterItem> items;
            std::ranges::copy_if(filter.items, std::back_inserter(items),
                                 [&](const FilterItem& item) { return item.kind == kind.kind; });
            if (!items.empty())
                add(carried(items), carried_words(items));
        }
    }

    void ranges(const Filter& filter)
    {
        if (filter.surnames)
            add(surname_condition(*filter.surnames), words_of(*filter.surnames));
        if (const auto& years = filter.school_years)
            add(condition(u"([school_year]>=? AND [school_year]<=? AND NOT [school_year]=0)"_s, years->first,
                          years->last),
                words_of(*years));
        if (filter.ages)
            add(age_condition(*filter.ages, m_day.today), words_of(*filter.ages, m_day));
        for (const auto& criterion : filter.dates)
            add(date_condition(criterion), words_of(criterion, m_day.order));
        if (filter.suburb_known)
            add({u"[suburb] IS NOT NULL"_s}, u"with a known suburb"_s);
        if (filter.own_postcode)
            add({u"[postcode_var] IS NOT NULL"_s}, u"with a postcode of their own"_s);
        if (filter.family_type != FamilyType::all_people)
            add(type_condition(filter.family_type), family_type(filter.family_type).label.toString());
    }

    void fusions(const Filter& filter, std::span<const Fusion> existing)
    {
        for (const int key : filter.fusions) {
            const auto found = std::ranges::find(existing, key, &Fusion::fusion_id);
            if (found == existing.end())
                add({nobody}, u"of a fusion that no longer exists"_s);
            else
                add(fusion_condition(*found), u"of the fusion %1"_s.arg(found->name));
        }
    }

    [[nodiscard]] std::vector<Criterion> take() { return std::move(m_criteria); }

private:
    void add(Condition where, const QString& words) { m_criteria.push_back({std::move(where), words}); }

    const FilterDay& m_day;
    std::vector<Criterion> m_criteria;
};

} // namespace

std::vector<Criterion> criteria_of(const Filter& filter, std::span<const Fusion> fusions, const FilterDay& day)
{
    Collector collector(day);
    collector.whom(filter);
    collector.ranges(filter);
    collector.fusions(filter, fusions);
    return collector.take();
}

} // namespace kindrel::people
