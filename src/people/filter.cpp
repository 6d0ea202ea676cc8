#include "people/filter.h"

#include <algorithm>

namespace kindrel::people {

namespace {

using enum FilterKind;

constexpr std::array<FilterKindRow, filter_kind_count> kinds{{
    {status, SetupKind::status, nullptr, nullptr, nullptr, nullptr, u"Status", u"with", u"a", u"status"},
    {groups, SetupKind::groups, nullptr, nullptr, nullptr, nullptr, u"Groups", u"in", u"a", u"group"},
    {family_groups, SetupKind::family_groups, nullptr, nullptr, nullptr, nullptr, u"Family Groups", u"in", u"a",
     u"family group"},
    {ministry, SetupKind::ministries, "ministry_type", nullptr, nullptr, nullptr, u"Ministry", u"in", u"a",
     u"ministry"},
    {dates, SetupKind::personal_dates, nullptr, nullptr, "in_date_tagged", nullptr, u"Dates", u"with", u"a", u"date"},
    {family_dates, SetupKind::family_dates, nullptr, nullptr, "family_date_tagged", nullptr, u"Family Dates", u"with",
     u"a", u"family date"},
    {flexi, SetupKind::flexi_fields, nullptr, "flexi_field", "flexi_tagged", nullptr, u"Flexi", u"with", u"a",
     u"flexi field"},
    {occupation, SetupKind::occupations, nullptr, nullptr, nullptr, nullptr, u"Occupation", u"with", u"an",
     u"occupation"},
    {suburb, SetupKind::suburbs, nullptr, nullptr, nullptr, "[Type]=1", u"Suburb", u"in", u"a", u"suburb"},
}};

constexpr std::array states{
    PersonStateRow{&PersonStates::active, "Active", u"Active People", u"active"},
    PersonStateRow{&PersonStates::privacy, "Privacy", u"Privacy Requested", u"under a privacy request"},
    PersonStateRow{&PersonStates::prospect, "Prospect", u"Prospect People", u"prospects"},
    PersonStateRow{&PersonStates::archived, "archive", u"Archived People", u"archived"},
    PersonStateRow{&PersonStates::contact, "contact", u"Contact", u"contacts"},
    PersonStateRow{&PersonStates::deceased, "Decease", u"Deceased", u"deceased"},
};

constexpr std::array single_adults{1, 8, 9, 10};
constexpr std::array single_parents{2, 11, 12, 13};
constexpr std::array married{3, 14};
constexpr std::array married_with_children{4, 15};
constexpr std::array widowers{8, 10};
constexpr std::array widowers_with_children{11, 13};
constexpr std::array bereft_of_a_child{9, 10, 12, 13, 14, 15};

constexpr std::array types{
    FamilyTypeRow{FamilyType::all_people, u"All People", {}},
    FamilyTypeRow{FamilyType::single_adult, u"Single Adult", single_adults},
    FamilyTypeRow{FamilyType::single_parent, u"Single Parent", single_parents},
    FamilyTypeRow{FamilyType::married_no_child, u"Married, No Child", married},
    FamilyTypeRow{FamilyType::married_with_child, u"Married, With Child", married_with_children},
    FamilyTypeRow{FamilyType::widower_no_child, u"Widower, No Child", widowers},
    FamilyTypeRow{FamilyType::widower_with_child, u"Widower, with Child", widowers_with_children},
    FamilyTypeRow{FamilyType::deceased_child, u"Adults with Deceased Child", bereft_of_a_child},
};

bool asks_for(const Filter& filter, DateSource source)
{
    return std::ranges::find(filter.dates, source, &DateCriterion::source) != filter.dates.end();
}

} // namespace

std::span<const FilterKindRow> filter_kinds()
{
    return kinds;
}

const FilterKindRow& filter_kind(FilterKind kind)
{
    return kinds[static_cast<std::size_t>(kind)];
}

std::span<const PersonStateRow> person_states()
{
    return states;
}

std::span<const FamilyTypeRow> family_types()
{
    return types;
}

const FamilyTypeRow& family_type(FamilyType type)
{
    return types[static_cast<std::size_t>(type)];
}

bool asks_for_birth_dates(const Filter& filter)
{
    return filter.ages || asks_for(filter, DateSource::birth_date);
}

bool asks_for_visits(const Filter& filter)
{
    return asks_for(filter, DateSource::visits);
}

} // namespace kindrel::people
