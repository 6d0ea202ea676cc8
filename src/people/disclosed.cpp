#include "people/disclosed.h"

#include "people/names.h"

#include <algorithm>
#include <array>

namespace kindrel::people {

namespace {

/// A hidden twin and the texts that it keeps out of output.
struct HiddenPersonText
{
    bool Person::*hidden;
    QString Person::*text;
};

struct HiddenAddressText
{
    bool Address::*hidden;
    QString Address::*text;
};

constexpr std::array person_twins{
    HiddenPersonText{&Person::Preferred_Name_hidden, &Person::preferred_name},
    HiddenPersonText{&Person::Title_hidden, &Person::Title},
    HiddenPersonText{&Person::middle_hidden, &Person::middle_name},
    HiddenPersonText{&Person::surname_hidden, &Person::other_surname},
    HiddenPersonText{&Person::mobile_hidden, &Person::mobile_phone},
    HiddenPersonText{&Person::email_hidden, &Person::Personal_email},
    HiddenPersonText{&Person::bussiness_phone_hidden, &Person::business_phone},
    HiddenPersonText{&Person::Bussiness_fax_hidden, &Person::business_fax},
    HiddenPersonText{&Person::bussiness_email_hidden, &Person::business_email},
    HiddenPersonText{&Person::Bussiness_hidden, &Person::business_phone},
    HiddenPersonText{&Person::Bussiness_hidden, &Person::business_fax},
    HiddenPersonText{&Person::Bussiness_hidden, &Person::business_email},
};

constexpr std::array address_twins{
    HiddenAddressText{&Address::res_hidden, &Address::res_street},
    HiddenAddressText{&Address::res_hidden, &Address::res_street2},
    HiddenAddressText{&Address::res_hidden, &Address::res_state},
    HiddenAddressText{&Address::res_hidden, &Address::res_country},
    HiddenAddressText{&Address::res_hidden, &Address::res_map},
    HiddenAddressText{&Address::res_hidden, &Address::res_ref},
    HiddenAddressText{&Address::post_hidden, &Address::post_street},
    HiddenAddressText{&Address::post_hidden, &Address::post_street2},
    HiddenAddressText{&Address::post_hidden, &Address::post_state},
    HiddenAddressText{&Address::post_hidden, &Address::post_country},
    HiddenAddressText{&Address::phone_hidden, &Address::phone},
    HiddenAddressText{&Address::family_fax_hidden, &Address::family_fax},
    HiddenAddressText{&Address::family_mobile_hidden, &Address::family_mobile},
    HiddenAddressText{&Address::family_email_hidden, &Address::family_email},
    HiddenAddressText{&Address::family_email_hidden, &Address::family_email_description},
};

template <class Record, class Twins>
void blank_hidden(Record& record, const Twins& twins)
{
    for (const auto& twin : twins) {
        if (record.*twin.hidden)
            (record.*twin.text).clear();
    }
}

/// The hidden twins that a withheld kind of detail sets.
template <class Record>
struct Withheld
{
    Detail detail;
    bool Record::*hidden;
};

constexpr std::array withheld_of_people{
    Withheld<Person>{Detail::phones, &Person::mobile_hidden},
    Withheld<Person>{Detail::phones, &Person::bussiness_phone_hidden},
    Withheld<Person>{Detail::phones, &Person::Bussiness_fax_hidden},
    Withheld<Person>{Detail::emails, &Person::email_hidden},
    Withheld<Person>{Detail::emails, &Person::bussiness_email_hidden},
    Withheld<Person>{Detail::birth_dates, &Person::birthdate_hidden},
    Withheld<Person>{Detail::work, &Person::Bussiness_hidden},
};
constexpr std::array withheld_of_families{
    Withheld<Address>{Detail::addresses, &Address::res_hidden},
    Withheld<Address>{Detail::addresses, &Address::post_hidden},
    Withheld<Address>{Detail::phones, &Address::phone_hidden},
    Withheld<Address>{Detail::phones, &Address::family_mobile_hidden},
    Withheld<Address>{Detail::phones, &Address::family_fax_hidden},
    Withheld<Address>{Detail::emails, &Address::family_email_hidden},
};

template <class Record, class Rows>
void hide(Record& record, const Rows& rows, const Details& withheld)
{
    for (const auto& [detail, hidden] : rows) {
        if (withheld[static_cast<std::size_t>(detail)])
            record.*hidden = true;
    }
}

void blank_address(FamilyFile& file)
{
    blank_hidden(file.address, address_twins);
    if (file.address.res_hidden)
        file.residential.reset();
    if (file.address.post_hidden)
        file.postal.reset();
}

void blank_person(Person& person, const Disclosure& disclosure)
{
    hide(person, withheld_of_people, disclosure.withheld);
    blank_hidden(person, person_twins);
    if (person.Bussiness_hidden)
        person.occupations.clear();
    if (person.birthdate_hidden || !disclosure.birth_dates)
        person.birthdate.reset();
    if (!disclosure.pins)
        person.personal_pin.clear();
}

} // namespace

Disclosure Disclosure::of(const core::Office& office)
{
    using core::Area;
    const bool pins = office.may(Area::full_financial) || office.may(Area::pin_financial_only);
    return {office.settings.use_preferred_names,
            office.may(Area::birth_dates),
            pins,
            office.may(Area::visitation_tab),
            office.day_order(),
            {}};
}

QString DisclosedFamily::name(const Person& person) const
{
    return display_name(person, m_use_preferred_names);
}

DisclosedFamily disclose(FamilyFile file, const Disclosure& disclosure)
{
    DisclosedFamily disclosed;
    disclosed.m_use_preferred_names = disclosure.use_preferred_names;
    disclosed.m_day_order = disclosure.day_order;
    hide(file.address, withheld_of_families, disclosure.withheld);
    if (disclosure.withheld[static_cast<std::size_t>(Detail::phones)])
        std::ranges::for_each(file.other_contacts, [](OtherContact& contact) { contact.phone.clear(); });
    if (!disclosure.visits)
        file.visits.clear();
    blank_address(file);
    for (auto& person : file.people)
        blank_person(person, disclosure);
    disclosed.m_file = std::move(file);
    return disclosed;
}

} // namespace kindrel::people
