#include "register_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;
using core::Date;
using registers::RegisterDate;
using registers::WeeklyRegister;

namespace {

class DatedRegisterTest : public RegisterTest
{
protected:
    [[nodiscard]] std::vector<Date> dates() const
    {
        std::vector<Date> found;
        for (const auto& date : weekly->dates())
            found.push_back(date.date);
        return found;
    }
    [[nodiscard]] int key_of(const Date& date) const
    {
        const auto found = std::ranges::find(weekly->dates(), date, &RegisterDate::date);
        return found == weekly->dates().end() ? 0 : found->key;
    }
};

const QString used = u"This date has already been used. Please enter another date."_s;
const QString exists =
    u"Unable to change to this date as it already exists, please choose a date which has not been used yet."_s;
const QString none_chosen = u"Please choose a date that you wish to View or Alter"_s;
const QString removal = u"Please confirm that you wish to remove this record"_s;
const QString unsaved =
    u"You have un-saved Weekly Statistics information, do you wish to save this data before exiting "
    "the weekly program?"_s;

/// Loses its figures' table inside the transaction that writes, before the rows are written or after.
class BreakingRegister : public WeeklyRegister
{
public:
    using WeeklyRegister::WeeklyRegister;
    bool before = false, after = false;

protected:
    bool setup_unchanged() override
    {
        if (before)
            lose_table();
        return true;
    }
    void save_rows() override
    {
        WeeklyRegister::save_rows();
        if (after)
            lose_table();
    }

private:
    void lose_table() { session().execute(u"ALTER TABLE [tbl_weekly_amount] RENAME TO [gone];"_s); }
};

} // namespace

KINDREL_ON_BOTH_ENGINES(DatedRegisterTest);

TEST_P(DatedRegisterTest, WithoutProjectsOrTheRightNobodyComesIn)
{
    session().execute(u"DELETE FROM [tbl_weekly_project];"_s);
    dialogue().expect_box(u"Unable to enter a Weekly project, as no Weekly projects have been setup. Please go to the "
                          "weekly setup area, which is accessed from the main menu setup tab to enter a new weekly "
                          "project."_s);
    EXPECT_FALSE(weekly->enter());

    office().rights.set(core::Area::weekly_statistics, false);
    for (int act = 0; act < 4; ++act)
        dialogue().expect_box(
            u"Your password does not give access to \"%1\""_s.arg(core::area_name(core::Area::weekly_statistics)));
    EXPECT_FALSE(weekly->enter());
    EXPECT_FALSE(weekly->open(1));
    EXPECT_FALSE(weekly->add(first));
    EXPECT_FALSE(weekly->remove(1));
    EXPECT_EQ(count(u"[tbl_weekly_date]"_s), 0);
}

TEST_P(DatedRegisterTest, TheProjectLastWorkedInIsChosenAgain)
{
    ASSERT_TRUE(weekly->enter());
    EXPECT_EQ(weekly->project(), 1);
    ASSERT_TRUE(weekly->choose_project(2));
    WeeklyRegister again(other->office);
    ASSERT_TRUE(again.enter());
    EXPECT_EQ(again.project(), 2);

    session().execute(u"DELETE FROM [tbl_weekly_project] WHERE [weekly_project_id]=2;"_s);
    ASSERT_TRUE(again.enter());
    EXPECT_EQ(again.project(), 1);
}

TEST_P(DatedRegisterTest, AnAddedDateIsOpenUnderTheLockAndListedInItsPlace)
{
    start_with({second, third, first});

    EXPECT_EQ(dates(), std::vector({third, second, first}));
    EXPECT_EQ(weekly->open_date()->date, first);
    EXPECT_EQ(locks(), 1);
    EXPECT_TRUE(weekly->leave());
    EXPECT_EQ(locks(), 0);
    EXPECT_FALSE(weekly->open_date());
    ASSERT_TRUE(weekly->open(key_of(second)));
    EXPECT_EQ(locks(), 1);
    weekly.reset();
    EXPECT_EQ(locks(), 0) << "A register that ends without leaving keeps its project locked.";
}

TEST_P(DatedRegisterTest, ADayIsUsedOnceInAProjectAndMayBeUsedInAnother)
{
    start_with({first});
    ASSERT_TRUE(weekly->leave());

    dialogue().expect_box(used);
    EXPECT_FALSE(weekly->add(first));
    EXPECT_EQ(locks(), 0);
    ASSERT_TRUE(weekly->choose_project(2));
    EXPECT_TRUE(weekly->add(first));
    EXPECT_EQ(count(u"[tbl_weekly_date]"_s), 2);
}

TEST_P(DatedRegisterTest, ADayWithoutAYearOrOutsideTheCalendarIsRefused)
{
    ASSERT_TRUE(weekly->enter());
    const auto unreadable = core::bad_date_message(core::DayOrder::day_first);
    for (const auto& [day, message] : {std::pair{Date{1800, 5, 12}, core::Message{u"Please enter the year too."_s}},
                                       std::pair{Date{2024, 2, 30}, unreadable}, std::pair{Date{}, unreadable}}) {
        dialogue().expect_box(message.text, message.more);
        EXPECT_FALSE(weekly->add(day));
    }
    EXPECT_EQ(count(u"[tbl_weekly_date]"_s), 0);
}

TEST_P(DatedRegisterTest, AnotherDayTakesWhatIsStoredAndWhatIsTypedAlong)
{
    start_with({first, second, third});
    type(*weekly, {u"10", u"20"});
    ASSERT_TRUE(weekly->save());
    type(*weekly, {u"11"});
    dialogue().expect_box(exists);
    EXPECT_FALSE(weekly->change_date(second));
    const Date moved{2024, 4, 30};
    ASSERT_TRUE(weekly->change_date(moved));

    EXPECT_EQ(dates(), std::vector({second, moved, first}));
    EXPECT_EQ(stored(moved), u"1:10 2:20");
    EXPECT_EQ(weekly->last_date(), first);
    EXPECT_TRUE(weekly->altered());
    EXPECT_TRUE(weekly->save());
    EXPECT_EQ(stored(moved), u"1:11 2:20");
}

TEST_P(DatedRegisterTest, WithoutAChosenDateNothingOpensChangesOrGoes)
{
    ASSERT_TRUE(weekly->enter());
    for (int act = 0; act < 3; ++act)
        dialogue().expect_box(none_chosen);
    EXPECT_FALSE(weekly->open(0));
    EXPECT_FALSE(weekly->change_date(first));
    EXPECT_FALSE(weekly->save());
    dialogue().expect_box(u"Please choose a record to delete"_s);
    EXPECT_FALSE(weekly->remove(0));
}

TEST_P(DatedRegisterTest, ARemovedDateGoesWithItsFiguresAndItsNote)
{
    start_with({first});
    type(*weekly, {u"10", u"20"});
    ASSERT_TRUE(weekly->save());
    session().execute(u"INSERT INTO [tbl_weekly_memo] ([weekly_date_id],[Notes]) VALUES (?,'Rain');"_s,
                      weekly->open_date()->key);
    ASSERT_TRUE(weekly->add(second));
    type(*weekly, {u"30"});
    ASSERT_TRUE(weekly->save());

    dialogue().expect_confirm(removal, Answer::no, Answer::no);
    EXPECT_FALSE(weekly->remove(key_of(first)));
    EXPECT_EQ(dialogue().seen().back().more, u"2 figures and 1 note go with it.");
    dialogue().expect_confirm(removal, Answer::yes, Answer::no);
    EXPECT_TRUE(weekly->remove(key_of(first)));

    EXPECT_EQ(dates(), std::vector({second}));
    EXPECT_EQ(weekly->open_date()->date, second) << "Another date was open and stays so.";
    EXPECT_EQ(count(u"[tbl_weekly_amount]"_s), 1);
    EXPECT_EQ(count(u"[tbl_weekly_memo]"_s), 0);
    dialogue().expect_confirm(removal, Answer::yes, Answer::no);
    EXPECT_TRUE(weekly->remove(key_of(second)));
    EXPECT_EQ(dialogue().seen().back().more, u"1 figure goes with it.");
    EXPECT_FALSE(weekly->open_date());
    EXPECT_EQ(locks(), 0);
}

TEST_P(DatedRegisterTest, ADateThatIsRemovedUnopenedLeavesNoLockBehind)
{
    start_with({first, second});
    ASSERT_TRUE(weekly->leave());
    dialogue().expect_confirm(removal, Answer::yes, Answer::no);
    EXPECT_TRUE(weekly->remove(key_of(second)));
    EXPECT_EQ(dialogue().seen().back().more, u"") << "It had nothing.";
    EXPECT_EQ(dates(), std::vector({first}));
    EXPECT_EQ(locks(), 0);
}

TEST_P(DatedRegisterTest, UnsavedWorkIsSavedDroppedOrStayedWith)
{
    start_with({first});
    type(*weekly, {u"10"});
    dialogue().expect_confirm_or_cancel(unsaved, std::nullopt);
    EXPECT_FALSE(weekly->leave());
    EXPECT_EQ(weekly->open_date()->date, first);
    dialogue().expect_confirm_or_cancel(unsaved, true);
    EXPECT_TRUE(weekly->add(second));
    EXPECT_EQ(stored(first), u"1:10");

    type(*weekly, {u"20"});
    dialogue().expect_confirm_or_cancel(unsaved, false);
    dialogue().expect_box(used);
    EXPECT_FALSE(weekly->add(first));
    EXPECT_EQ(weekly->open_date()->date, second);
    EXPECT_FALSE(weekly->altered()) << "What was dropped still stands.";

    type(*weekly, {u"30"});
    dialogue().expect_confirm_or_cancel(unsaved, false);
    EXPECT_TRUE(weekly->choose_project(2));
    EXPECT_EQ(stored(second), u"");
    EXPECT_EQ(locks(), 0);
}

TEST_P(DatedRegisterTest, WritingThatCannotBeReadBackIsNotDone)
{
    BreakingRegister breaking(office());
    ASSERT_TRUE(breaking.enter() && breaking.add(first));
    type(breaking, {u"10"});
    breaking.after = true;
    EXPECT_THROW((void)breaking.save(), core::DatabaseError);
    EXPECT_TRUE(breaking.altered());
    EXPECT_EQ(stored(first), u"");

    breaking.after = false;
    breaking.before = true;
    EXPECT_THROW((void)breaking.change_date(second), core::DatabaseError);
    EXPECT_EQ(breaking.open_date()->date, first);
    EXPECT_EQ(count(u"[tbl_weekly_date] WHERE [weekly_date]='2024-04-28'"_s), 1);

    breaking.before = false;
    EXPECT_TRUE(breaking.save());
    EXPECT_FALSE(breaking.altered());
    EXPECT_EQ(stored(first), u"1:10");
}

TEST_P(DatedRegisterTest, DroppingUnsavedWorkReadsNothing)
{
    start_with({first});
    type(*weekly, {u"10"});
    session().execute(u"ALTER TABLE [tbl_weekly_amount] RENAME TO [gone];"_s);
    dialogue().expect_confirm_or_cancel(unsaved, false);
    EXPECT_TRUE(weekly->leave());
    EXPECT_FALSE(weekly->open_date());
}

TEST_P(DatedRegisterTest, AnOddDayIsNoted)
{
    start_with({first, second});
    EXPECT_EQ(weekly->date_note({2024, 5, 13}), u"") << "Two dates make no habit.";
    ASSERT_TRUE(weekly->add(third));

    EXPECT_EQ(weekly->date_note({2024, 5, 5}), u"");
    EXPECT_EQ(weekly->date_note({2024, 5, 13}), u"13/05/2024 is a Monday, but most dates of this project are Sundays.");
    EXPECT_EQ(weekly->date_note({2024, 5, 19}), u"19/05/2024 lies in the future.");
    EXPECT_EQ(weekly->date_note({2024, 5, 15}),
              u"15/05/2024 is a Wednesday, but most dates of this project are Sundays.")
        << "Today is not the future.";
    EXPECT_EQ(weekly->date_note({2204, 5, 12}),
              u"12/05/2204 is a Saturday, but most dates of this project are Sundays. 12/05/2204 lies in the future.");
}

TEST_P(DatedRegisterTest, TheHabitIsThatOfTheLastTwelveDates)
{
    ASSERT_TRUE(weekly->enter());
    for (int week = 0; week < 20; ++week) // Sundays for long, then six Mondays.
        ASSERT_TRUE(weekly->add(Date::from(QDate(2023, 1, week < 14 ? 1 : 2).addDays(7 * week))));
    EXPECT_EQ(weekly->date_note({2024, 5, 14}), u"") << "Six of twelve are no majority.";
    ASSERT_TRUE(weekly->add(Date::from(QDate(2023, 1, 2).addDays(7 * 20))));
    EXPECT_EQ(weekly->date_note({2024, 5, 14}),
              u"14/05/2024 is a Tuesday, but most dates of this project are Mondays.");
}

TEST_P(DatedRegisterTest, ADateThatCannotBeReadIsNotOpenedOverTheFiguresOfAnother)
{
    start_with({first, second});
    type(*weekly, {u"10"});
    ASSERT_TRUE(weekly->save());
    const int other_date = weekly->dates().back().key;
    session().execute(u"DROP VIEW [qry_weekly_load_groups];"_s);

    EXPECT_THROW((void)weekly->open(other_date), core::DatabaseError);

    EXPECT_FALSE(weekly->open_date());
    EXPECT_TRUE(weekly->rows().empty());
    EXPECT_EQ(locks(), 0);
}

} // namespace kindrel::test
