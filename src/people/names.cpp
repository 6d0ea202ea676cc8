#include "people/names.h"

#include <algorithm>
#include <array>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

struct Marker
{
    bool Person::*flag;
    QStringView full;
    QStringView shortened;
};

constexpr std::array marker_table{
    Marker{&Person::Privacy, u" (Privacy)", u"(Pr)"},   Marker{&Person::Prospect, u" (Prospect)", u"(Pros)"},
    Marker{&Person::archive, u" (Archive)", u"(Arch)"}, Marker{&Person::contact, u" (Contact)", u"(Con)"},
    Marker{&Person::Decease, u" (Deceased)", u"(Dec)"},
};

constexpr int first_child_code = 5;
constexpr int last_child_code = 7;
constexpr std::array married_codes{3, 4, 14, 15};

bool is_married(const Person& person)
{
    return std::ranges::find(married_codes, person.Marital) != married_codes.end();
}

/// Of a married primary's household: the first other married adult, else the first other adult.
const Person* spouse_of(const Person& primary, const std::vector<const Person*>& other_adults)
{
    if (!is_married(primary) || other_adults.empty())
        return nullptr;
    const auto married = std::ranges::find_if(other_adults, [](const Person* adult) { return is_married(*adult); });
    return married != other_adults.end() ? *married : other_adults.front();
}

QString joined_names(const std::vector<const Person*>& people, QStringView separator, bool use_preferred_names)
{
    QStringList names;
    for (const auto* person : people)
        names += display_name(*person, use_preferred_names);
    return names.join(separator);
}

QStringList address_lines(const FamilyFile& file)
{
    if (file.address.res_hidden)
        return {u"(Unlisted Address)"_s};
    QStringList lines{file.address.res_street, file.address.res_street2};
    lines.removeAll(QString());
    const auto& suburb = file.residential;
    lines += suburb ? u"%1 %2"_s.arg(suburb->suburb, suburb->shown_postcode()).trimmed() : u"Unknown Suburb"_s;
    return lines;
}

} // namespace

QString markers(const Person& person, Markers kind)
{
    QString text;
    for (const auto& marker : marker_table) {
        if (kind != Markers::none && person.*marker.flag)
            text += kind == Markers::full ? marker.full : marker.shortened;
    }
    return text;
}

QString display_name(const Person& person, bool use_preferred_names)
{
    const bool preferred = use_preferred_names && !person.preferred_name.isEmpty() && !person.Preferred_Name_hidden;
    return preferred ? person.preferred_name : person.Name;
}

bool is_child(const Person& person)
{
    return person.Marital >= first_child_code && person.Marital <= last_child_code;
}

Household household_of(std::span<const Person> people)
{
    Household household;
    if (people.empty())
        return household;
    household.primary = &people.front();
    household.adults.push_back(household.primary);
    std::vector<const Person*> others;
    for (const auto& person : people.subspan(1))
        (is_child(person) ? household.children : others).push_back(&person);
    household.spouse = spouse_of(*household.primary, others);
    if (household.spouse)
        household.adults.push_back(household.spouse);
    std::ranges::copy_if(others, std::back_inserter(household.adults),
                         [&](const Person* other) { return other != household.spouse; });
    return household;
}

Household living_household(std::span<const Person> people)
{
    auto household = household_of(people);
    const auto gone = [](const Person* person) {
        return person->Decease;
    };
    std::erase_if(household.adults, gone);
    std::erase_if(household.children, gone);
    if (household.spouse && gone(household.spouse))
        household.spouse = nullptr;
    if (household.primary && gone(household.primary)) {
        household.primary = household.adults.empty() ? nullptr : household.adults.front();
        household.spouse = nullptr;
    }
    return household;
}

int next_school_year(int year)
{
    return year == -1 ? 1 : year + 1;
}

QString school_year_text(const std::optional<int>& year)
{
    constexpr int kinder = -2;
    if (!year)
        return {};
    return year == kinder ? u"Kinder"_s : QString::number(*year);
}

QString family_summary(const FamilyFile& file, bool use_preferred_names)
{
    const auto household = household_of(file.people);
    const auto& address = file.address;
    QStringList lines{joined_names(household.adults, u" & ", use_preferred_names) + u' ' + file.family.surname};
    if (!household.children.empty())
        lines += u"Children: "_s + joined_names(household.children, u", ", use_preferred_names);
    lines += address_lines(file);
    if (!address.res_map.isEmpty())
        lines += u"Map: %1 Ref: %2"_s.arg(address.res_map, address.res_ref);
    if (!address.phone.isEmpty())
        lines += (address.phone_hidden ? u"(Unlisted Phone: %1)"_s : u"Phone: %1"_s).arg(address.phone);
    return lines.join(u"\r\n"_s);
}

QString booked_out_note(const Family& family, core::DayOrder order)
{
    if (!family.booked_out)
        return {};
    const auto date = family.booked_out_date ? family.booked_out_date->shown(order) : QString();
    return u" (Booked out to "_s + family.booked_out_person + u" on "_s + date + u')' +
           (family.active_in_book ? u" (Edit mode is enabled on this file)"_s
                                  : u" (Unable to Edit this Family file)"_s);
}

} // namespace kindrel::people
