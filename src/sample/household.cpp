#include "sample/household.h"

#include <algorithm>

namespace kindrel::sample {

using namespace Qt::StringLiterals;

namespace {

using people::Person;

// Codes of the adults who are not the family's first ones.
constexpr int grown_child = 1;
constexpr int old_parent = 8;
constexpr int married = 3;
constexpr int married_with_children = 4;
// Codes of children: before, at and after school.
constexpr int small_child = 5;
constexpr int scholar = 6;
constexpr int school_leaver = 7;

constexpr int oldest_child = 18;
constexpr int youngest_mother = 20;
constexpr int oldest_mother = 42;

constexpr std::array plans{
    HouseholdPlan{1, 19, false, false, false, false, 19, 82}, HouseholdPlan{2, 8, false, true, false, false, 24, 54},
    HouseholdPlan{3, 20, true, false, false, false, 22, 86},  HouseholdPlan{4, 36, true, true, false, false, 25, 57},
    HouseholdPlan{8, 7, false, false, true, false, 55, 94},   HouseholdPlan{9, 1, false, false, false, true, 45, 86},
    HouseholdPlan{10, 1, false, false, true, true, 58, 92},   HouseholdPlan{11, 2, false, true, true, false, 34, 57},
    HouseholdPlan{12, 1, false, true, false, true, 32, 55},   HouseholdPlan{13, 1, false, true, true, true, 36, 57},
    HouseholdPlan{14, 2, true, false, false, true, 44, 88},   HouseholdPlan{15, 2, true, true, false, true, 32, 57},
};

/// Year 1 is the year of the sixth birthday for those born until April, else the one after. Zero is nobody's year: the
/// year before year 1 is -1.
std::optional<int> school_year_of(const QDate& birth, const QDate& today)
{
    const int level = today.year() - birth.year() - (birth.month() > 4 ? 6 : 5);
    if (level > 12 || level < -1)
        return std::nullopt;
    return level > 0 ? level : level - 1;
}

QString title_of(int marital, bool female, int age, Chance& chance)
{
    if (age > 30 && chance.percent(5))
        return chance.percent(60) ? u"Dr"_s : chance.percent(50) ? u"Rev"_s : u"Prof"_s;
    if (!female)
        return age < 13 ? u"Master"_s : u"Mr"_s;
    if (age <= oldest_child)
        return u"Miss"_s;
    if (marital == 1)
        return age > 30 || chance.percent(20) ? u"Ms"_s : u"Miss"_s;
    return chance.percent(72) ? u"Mrs"_s : u"Ms"_s;
}

bool is_taken(const MadeFamily& family, const QString& name)
{
    return std::ranges::find(family.file.people, name, &Person::Name) != family.file.people.end();
}

GivenName free_name(const MadeFamily& family, bool female, int age, const Stock& stock, Chance& chance)
{
    auto name = stock.names.given_name(family.origin, female, age, chance);
    for (int tries = 0; tries < 20 && is_taken(family, name.name); ++tries)
        name = stock.names.given_name(family.origin, female, age, chance);
    return name;
}

/// Different ages that children of these parents may have, the eldest first.
std::vector<int> ages_of_children(int count, int younger_parent, int older_parent, Chance& chance)
{
    const int eldest = std::clamp(younger_parent - youngest_mother, 0, oldest_child);
    const int youngest = std::clamp(older_parent - oldest_mother, 0, eldest);
    std::vector<int> ages;
    for (int age = eldest; age >= youngest; --age)
        ages.push_back(age);
    while (static_cast<int>(ages.size()) > count)
        ages.erase(ages.begin() + chance.below(static_cast<int>(ages.size())));
    return ages;
}

int number_of_children(Chance& chance)
{
    constexpr std::array often{1, 1, 1, 1, 1, 1, 2, 2, 2, 2, 2, 2, 2, 2, 3, 3, 3, 3, 4, 5};
    return chance.pick(often);
}

void add_living_children(MadeFamily& family, bool couple, const Stock& stock, Chance& chance)
{
    const int first = family.figures.front().age;
    const int second = couple ? family.figures[1].age : first;
    const auto [younger, older] = std::minmax(first, second);
    for (const int age : ages_of_children(number_of_children(chance), younger, older, chance))
        add_child(family, age, stock, chance);
}

void add_deceased_child(MadeFamily& family, const Stock& stock, Chance& chance)
{
    const int age = std::max(1, family.figures.front().age - chance.between(22, 34));
    auto& child = add_person(family, small_child, chance.percent(50), age, stock, chance);
    child.Decease = true;
    child.school_year.reset();
    child.Title.clear();
}

void add_further_adults(MadeFamily& family, bool parents, const Stock& stock, Chance& chance)
{
    const int age = family.figures.front().age;
    if (parents && age >= 46 && chance.percent(35)) {
        const int young_age = chance.between(19, std::min(34, age - 24));
        add_person(family, grown_child, chance.percent(50), young_age, stock, chance);
    }
    if (age >= 30 && age <= 66 && chance.percent(4)) {
        const int old_age = age + chance.between(23, 29);
        add_person(family, old_parent, chance.percent(70), old_age, stock, chance);
    }
}

} // namespace

std::span<const HouseholdPlan> household_plans()
{
    return plans;
}

const HouseholdPlan& any_plan(Chance& chance)
{
    int place = chance.below(100);
    return *std::ranges::find_if(plans, [&](const HouseholdPlan& plan) { return (place -= plan.share) < 0; });
}

Person& add_person(MadeFamily& family, int marital, bool female, int age, const Stock& stock, Chance& chance)
{
    const auto name = free_name(family, female, age, stock, chance);
    const auto birth = day_at_age(stock, age, 0, chance);
    family.figures.push_back({female, age, family.tone, chance.next()});
    auto& person = family.file.people.emplace_back();
    person.Name = name.name;
    person.preferred_name = chance.percent(60) ? name.preferred : QString();
    person.Marital = marital;
    person.Title = title_of(marital, female, age, chance);
    if (chance.percent(88))
        person.birthdate = birth;
    if (age <= oldest_child)
        person.school_year = school_year_of(birth.qdate(), stock.today);
    return person;
}

Person& add_child(MadeFamily& family, int age, const Stock& stock, Chance& chance)
{
    auto& child = add_person(family, small_child, chance.percent(50), age, stock, chance);
    if (child.school_year > 0)
        child.Marital = scholar;
    else if (age > 10)
        child.Marital = school_leaver;
    return child;
}

MadeFamily make_household(const HouseholdPlan& plan, const Surname& surname, const Stock& stock, Chance& chance)
{
    MadeFamily family;
    family.origin = surname.origin;
    family.tone = chance.below(6);
    family.file.family.surname = surname.name;
    const int age = chance.between(plan.youngest, plan.oldest);
    const bool female = chance.percent(plan.widowed ? 75 : plan.couple ? 12 : 60);
    add_person(family, plan.marital, female, age, stock, chance);
    if (plan.couple)
        add_person(family, plan.marital, !female, std::max(19, age + chance.between(-4, 3)), stock, chance);
    if (plan.widowed && chance.percent(45))
        add_person(family, plan.children ? married_with_children : married, !female, age + chance.between(-2, 6), stock,
                   chance)
            .Decease = true;
    if (plan.lost_child && chance.percent(70))
        add_deceased_child(family, stock, chance);
    add_further_adults(family, plan.couple || plan.children, stock, chance);
    if (plan.children)
        add_living_children(family, plan.couple, stock, chance);
    return family;
}

} // namespace kindrel::sample
