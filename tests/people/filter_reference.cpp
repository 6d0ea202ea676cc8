#include "filter_reference.h"

#include "people/sort_key.h"

#include <algorithm>
#include <tuple>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using core::Date;

namespace {

struct Someone
{
    const FamilyFile& file;
    const Person& person;
};

bool in_list(const Family& family, FamilyList list)
{
    switch (list) {
    case FamilyList::all:
        return true;
    case FamilyList::active:
        return family.Condition == FileStatus::active;
    case FamilyList::privacy:
        return family.Condition == FileStatus::privacy;
    case FamilyList::active_and_privacy:
        return family.Condition == FileStatus::active || family.Condition == FileStatus::privacy;
    case FamilyList::prospect:
        return family.Condition == FileStatus::prospect;
    case FamilyList::archive:
        return family.Condition == FileStatus::archive;
    case FamilyList::booked_in:
        return family.active_in_book;
    case FamilyList::booked_out:
        return family.booked_out;
    }
    return false;
}

bool in_states(const Person& person, const PersonStates& states)
{
    const bool stateless =
        !person.Active && !person.Privacy && !person.Prospect && !person.archive && !person.contact && !person.Decease;
    return stateless || (states.active && person.Active) || (states.privacy && person.Privacy) ||
           (states.prospect && person.Prospect) || (states.archived && person.archive) ||
           (states.contact && person.contact) || (states.deceased && person.Decease);
}

std::vector<LinkRow> rows_of(const Someone& someone, FilterKind kind)
{
    const auto& [file, person] = someone;
    switch (kind) {
    case FilterKind::status:
        return person.status;
    case FilterKind::groups:
        return person.groups;
    case FilterKind::family_groups:
        return file.family_groups;
    case FilterKind::ministry:
        return person.ministries;
    case FilterKind::dates:
        return person.dates;
    case FilterKind::family_dates:
        return file.family_dates;
    case FilterKind::flexi:
        return person.flexi;
    case FilterKind::occupation:
        return person.occupations;
    case FilterKind::suburb:
        break;
    }
    if (!file.residential || file.residential->suburb_id == 0)
        return {};
    return {LinkRow{file.residential->suburb_id, {}, 0, {}, {}, false}};
}

bool answers(const LinkRow& row, const FilterItem& item)
{
    if (row.item != item.item)
        return false;
    const bool active = row.type == static_cast<int>(MinistryState::active);
    const bool potential = row.type == static_cast<int>(MinistryState::potential);
    if (item.kind == FilterKind::ministry) {
        if ((item.ministry == MinistryChoice::active && !active) ||
            (item.ministry == MinistryChoice::potential && !potential) ||
            (item.ministry == MinistryChoice::not_active && active) ||
            (item.ministry == MinistryChoice::not_potential && potential))
            return false;
    }
    if ((item.marks == Marks::marked && !row.tagged) || (item.marks == Marks::unmarked && row.tagged))
        return false;
    return !item.value || *item.value == row.field;
}

/// A row may not be meant by an excluded item, and must be meant by an included one where there are any. Without rows
/// nothing is excluded.
bool carries(const std::vector<LinkRow>& rows, const std::vector<FilterItem>& items)
{
    const auto included = std::ranges::count(items, false, &FilterItem::exclude);
    if (rows.empty())
        return included == 0;
    return std::ranges::any_of(rows, [&](const LinkRow& row) {
        bool wanted = included == 0;
        for (const auto& item : items) {
            if (item.exclude && answers(row, item))
                return false;
            wanted = wanted || (!item.exclude && answers(row, item));
        }
        return wanted;
    });
}

bool carries_items(const Someone& someone, const std::vector<FilterItem>& items)
{
    for (const auto& kind : filter_kinds()) {
        std::vector<FilterItem> of_kind;
        for (const auto& item : items) {
            if (item.kind == kind.kind)
                of_kind.push_back(item);
        }
        if (!of_kind.empty() && !carries(rows_of(someone, kind.kind), of_kind))
            return false;
    }
    return true;
}

bool in_letters(const Someone& someone, const SurnameRange& range)
{
    const auto& [file, person] = someone;
    const bool own = range.own_surname && !person.other_surname.isEmpty() && !person.surname_hidden;
    const auto letter = sort_key(own ? person.other_surname : file.family.surname).left(1);
    return letter >= sort_key(range.first).left(1) && letter <= sort_key(range.last).left(1);
}

bool in_school_years(const Person& person, const SchoolYears& years)
{
    return person.school_year && *person.school_year != 0 && *person.school_year >= years.first &&
           *person.school_year <= years.last;
}

bool in_ages(const Person& person, const Ages& ages, const QDate& today)
{
    if (!person.birthdate || !person.birthdate->year_known())
        return false;
    const int age = (ages.on ? ages.on->year : today.year()) - person.birthdate->year;
    return age > 0 && age >= ages.youngest && age <= ages.oldest;
}

std::vector<std::optional<Date>> dates_of(const Someone& someone, const DateCriterion& criterion)
{
    std::vector<std::optional<Date>> dates;
    const auto take = [&](const std::vector<LinkRow>& rows) {
        for (const auto& row : rows) {
            if (criterion.item == 0 || criterion.item == row.item)
                dates.push_back(row.date);
        }
    };
    switch (criterion.source) {
    case DateSource::birth_date:
        dates.push_back(someone.person.birthdate);
        break;
    case DateSource::personal_date:
        take(someone.person.dates);
        break;
    case DateSource::family_date:
        take(someone.file.family_dates);
        break;
    case DateSource::events:
        for (const auto& event : someone.file.events)
            dates.push_back(event.event_date);
        break;
    case DateSource::visits:
        for (const auto& visit : someone.file.visits)
            dates.push_back(visit.date);
        break;
    }
    return dates;
}

bool in_span(const Date& date, const DateCriterion& criterion)
{
    const int day = date.month * 100 + date.day;
    const int from = criterion.from.month * 100 + criterion.from.day;
    const int to = criterion.to.month * 100 + criterion.to.day;
    switch (criterion.span) {
    case DateSpan::days:
        return date >= criterion.from && date <= criterion.to;
    case DateSpan::anniversaries:
        return from <= to ? day >= from && day <= to : day >= from || day <= to;
    case DateSpan::month:
        return date.month == criterion.month;
    }
    return false;
}

bool has_date(const Someone& someone, const DateCriterion& criterion)
{
    return std::ranges::any_of(dates_of(someone, criterion),
                               [&](const auto& date) { return date && in_span(*date, criterion); });
}

bool is_of_type(int marital, FamilyType type)
{
    const std::vector<std::vector<int>> codes{{},      {1, 8, 9, 10}, {2, 11, 12, 13}, {3, 14},
                                              {4, 15}, {8, 10},       {11, 13},        {9, 10, 12, 13, 14, 15}};
    const auto& wanted = codes[static_cast<std::size_t>(type)];
    return wanted.empty() || std::ranges::find(wanted, marital) != wanted.end();
}

bool in_fusion(const Someone& someone, const Fusion& fusion)
{
    int left = 0, alternatives = 0, holding = 0;
    for (const auto& entry : fusion.entries) {
        if (entry.lost)
            continue;
        ++left;
        const auto rows = rows_of(someone, entry.item.kind);
        const bool some = std::ranges::any_of(rows, [&](const auto& row) { return answers(row, entry.item); });
        const bool other = std::ranges::any_of(rows, [&](const auto& row) { return !answers(row, entry.item); });
        if ((entry.mode == FusionMode::and_plus && !some) || (entry.mode == FusionMode::and_minus && some))
            return false;
        alternatives += entry.mode == FusionMode::or_plus || entry.mode == FusionMode::or_minus;
        holding += entry.mode == FusionMode::or_plus && some;
        holding += entry.mode == FusionMode::or_minus && (other || rows.empty());
    }
    const bool all_lost = left == 0 && !fusion.entries.empty();
    return !all_lost && (alternatives == 0 || holding > 0);
}

bool is_meant(const Someone& someone, const Filter& filter, const std::vector<Fusion>& fusions, const QDate& today)
{
    const auto& [file, person] = someone;
    const auto& suburb = file.residential;
    const auto of_fusion = [&](int key) {
        const auto found = std::ranges::find(fusions, key, &Fusion::fusion_id);
        return found != fusions.end() && in_fusion(someone, *found);
    };
    return filter.families && in_list(file.family, *filter.families) && in_states(person, filter.states) &&
           carries_items(someone, filter.items) && (!filter.surnames || in_letters(someone, *filter.surnames)) &&
           (!filter.school_years || in_school_years(person, *filter.school_years)) &&
           (!filter.ages || in_ages(person, *filter.ages, today)) &&
           std::ranges::all_of(filter.dates, [&](const auto& date) { return has_date(someone, date); }) &&
           (!filter.suburb_known || (suburb && suburb->suburb_id != 0)) &&
           (!filter.own_postcode || (suburb && !suburb->postcode_var.isEmpty())) &&
           is_of_type(person.Marital, filter.family_type) && std::ranges::all_of(filter.fusions, of_fusion);
}

} // namespace

std::vector<Member> meant(const std::vector<FamilyFile>& church, const Filter& filter,
                          const std::vector<Fusion>& fusions, const QDate& today)
{
    std::vector<Someone> found;
    for (const auto& file : church) {
        for (const auto& person : file.people) {
            if (is_meant({file, person}, filter, fusions, today))
                found.push_back({file, person});
        }
    }
    std::vector<std::tuple<QString, QString, int, int, int>> ordered;
    for (const auto& [file, person] : found)
        ordered.emplace_back(sort_key(file.family.surname), file.family.Primary_name, file.family.Surname_ID,
                             person.position, person.person_id);
    std::ranges::sort(ordered);
    std::vector<Member> members;
    for (const auto& [surname, name, family, position, key] : ordered)
        members.push_back({key, family});
    return members;
}

} // namespace kindrel::test
