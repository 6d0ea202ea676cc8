#include "people/editor_fixture.h"
#include "people/list_plan.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using people::ListPlan;
using people::ListRange;
using people::Needs;

namespace {

/// Adams: Ann and Ben; Lane: Cy, deceased; Moss: Di; Šimek: Eve. Only Adams and Moss have contacts, Moss hidden ones.
class ListPlanTest : public EditorTest
{
protected:
    void SetUp() override
    {
        EditorTest::SetUp();
        if (!church)
            return;
        adams = store(u"Adams"_s, {u"Ann"_s, u"Ben"_s}, [](people::FamilyFile& file) {
            file.address.res_street = u"1 High Street"_s;
            file.people[1].Personal_email = u"ben@example.org"_s;
        });
        store(u"Lane"_s, {u"Cy"_s}, [](people::FamilyFile& file) { file.people[0].Decease = true; });
        moss = store(u"Moss"_s, {u"Di"_s}, [](people::FamilyFile& file) {
            file.address.res_street = u"2 High Street"_s;
            file.address.res_hidden = true;
            file.address.phone = u"555"_s;
            file.address.phone_hidden = true;
        });
        store(u"Šimek"_s, {u"Eve"_s}, [](people::FamilyFile&) {});
        plan.filter.families = people::FamilyList::active;
    }
    people::FamilyFile store(const QString& surname, std::initializer_list<QString> names,
                             const std::function<void(people::FamilyFile&)>& change)
    {
        auto file = family(surname, names);
        change(file);
        return people::save_family(session(), file, office().clock.today());
    }
    [[nodiscard]] people::Member member(const QString& name)
    {
        for (const auto& person : people::everybody(session(), false))
            if (person.name.startsWith(name))
                return person.member;
        throw std::runtime_error(name.toStdString());
    }
    /// First letters of the names of the list.
    [[nodiscard]] QString made()
    {
        QString letters;
        for (const auto& person : people::make_list(office(), plan).people)
            letters += person.name[0];
        return letters;
    }

    ListPlan plan;
    people::FamilyFile adams, moss;
};
KINDREL_ON_BOTH_ENGINES(ListPlanTest);

} // namespace

TEST_P(ListPlanTest, PeopleAreListedWithTheirMarkersAndFamilies)
{
    plan.filter.states.deceased = true;
    const auto list = people::make_list(office(), plan);
    ASSERT_EQ(list.people.size(), 5u);
    EXPECT_EQ(list.people[2].name, u"Cy (Deceased)");
    EXPECT_EQ(list.people[2].surname, u"Lane");
    EXPECT_EQ(list.list.members.size(), 5u);
    EXPECT_EQ(list.list.members[2].person_id, list.people[2].member.person_id);
}

TEST_P(ListPlanTest, ARangeTakesLettersFirstAndPlacesOfWhatIsLeft)
{
    struct Case
    {
        ListRange range;
        QString left;
        QString words;
    };
    const std::vector<Case> cases{
        {{}, u"ABDE"_s, {}},
        {{.first_letter = u"m"_s}, u"DE"_s, u"surnames from m"_s},
        {{.last_letter = u"m"_s}, u"ABD"_s, u"surnames up to m"_s},
        {{.first_letter = u"Mo"_s, .last_letter = u"S"_s}, u"DE"_s, u"surnames from Mo to S"_s},
        {{.first = 2, .last = 3}, u"BD"_s, u"places from 2 to 3"_s},
        {{.last_letter = u"M"_s, .first = 3}, u"D"_s, u"surnames up to M, places from 3"_s},
        {{.first = 9}, {}, u"places from 9"_s},
        {{.first = 3, .last = 2}, {}, u"places from 3 to 2"_s},
    };
    for (const auto& [range, left, words] : cases) {
        plan.range = range;
        EXPECT_EQ(made(), left) << words.toStdString();
        EXPECT_EQ(people::range_words(range), words);
    }
}

TEST_P(ListPlanTest, TheOwnSurnameIsShownAndOrdersIndividualsUnlessItIsHiddenOrTheFamilys)
{
    store(u"Tiplady"_s, {u"Flo"_s, u"Gus"_s, u"Hal"_s}, [](people::FamilyFile& file) {
        file.people[0].other_surname = u"Achterberg"_s;
        file.people[0].Decease = true;
        file.people[1].other_surname = u"Abbot"_s;
        file.people[1].surname_hidden = true;
        file.people[2].other_surname = u"Tiplady"_s;
    });
    plan.filter.states.deceased = true;
    plan.range.first_letter = u"T"_s;
    QStringList names;
    for (const auto& person : people::make_list(office(), plan).people)
        names += u"%1, %2"_s.arg(person.surname, person.name);
    EXPECT_EQ(names, QStringList({u"Tiplady, Flo Achterberg (Deceased)"_s, u"Tiplady, Gus"_s, u"Tiplady, Hal"_s}));

    plan.sort.by = people::SortBy::individual;
    EXPECT_EQ(made(), u"GH");
    plan.range = {.first_letter = u"A"_s, .last_letter = u"A"_s};
    EXPECT_EQ(made(), u"FAB");
}

TEST_P(ListPlanTest, WhatIsNeededMayBeTheFamilysOrTheOwnAndHiddenOnesDoNotCount)
{
    const std::vector<std::pair<Needs, QString>> cases{
        {{.address = true}, u"AB"_s}, {{.phone = true}, {}},
        {{.email = true}, u"B"_s},    {{.address = true, .email = true}, u"B"_s},
        {{.birth_date = true}, {}},
    };
    for (const auto& [needs, left] : cases) {
        plan.needs = needs;
        EXPECT_EQ(made(), left) << people::needs_words(needs).toStdString();
    }
}

TEST_P(ListPlanTest, WhoIsAddedStandsInOrderOrLastWhereAStepLeavesThemOut)
{
    people::add_by_hand(plan, {member(u"Cy"_s)});
    people::add_by_hand(plan, {member(u"Ann"_s)});
    EXPECT_EQ(made(), u"ABCDE");
    plan.range.first_letter = u"M"_s;
    EXPECT_EQ(made(), u"DECA");
}

TEST_P(ListPlanTest, WhoIsStruckStaysOffUntilAddedAgain)
{
    const auto ben = member(u"Ben"_s);
    people::strike_by_hand(plan, {ben.person_id});
    plan.range.last = 2;
    EXPECT_EQ(made(), u"AD");
    people::add_by_hand(plan, {ben});
    EXPECT_EQ(made(), u"AB");
    people::strike_by_hand(plan, {ben.person_id});
    EXPECT_EQ(made(), u"AD");
}

TEST_P(ListPlanTest, PeopleFoundElsewhereStandInPlaceOfTheFiltersAndAreOrderedAndNarrowedLikeThose)
{
    plan.found = {{member(u"Eve"_s), member(u"Cy"_s), member(u"Ann"_s)}, u"People with a title"_s};
    EXPECT_EQ(made(), u"AE") << "Cy has died.";
    people::strike_by_hand(plan, {member(u"Cy"_s).person_id});
    people::add_by_hand(plan, {member(u"Di"_s), member(u"Ann"_s), member(u"Di"_s)});
    EXPECT_EQ(made(), u"ADE");
    plan.needs.address = true;
    EXPECT_EQ(made(), u"AD");
    EXPECT_EQ(people::make_list(office(), plan).list.criteria,
              u"People with a title; with an address; 2 added and 1 struck by hand");
}

TEST_P(ListPlanTest, TheCriteriaTellTheWholePlan)
{
    plan.sort.by = people::SortBy::individual;
    plan.range = {.first_letter = u"A"_s, .last_letter = u"M"_s};
    plan.needs.address = true;
    people::add_by_hand(plan, {member(u"Cy"_s)});
    people::strike_by_hand(plan, {member(u"Ann"_s).person_id});
    const QString words = people::make_list(office(), plan).list.criteria;
    EXPECT_TRUE(words.endsWith(u"; by Individual; with an address; surnames from A to M; 1 added and 1 struck by hand"))
        << words.toStdString();
}

} // namespace kindrel::test
