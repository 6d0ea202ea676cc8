#include "people/filter_search.h"

#include "people/family_store.h"
#include "people/fusion_rows.h"
#include "support/families.h"
#include "support/scripted_dialogue.h"
#include "support/test_church.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using core::Date;
using core::DayOrder;

namespace {

const QDate today(2024, 5, 15);

/// Everybody of every state.
Filter everybody()
{
    return {.families = FamilyList::all, .states = {true, true, true, true, true, true}};
}

LinkRow carries(int item)
{
    return {item, {}, 0, {}, {}, false};
}

class FilterTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (church)
            add_setup_items(session());
    }
    /// A family of one, whose surname is the name.
    FamilyFile& add(const QString& name)
    {
        auto& file = files.emplace_back(family(name, {name}));
        file.people.front().Active = true;
        return file;
    }
    void store() { add_families(session(), files, today); }
    [[nodiscard]] QString found(const Filter& filter)
    {
        QStringList names;
        for (const auto& member : find_people(session(), filter, {today}).members) {
            for (const auto& file : files) {
                if (file.family.Surname_ID == member.surname_id)
                    names += file.family.surname;
            }
        }
        return names.join(u' ');
    }

    std::vector<FamilyFile> files;
};

} // namespace

TEST_P(FilterTest, SchoolYearsFromBeforeSchoolOnNeverHoldYearZero)
{
    for (const int year : {-3, -2, -1, 1, 2, 3, 4})
        add(u"Y%1"_s.arg(year)).people.front().school_year = year;
    add(u"None"_s);
    store();
    auto filter = everybody();
    filter.school_years = SchoolYears{-2, 3};
    EXPECT_EQ(found(filter), u"Y-1 Y-2 Y1 Y2 Y3"_s);
    filter.school_years = SchoolYears{0, 0};
    EXPECT_EQ(found(filter), QString());
}

TEST_P(FilterTest, ABirthdayIsFoundInAnyYearAndPastTheEndOfTheYear)
{
    const std::vector<std::pair<QString, Date>> births{
        {u"A"_s, {2001, 2, 28}}, {u"B"_s, {1800, 2, 29}}, {u"C"_s, {1999, 3, 1}},   {u"D"_s, {1800, 3, 12}},
        {u"E"_s, {2030, 3, 31}}, {u"F"_s, {1950, 4, 1}},  {u"G"_s, {2000, 12, 31}}, {u"H"_s, {2024, 1, 1}}};
    for (const auto& [name, birth] : births)
        add(name).people.front().birthdate = birth;
    add(u"Unknown"_s);
    store();
    struct Case
    {
        Date from, to;
        QString names;
    };
    for (const auto& [from, to, names] : std::vector<Case>{
             {{2024, 3, 1}, {2024, 3, 31}, u"C D E"_s},
             {{1999, 3, 1}, {1801, 3, 31}, u"C D E"_s},
             {{2024, 2, 29}, {2024, 2, 29}, u"B"_s},
             {{2023, 12, 20}, {2024, 2, 28}, u"A G H"_s},
             {{2024, 3, 2}, {2024, 3, 1}, u"A B C D E F G H"_s},
         }) {
        auto filter = everybody();
        filter.dates = {{.span = DateSpan::anniversaries, .from = from, .to = to}};
        EXPECT_EQ(found(filter), names) << from.stored().toStdString();
    }
    auto march = everybody();
    march.dates = {{.span = DateSpan::month, .month = 3}};
    EXPECT_EQ(found(march), u"C D E"_s);
}

TEST_P(FilterTest, WhoIsNotBornYetOrInAnUnknownYearHasNoAge)
{
    const std::vector<std::pair<QString, Date>> births{{u"Baby"_s, {2024, 1, 1}},    {u"Future"_s, {2025, 1, 1}},
                                                       {u"One"_s, {2023, 12, 31}},   {u"Oldest"_s, {1801, 1, 1}},
                                                       {u"Unknown"_s, {1800, 6, 6}}, {u"Twenty"_s, {2004, 12, 31}}};
    for (const auto& [name, birth] : births)
        add(name).people.front().birthdate = birth;
    add(u"Nobody"_s);
    store();
    struct Case
    {
        Ages ages;
        QString names;
    };
    for (const auto& [ages, names] : std::vector<Case>{
             {{-99, 9999, {}}, u"Oldest One Twenty"_s},
             {{0, 0, {}}, {}},
             {{-99, -99, {}}, {}},
             {{1, 1, {}}, u"One"_s},
             {{20, 20, {}}, u"Twenty"_s},
             {{1, 2, Date{2026, 1, 1}}, u"Baby Future"_s},
             {{223, 224, {}}, u"Oldest"_s},
         }) {
        auto filter = everybody();
        filter.ages = ages;
        EXPECT_EQ(found(filter), names) << ages.youngest << " to " << ages.oldest;
    }
}

TEST_P(FilterTest, AnExclusionLooksAtEachItemForItself)
{
    add(u"Both"_s).people.front().groups = {carries(1), carries(2)};
    add(u"First"_s).people.front().groups = {carries(1)};
    add(u"None"_s);
    add(u"Second"_s).people.front().groups = {carries(2)};
    store();
    const FilterItem first{.kind = FilterKind::groups, .item = 1};
    const FilterItem second{.kind = FilterKind::groups, .item = 2};
    const FilterItem not_first{.kind = FilterKind::groups, .item = 1, .exclude = true};
    const FilterItem not_second{.kind = FilterKind::groups, .item = 2, .exclude = true};
    const std::vector<std::pair<std::vector<FilterItem>, QString>> cases{
        {{first}, u"Both First"_s},
        {{first, second}, u"Both First Second"_s},
        {{not_first}, u"Both None Second"_s},
        {{not_first, not_second}, u"None"_s},
        {{first, not_second}, u"Both First"_s},
        {{first, not_first}, {}},
    };
    for (const auto& [items, names] : cases) {
        auto filter = everybody();
        filter.items = items;
        EXPECT_EQ(found(filter), names) << sentence(session(), filter, {today}).toStdString();
    }
}

TEST_P(FilterTest, StatesMarksAndValuesNarrowAnItem)
{
    const auto ministry = [&](const QString& name, const std::vector<int>& states) {
        auto& person = add(name).people.front();
        for (const int state : states) {
            person.ministries.push_back(carries(1));
            person.ministries.back().type = state;
        }
    };
    ministry(u"Active"_s, {1});
    ministry(u"Both"_s, {1, 2});
    ministry(u"Neither"_s, {});
    ministry(u"Potential"_s, {2});
    const auto field = [&](const QString& name, const QString& value, bool tagged) {
        auto& person = add(name).people.front();
        person.flexi = {carries(1)};
        person.flexi.front().field = value;
        person.flexi.front().tagged = tagged;
    };
    field(u"Vegan"_s, u"Vegan"_s, true);
    field(u"Void"_s, {}, false);
    store();
    const auto in = [](MinistryChoice choice, bool exclude) {
        return FilterItem{.kind = FilterKind::ministry, .item = 1, .exclude = exclude, .ministry = choice};
    };
    const auto with = [](Marks marks, const std::optional<QString>& value, bool exclude = false) {
        return FilterItem{.kind = FilterKind::flexi, .item = 1, .exclude = exclude, .marks = marks, .value = value};
    };
    const std::vector<std::pair<FilterItem, QString>> cases{
        {in(MinistryChoice::any, false), u"Active Both Potential"_s},
        {in(MinistryChoice::active, false), u"Active Both"_s},
        {in(MinistryChoice::potential, false), u"Both Potential"_s},
        {in(MinistryChoice::not_active, false), u"Both Potential"_s},
        {in(MinistryChoice::not_potential, false), u"Active Both"_s},
        {in(MinistryChoice::active, true), u"Both Neither Potential Vegan Void"_s},
        {with(Marks::marked, {}), u"Vegan"_s},
        {with(Marks::unmarked, {}), u"Void"_s},
        {with(Marks::any, u"Vegan"_s), u"Vegan"_s},
        {with(Marks::any, u"vegan"_s), {}},
        {with(Marks::any, u""_s), u"Void"_s},
        {with(Marks::any, u"Vegan"_s, true), u"Active Both Neither Potential Void"_s},
        {with(Marks::marked, {}, true), u"Active Both Neither Potential Void"_s},
    };
    for (const auto& [item, names] : cases) {
        auto filter = everybody();
        filter.items = {item};
        EXPECT_EQ(found(filter), names) << sentence(session(), filter, {today}).toStdString();
    }
    auto other_than_vegan = everybody();
    other_than_vegan.items = {with(Marks::any, {}), with(Marks::any, u"Vegan"_s, true)};
    EXPECT_EQ(found(other_than_vegan), u"Void"_s) << "An empty value is another value.";
    auto several = everybody();
    several.items = {with(Marks::any, u"Vegan"_s), with(Marks::any, u""_s)};
    EXPECT_EQ(found(several), u"Vegan Void"_s) << "Values of one field are alternatives.";
    EXPECT_EQ(flexi_values(session(), 1), QStringList{u"Vegan"_s});
}

TEST_P(FilterTest, LettersPassOverAccentsAndHiddenSurnames)
{
    add(u"Åberg"_s).people.front().other_surname = u"Zhao"_s;
    auto& hidden = add(u"bell"_s).people.front();
    hidden.other_surname = u"Zulu"_s;
    hidden.surname_hidden = true;
    add(u"Čapek"_s);
    add(u"Žižek"_s).people.front().other_surname = u"Adams"_s;
    store();
    auto filter = everybody();
    const std::vector<std::pair<SurnameRange, QString>> cases{
        {{u"a"_s, u"B"_s, false}, u"Åberg bell"_s},
        {{u"a"_s, u"B"_s, true}, u"bell Žižek"_s},
        {{u"Ž"_s, {}, false}, u"Žižek"_s},
        {{{}, u"c"_s, true}, u"bell Čapek Žižek"_s},
        {{u"Z"_s, u"A"_s, false}, {}},
    };
    for (const auto& [range, names] : cases) {
        filter.surnames = range;
        EXPECT_EQ(found(filter), names) << range.first.toStdString();
    }
}

TEST_P(FilterTest, WithoutAFamilyListNobodyIsFound)
{
    add(u"Abel"_s);
    store();
    ScriptedDialogue dialogue;
    dialogue.expect_box(
        u"You need to apply a File Status filter before continuing, for example choose 'Active Families'"_s);
    EXPECT_FALSE(complete(dialogue, {}));
    EXPECT_EQ(count_people(session(), {}, {today}), 0);
    EXPECT_TRUE(complete(dialogue, everybody()));
    EXPECT_EQ(count_people(session(), everybody(), {today}), 1);
}

TEST_P(FilterTest, TheCriterionThatEmptiesTheListIsNamed)
{
    add(u"Abel"_s).people.front().groups = {carries(1)};
    store();
    auto filter = everybody();
    filter.items = {{.kind = FilterKind::groups, .item = 1, .text = u"Choir"_s},
                    {.kind = FilterKind::status, .item = 1, .text = u"Elder"_s}};
    filter.family_type = FamilyType::single_parent;
    EXPECT_EQ(emptying_criterion(session(), filter, {today}), u"with the status Elder"_s);
    filter.items.pop_back();
    EXPECT_EQ(emptying_criterion(session(), filter, {today}), u"Single Parent"_s);
    filter.family_type = FamilyType::single_adult;
    EXPECT_EQ(emptying_criterion(session(), filter, {today}), std::nullopt);
    filter.families = FamilyList::archive;
    EXPECT_EQ(emptying_criterion(session(), filter, {today}), u"Archive Families"_s);
}

TEST_P(FilterTest, AFilterReadsAsPlainEnglish)
{
    Filter filter{.families = FamilyList::active, .states = {.deceased = true}};
    filter.items = {
        {.kind = FilterKind::groups, .item = 1, .text = u"Choir"_s},
        {.kind = FilterKind::ministry,
         .item = 2,
         .text = u"Music"_s,
         .exclude = true,
         .ministry = MinistryChoice::potential},
        {.kind = FilterKind::groups, .item = 2, .text = u"Band"_s},
        {.kind = FilterKind::groups, .item = 3, .text = u"Crèche"_s, .exclude = true},
        {.kind = FilterKind::flexi, .item = 3, .text = u"Diet"_s, .marks = Marks::marked, .value = u"Vegan"_s}};
    filter.surnames = SurnameRange{u"A"_s, u"M"_s};
    filter.school_years = SchoolYears{-2, 3};
    filter.ages = Ages{20, 30};
    filter.dates = {
        {.span = DateSpan::anniversaries, .from = {2024, 3, 1}, .to = {2024, 3, 31}},
        {.source = DateSource::family_date, .item = 1, .text = u"Wedding"_s, .span = DateSpan::month, .month = 5},
        {.source = DateSource::visits, .from = {2023, 1, 2}, .to = {2023, 3, 4}}};
    filter.own_postcode = true;
    filter.family_type = FamilyType::widower_with_child;
    const QStringList words{u"Active Families"_s,
                            u"people who are active or deceased, or of no state"_s,
                            u"in the group Choir or Band, other than Crèche"_s,
                            u"in a ministry other than Music (potential), or in none"_s,
                            u"with the flexi field Diet (marked) = Vegan"_s,
                            u"with the family's surname from A to M"_s,
                            u"in school year -2 to 3"_s,
                            u"aged 20 to 30 on 15/05/2024"_s,
                            u"born between 1 March and 31 March of any year"_s,
                            u"of a family with the date Wedding in May"_s,
                            u"of a family visited from 02/01/2023 to 04/03/2023"_s,
                            u"with a postcode of their own"_s,
                            u"Widower, with Child"_s};
    EXPECT_EQ(find_people(session(), filter, {today}).criteria.split(u"; "_s), words);
    const auto american = sentence(session(), filter, {today, DayOrder::month_first});
    EXPECT_TRUE(american.contains(u"on 05/15/2024; born between March 1 and March 31"_s)) << american.toStdString();
}

TEST_P(FilterTest, WhatTheChurchNoLongerHasIsTold)
{
    Fusion fusion;
    fusion.name = u"Leaders"_s;
    fusion.entries = {{.item = {.kind = FilterKind::groups, .item = 9, .text = u"Choir"_s}},
                      {.item = {.kind = FilterKind::groups, .item = 1, .text = u"Band"_s}}};
    save_fusions(session(), {fusion}, {});
    auto filter = everybody();
    filter.items = {{.kind = FilterKind::status, .item = 9, .text = u"Elder"_s},
                    {.kind = FilterKind::status, .item = 1, .text = u"Deacon"_s}};
    filter.dates = {{.source = DateSource::family_date, .item = 9, .text = u"Wedding"_s}};
    filter.fusions = {1, 2};
    EXPECT_EQ(lost_items(session(), filter),
              (QStringList{u"The status 'Elder' no longer exists"_s, u"The family date 'Wedding' no longer exists"_s,
                           u"The group 'Choir' of the fusion 'Leaders' no longer exists and is left out"_s,
                           u"A fusion of this filter no longer exists, so that nobody can be found"_s}));
}

KINDREL_ON_BOTH_ENGINES(FilterTest);

} // namespace kindrel::test
