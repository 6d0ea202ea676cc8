#include "core/removal.h"
#include "register_fixture.h"
#include "support/processes.h"

#include <random>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;
using core::Date;
using registers::WeeklyRegister;

namespace {

const QString one_at_a_time =
    u"To protect the integrity of your data, Kindrel only allows one user at a time to edit the weekly Project. If no "
    "user is on the system then you will need to enter the 'Network Setup' area to unlock this Weekly project."_s;
const QString changed = u"What is stored of this date has changed since it was opened here."_s;
const QString kept = u"Nothing was stored. What was typed stands here until you leave the date."_s;
const QString removed_elsewhere = u"This date has been removed by another user."_s;

/// Two workstations in one church: `weekly` at this one, `theirs` at the other.
class RegisterRaceTest : public RegisterTest
{
protected:
    void SetUp() override
    {
        RegisterTest::SetUp();
        if (church)
            theirs.emplace(other->office);
    }
    /// This workstation has a date open with figures stored, and others typed since.
    void type_over_stored()
    {
        start_with({first});
        type(*weekly, {u"10", u"20", u"30"});
        ASSERT_TRUE(weekly->save());
        type(*weekly, {u"11", u"", u"31"});
    }
    /// The other workstation takes the lock away and opens the same date.
    void break_in()
    {
        core::Locks(other->office).unlock(core::LockKind::weekly, 1);
        ASSERT_TRUE(theirs->enter());
        ASSERT_TRUE(theirs->open(weekly->open_date()->key));
    }
    /// Who is named as the holder beneath a refusal.
    [[nodiscard]] static QString held_by(const QString& whom)
    {
        return u"Weekly project 'Sunday' is held by %1 since 10:30 on 15/05/2024."_s.arg(whom);
    }

    std::optional<WeeklyRegister> theirs;
};

} // namespace

KINDREL_ON_BOTH_ENGINES(RegisterRaceTest);

TEST_P(RegisterRaceTest, WhileADateIsOpenNobodyElseOpensAddsOrRemoves)
{
    start_with({first, second});
    const int key = weekly->open_date()->key;
    ASSERT_TRUE(theirs->enter());

    const auto more = one_at_a_time + u'\n' + held_by(u"the workstation 'office-1'"_s);
    const auto entry = u"Unable to enter this Weekly Project as another user is editing this Weekly Project."_s;
    other->dialogue.expect_box(entry, more);
    EXPECT_FALSE(theirs->open(key));
    other->dialogue.expect_box(entry, more);
    EXPECT_FALSE(theirs->add(third));
    other->dialogue.expect_confirm(u"Please confirm that you wish to remove this record"_s, Answer::yes);
    other->dialogue.expect_box(u"Unable to delete this date as another user is editing this Weekly Project."_s, more);
    EXPECT_FALSE(theirs->remove(key));
    EXPECT_EQ(count(u"[tbl_weekly_date]"_s), 2);
    EXPECT_EQ(locks(), 1);

    EXPECT_TRUE(theirs->choose_project(2));
    EXPECT_TRUE(theirs->add(third)) << "Another project is free.";
    ASSERT_TRUE(weekly->leave());
    EXPECT_TRUE(theirs->choose_project(1));
    EXPECT_TRUE(theirs->open(key));
}

TEST_P(RegisterRaceTest, NobodyComesInWhileProjectsAreSetUp)
{
    ASSERT_TRUE(weekly->enter());
    ASSERT_TRUE(core::Locks(other->office).take(core::LockKind::area, core::AreaCode::project_setup));

    dialogue().expect_box(u"Unable to enter this Weekly Project as another user is editing this Weekly Project."_s);
    EXPECT_FALSE(weekly->add(first));
    EXPECT_TRUE(dialogue().seen().back().more.contains(u"Roll/Finance/Weekly setup area is held"));
    EXPECT_EQ(count(u"[tbl_weekly_date]"_s), 0);
}

TEST_P(RegisterRaceTest, WhoeverLostTheLockToSomebodySavesNothing)
{
    type_over_stored();
    break_in();

    dialogue().expect_box(
        u"The lock on this Weekly Project was taken away while the date was open here, and another user has it now."_s,
        kept + u'\n' + one_at_a_time + u'\n' + held_by(u"the workstation 'office-2'"_s));
    EXPECT_FALSE(weekly->save());
    EXPECT_EQ(stored(first), u"1:10 2:20 3:$30.00");
    EXPECT_TRUE(weekly->altered()) << "What was typed is lost.";
}

TEST_P(RegisterRaceTest, WhoeverLostTheLockOverwritesNothingThatOthersStoredMeanwhile)
{
    type_over_stored();
    break_in();
    type(*theirs, {u"12"});
    ASSERT_TRUE(theirs->save());
    ASSERT_TRUE(theirs->leave());

    dialogue().expect_box(changed,
                          u"Another user may have changed it after the lock on this Weekly Project was taken away, or "
                          "the connection was lost while it was being stored. "_s +
                              kept);
    EXPECT_FALSE(weekly->save());
    EXPECT_EQ(stored(first), u"1:12 2:20 3:$30.00");
    EXPECT_EQ(locks(), 0) << "The refused save took the lock.";
    EXPECT_TRUE(weekly->altered());
}

TEST_P(RegisterRaceTest, WhoeverLostTheLockLeavesThatOfTheNextAlone)
{
    type_over_stored();
    break_in();
    const auto drop = [&] {
        dialogue().expect_confirm_or_cancel(u"You have un-saved Weekly Statistics information, do you wish to save "
                                            "this data before exiting the weekly program?"_s,
                                            false);
    };
    drop();
    dialogue().expect_box(u"Unable to enter this Weekly Project as another user is editing this Weekly Project."_s);
    EXPECT_FALSE(weekly->add(second));
    EXPECT_EQ(count(u"[tbl_weekly_date]"_s), 1);

    type(*weekly, {u"11"});
    drop();
    EXPECT_TRUE(weekly->leave());
    EXPECT_EQ(locks(), 1) << "The lock of the other workstation was released.";
    type(*theirs, {u"12"});
    EXPECT_TRUE(theirs->save());
}

TEST_P(RegisterRaceTest, ALockTakenAgainForSomethingElseHidesNoChange)
{
    type_over_stored();
    ASSERT_TRUE(weekly->save());
    ASSERT_TRUE(weekly->add(second));
    const int key = weekly->dates().back().key;
    type(*weekly, {u"40"});
    break_in();
    type(*theirs, {u"41"});
    ASSERT_TRUE(theirs->save());
    ASSERT_TRUE(theirs->leave());
    dialogue().expect_confirm(u"Please confirm that you wish to remove this record"_s, Answer::yes);
    dialogue().expect_box(changed);
    EXPECT_FALSE(weekly->remove(key));
    dialogue().expect_box(changed);
    EXPECT_FALSE(weekly->save());
    EXPECT_EQ(stored(second), u"1:41");
}

TEST_P(RegisterRaceTest, ALockThatNobodyUsedMeanwhileIsTakenAgain)
{
    type_over_stored();
    core::Locks(other->office).unlock(core::LockKind::weekly, 1);

    EXPECT_TRUE(weekly->save());
    EXPECT_EQ(stored(first), u"1:11 3:$31.00");
    EXPECT_EQ(locks(), 1);
    EXPECT_TRUE(weekly->leave());
    EXPECT_EQ(locks(), 0);
}

TEST_P(RegisterRaceTest, ADateRemovedElsewhereIsNotBroughtBack)
{
    type_over_stored();
    break_in();
    other->dialogue.expect_confirm(u"Please confirm that you wish to remove this record"_s, Answer::yes);
    ASSERT_TRUE(theirs->remove(weekly->open_date()->key));

    dialogue().expect_box(removed_elsewhere, kept);
    EXPECT_FALSE(weekly->save());
    dialogue().expect_box(removed_elsewhere, kept);
    EXPECT_FALSE(weekly->change_date(second));
    EXPECT_EQ(count(u"[tbl_weekly_amount]"_s), 0);
    EXPECT_EQ(count(u"[tbl_weekly_date]"_s), 0);
    EXPECT_EQ(weekly->rows()[0].figure, registers::whole(11));
    EXPECT_TRUE(weekly->dates().empty());
}

TEST_P(RegisterRaceTest, ADateThatIsGoneBeforeItIsOpenedIsTold)
{
    start_with({first, second});
    const int key = weekly->dates().back().key;
    ASSERT_TRUE(weekly->leave());
    core::remove_entities(*other->office.session, core::Entity::weekly_date, std::array{key});

    dialogue().expect_box(removed_elsewhere);
    EXPECT_FALSE(weekly->open(key));
    EXPECT_EQ(weekly->dates().size(), 1u);
    EXPECT_EQ(locks(), 0);
}

TEST_P(RegisterRaceTest, AProjectThatIsGoneIsToldAndAnotherShown)
{
    ASSERT_TRUE(weekly->enter());
    core::remove_entities(*other->office.session, core::Entity::weekly_project, std::array{1});

    dialogue().expect_box(u"This Weekly Project has been removed by another user."_s);
    EXPECT_FALSE(weekly->add(first));
    EXPECT_EQ(weekly->project(), 2);
    EXPECT_EQ(count(u"[tbl_weekly_date]"_s), 0);
    EXPECT_EQ(locks(), 0);
}

TEST_P(RegisterRaceTest, ACategoryThatIsGoneWithTheLockGetsNoFigure)
{
    start_with({first});
    type(*weekly, {u"11", u"12"});
    core::Locks(other->office).unlock(core::LockKind::weekly, 1);
    core::remove_entities(*other->office.session, core::Entity::weekly_group, std::array{2});

    dialogue().expect_box(changed);
    EXPECT_FALSE(weekly->save());
    EXPECT_EQ(count(u"[tbl_weekly_amount]"_s), 0);
}

TEST_P(RegisterRaceTest, SeveralProcessesWorkOnOneDateInTurnAndLoseNothing)
{
    constexpr int saves = 8;
    start_with({first});
    ASSERT_TRUE(weekly->save());
    const int key = weekly->open_date()->key;
    weekly.reset();
    theirs.reset();
    desk.reset();
    other.reset();
    church->close();
    const auto work = [&]() -> QByteArray {
        WorkingOffice working(*church);
        for (int saved = 0; saved < saves;) {
            WeeklyRegister mine(working.office);
            if (!mine.enter() || !mine.open(key))
                continue;
            for (const int row : {0, 2}) {
                const auto figure = mine.rows()[static_cast<std::size_t>(row)].figure.value_or(core::Amount{});
                (void)mine.enter_figure(row, QString::number(figure.ten_thousandths / 10000 + 1));
            }
            saved += mine.save();
        }
        return {};
    };
    (void)run_together({work, work, work});
    church->reopen();
    EXPECT_EQ(stored(first), u"1:24 3:$24.00");
    EXPECT_EQ(locks(), 0);
}

TEST_P(RegisterRaceTest, SeveralProcessesAddTheSameDatesAndEachStandsOnce)
{
    constexpr int weeks = 12;
    weekly.reset();
    theirs.reset();
    desk.reset();
    other.reset();
    church->close();
    const auto work = [&]() -> QByteArray {
        WorkingOffice working(*church);
        int added = 0;
        for (int week = 0; week < weeks; ++week) {
            const auto date = Date::from(QDate(2024, 1, 7).addDays(7 * week));
            WeeklyRegister mine(working.office);
            if (!mine.enter())
                continue;
            // Until either this process has added it or somebody else has: the lock may be held.
            for (bool there = false; !there;) {
                added += mine.add(date);
                mine.refresh_dates();
                there = std::ranges::find(mine.dates(), date, &registers::RegisterDate::date) != mine.dates().end();
            }
        }
        return QByteArray::number(added);
    };
    int added = 0;
    for (const auto& result : run_together({work, work, work}))
        added += result.toInt();
    church->reopen();
    EXPECT_EQ(added, weeks);
    EXPECT_EQ(count(u"[tbl_weekly_date]"_s), weeks);
    EXPECT_EQ(locks(), 0);
}

TEST_P(RegisterRaceTest, AKilledSaveLeavesTheFiguresOfOneSaveAlone)
{
    constexpr int categories = 150;
    std::vector<std::vector<core::Value>> rows;
    for (int key = 101; key <= 100 + categories; ++key)
        rows.push_back({core::to_value(key), core::to_value(u"C%1"_s.arg(key)), core::to_value(key), core::to_value(1),
                        core::to_value(1)});
    session().insert(u"tbl_weekly_group"_s,
                     {u"group_id"_s, u"group"_s, u"position"_s, u"group_type"_s, u"weekly_project_id"_s}, rows);
    start_with({first});
    const int key = weekly->open_date()->key;
    weekly.reset();
    theirs.reset();
    desk.reset();
    other.reset();
    std::mt19937 random(20261123);
    for (int round = 0; round < 25; ++round) {
        church->close();
        run_and_kill(
            [&](const Ready& ready) {
                WorkingOffice working(*church);
                WeeklyRegister mine(working.office);
                if (!mine.enter() || !mine.open(key))
                    return;
                for (int figure = 1;; ++figure) {
                    for (int row = 0; row < static_cast<int>(mine.rows().size()); ++row)
                        (void)mine.enter_figure(row, QString::number(figure));
                    (void)mine.save();
                    if (figure == 1)
                        ready();
                }
            },
            std::chrono::microseconds(random() % 15000));
        church->reopen();
        EXPECT_EQ(count(u"[tbl_weekly_amount]"_s), categories + 3) << "A save stands by half.";
        EXPECT_EQ(number_of(session(), u"SELECT COUNT(DISTINCT [amount]) FROM [tbl_weekly_amount];"_s), 1)
            << "Two saves are mixed.";
        EXPECT_EQ(locks(), 1) << "The lock of a killed program stays until it is released.";
        session().execute(u"DELETE FROM [tbl_weekly_locked];"_s);
    }
}

} // namespace kindrel::test
