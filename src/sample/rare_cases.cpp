#include "sample/rare_cases.h"

#include "people/fields.h"
#include "people/names.h"
#include "sample/belongings.h"
#include "sample/contact_details.h"
#include "sample/hidden_twins.h"

#include <algorithm>

namespace kindrel::sample {

using namespace Qt::StringLiterals;

namespace {

using core::Date;

constexpr Date leap_day_of_unknown_year{Date::unknown_year, 2, 29};
constexpr Date day_of_unknown_year{Date::unknown_year, 3, 12};

void fill_to_seventeen(MadeFamily& family, const Stock& stock, Chance& chance)
{
    constexpr int age_of_parents = 46;
    family.file.people.resize(2);
    family.figures.resize(2);
    for (const std::size_t parent : {0, 1}) {
        family.figures[parent].age = age_of_parents;
        family.file.people[parent].birthdate = day_at_age(stock, age_of_parents, 0, chance);
    }
    for (int age = 18; static_cast<int>(family.file.people.size()) < people::most_people; --age)
        add_child(family, age, stock, chance);
}

void lengthen_names(MadeFamily& family, const Stock&, Chance&)
{
    // Sixty letters each.
    family.file.family.surname = u"Featherstonehaugh-Cholmondeley-Wolstenholme-Abercrombie-Hart"_s;
    family.file.people.front().Name = u"Bartholomew Maximilian Ferdinand Christopher Theodore Alwyne"_s;
}

void shorten_names(MadeFamily& family, const Stock&, Chance&)
{
    family.file.family.surname = u"Y"_s;
    family.file.people.front().Name = u"O"_s;
}

void bury_primary(MadeFamily& family, const Stock&, Chance&)
{
    auto& people = family.file.people;
    people[0].Active = people[0].Privacy = people[0].Prospect = people[0].archive = people[0].contact = false;
    people[0].Decease = true;
    people[1].Marital = std::ranges::any_of(people, kindrel::people::is_child) ? 11 : 8;
}

void drop_address(MadeFamily& family, const Stock&, Chance&)
{
    family.file.address = {};
    family.file.residential.reset();
    family.file.postal.reset();
}

void keep_suburb_alone(MadeFamily& family, const Stock&, Chance&)
{
    family.file.address.res_street.clear();
    family.file.address.res_street2.clear();
}

void keep_postcode_alone(MadeFamily& family, const Stock& stock, Chance& chance)
{
    keep_suburb_alone(family, stock, chance);
    family.file.residential = people::Suburb();
    family.file.residential->postcode_var = u"9177"_s;
}

void change_postcode(MadeFamily& family, const Stock&, Chance&)
{
    family.file.residential->postcode_var = u"9188"_s;
}

void move_overseas(MadeFamily& family, const Stock&, Chance&)
{
    auto& address = family.file.address;
    address.res_country = u"New Zealand"_s;
    address.post_country = u"New Zealand"_s;
    address.res_map.clear();
    address.res_ref.clear();
}

void forget_years(MadeFamily& family, const Stock& stock, Chance&)
{
    auto& file = family.file;
    file.people[0].birthdate = leap_day_of_unknown_year;
    file.people[1].birthdate = day_of_unknown_year;
    file.people[0].dates = {dated_link(stock.lists.items(SetupList::personal_dates)[0], day_of_unknown_year)};
    file.events.insert(file.events.begin(), {leap_day_of_unknown_year, u"Grandmother's name day"_s});
    file.family_dates = {dated_link(stock.lists.items(SetupList::family_dates)[0], leap_day_of_unknown_year)};
}

void set_every_flag(MadeFamily& family, const Stock&, Chance&)
{
    auto& person = family.file.people.front();
    person.Active = person.Privacy = person.Prospect = person.archive = person.contact = person.Decease = true;
}

void clear_every_flag(MadeFamily& family, const Stock&, Chance&)
{
    auto& person = family.file.people.front();
    person.Active = person.Privacy = person.Prospect = person.archive = person.contact = person.Decease = false;
}

void book_out(MadeFamily& family, const Stock& stock, Chance&)
{
    auto& row = family.file.family;
    row.booked_out = true;
    row.booked_out_date = Date::from(stock.today.addDays(-9));
    row.booked_out_person = family.index % 2 ? u"Pastoral assistant"_s : u"Elder of the area"_s;
    row.active_in_book = family.index % 2 != 0;
}

void book_in(MadeFamily& family, const Stock&, Chance&)
{
    family.file.family.active_in_book = true;
}

/// Only booking closes sections of a record: each closed one stands in a booked family.
template <int part>
void close_sections(MadeFamily& family, const Stock& stock, Chance& chance)
{
    book_out(family, stock, chance);
    const auto sections = people::access_fields();
    for (std::size_t i = part; i < sections.size(); i += 4)
        family.file.access.*std::get<bool people::RecordAccess::*>(sections[i].member) = false;
}

void await_transfer(MadeFamily& family, const Stock&, Chance&)
{
    family.file.address.transfer_exists = true;
}

void leave_audio_note(MadeFamily& family, const Stock&, Chance&)
{
    family.file.address.audio_note = u"entry.wav"_s;
}

void serve_twice(MadeFamily& family, const Stock& stock, Chance&)
{
    auto& ministries = family.file.people.front().ministries;
    ministries.assign(2, link_to(stock.lists.items(SetupList::ministries).back()));
    ministries[0].type = static_cast<int>(people::MinistryState::active);
    ministries[1].type = static_cast<int>(people::MinistryState::potential);
}

void strip_person(MadeFamily& family, const Stock&, Chance&)
{
    auto& person = family.file.people.front();
    Person bare;
    bare.Name = person.Name;
    bare.Marital = person.Marital;
    bare.Active = true;
    person = bare;
    std::erase_if(family.stays, [](const Stay& stay) { return stay.place == 0; });
}

void fill_lists(MadeFamily& family, const Stock& stock, Chance& chance)
{
    auto& file = family.file;
    for (const auto& event : stock.events)
        file.events.push_back({recent_day(stock, 20, chance), event});
    for (const auto& contact : stock.contacts)
        file.other_contacts.push_back({contact, phone_number(chance)});
    for (const auto& comment : stock.comments)
        file.visits.push_back({recent_day(stock, 5, chance), stock.visitors.front(), comment});
}

void share_name(MadeFamily& family, const Stock&, Chance&)
{
    family.file.people[1].Name = family.file.people[0].Name;
}

void be_born_today(MadeFamily& family, const Stock& stock, Chance& chance)
{
    add_child(family, 0, stock, chance).birthdate = Date::from(stock.today);
}

void be_born_on_leap_day(MadeFamily& family, const Stock& stock, Chance&)
{
    constexpr Date leap_day{1956, 2, 29};
    family.file.people.front().birthdate = leap_day;
    family.figures.front().age = stock.today.year() - leap_day.year;
}

void be_very_old(MadeFamily& family, const Stock& stock, Chance&)
{
    family.file.people.front().birthdate = Date::from(stock.today.addYears(-104).addDays(-12));
    family.figures.front().age = 104;
}

template <class Record>
void hide(Record& record, const HiddenTwin<Record>& twin)
{
    record.*twin.hidden = true;
    if (twin.value && (record.*twin.value).isEmpty())
        record.*twin.value = twin.example.toString();
}

void hide_of_person(MadeFamily& family, const HiddenTwin<Person>& twin, const Stock& stock, Chance& chance)
{
    auto& person = family.file.people.front();
    hide(person, twin);
    if (!twin.value && !person.birthdate)
        person.birthdate = day_at_age(stock, family.figures.front().age, 0, chance);
}

/// Where a family stands among the rare ones; -1 for the many between them.
int rare_place(int index)
{
    constexpr int rare_families_among = 10 * rare_families;
    const int place = index % rare_families_among;
    return place < rare_families ? place : -1;
}

struct RareCase
{
    int place;
    int marital; ///< Of the household that the case needs; 0 for any.
    void (*make)(MadeFamily& family, const Stock& stock, Chance& chance);
};

constexpr int first_person_twin = 20;
constexpr int first_family_twin = 40;

/// Those that change who is in a family, or how old; the others follow when it has everything.
constexpr std::array grown_cases{
    RareCase{14, 4, fill_to_seventeen},
    RareCase{72, 4, be_born_today},
    RareCase{73, 1, be_born_on_leap_day},
    RareCase{74, 8, be_very_old},
};

constexpr std::array rare_cases{
    RareCase{15, 4, lengthen_names},
    RareCase{16, 0, shorten_names},
    RareCase{17, 4, bury_primary},
    RareCase{first_family_twin + 1, 0, give_postal_address},
    RareCase{50, 0, drop_address},
    RareCase{51, 0, keep_suburb_alone},
    RareCase{52, 0, keep_postcode_alone},
    RareCase{53, 0, change_postcode},
    RareCase{54, 0, move_overseas},
    RareCase{55, 0, give_postal_address},
    RareCase{56, 3, forget_years},
    RareCase{57, 0, set_every_flag},
    RareCase{58, 0, clear_every_flag},
    RareCase{59, 1, strip_person},
    RareCase{60, 0, close_sections<0>},
    RareCase{61, 0, close_sections<1>},
    RareCase{62, 0, close_sections<2>},
    RareCase{63, 0, close_sections<3>},
    RareCase{64, 0, book_out},
    RareCase{65, 0, book_out},
    RareCase{66, 0, book_in},
    RareCase{67, 0, await_transfer},
    RareCase{68, 0, leave_audio_note},
    RareCase{69, 0, serve_twice},
    RareCase{70, 0, fill_lists},
    RareCase{71, 3, share_name},
};

void make_cases(std::span<const RareCase> cases, MadeFamily& family, const Stock& stock, Chance& chance)
{
    for (const auto& rare : cases) {
        if (rare.place == rare_place(family.index))
            rare.make(family, stock, chance);
    }
}

struct WishedOrigin
{
    int place;
    QStringView origin;
};

constexpr std::array wished_origins{
    WishedOrigin{75, u"levant-own-letters"},
    WishedOrigin{76, u"hebrew-own-letters"},
    WishedOrigin{77, u"vietnamese"},
    WishedOrigin{78, u"slavic"},
    WishedOrigin{79, u"lusitan"},
};

} // namespace

const HouseholdPlan* wished_plan(int index)
{
    const auto plans = household_plans();
    const auto place = static_cast<std::size_t>(rare_place(index));
    if (place < plans.size())
        return &plans[place];
    for (const std::span<const RareCase> cases : {std::span<const RareCase>(grown_cases), {rare_cases}}) {
        const auto rare = std::ranges::find(cases, rare_place(index), &RareCase::place);
        if (rare != cases.end() && rare->marital != 0)
            return &*std::ranges::find(plans, rare->marital, &HouseholdPlan::marital);
    }
    return nullptr;
}

QString wished_origin(int index)
{
    const auto wish = std::ranges::find(wished_origins, rare_place(index), &WishedOrigin::place);
    return wish == wished_origins.end() ? QString() : wish->origin.toString();
}

std::optional<people::FileStatus> wished_status(int index)
{
    constexpr int first = 14;
    constexpr int last = 79;
    const int place = rare_place(index);
    return place >= first && place <= last ? std::optional(people::FileStatus::active) : std::nullopt;
}

void grow_rare(MadeFamily& family, const Stock& stock, Chance& chance)
{
    make_cases(grown_cases, family, stock, chance);
}

void make_rare(MadeFamily& family, const Stock& stock, Chance& chance)
{
    const int place = rare_place(family.index);
    make_cases(rare_cases, family, stock, chance);
    // Last, so that there is something to hide.
    if (const auto twin = static_cast<std::size_t>(place - first_person_twin); twin < person_twins.size())
        hide_of_person(family, person_twins[twin], stock, chance);
    if (const auto twin = static_cast<std::size_t>(place - first_family_twin); twin < family_twins.size())
        hide(family.file.address, family_twins[twin]);
}

} // namespace kindrel::sample
