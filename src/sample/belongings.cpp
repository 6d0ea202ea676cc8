#include "sample/belongings.h"

#include "people/names.h"

#include <algorithm>

namespace kindrel::sample {

using namespace Qt::StringLiterals;

namespace {

using people::FileStatus;
using people::LinkRow;
using people::MinistryState;
using people::Person;

/// A person on the way to carrying items.
struct Carrier
{
    Person& person;
    const Figure& figure;
    int eagerness; ///< In percent of the items' shares.
};

FileStatus any_status(Chance& chance)
{
    const int place = chance.below(100);
    return place < 72   ? FileStatus::active
           : place < 78 ? FileStatus::privacy
           : place < 89 ? FileStatus::prospect
                        : FileStatus::archive;
}

void give_flags(Person& person, FileStatus status, Chance& chance)
{
    if (person.Decease)
        return;
    person.Privacy = status == FileStatus::privacy || chance.percent(2);
    person.archive = status == FileStatus::archive || chance.percent(2);
    person.Prospect = status == FileStatus::prospect || chance.percent(2);
    person.contact = chance.percent(status == FileStatus::active ? 4 : 8);
    person.Active = (status == FileStatus::active || status == FileStatus::privacy) && !person.archive &&
                    !person.contact && !person.Prospect && chance.percent(95);
}

int eagerness_of(const Person& person)
{
    return person.Decease ? 15 : person.Active ? 100 : person.contact ? 10 : person.archive ? 20 : 35;
}

bool carries(const SetupItem& item, const Carrier& carrier, Chance& chance)
{
    return is_for(item.audience, carrier.figure.age, carrier.figure.female) &&
           chance.below(10000) < item.share * carrier.eagerness;
}

void give_plain(std::vector<LinkRow>& rows, const std::vector<SetupItem>& items, const Carrier& carrier, Chance& chance)
{
    for (const auto& item : items) {
        if (carries(item, carrier, chance))
            rows.push_back(link_to(item));
    }
}

void give_ministries(const std::vector<SetupItem>& items, const Carrier& carrier, Chance& chance)
{
    for (const auto& item : items) {
        const auto state = chance.percent(76) ? MinistryState::active : MinistryState::potential;
        if (!carrier.person.Decease && carries(item, carrier, chance))
            carrier.person.ministries.emplace_back(link_to(item)).type = static_cast<int>(state);
    }
}

void give_dates(const std::vector<SetupItem>& items, const Carrier& carrier, const Stock& stock, Chance& chance)
{
    for (const auto& item : items) {
        const int youngest = item.more[0].toInt();
        const int oldest = std::min(item.more[1].toInt(), carrier.figure.age);
        if (youngest > oldest || !carries(item, carrier, chance))
            continue;
        const int at = chance.between(youngest, oldest);
        const auto date = day_at_age(stock, carrier.figure.age, at, chance);
        carrier.person.dates.push_back(dated_link(item, date, chance.percent(30)));
    }
}

void give_flexi(const std::vector<SetupItem>& items, const Carrier& carrier, Chance& chance)
{
    for (const auto& item : items) {
        if (!carries(item, carrier, chance))
            continue;
        auto& row = carrier.person.flexi.emplace_back(link_to(item));
        const auto values = item.more[0].split(u"; "_s);
        row.field = chance.pick(values);
        row.tagged = chance.percent(30);
    }
}

void give_occupations(const std::vector<SetupItem>& items, const Carrier& carrier, Chance& chance)
{
    const int age = carrier.figure.age;
    if (age < 18 || !chance.percent(80))
        return;
    const auto named = [&](QStringView text) -> const SetupItem& {
        return *std::ranges::find(items, text, &SetupItem::text);
    };
    const auto& usual = chance.pick(items);
    const auto& item = age >= 67 ? named(u"Retired") : age <= 22 && chance.percent(60) ? named(u"Student") : usual;
    carrier.person.occupations.push_back(link_to(item));
    if (const auto& second = chance.pick(items); second.key != item.key && chance.percent(4))
        carrier.person.occupations.push_back(link_to(second));
}

/// Since when somebody of that age may have belonged: at most eighteen years ago, no earlier than the third birthday.
core::Date joining_day(const Stock& stock, int age, Chance& chance)
{
    return recent_day(stock, std::clamp(age - 3, 1, 18), chance);
}

std::optional<Stay> past_stay(const SetupItem& group, std::size_t place, int age, const Stock& stock, Chance& chance)
{
    const auto in = joining_day(stock, age, chance);
    const int days = static_cast<int>(in.qdate().daysTo(stock.today));
    if (days < 60)
        return {};
    return Stay{place, group.key, in, core::Date::from(in.qdate().addDays(chance.between(30, days)))};
}

/// Groups that no longer meet, and some that do, leave a past membership behind; a present one may follow it.
void give_groups(MadeFamily& family, std::size_t place, const Carrier& carrier, const Stock& stock, Chance& chance)
{
    const int age = carrier.figure.age;
    for (const auto& group : stock.lists.items(SetupList::groups)) {
        auto since = joining_day(stock, age, chance);
        const bool present = SetupLists::meets(group) && !carrier.person.Decease && carries(group, carrier, chance);
        if (chance.percent(SetupLists::meets(group) ? 2 : 8) && age > 8) {
            if (const auto past = past_stay(group, place, age, stock, chance)) {
                family.stays.push_back(*past);
                since = std::max(since, *past->out);
            }
        }
        if (!present)
            continue;
        carrier.person.groups.push_back(link_to(group));
        family.stays.push_back({place, group.key, since, {}});
    }
}

void give_person_items(MadeFamily& family, std::size_t place, const Stock& stock, Chance& chance)
{
    auto& person = family.file.people[place];
    const Carrier carrier{person, family.figures[place], eagerness_of(person)};
    give_plain(person.status, stock.lists.items(SetupList::status), carrier, chance);
    give_groups(family, place, carrier, stock, chance);
    give_ministries(stock.lists.items(SetupList::ministries), carrier, chance);
    give_dates(stock.lists.items(SetupList::personal_dates), carrier, stock, chance);
    give_flexi(stock.lists.items(SetupList::flexi_fields), carrier, chance);
    give_occupations(stock.lists.items(SetupList::occupations), carrier, chance);
}

core::Date wedding_day(const Stock& stock, int age, Chance& chance)
{
    const int at = chance.between(std::min(20, age), std::min(30, age));
    return day_at_age(stock, age, at, chance);
}

} // namespace

void give_standing(MadeFamily& family, std::optional<FileStatus> wished, const Stock& stock, Chance& chance)
{
    auto& row = family.file.family;
    row.Condition = wished ? *wished : any_status(chance);
    row.created = recent_day(stock, 14, chance);
    for (auto& person : family.file.people)
        give_flags(person, row.Condition, chance);
}

void give_items(MadeFamily& family, const Stock& stock, Chance& chance)
{
    auto& file = family.file;
    for (std::size_t place = 0; place < file.people.size(); ++place)
        give_person_items(family, place, stock, chance);
    const bool couple = people::household_of(file.people).spouse != nullptr;
    for (const auto& item : stock.lists.items(SetupList::family_groups)) {
        if (chance.percent(item.share))
            file.family_groups.push_back(link_to(item));
    }
    const int age = family.figures.front().age;
    for (const auto& item : stock.lists.items(SetupList::family_dates)) {
        const bool wedding = item.audience == Audience::couples;
        if ((wedding && !couple) || !chance.percent(item.share))
            continue;
        const auto date = wedding ? wedding_day(stock, age, chance) : recent_day(stock, 16, chance);
        file.family_dates.push_back(dated_link(item, date, chance.percent(30)));
    }
}

} // namespace kindrel::sample
