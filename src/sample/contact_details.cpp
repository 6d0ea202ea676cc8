#include "sample/contact_details.h"

#include "people/sort_key.h"
#include "sample/hidden_twins.h"

#include <algorithm>

namespace kindrel::sample {

using namespace Qt::StringLiterals;

namespace {

using people::Suburb;
using people::SuburbType;

constexpr int oldest_at_work = 67;

/// The Latin letters of a name, as an e-mail address takes them.
QString mail_letters(const QString& name)
{
    QString letters;
    for (const QChar letter : people::sort_key(name)) {
        if (letter >= u'A' && letter <= u'Z')
            letters += letter.toLower();
    }
    return letters.isEmpty() ? u"office"_s : letters;
}

/// No two families share an address; the domains are kept for examples.
QString mail_address(const QString& name, const MadeFamily& family, Chance& chance)
{
    constexpr std::array domains{"example.org", "example.net", "example.com"};
    return u"%1.%2%3@%4"_s.arg(mail_letters(name), mail_letters(family.file.family.surname))
        .arg(family.index + 1)
        .arg(QString::fromLatin1(chance.pick(domains)));
}

QString street_line(const Stock& stock, Chance& chance)
{
    const auto number = QString::number(chance.between(1, chance.percent(80) ? 120 : 1400));
    const auto unit = chance.percent(14) ? QString::number(chance.between(1, 24)) + u'/' : QString();
    return unit + number + u' ' + chance.pick(stock.streets);
}

void give_family_contacts(MadeFamily& family, Chance& chance)
{
    auto& address = family.file.address;
    if (chance.percent(84))
        address.phone = phone_number(chance);
    if (chance.percent(30))
        address.family_mobile = mobile_number(chance);
    if (chance.percent(4))
        address.family_fax = phone_number(chance);
    if (chance.percent(55)) {
        address.family_email = mail_address(u"the"_s, family, chance);
        if (chance.percent(25))
            address.family_email_description = chance.percent(50) ? u"Home"_s : u"Read on Sundays only"_s;
    }
}

void give_business_contacts(people::Person& person, const MadeFamily& family, Chance& chance)
{
    if (chance.percent(45))
        person.business_phone = phone_number(chance);
    if (chance.percent(8))
        person.business_fax = phone_number(chance);
    if (chance.percent(30))
        person.business_email = mail_address(u"work"_s + person.Name, family, chance);
}

template <class Record, std::size_t N>
void hide_values(Record& record, const std::array<HiddenTwin<Record>, N>& twins, int share, Chance& chance)
{
    for (const auto& twin : twins)
        record.*twin.hidden = chance.percent(share) && twin.value && !(record.*twin.value).isEmpty();
}

} // namespace

Suburb suburb_from(const SetupItem& item, SuburbType type)
{
    return {item.key, type, {}, item.text, item.more[0]};
}

void give_address(MadeFamily& family, const Stock& stock, Chance& chance)
{
    auto& address = family.file.address;
    const auto& suburb = chance.pick(stock.lists.items(SetupList::suburbs));
    family.file.residential = suburb_from(suburb, SuburbType::residential);
    address.res_state = suburb.more[1];
    if (chance.percent(96)) {
        address.res_street = street_line(stock, chance);
        if (chance.percent(5))
            address.res_street2 = chance.percent(50) ? u"Lakeside Retirement Village"_s : u"Rear cottage"_s;
    }
    if (chance.percent(60)) {
        address.res_map = QString::number(chance.between(1, 180));
        address.res_ref = QChar(u'A' + chance.below(11));
        address.res_ref += QString::number(chance.between(1, 12));
    }
    if (chance.percent(11))
        give_postal_address(family, stock, chance);
    give_family_contacts(family, chance);
}

void give_postal_address(MadeFamily& family, const Stock& stock, Chance& chance)
{
    auto& address = family.file.address;
    const auto& suburb = chance.pick(stock.lists.items(SetupList::suburbs));
    family.file.postal = suburb_from(suburb, SuburbType::postal);
    address.post_state = suburb.more[1];
    address.post_street =
        chance.percent(70) ? u"PO Box %1"_s.arg(chance.between(1, 990)) : u"c/- "_s + street_line(stock, chance);
}

void give_personal_contacts(MadeFamily& family, const Stock& stock, Chance& chance)
{
    for (std::size_t place = 0; place < family.file.people.size(); ++place) {
        auto& person = family.file.people[place];
        const auto& figure = family.figures[place];
        if (chance.percent(58))
            person.middle_name = stock.names.given_name(family.origin, figure.female, figure.age, chance).name;
        if (person.Decease)
            continue;
        if (place > 0 && chance.percent(4))
            person.other_surname = stock.names.any_surname(chance).name;
        if (figure.age >= 13 && chance.percent(72))
            person.mobile_phone = mobile_number(chance);
        if (figure.age >= 15 && chance.percent(52))
            person.Personal_email = mail_address(person.Name, family, chance);
        if (figure.age >= 20 && figure.age < oldest_at_work)
            give_business_contacts(person, family, chance);
    }
}

void give_records(MadeFamily& family, const Stock& stock, Chance& chance)
{
    auto& file = family.file;
    for (int count = chance.percent(14) ? chance.between(1, 2) : 0; count > 0; --count)
        file.other_contacts.push_back({chance.pick(stock.contacts), phone_number(chance)});
    for (int count = chance.percent(28) ? chance.between(1, 3) : 0; count > 0; --count)
        file.events.push_back({recent_day(stock, 9, chance), chance.pick(stock.events)});
    for (int count = chance.percent(24) ? chance.between(1, 4) : 0; count > 0; --count)
        file.visits.push_back({recent_day(stock, 3, chance), chance.pick(stock.visitors), chance.pick(stock.comments)});
    std::ranges::sort(file.events, {}, &people::Event::event_date);
    std::ranges::sort(file.visits, {}, &people::Visit::date);
}

void hide_some(MadeFamily& family, Chance& chance)
{
    hide_values(family.file.address, family_twins, 3, chance);
    for (auto& person : family.file.people)
        hide_values(person, person_twins, 2, chance);
}

} // namespace kindrel::sample
