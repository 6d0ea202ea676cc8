#include "people/editor_fixture.h"

#include "people/family_roles.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;
using core::Date;
using people::FamilyEditor;
using people::RowList;

namespace {

/// Changes in memory, which no engine takes part in.
class FamilyRowsEditTest : public testing::Test
{
protected:
    FamilyRowsEditTest()
    {
        fill_setup_lists(church.session());
        auto file = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cy"_s, u"Di"_s});
        file.people[2].Marital = file.people[3].Marital = 6;
        key = people::save_family(church.session(), file, desk.clock.today()).family.Surname_ID;
        EXPECT_TRUE(editor.open(key));
    }
    [[nodiscard]] QStringList names() const
    {
        QStringList found;
        for (const auto& person : editor.file().people)
            found += person.Name;
        return found;
    }

    TestChurch church{core::EngineKind::sqlite};
    SetupOffice desk{church};
    ScriptedDialogue& dialogue = desk.dialogue;
    int key = 0;
    FamilyEditor editor{desk.office};
};

} // namespace

TEST_F(FamilyRowsEditTest, PeopleMoveAmongTheirLikesAndAnAdultStaysFirst)
{
    const auto no_higher = u"Unable to move this person any higher within the family file"_s;
    const auto no_lower = u"Unable to move this person any lower in the family file"_s;
    const auto needs_adult =
        u"Unable to move this person, as you must always have at least one person as the primary adult in the family."_s;
    EXPECT_TRUE(editor.move_person_down(0));
    EXPECT_TRUE(editor.move_person_up(3));
    EXPECT_EQ(names(), QStringList({u"Ben"_s, u"Ann"_s, u"Di"_s, u"Cy"_s}));
    dialogue.expect_box(no_higher);
    EXPECT_FALSE(editor.move_person_up(0));
    dialogue.expect_box(no_lower);
    EXPECT_FALSE(editor.move_person_down(3));
    dialogue.expect_box(no_higher);
    EXPECT_FALSE(editor.move_person_up(2));

    dialogue.expect_confirm(u"Please confirm you wish to delete Ann from the family file"_s, Answer::yes);
    ASSERT_TRUE(editor.remove_person(1));
    dialogue.expect_box(needs_adult);
    EXPECT_FALSE(editor.move_person_up(1));
    dialogue.expect_box(needs_adult);
    EXPECT_FALSE(editor.move_person_down(0));
    EXPECT_EQ(names(), QStringList({u"Ben"_s, u"Di"_s, u"Cy"_s}));
}

TEST_F(FamilyRowsEditTest, ThePrimaryPersonCannotBeRemoved)
{
    dialogue.expect_box(u"Unable to remove a persons name until you have chosen one to delete"_s);
    EXPECT_FALSE(editor.remove_person(-1));
    dialogue.expect_box(u"Unable to remove the primary person in this family file, if you wish to remove this person "
                        "then move another person into the primary position then remove them."_s);
    EXPECT_FALSE(editor.remove_person(0));
    dialogue.expect_confirm(u"Please confirm you wish to delete Di from the family file"_s, Answer::no, Answer::no);
    EXPECT_FALSE(editor.remove_person(3));
    EXPECT_EQ(names().size(), 4);
}

TEST_F(FamilyRowsEditTest, ASchoolYearOfZeroIsRefused)
{
    EXPECT_TRUE(editor.set_school_year(2, -1));
    dialogue.expect_box(
        u"You are unable to enter a zero value here, if you want to represent a year before a person "
        "reaches year one level, for example, preps, enter a negative number, for example -1. Automatic "
        "increment skips zero: it moves people from -1 straight to 1. Kinder is -2."_s);
    EXPECT_FALSE(editor.set_school_year(2, 0));
    EXPECT_EQ(editor.file().people[2].school_year, -1);
    EXPECT_TRUE(editor.set_school_year(2, std::nullopt));
    EXPECT_FALSE(editor.altered());
}

TEST_F(FamilyRowsEditTest, EachListRemovesInItsOwnWords)
{
    const auto row = u"Please confirm that you wish to remove this row"_s;
    const struct
    {
        RowList list;
        QString question;
    } cases[]{
        {RowList::status, row},
        {RowList::groups, row},
        {RowList::ministries, row},
        {RowList::flexi, u"Please confirm that you wish to remove this flexi from this person"_s},
        {RowList::dates, u"Please confirm that you wish to remove this date from this person"_s},
        {RowList::occupations, row},
        {RowList::family_groups, row},
        {RowList::family_dates, u"Please confirm that you wish to remove this date from this family"_s},
    };
    for (const auto& [list, question] : cases) {
        ASSERT_TRUE(editor.add_item({list, 2}, 1, u"one"_s));
        EXPECT_FALSE(editor.add_item({list, 2}, 1, u"one"_s));
        dialogue.expect_confirm(question, Answer::no, Answer::no);
        EXPECT_FALSE(editor.remove_row({list, 2, 0}));
        dialogue.expect_confirm(question, Answer::yes);
        EXPECT_TRUE(editor.remove_row({list, 2, 0}));
        EXPECT_FALSE(editor.remove_row({list, 2, 0}));
    }
    EXPECT_FALSE(editor.altered());
}

TEST_F(FamilyRowsEditTest, RowsMoveWhereTheOrderIsThePersonsOwn)
{
    for (const int item : {1, 2, 3})
        ASSERT_TRUE(editor.add_item({RowList::groups, 1}, item, u"group"_s));
    EXPECT_TRUE(editor.move_row_up({RowList::groups, 1, 2}));
    EXPECT_EQ(editor.file().people[1].groups[1].item, 3);
    dialogue.expect_box(u"Unable to move this row up as it is at the top of the list"_s);
    EXPECT_FALSE(editor.move_row_up({RowList::groups, 1, 0}));
    dialogue.expect_box(u"Unable to move this row down as it is at the bottom of the list"_s);
    EXPECT_FALSE(editor.move_row_down({RowList::groups, 1, 2}));
    editor.change({}, [](people::FamilyFile& file) { file.events = {{{}, u"First"_s}, {{}, u"Second"_s}}; });
    EXPECT_TRUE(editor.move_row_down({RowList::events, 0, 0}));
    EXPECT_EQ(editor.file().events.front().event, u"Second");
}

TEST_F(FamilyRowsEditTest, TodayReplacesAnotherDateAfterAsking)
{
    const auto question = u"A date has already been entered, do you wish to change this date to today's date"_s;
    const auto today = Date::from(desk.clock.today());
    ASSERT_TRUE(editor.add_item({RowList::dates, 0}, 1, u"date"_s));
    ASSERT_TRUE(editor.add_item({RowList::family_dates}, 1, u"date"_s));
    editor.change({}, [](people::FamilyFile& file) { file.events = {{Date{1990, 1, 2}, u"Wedding"_s}}; });
    EXPECT_TRUE(editor.set_today({RowList::dates, 0, 0}));
    EXPECT_TRUE(editor.set_today({RowList::family_dates, 0, 0}));
    EXPECT_EQ(editor.file().people[0].dates[0].date, today);
    EXPECT_EQ(editor.file().family_dates[0].date, today);
    dialogue.expect_confirm(question, Answer::no, Answer::no);
    EXPECT_FALSE(editor.set_today({RowList::events, 0, 0}));
    dialogue.expect_confirm(question, Answer::yes);
    EXPECT_TRUE(editor.set_today({RowList::events, 0, 0}));
    EXPECT_EQ(editor.file().events[0].event_date, today);
    EXPECT_FALSE(editor.set_today({RowList::groups, 0, 0}));
}

TEST(FamilyRolesTest, AChildAndASpouseLeadFromEachStandingToItsCounterpart)
{
    const struct
    {
        int code, with_child, with_spouse;
    } cases[]{{1, 2, 3},    {2, 2, 4},   {3, 4, 3},    {8, 11, 3},   {9, 12, 14},
              {10, 13, 14}, {11, 11, 4}, {13, 13, 15}, {14, 15, 14}, {6, 6, 6}};
    for (const auto& [code, child, spouse] : cases) {
        EXPECT_EQ(people::with_child(code), child) << code;
        EXPECT_EQ(people::with_spouse(code), spouse) << code;
    }
}

} // namespace kindrel::test
