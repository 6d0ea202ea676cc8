#include "desktop/people/card_text.h"
#include "people/family_roles.h"

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::FamilyFile;
using people::Person;
using people::Suburb;

namespace {

/// The text fields of a record under their captions; `where` is the record itself or its address.
template <auto Value>
QString address_text(const FamilyFile& file, const CardReader&)
{
    return file.address.*Value;
}

template <auto Hidden>
bool address_hidden(const FamilyFile& file)
{
    return file.address.*Hidden;
}

template <auto Value>
QString person_text(const Person& person, const CardReader&)
{
    return person.*Value;
}

template <auto Hidden>
bool person_hidden(const Person& person)
{
    return person.*Hidden;
}

/// A work contact stays out of output under its own mark or that of all business data.
template <auto Hidden>
bool business_hidden(const Person& person)
{
    return person.*Hidden || person.Bussiness_hidden;
}

QString suburb_text(const std::optional<Suburb>& suburb)
{
    return suburb ? u"%1 %2"_s.arg(suburb->suburb, suburb->shown_postcode()).trimmed() : u"Unknown Suburb"_s;
}

QString joined(const QString& first, const QString& separator, const QString& second)
{
    return first.isEmpty() || second.isEmpty() ? first + second : first + separator + second;
}

QString map_text(const FamilyFile& file, const CardReader&)
{
    return joined(file.address.res_map, u"  Ref: "_s, file.address.res_ref);
}

QString email_text(const FamilyFile& file, const CardReader&)
{
    const auto& address = file.address;
    const bool described = !address.family_email_description.isEmpty();
    return described ? joined(address.family_email, u" "_s, u'(' + address.family_email_description + u')')
                     : address.family_email;
}

QString transfer_text(const FamilyFile& file, const CardReader&)
{
    return file.address.transfer_exists ? u"Yes"_s : QString();
}

QString birth_text(const Person& person, const CardReader& reader)
{
    if (!reader.disclosure.birth_dates)
        return u"Your password does not show birth dates"_s;
    return person.birthdate ? person.birthdate->shown(reader.disclosure.day_order) : QString();
}

QString school_text(const Person& person, const CardReader&)
{
    switch (person.school_year.value_or(0)) {
    case 0:
        return {};
    case -1:
        return u"-1 (the year before year 1)"_s;
    case -2:
        return u"-2 (kinder)"_s;
    default:
        return QString::number(*person.school_year);
    }
}

QString type_text(const Person& person, const CardReader&)
{
    return people::marital_word(person.Marital);
}

struct Flag
{
    bool Person::*flag;
    const char* word;
};

constexpr std::array flags{Flag{&Person::Active, "Active"},     Flag{&Person::Privacy, "Privacy Request"},
                           Flag{&Person::Prospect, "Prospect"}, Flag{&Person::archive, "Archive"},
                           Flag{&Person::contact, "Contact"},   Flag{&Person::Decease, "Deceased"}};

QString standing_text(const Person& person, const CardReader&)
{
    QStringList words;
    for (const Flag& flag : flags)
        if (person.*flag.flag)
            words << QString::fromLatin1(flag.word);
    return words.join(u", "_s);
}

QString pin_text(const Person& person, const CardReader& reader)
{
    return reader.disclosure.pins ? person.personal_pin : u"Your password does not show PINs"_s;
}

using Address = people::Address;

constexpr std::array residential{
    FamilyField{"Street", address_text<&Address::res_street>, address_hidden<&Address::res_hidden>},
    FamilyField{"", address_text<&Address::res_street2>},
    FamilyField{"Suburb",
                [](const FamilyFile& file, const CardReader&) {
                    return suburb_text(file.residential);
                }},
    FamilyField{"State", address_text<&Address::res_state>},
    FamilyField{"Country", address_text<&Address::res_country>},
    FamilyField{"Map", map_text},
};

constexpr std::array postal{
    FamilyField{"Street", address_text<&Address::post_street>, address_hidden<&Address::post_hidden>},
    FamilyField{"", address_text<&Address::post_street2>},
    FamilyField{"Suburb",
                [](const FamilyFile& file, const CardReader&) {
                    return suburb_text(file.postal);
                }},
    FamilyField{"State", address_text<&Address::post_state>},
    FamilyField{"Country", address_text<&Address::post_country>},
};

constexpr std::array contacts{
    FamilyField{"Phone", address_text<&Address::phone>, address_hidden<&Address::phone_hidden>},
    FamilyField{"Mobile", address_text<&Address::family_mobile>, address_hidden<&Address::family_mobile_hidden>},
    FamilyField{"Fax", address_text<&Address::family_fax>, address_hidden<&Address::family_fax_hidden>},
    FamilyField{"E-mail", email_text, address_hidden<&Address::family_email_hidden>},
    FamilyField{"Audio note", address_text<&Address::audio_note>},
    FamilyField{"Transfer", transfer_text},
};

constexpr std::array names{
    PersonField{"Title", person_text<&Person::Title>, person_hidden<&Person::Title_hidden>},
    PersonField{"Given name", person_text<&Person::Name>},
    PersonField{"Preferred name", person_text<&Person::preferred_name>, person_hidden<&Person::Preferred_Name_hidden>},
    PersonField{"Middle name", person_text<&Person::middle_name>, person_hidden<&Person::middle_hidden>},
    PersonField{"Other surname", person_text<&Person::other_surname>, person_hidden<&Person::surname_hidden>},
    PersonField{"Birth date", birth_text, person_hidden<&Person::birthdate_hidden>},
    PersonField{"School year", school_text},
    PersonField{"Family type", type_text},
    PersonField{"Standing", standing_text},
};

constexpr std::array reach{
    PersonField{"Mobile", person_text<&Person::mobile_phone>, person_hidden<&Person::mobile_hidden>},
    PersonField{"E-mail", person_text<&Person::Personal_email>, person_hidden<&Person::email_hidden>},
    PersonField{"Business phone", person_text<&Person::business_phone>,
                business_hidden<&Person::bussiness_phone_hidden>},
    PersonField{"Business fax", person_text<&Person::business_fax>, business_hidden<&Person::Bussiness_fax_hidden>},
    PersonField{"Business e-mail", person_text<&Person::business_email>,
                business_hidden<&Person::bussiness_email_hidden>},
    PersonField{"PIN", pin_text},
};

} // namespace

std::span<const FamilyField> residential_fields()
{
    return residential;
}

std::span<const FamilyField> postal_fields()
{
    return postal;
}

std::span<const FamilyField> contact_fields()
{
    return contacts;
}

std::span<const PersonField> name_fields()
{
    return names;
}

std::span<const PersonField> reach_fields()
{
    return reach;
}

} // namespace kindrel::desktop
