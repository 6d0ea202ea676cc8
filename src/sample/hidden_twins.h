#pragma once

#include "people/records.h"

#include <array>

namespace kindrel::sample {

/// A hidden mark and the text that it hides; null where it hides a date.
template <class Record>
struct HiddenTwin
{
    bool Record::*hidden;
    QString Record::*value;
    QStringView example; ///< For a rare case that has no such text yet.
};

using people::Address;
using people::Person;

inline constexpr std::array person_twins{
    HiddenTwin<Person>{&Person::Title_hidden, &Person::Title, u"Dr"},
    HiddenTwin<Person>{&Person::birthdate_hidden, nullptr, u""},
    HiddenTwin<Person>{&Person::middle_hidden, &Person::middle_name, u"Rosalind"},
    HiddenTwin<Person>{&Person::surname_hidden, &Person::other_surname, u"Haverstock"},
    HiddenTwin<Person>{&Person::mobile_hidden, &Person::mobile_phone, u"0555 010 020"},
    HiddenTwin<Person>{&Person::email_hidden, &Person::Personal_email, u"unlisted@example.org"},
    HiddenTwin<Person>{&Person::bussiness_phone_hidden, &Person::business_phone, u"(03) 5550 0101"},
    HiddenTwin<Person>{&Person::Bussiness_fax_hidden, &Person::business_fax, u"(03) 5550 0102"},
    HiddenTwin<Person>{&Person::bussiness_email_hidden, &Person::business_email, u"unlisted.work@example.org"},
    HiddenTwin<Person>{&Person::Bussiness_hidden, &Person::business_phone, u"(03) 5550 0103"},
    HiddenTwin<Person>{&Person::Preferred_Name_hidden, &Person::preferred_name, u"Sunny"},
};

inline constexpr std::array family_twins{
    HiddenTwin<Address>{&Address::res_hidden, &Address::res_street, u"14 Kingfisher Crescent"},
    HiddenTwin<Address>{&Address::post_hidden, &Address::post_street, u"PO Box 71"},
    HiddenTwin<Address>{&Address::phone_hidden, &Address::phone, u"(03) 7010 0104"},
    HiddenTwin<Address>{&Address::family_fax_hidden, &Address::family_fax, u"(03) 7010 0105"},
    HiddenTwin<Address>{&Address::family_mobile_hidden, &Address::family_mobile, u"0555 010 030"},
    HiddenTwin<Address>{&Address::family_email_hidden, &Address::family_email, u"unlisted.family@example.org"},
};

} // namespace kindrel::sample
