#include "people/family_checks.h"

#include <algorithm>
#include <array>
#include <stdexcept>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using Where = SaveRefusal::Where;

/// What a street asks for, and the words in which it does.
struct AddressRule
{
    QString Address::*street;
    QString Address::*street2;
    std::optional<Suburb> FamilyFile::*suburb;
    Where suburb_field, postcode_field;
    const char16_t* no_suburb;
    const char16_t* no_postcode;
};

constexpr std::array address_rules{
    AddressRule{&Address::res_street, &Address::res_street2, &FamilyFile::residential, Where::residential_suburb,
                Where::residential_postcode, u"You need to enter the address suburb before saving this file",
                u"You need to enter the address postcode before saving this file"},
    AddressRule{&Address::post_street, &Address::post_street2, &FamilyFile::postal, Where::postal_suburb,
                Where::postal_postcode, u"You need to enter the postal address suburb before saving this file",
                u"You need to enter the postal postcode before saving this file"},
};

bool is_blank(const QString& text)
{
    return text.trimmed().isEmpty();
}

bool has_given_name(const FamilyFile& file)
{
    return std::ranges::any_of(file.people, [](const Person& person) { return !is_blank(person.Name); });
}

std::optional<SaveRefusal> refusal_by(const AddressRule& rule, const FamilyFile& file)
{
    if (is_blank(file.address.*rule.street) && is_blank(file.address.*rule.street2))
        return std::nullopt;
    const auto& suburb = file.*rule.suburb;
    if (!suburb || suburb->suburb_id == 0)
        return SaveRefusal{rule.suburb_field, QString::fromUtf16(rule.no_suburb)};
    if (is_blank(suburb->shown_postcode()))
        return SaveRefusal{rule.postcode_field, QString::fromUtf16(rule.no_postcode)};
    return std::nullopt;
}

} // namespace

std::optional<SaveRefusal> save_refusal(const FamilyFile& file)
{
    if (is_blank(file.family.surname)) {
        return SaveRefusal{Where::surname,
                           u"You need to enter a surname before attempting to save a file. Do you wish to exit the "
                           "family editor without saving the file?"_s,
                           true};
    }
    if (file.people.empty())
        return SaveRefusal{Where::people, u"Unable to save this file until you enter some people in it"_s};
    if (!has_given_name(file)) {
        return SaveRefusal{Where::given_name,
                           u"You need to enter at least one person's given name before attempting to save the file. "
                           "Do you wish to exit the family editor without saving the file?"_s,
                           true};
    }
    for (const auto& rule : address_rules) {
        if (auto refusal = refusal_by(rule, file))
            return refusal;
    }
    return std::nullopt;
}

void require_storable(const FamilyFile& file)
{
    if (is_blank(file.family.surname))
        throw std::logic_error("A family without a surname is not stored.");
    if (!has_given_name(file))
        throw std::logic_error("A family without a given name is not stored.");
    if (file.people.size() > most_people)
        throw std::logic_error("A family of more than 17 people is not stored.");
    if (std::ranges::any_of(file.people, [](const Person& person) { return person.school_year == 0; }))
        throw std::logic_error("A school year of zero is not stored.");
}

core::Message family_is_full()
{
    return {u"Unable to add any more people to this family file"_s};
}

core::Message no_school_year_zero()
{
    return {u"You are unable to enter a zero value here, if you want to represent a year before a person reaches year "
            "one level, for example, preps, enter a negative number, for example -1. Automatic increment skips zero: "
            "it moves people from -1 straight to 1. Kinder is -2."_s};
}

} // namespace kindrel::people
