#include "core/locks.h"

#include "core/system_workstation.h"
#include "support/processes.h"
#include "workplace.h"

#include <QCoreApplication>
#include <QFile>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

/// A lock of every kind.
struct KindCase
{
    LockKind kind;
    LockKey key, other;
    const char* table;
    bool for_many = false; ///< As many workstations as like to may hold it.
};

std::vector<KindCase> every_kind()
{
    return {
        {LockKind::area, AreaCode::setup, AreaCode::visitation, "tbl_locked_area"},
        {LockKind::family, 7, 8, "tbl_locked_family_files"},
        {LockKind::roll_area, 7, 8, "tbl_locked_roll_area", true},
        {LockKind::finance_area, 7, 8, "tbl_locked_finance_area", true},
        {LockKind::roster_area, 7, 8, "tbl_locked_roster_area", true},
        {LockKind::wardline_area, 7, 8, "tbl_locked_wardline_area", true},
        {LockKind::roll, 7, 8, "tbl_roll_locked"},
        {LockKind::finance, 7, 8, "tbl_finance_locked"},
        {LockKind::weekly, 7, 8, "tbl_weekly_locked"},
        {LockKind::roster, 7, 8, "tbl_roster_locked"},
        {LockKind::wardline, 7, 8, "tbl_wardline_locked"},
        {LockKind::custom_letter, u"Welcome"_s, u"Thanks"_s, "Tbl_custom_letter_lock"},
        {LockKind::custom_report, u"Ages"_s, u"Names"_s, "Tbl_custom_report_lock"},
    };
}

QStringList words(const std::vector<HeldLock>& locks)
{
    QStringList all;
    for (const auto& lock : locks)
        all += lock.what;
    return all;
}

/// Work for one of several processes: does it over and over and tells how often it went wrong.
QByteArray tally(int rounds, const std::function<bool()>& work)
{
    int faults = 0;
    for (int round = 0; round < rounds; ++round)
        faults += work() ? 0 : 1;
    return QByteArray::number(faults);
}

/// Makes a file that must not be there yet, and takes it away again.
bool alone_inside(const QString& file)
{
    QFile inside(file);
    return inside.open(QIODevice::WriteOnly | QIODevice::NewOnly) && inside.remove();
}

} // namespace

class LocksTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (!church)
            return;
        here.emplace(*church, u"office-1"_s);
        there.emplace(*church, u"office-2"_s);
    }
    std::optional<Workplace> here, there;
};
KINDREL_ON_BOTH_ENGINES(LocksTest);

TEST_P(LocksTest, ALockOfAnyKindIsSeenByAllUntilItIsReleased)
{
    for (const auto& [kind, key, other, table, for_many] : every_kind()) {
        SCOPED_TRACE(table);
        ASSERT_TRUE(here->locks.take(kind, key));

        EXPECT_TRUE(there->locks.check(kind, key));
        EXPECT_FALSE(there->locks.check(kind, other));
        EXPECT_TRUE(there->locks.any(kind));
        EXPECT_EQ(there->locks.take(kind, key), for_many);
        EXPECT_EQ(there->locks.count(kind), for_many ? 2 : 1);
        EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [%1];"_s.arg(QLatin1StringView(table))),
                  for_many ? 2 : 1);
        if (for_many)
            there->locks.release(kind, key);

        here->locks.release(kind, key);
        EXPECT_FALSE(there->locks.check(kind, key));
        EXPECT_FALSE(there->locks.any(kind));
        EXPECT_TRUE(there->locks.take(kind, key));
    }
}

TEST_P(LocksTest, ReleasingALockThatIsNotThereDoesNothing)
{
    ASSERT_TRUE(there->locks.take(LockKind::family, 8));

    here->locks.release(LockKind::family, 7);

    EXPECT_EQ(here->locks.count(LockKind::family), 1);
}

TEST_P(LocksTest, AnErrorWhileReleasingIsIgnored)
{
    session().execute(u"DROP TABLE [tbl_locked_family_files];"_s);

    here->locks.release(LockKind::family, 7);

    EXPECT_THROW((void)here->locks.check(LockKind::family, 7), DatabaseError);
}

TEST_P(LocksTest, RowsOfOneKeyAreReleasedOneAtATimeAndOnesOwnFirst)
{
    ASSERT_TRUE(here->locks.take(LockKind::roll, 7));
    session().execute(u"INSERT INTO [tbl_roll_locked] ([roll_locked],[workstation],[process],[taken]) "
                      "VALUES (7,'office-9',12,'2001-01-01T00:00:00.000');"_s);
    session().execute(u"INSERT INTO [tbl_roll_locked] ([roll_locked]) VALUES (7);"_s);

    here->locks.release(LockKind::roll, 7);
    EXPECT_EQ(here->locks.count(LockKind::roll), 2);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_roll_locked] WHERE [workstation]='office-1';"_s), 0);

    here->locks.release(LockKind::roll, 7);
    EXPECT_TRUE(here->locks.check(LockKind::roll, 7));
    here->locks.release(LockKind::roll, 7);
    EXPECT_FALSE(here->locks.check(LockKind::roll, 7));
}

TEST_P(LocksTest, OfRowsThatAreTheSameInEverythingOneReleaseTakesOne)
{
    for (int row = 0; row < 3; ++row)
        ASSERT_TRUE(here->locks.take(LockKind::roll_area, 7));

    here->locks.release(LockKind::roll_area, 7);

    EXPECT_EQ(here->locks.count(LockKind::roll_area), 2);
}

TEST_P(LocksTest, TakingIsRefusedWhileOneOfTheOtherLocksIsHeld)
{
    const std::vector<LockCheck> in_setup{{LockKind::area, AreaCode::setup}};
    const std::vector<LockCheck> any_family{{LockKind::family}};
    ASSERT_TRUE(here->locks.take(LockKind::area, AreaCode::setup, any_family));

    EXPECT_FALSE(there->locks.take(LockKind::family, 7, in_setup));
    here->locks.release(LockKind::area, AreaCode::setup);
    EXPECT_TRUE(there->locks.take(LockKind::family, 7, in_setup));
    EXPECT_FALSE(here->locks.take(LockKind::area, AreaCode::setup, any_family));
}

TEST_P(LocksTest, AnyProjectMeansOneWithAKeyAboveZero)
{
    session().execute(u"INSERT INTO [tbl_weekly_locked] ([weekly_locked]) VALUES (0);"_s);

    EXPECT_FALSE(here->locks.any(LockKind::weekly));
    EXPECT_EQ(here->locks.count(LockKind::weekly), 1);
}

TEST_P(LocksTest, UnlockingDeletesEveryRowOfTheLockWhoeverTookIt)
{
    ASSERT_TRUE(here->locks.take(LockKind::finance, 7));
    ASSERT_TRUE(here->locks.take(LockKind::finance, 8));
    session().execute(u"INSERT INTO [tbl_finance_locked] ([finance_locked]) VALUES (7);"_s);

    EXPECT_EQ(there->locks.unlock(LockKind::finance, 7), 2);

    EXPECT_EQ(here->locks.count(LockKind::finance), 1);
}

TEST_P(LocksTest, EveryLockIsListedInWordsThatAPersonUnderstands)
{
    session().execute(
        u"INSERT INTO [tbl_surname] ([Surname_ID],[surname],[Primary_name]) VALUES (7,'Naismith','Ann');"_s);
    session().execute(u"INSERT INTO [tbl_roll_project] ([roll_project_id],[roll_project]) VALUES (7,'Morning');"_s);
    session().execute(u"INSERT INTO [tbl_wardline_compliance] ([compliance_id],[compliance]) VALUES (7,'Youth');"_s);
    for (const auto& lock : every_kind())
        ASSERT_TRUE(here->locks.take(lock.kind, lock.key));
    ASSERT_TRUE(here->locks.take(LockKind::area, 99));

    EXPECT_EQ(words(there->locks.all()).join(u'|'),
              u"Setup area|Area 99|Family file 'Naismith, Ann'|People within the Roll area|People within the Finance "
              "area|People within the Roster area|People within the Wardline area|Roll project 'Morning'|Finance "
              "project 7|Weekly project 7|Roster project 7|Wardline compliance 'Youth'|Custom letter 'Welcome'|Custom "
              "report 'Ages'"_s);
}

TEST_P(LocksTest, AHolderIsNamedWithWorkstationAndTime)
{
    ASSERT_TRUE(here->locks.take(LockKind::family, 7));
    session().execute(u"INSERT INTO [tbl_locked_family_files] ([surname_id]) VALUES (8);"_s);
    const auto holder = there->locks.holder(LockKind::family, 7);

    ASSERT_TRUE(holder);
    EXPECT_EQ(holder->workstation, u"office-1"_s);
    EXPECT_EQ(holder->process, QCoreApplication::applicationPid());
    EXPECT_EQ(holder->since, here->clock.now());
    EXPECT_FALSE(there->locks.holder(LockKind::family, 9));

    const auto locks = there->locks.all();
    EXPECT_EQ(held_line(locks[1], DayOrder::month_first),
              u"Family file 7 is held by the workstation 'office-1' since 10:30 on 05/15/2024."_s);
    EXPECT_EQ(held_line(locks[0], DayOrder::day_first), u"Family file 8 is held."_s);
    EXPECT_EQ(held_line(here->locks.all()[1], DayOrder::day_first),
              u"Family file 7 is held by this workstation since 10:30 on 15/05/2024."_s);
}

TEST_P(LocksTest, SeveralProcessesNeverHoldOneLockTogether)
{
    const QString inside = church->folder() + u"/inside"_s;
    const auto work = [&] {
        Workplace workplace(*church, u"office-%1"_s.arg(QCoreApplication::applicationPid()));
        return tally(25, [&] {
            if (!workplace.locks.take(LockKind::weekly, 7))
                return true;
            const bool alone = alone_inside(inside) && workplace.locks.count(LockKind::weekly) == 1;
            workplace.locks.release(LockKind::weekly, 7);
            return alone;
        });
    };

    for (const auto& faults : run_together({work, work, work, work}))
        EXPECT_EQ(faults, "0");
    EXPECT_EQ(here->locks.count(LockKind::weekly), 0);
}

TEST_P(LocksTest, OfTwoLocksThatShutEachOtherOutNeverBothAreHeld)
{
    const QString inside = church->folder() + u"/inside"_s;
    const auto worker = [&](LockKind kind, LockKey key, LockCheck unless) {
        return [this, inside, kind, key, unless] {
            Workplace workplace(*church, u"office-%1"_s.arg(QCoreApplication::applicationPid()));
            return tally(25, [&] {
                if (!workplace.locks.take(kind, key, std::array{unless}))
                    return true;
                const bool alone = alone_inside(inside);
                workplace.locks.release(kind, key);
                return alone;
            });
        };
    };
    const auto setup = worker(LockKind::area, AreaCode::setup, {LockKind::family});
    const auto family = worker(LockKind::family, 7, {LockKind::area, AreaCode::setup});

    for (const auto& faults : run_together({setup, family, setup, family}))
        EXPECT_EQ(faults, "0");
}

TEST_P(LocksTest, ProcessesThatTakeReleaseAndUnlockAtOnceLeaveNothingBehind)
{
    const auto user = [&] {
        Workplace workplace(*church, u"office-%1"_s.arg(QCoreApplication::applicationPid()));
        return tally(20, [&] {
            for (const int family : {1, 2, 3}) {
                if (workplace.locks.take(LockKind::family, family))
                    workplace.locks.release(LockKind::family, family);
            }
            return true;
        });
    };
    const auto unlocker = [&] {
        Workplace workplace(*church, u"office-9"_s);
        return tally(20, [&] {
            for (const auto& lock : workplace.locks.all())
                workplace.locks.unlock(lock.kind, lock.key);
            return workplace.locks.count(LockKind::family) <= 2;
        });
    };

    for (const auto& faults : run_together({user, user, unlocker}))
        EXPECT_EQ(faults, "0");
    EXPECT_EQ(here->locks.count(LockKind::family), 0);
}

TEST_P(LocksTest, WhatAKilledProgramHeldStaysUntilItsOwnWorkstationReleasesIt)
{
    here->workstation.machine = SystemWorkstation().name();
    run_and_kill(
        [&](const Ready& ready) {
            const auto own = church->another();
            SystemWorkstation workstation;
            SystemClock clock;
            Locks locks(*own, workstation, clock);
            if (locks.take(LockKind::family, 7) && locks.take(LockKind::roll, 7))
                ready();
            for (;;)
                (void)locks.check(LockKind::family, 7);
        },
        std::chrono::milliseconds(5));
    SystemWorkstation workstation;
    SystemClock clock;
    const auto own = church->another();
    Locks locks(*own, workstation, clock);
    ASSERT_TRUE(locks.take(LockKind::weekly, 7));
    ASSERT_TRUE(there->locks.take(LockKind::finance, 7));

    EXPECT_FALSE(there->locks.take(LockKind::family, 7));
    EXPECT_EQ(there->locks.release_stale(), 0);
    EXPECT_EQ(words(locks.stale()), QStringList({u"Family file 7"_s, u"Roll project 7"_s}));
    EXPECT_EQ(locks.release_stale(), 2);
    EXPECT_EQ(words(locks.all()), QStringList({u"Finance project 7"_s, u"Weekly project 7"_s}));
}

TEST_P(LocksTest, ReleasingWhatOneLeftBehindIsOfferedAtEntry)
{
    const QString question =
        u"This workstation left locks behind when Kindrel last ended. Do you wish to release them?"_s;
    session().execute(u"INSERT INTO [tbl_roster_locked] ([roster_locked],[workstation],[process],[taken]) "
                      "VALUES (3,'office-1',4711,'2024-05-14T17:45:00.000');"_s);
    offer_stale_locks(here->office);
    here->workstation.ended = {4711};
    offer_stale_locks(there->office);

    here->dialogue.expect_confirm(question, Answer::no, here->office.shared() ? Answer::no : Answer::yes);
    offer_stale_locks(here->office);
    EXPECT_EQ(here->locks.count(LockKind::roster), 1);
    EXPECT_EQ(here->dialogue.seen().back().more,
              u"Roster project 3 is held by this workstation since 17:45 on 14/05/2024."_s);

    here->dialogue.expect_confirm(question, Answer::yes);
    offer_stale_locks(here->office);
    EXPECT_EQ(here->locks.count(LockKind::roster), 0);
}

} // namespace kindrel::test
