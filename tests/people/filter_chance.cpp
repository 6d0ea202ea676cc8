#include "filter_chance.h"

#include <array>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using core::Date;

namespace {

constexpr std::array<QStringView, 14> surnames{u"Abel",     u"abel",  u"Åkesson",  u"Baker",  u"Čapek",
                                               u"Łuk",      u"Mbeki", u"McDonald", u"Nguyễn", u"O'Brien",
                                               u"Ødegaard", u"Zhao",  u"Žižek",    u"Æthel"};
constexpr std::array<QStringView, 6> names{u"Ann", u"ann", u"Ben", u"Éva", u"Zoë", u"Carl"};
constexpr std::array<QStringView, 3> values{u"", u"Yes", u"yes"};
/// Ends of months and years, leap days, and years that are unknown, to come, or close to the unknown one.
constexpr std::array dates{Date{1800, 2, 29},  Date{1800, 3, 12},  Date{1799, 6, 1},  Date{1801, 1, 1},
                           Date{1955, 3, 31},  Date{1980, 12, 31}, Date{1981, 1, 1},  Date{2000, 2, 29},
                           Date{2004, 3, 1},   Date{2010, 4, 30},  Date{2012, 10, 9}, Date{2019, 9, 10},
                           Date{2023, 12, 31}, Date{2024, 1, 1},   Date{2024, 5, 15}, Date{2031, 7, 7}};
constexpr int items = 3;

} // namespace

std::optional<Date> Chance::date()
{
    return percent(15) ? std::nullopt : std::optional(day());
}

Date Chance::day()
{
    return one_of(dates);
}

std::vector<LinkRow> Chance::links(FilterKind kind)
{
    std::vector<LinkRow> rows;
    for (int item = 1; item <= items; ++item) {
        if (!percent(30))
            continue;
        LinkRow row{item, {}, 0, {}, {}, false};
        if (filter_kind(kind).has_marks())
            row.tagged = percent(50);
        if (kind == FilterKind::dates || kind == FilterKind::family_dates)
            row.date = date();
        if (kind == FilterKind::flexi)
            row.field = one_of(values).toString();
        if (kind == FilterKind::ministry)
            row.type = 1 + below(2);
        rows.push_back(row);
        if (kind == FilterKind::ministry && percent(25)) {
            row.type = 3 - row.type;
            rows.push_back(row);
        }
    }
    return rows;
}

Person Chance::person(int place)
{
    Person made;
    made.Name = one_of(names).toString();
    made.Marital = place < 2 ? one_of(std::array{1, 2, 3, 4, 8, 9, 10, 11, 12, 13, 14, 15}) : 5 + below(3);
    made.Active = percent(65);
    for (const auto state : {&Person::Decease, &Person::Privacy, &Person::Prospect, &Person::archive, &Person::contact})
        made.*state = percent(12);
    made.birthdate = date();
    if (percent(60))
        made.school_year = one_of(std::array{-2, -1, 1, 2, 3, 12});
    if (percent(30))
        made.other_surname = one_of(surnames).toString();
    made.surname_hidden = percent(30);
    made.status = links(FilterKind::status);
    made.groups = links(FilterKind::groups);
    made.ministries = links(FilterKind::ministry);
    made.dates = links(FilterKind::dates);
    made.flexi = links(FilterKind::flexi);
    made.occupations = links(FilterKind::occupation);
    return made;
}

FamilyFile Chance::family()
{
    FamilyFile made;
    made.family.surname = one_of(surnames).toString();
    made.family.Condition = static_cast<FileStatus>(percent(60) ? 0 : below(4));
    made.family.booked_out = percent(15);
    made.family.active_in_book = percent(15);
    if (percent(70))
        made.residential =
            Suburb{below(items + 1), SuburbType::residential, percent(25) ? u"3999"_s : QString(), {}, {}};
    if (made.residential && made.residential->suburb_id == 0)
        made.residential->postcode_var = u"4000"_s;
    if (percent(40))
        made.postal = Suburb{1 + below(items), SuburbType::postal, percent(50) ? u"3998"_s : QString(), {}, {}};
    for (int event = below(3); event > 0; --event)
        made.events.push_back({date(), u"Event"_s});
    for (int visit = below(3); visit > 0; --visit)
        made.visits.push_back({date(), u"Visitor"_s, {}});
    made.family_groups = links(FilterKind::family_groups);
    made.family_dates = links(FilterKind::family_dates);
    for (int place = 0, size = 1 + below(4); place < size; ++place)
        made.people.push_back(person(place));
    return made;
}

std::vector<FamilyFile> Chance::church(int families)
{
    std::vector<FamilyFile> made;
    for (int number = 0; number < families; ++number)
        made.push_back(family());
    return made;
}

FilterItem Chance::item()
{
    FilterItem made;
    made.kind = static_cast<FilterKind>(below(filter_kind_count));
    made.item = 1 + below(items);
    made.text = u"item %1"_s.arg(made.item);
    if (made.kind == FilterKind::ministry)
        made.ministry = static_cast<MinistryChoice>(below(5));
    if (filter_kind(made.kind).has_marks() && percent(50))
        made.marks = static_cast<Marks>(below(3));
    if (made.kind == FilterKind::flexi && percent(50))
        made.value = one_of(values).toString();
    return made;
}

DateCriterion Chance::date_criterion()
{
    DateCriterion made;
    made.source = static_cast<DateSource>(below(5));
    if (made.source == DateSource::personal_date || made.source == DateSource::family_date)
        made.item = below(items + 1);
    made.span = static_cast<DateSpan>(below(3));
    made.from = day();
    made.to = day();
    if (made.span == DateSpan::days && made.to < made.from && percent(90))
        std::swap(made.from, made.to);
    made.month = 1 + below(12);
    return made;
}

void Chance::add_ranges(Filter& filter)
{
    constexpr std::array<QStringView, 8> letters{u"a", u"Å", u"B", u"L", u"m", u"O", u"Ø", u"Z"};
    if (percent(20))
        filter.surnames = SurnameRange{one_of(letters).toString(), one_of(letters).toString(), percent(50)};
    if (percent(15))
        filter.school_years = SchoolYears{below(5) - 3, below(4)};
    if (percent(20)) {
        const int youngest = below(60) - 5;
        filter.ages = Ages{youngest, youngest + below(50), percent(50) ? std::optional(day()) : std::nullopt};
    }
    for (int count = percent(40) ? 1 + below(2) : 0; count > 0; --count)
        filter.dates.push_back(date_criterion());
    filter.suburb_known = percent(10);
    filter.own_postcode = percent(10);
    if (percent(20))
        filter.family_type = static_cast<FamilyType>(below(8));
}

Filter Chance::filter(int fusions)
{
    Filter made;
    made.families = static_cast<FamilyList>(percent(60) ? below(2) : below(family_list_count));
    for (const auto& state : person_states())
        made.states.*state.on = percent(50);
    for (int count = below(4); count > 0; --count) {
        auto added = item();
        added.exclude = percent(40);
        made.items.push_back(added);
        // Another item of the same kind more often than chance would have it.
        if (percent(40)) {
            const bool another_value = added.kind == FilterKind::flexi && added.value && percent(50);
            if (!another_value)
                added.item = 1 + below(items);
            added.exclude = another_value ? added.exclude : percent(50);
            if (added.kind == FilterKind::flexi && (another_value || percent(50)))
                added.value = percent(50) && !another_value ? std::nullopt : std::optional(one_of(values).toString());
            made.items.push_back(added);
        }
    }
    add_ranges(made);
    for (int count = percent(25) ? 1 + below(2) : 0; count > 0; --count)
        made.fusions.push_back(1 + below(fusions + 1)); // The last one does not exist.
    return made;
}

Fusion Chance::fusion(int number)
{
    Fusion made;
    made.name = u"Fusion %1"_s.arg(number);
    for (const auto& state : person_states())
        made.states.*state.on = percent(50);
    for (int count = below(5); count > 0; --count) {
        FusionEntry entry{.item = item(), .mode = static_cast<FusionMode>(below(fusion_mode_count))};
        if (entry.item.marks == Marks::unmarked)
            entry.item.marks = Marks::any;
        if (entry.item.ministry > MinistryChoice::potential)
            entry.item.ministry = MinistryChoice::any;
        if (entry.item.value && entry.item.value->isEmpty())
            entry.item.value.reset();
        entry.lost = percent(15);
        if (entry.lost)
            entry.item.item += 90;
        made.entries.push_back(entry);
    }
    return made;
}

} // namespace kindrel::test
