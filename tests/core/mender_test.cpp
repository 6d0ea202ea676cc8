#include "mender_place.h"

#include "core/locks.h"
#include "core/restore_swap.h"
#include "core/sqlite_session.h"

#include <map>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

/// A damage done by statements, the words that tell of it, and what a statement counts once it is mended.
struct RowDamage
{
    QStringList damage;
    QString kind, words, proof;
    qint64 proven;
};

const std::array row_damages{
    RowDamage{{u"DELETE FROM [tbl_address] WHERE [surname_id]=1;"_s},
              u"companions"_s,
              u"1 family without an address record."_s,
              u"SELECT COUNT(*) FROM [tbl_address];"_s,
              2},
    RowDamage{{u"DELETE FROM [tbl_personal_details] WHERE [person_id]<>10;"_s},
              u"companions"_s,
              u"2 people without a record of personal details."_s,
              u"SELECT COUNT(*) FROM [tbl_personal_details];"_s,
              3},
    RowDamage{{u"DELETE FROM [tbl_roll_setup];"_s},
              u"companions"_s,
              u"1 roll project without a setup record."_s,
              u"SELECT [roll_project_id] FROM [tbl_roll_setup];"_s,
              3},
    RowDamage{{u"DELETE FROM [tbl_startup];"_s},
              u"companions"_s,
              u"The record of the church's settings is missing."_s,
              u"SELECT [Version] FROM [tbl_startup];"_s,
              1},
    RowDamage{{u"DELETE FROM [tbl_project_position];"_s},
              u"companions"_s,
              u"The record of the projects chosen last is missing."_s,
              u"SELECT COUNT(*) FROM [tbl_project_position];"_s,
              1},
    RowDamage{{u"DELETE FROM [tbl_surname] WHERE [Surname_ID]=1;"_s},
              u"orphans"_s,
              u"2 entries in 'people' of a family that is missing."_s,
              u"SELECT COUNT(*) FROM [tbl_people] WHERE [Surname_ID] IN (SELECT [Surname_ID] FROM [tbl_surname]);"_s,
              3},
    RowDamage{{u"DELETE FROM [tbl_group_setup] WHERE [group_id]=5;"_s},
              u"orphans"_s,
              u"2 entries in 'group memberships' of a group that is missing."_s,
              u"SELECT [position] FROM [tbl_group_setup] WHERE [group]='Recovered group 5';"_s,
              3},
    RowDamage{{u"DELETE FROM [tbl_finance_project];"_s},
              u"orphans"_s,
              u"1 entry in 'finance date' of a finance project that is missing."_s,
              u"SELECT [Data] FROM [tbl_finance_data];"_s,
              50000},
    RowDamage{{u"INSERT INTO [tbl_group] ([person_id],[group_id]) VALUES (77,6);"_s},
              u"orphans"_s,
              u"1 entry in 'group memberships' without an owner: what stood in 'people' is gone."_s,
              u"SELECT COUNT(*) FROM [tbl_group];"_s,
              3},
    RowDamage{{u"INSERT INTO [tbl_roll_attendance] ([roll_date_id],[person_id],[Attendance]) VALUES (99,10,192);"_s},
              u"orphans"_s,
              u"1 entry in 'roll attendance' without an owner: what stood in 'roll date' is gone."_s,
              u"SELECT COUNT(*) FROM [tbl_roll_attendance];"_s,
              1},
    RowDamage{{u"UPDATE [tbl_people] SET [position]=5 WHERE [person_id]=11;"_s},
              u"positions"_s,
              u"The people of 1 family are not numbered from 1 without gaps and doubles."_s,
              u"SELECT [position] FROM [tbl_people] WHERE [person_id]=11;"_s,
              2},
    RowDamage{{u"UPDATE [tbl_people] SET [position]=1;"_s},
              u"positions"_s,
              u"The people of 1 family are not numbered from 1 without gaps and doubles."_s,
              u"SELECT [position] FROM [tbl_people] WHERE [person_id]=11;"_s,
              2},
    RowDamage{{u"UPDATE [tbl_group_setup] SET [position]=2;"_s},
              u"positions"_s,
              u"Two entries of the list 'group setup' stand at one place."_s,
              u"SELECT COUNT(DISTINCT [position]) FROM [tbl_group_setup];"_s,
              2},
    RowDamage{{u"DELETE FROM [tbl_id_person];"_s},
              u"counters"_s,
              u"The key counter of 'person' is behind: new entries would get keys that are in use."_s,
              u"SELECT MAX([id_found]) FROM [tbl_id_person];"_s,
              900},
};

} // namespace

class MenderTest : public MenderPlaceTest
{
protected:
    /// Damages, finds, mends and looks again.
    void expect_mended(const QString& kind, const QString& words)
    {
        const auto found = examine();
        const auto wanted = std::ranges::find(found, words, &Finding::words);
        ASSERT_NE(wanted, found.end()) << told(found);
        EXPECT_EQ(wanted->kind, kind);
        EXPECT_EQ(wanted->cure, Cure::mend);
        EXPECT_FALSE(wanted->remedy.isEmpty());
        const auto mending = mend_church(*place, {});
        EXPECT_EQ(mending.refusal, QString());
        EXPECT_TRUE(mending.left.empty()) << told(mending.left);
        EXPECT_EQ(mending.mended.size(), found.size());
    }
};
KINDREL_ON_BOTH_ENGINES(MenderTest);

TEST_P(MenderTest, ASoundChurchHasNoFindingsAndMendingItWritesNothing)
{
    EXPECT_TRUE(examine().empty()) << told(examine());
    EXPECT_EQ(mend_church(*place, {}).copy, QString());
    EXPECT_TRUE(mended_files().isEmpty());
}

TEST_P(MenderTest, EveryDamageOfRowsIsFoundToldMendedAndGone)
{
    for (const auto& [damage, kind, words, proof, proven] : row_damages) {
        SCOPED_TRACE(damage.first().toStdString());
        run(damage);
        expect_mended(kind, words);
        EXPECT_EQ(number_of(session(), proof), proven);
    }
}

TEST_P(MenderTest, TheCopyHoldsTheChurchAsItWasBefore)
{
    run({u"DELETE FROM [tbl_people] WHERE [person_id]=10;"_s,
         u"UPDATE [tbl_people] SET [position]=9 WHERE [person_id]=20;"_s});
    const auto mending = mend_church(*place, {});
    const auto copy = open_sqlite(mending.copy);
    EXPECT_EQ(number_of(*copy, u"SELECT COUNT(*) FROM [tbl_group] WHERE [person_id]=10;"_s), 1);
    EXPECT_EQ(number_of(*copy, u"SELECT [position] FROM [tbl_people] WHERE [person_id]=20;"_s), 9);
    EXPECT_EQ(mended_files(), QStringList{u"KR10_records before mending 2024-05-15 103000.kdl"_s});
}

TEST_P(MenderTest, WhatHangsOnALostTableStays)
{
    const QStringList hanging{u"tbl_group"_s, u"tbl_personal_details"_s, u"tbl_address"_s, u"tbl_roll_attendance"_s,
                              u"tbl_finance_data"_s};
    const QString drop = GetParam() == EngineKind::sqlite ? u"DROP TABLE [%1];"_s : u"DROP TABLE [%1] CASCADE;"_s;
    std::map<QString, qint64> before;
    for (const auto& table : hanging)
        before[table] = number_of(session(), u"SELECT COUNT(*) FROM [%1];"_s.arg(table));
    int lost = 0;
    for (const auto& table : {u"tbl_roll_date"_s, u"tbl_finance_date"_s, u"tbl_people"_s, u"tbl_surname"_s}) {
        ++lost;
        for (const auto& damage : {u"DELETE FROM [%1];"_s, drop}) {
            run({damage.arg(table), u"INSERT INTO [tbl_locked_family_files] ([surname_id]) VALUES (1);"_s});
            EXPECT_EQ(mend_church(*place, {}).refusal.isEmpty(), damage != drop);
            EXPECT_EQ(unlock_church(*place).size(), 1);
            const auto mending = mend_church(*place, {});
            EXPECT_EQ(std::ranges::count(mending.left, u"lost_table"_s, &Finding::kind), lost) << told(mending.left);
            EXPECT_EQ(std::ranges::count(mending.left, Cure::by_hand, &Finding::cure), lost) << told(mending.left);
            for (const auto& [name, rows] : before)
                EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [%1];"_s.arg(name)), rows)
                    << name.toStdString() << " after " << damage.arg(table).toStdString();
        }
    }
}

TEST_P(MenderTest, ATableThatLostMostOfItsRowsTakesNothingAlong)
{
    run({u"DELETE FROM [tbl_people] WHERE [person_id]<>20;"_s});
    const auto mending = mend_church(*place, {});
    ASSERT_EQ(mending.left.size(), 1U) << told(mending.left);
    EXPECT_EQ(mending.left.front().words,
              u"Most of 'people' is gone: other entries speak of 2 that are missing, and 1 is left."_s);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_group];"_s), 3);
}

TEST_P(MenderTest, WhatOneTableTellsOfALostTableHoldsForAll)
{
    run({u"INSERT INTO [tbl_people] ([person_id],[Surname_ID],[Name],[position]) VALUES (21,2,'Dan',2),(22,2,'Eve',3);"_s,
         u"INSERT INTO [tbl_group] ([person_id],[group_id]) VALUES (101,5),(102,5),(103,5),(104,5),(105,5),(106,5);"_s,
         u"INSERT INTO [tbl_roll_attendance] ([roll_date_id],[person_id],[Attendance]) VALUES (7,101,192);"_s});
    const auto mending = mend_church(*place, {});
    ASSERT_EQ(mending.left.size(), 1U) << told(mending.left);
    EXPECT_EQ(mending.left.front().words,
              u"Most of 'people' is gone: other entries speak of 6 that are missing, and 5 are left."_s);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_group];"_s), 9);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_roll_attendance];"_s), 2) << "Not even the few.";
}

TEST_P(MenderTest, WithoutALockTableNobodyKnowsWhoIsInsideUntilTheChurchIsUnlocked)
{
    run({u"DROP TABLE [tbl_locked_area];"_s, u"DELETE FROM [tbl_address];"_s});
    const auto found = examine();
    EXPECT_EQ(std::ranges::count(found, Cure::unlock, &Finding::cure), 1) << told(found);
    EXPECT_TRUE(mend_church(*place, {}).refusal.startsWith(u"It cannot be told whether somebody is working"));
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_address];"_s), 0);

    (void)unlock_church(*place);
    EXPECT_EQ(mend_church(*place, {}).refusal, QString());
    EXPECT_TRUE(examine().empty()) << told(examine());
}

TEST_P(MenderTest, TheLocksAreLookedAtBehindTheMarkerThatKeepsOthersOut)
{
    struct Watching : FakeWorkstation
    {
        [[nodiscard]] bool process_runs(qint64) const override
        {
            behind_marker = behind_marker || QFile::exists(marker);
            return false;
        }
        QString marker;
        mutable bool behind_marker = false;
    } watching;
    watching.marker = in_church(u"lock.dat"_s);
    MenderPlace watched{.paths = *paths, .workstation = watching, .clock = clock, .session = church->another()};
    ASSERT_TRUE(Locks(session(), watching, clock).take(LockKind::family, 1));
    run({u"DELETE FROM [tbl_address];"_s});
    EXPECT_EQ(mend_church(watched, {}).refusal, QString());
    EXPECT_TRUE(watching.behind_marker);
}

TEST_P(MenderTest, WhoMayBeInsideKeepsTheMenderOutUntilTheChurchIsUnlocked)
{
    FakeWorkstation other;
    other.machine = u"office-2"_s;
    ASSERT_TRUE(Locks(session(), other, clock).take(LockKind::family, 1));
    run({u"DELETE FROM [tbl_address];"_s});

    const auto refused = mend_church(*place, {});
    EXPECT_TRUE(refused.refusal.contains(u"is held by the workstation 'office-2'")) << refused.refusal.toStdString();
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_address];"_s), 0);

    EXPECT_EQ(unlock_church(*place).size(), 1);
    EXPECT_EQ(mend_church(*place, {}).refusal, QString());
    EXPECT_TRUE(examine().empty()) << told(examine());
}

TEST_P(MenderTest, MarkersKeepTheMenderOutUntilTheChurchIsUnlocked)
{
    DataFolder::write(in_church(u"lock.dat"_s), "1234567890");
    DataFolder::write(in_church(u"security.dat"_s), "1234567890");
    run({u"DELETE FROM [tbl_address];"_s});
    const auto found = examine();
    EXPECT_EQ(std::ranges::count(found, Cure::unlock, &Finding::cure), 2) << told(found);
    EXPECT_TRUE(mend_church(*place, {}).refusal.contains(u"'lock.dat'"));

    EXPECT_EQ(unlock_church(*place), (QStringList{u"The marker 'lock.dat'"_s, u"The marker 'security.dat'"_s}));
    EXPECT_TRUE(mend_church(*place, {}).left.empty());
    EXPECT_FALSE(QFile::exists(in_church(u"lock.dat"_s)));
}

TEST_P(MenderTest, LocksThatOthersLeftAreToldAndThoseOfARunningProgramHereAreNot)
{
    FakeWorkstation other;
    other.machine = u"office-2"_s;
    ASSERT_TRUE(Locks(session(), workstation, clock).take(LockKind::family, 1));
    EXPECT_TRUE(examine().empty()) << told(examine());
    ASSERT_TRUE(Locks(session(), other, clock).take(LockKind::roll, 3));
    const auto found = examine();
    ASSERT_EQ(found.size(), 1U) << told(found);
    EXPECT_EQ(found.front().cure, Cure::unlock);
    EXPECT_TRUE(found.front().words.startsWith(u"Roll project 'Morning'"));
}

TEST_P(MenderTest, TwoPeopleWithOneGivingNumberAreLeftToAPerson)
{
    run({u"DROP INDEX [idx_pin_number];"_s,
         u"INSERT INTO [tbl_pin] ([person_id],[personal_pin]) VALUES (10,'104'),(11,'104');"_s});
    const auto mending = mend_church(*place, {});
    EXPECT_EQ(mending.refusal.isEmpty(), GetParam() == EngineKind::sqlite); // A server church could not be copied.
    const auto found = examine();
    const auto left = std::ranges::find(found, u"doubles"_s, &Finding::kind);
    ASSERT_NE(left, found.end());
    EXPECT_EQ(left->cure, Cure::by_hand);
    EXPECT_EQ(left->words,
              u"1 entry in 'giving numbers' is there more than once with different content (the first: 104)."_s);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_pin];"_s), 2);
}

TEST_P(MenderTest, ADatabaseOfAnotherVersionIsLeftAlone)
{
    run({u"UPDATE [tbl_startup] SET [Version]=9;"_s, u"DELETE FROM [tbl_address];"_s});
    EXPECT_TRUE(mend_church(*place, {}).refusal.contains(u"another version"));
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_address];"_s), 0);
}

TEST_P(MenderTest, SideFilesKeepWhatCanBeReadOfThem)
{
    const QString names = paths->folder(Folder::global) + u"Church_S.Dat"_s;
    DataFolder::write(names, "Saint Anne's         Chapel");
    DataFolder::write(in_church(u"loaded.dat"_s), {});
    EXPECT_EQ(examine().size(), 2U) << told(examine());
    EXPECT_TRUE(mend_church(*place, {}).left.empty());
    EXPECT_EQ(DataFolder::read(names).size(), 140);
    EXPECT_TRUE(DataFolder::read(names).startsWith("Saint Anne's        "));
    EXPECT_FALSE(DataFolder::read(names).contains("Chapel"));
    EXPECT_EQ(DataFolder::read(in_church(u"mended/Church_S.Dat"_s)), "Saint Anne's         Chapel");
}

TEST_P(MenderTest, AFileThatCannotBeMendedIsLeftAndWhatWasMendedIsToldWithTheCopy)
{
    static const QString unable = u"The disk is full."_s;
    const Check failing{Check::On::files, [](MenderPlace&) { return Findings{}; },
                        [](MenderPlace&) {
                            throw FileError(unable);
                        }};
    run({u"DELETE FROM [tbl_address];"_s});
    const auto mending = mend_church(*place, {&failing, 1});
    EXPECT_TRUE(QFile::exists(mending.copy));
    ASSERT_EQ(mending.mended.size(), 1U) << told(mending.mended);
    EXPECT_EQ(mending.mended.front().words, u"2 families without an address record."_s);
    ASSERT_EQ(mending.left.size(), 1U) << told(mending.left);
    EXPECT_EQ(mending.left.front().words, unable);
    EXPECT_EQ(mending.left.front().cure, Cure::by_hand);
}

TEST_P(MenderTest, TryingAgainToMendAFileThatMayNotBeWrittenLeavesNoHeapOfCopies)
{
    const QString names = paths->folder(Folder::global) + u"Church_S.Dat"_s;
    ASSERT_TRUE(QFile::link(u"/proc/version"_s, names)); // Which nobody may write.
    DataFolder::write(in_church(u"loaded.dat"_s), {});
    for (int attempt = 1; attempt <= 2; ++attempt) {
        const auto left = mend_church(*place, {}).left;
        EXPECT_EQ(std::ranges::count(left, u"side_files"_s, &Finding::kind), 1) << told(left);
        EXPECT_EQ(std::ranges::count(left, Cure::by_hand, &Finding::cure), 1) << told(left);
        EXPECT_EQ(mended_files().filter(u"Church_S"_s), QStringList());
    }
    EXPECT_EQ(mended_files().filter(u"loaded"_s), QStringList{u"loaded.dat"_s}) << "The others are mended.";
}

TEST_P(MenderTest, WhatTheSchemaLacksIsMadeAgain)
{
    struct Damage
    {
        QString statement, words;
    };
    for (const auto& [statement, words] : {
             Damage{u"DROP INDEX [idx_people_family];"_s, u"The index 'idx_people_family' is missing."_s},
             Damage{u"DROP VIEW [qry_search_window];"_s, u"The stored query 'qry_search_window' is missing."_s},
             Damage{u"DROP TABLE [tbl_filter_memory];"_s, u"The table 'tbl_filter_memory' is missing."_s},
         }) {
        run({statement});
        const auto found = examine();
        EXPECT_EQ(std::ranges::count(found, words, &Finding::words), 1) << told(found);
        EXPECT_TRUE(mend_church(*place, {}).left.empty()) << words.toStdString();
    }
}

TEST_P(MenderTest, ARestoreThatWasCutOffIsTakenBack)
{
    const QString portrait = in_church(u"Portrait/10.jpg"_s);
    DataFolder::write(portrait, "old");
    {
        RestoreWork work(place->paths);
        DataFolder::write(work.unpacked() + u"church/Portrait/10.jpg"_s, "fresh");
        work.swap({{u"unpacked/church/Portrait/"_s, Folder::portrait, {}}});
    }
    ASSERT_EQ(DataFolder::read(portrait), "fresh");
    ASSERT_EQ(examine().size(), 1U) << told(examine());
    EXPECT_EQ(examine().front().words, u"A restore was cut off."_s);
    EXPECT_TRUE(mend_church(*place, {}).left.empty());
    EXPECT_EQ(DataFolder::read(portrait), "old");
}

TEST_P(MenderTest, ARestoreThatIsStillRunningIsNotUnlocked)
{
    const QString portrait = in_church(u"Portrait/10.jpg"_s);
    DataFolder::write(portrait, "old");
    DataFolder::write(in_church(u"lock.dat"_s), "1234567890");
    RestoreWork work(place->paths);
    for (const bool exchanged : {false, true}) {
        if (exchanged) {
            DataFolder::write(work.unpacked() + u"church/Portrait/10.jpg"_s, "fresh");
            work.swap({{u"unpacked/church/Portrait/"_s, Folder::portrait, {}}});
        }
        EXPECT_THROW(unlock_church(*place), FileError);
        EXPECT_EQ(DataFolder::read(portrait), exchanged ? "fresh" : "old");
        EXPECT_TRUE(QFile::exists(in_church(u"lock.dat"_s)));
        EXPECT_TRUE(restore_unsettled(place->paths));
    }
    work.settle(*place->session);
    EXPECT_EQ(DataFolder::read(portrait), "old");
}

TEST_P(MenderTest, ARestoreWhoseRecordIsDamagedIsSetAsideAndTold)
{
    for (const bool mending : {true, false}) {
        DataFolder::write(in_church(u"restore_work/journal.json"_s), "{");
        DataFolder::write(in_church(u"restore_work/kept/0"_s), "the church's own");
        const auto told_of = mending ? mend_church(*place, {}).left.front().words : unlock_church(*place).value(0);
        EXPECT_TRUE(told_of.contains(u"cannot be told how far")) << told_of.toStdString();
        EXPECT_TRUE(examine().empty()) << told(examine());
        const QString aside = mending ? u"mended/restore_work"_s : u"mended/restore_work (2)"_s;
        EXPECT_EQ(DataFolder::read(in_church(aside + u"/kept/0"_s)), "the church's own");
    }
}

TEST_P(MenderTest, TheFolderOfWhatWasMendedIsForOwnerAndGroupAlone)
{
    const auto others = QFile::ReadOther | QFile::WriteOther | QFile::ExeOther;
    const auto open_to_all = QFile::ReadOwner | QFile::WriteOwner | QFile::ReadOther;
    const QStringList files{in_church(u"compact/KR10_records.kdl.unfinished"_s),
                            paths->folder(Folder::global) + u"Church_S.Dat"_s};
    for (const auto& file : files) {
        DataFolder::write(file, "half");
        QFile::setPermissions(file, open_to_all);
    }
    EXPECT_TRUE(mend_church(*place, {}).left.empty());
    EXPECT_FALSE(QFile::permissions(in_church(u"mended"_s)) & others);
    EXPECT_EQ(mended_files().size(), 3) << mended_files().join(u' ').toStdString();
    for (const auto& file : mended_files())
        EXPECT_FALSE(QFile::permissions(in_church(u"mended/"_s + file)) & others) << file.toStdString();
}

TEST_P(MenderTest, LeftoversOfWorkThatWasCutOffAreSetAside)
{
    const QStringList left{u"compact/KR10_records.kdl.unfinished"_s, u"Backup1/systembackup.new"_s,
                           u"Portrait/7.jpg.unfinished"_s, u"mended/KR10_records before.kdl.unfinished"_s};
    for (const auto& file : left)
        DataFolder::write(in_church(file), "half");
    DataFolder::write(in_church(u"Backup1/systembackup.kdl"_s), "whole");
    ASSERT_EQ(examine().size(), 1U) << told(examine());
    EXPECT_EQ(examine().front().count, 4);
    const auto mending = mend_church(*place, {});
    EXPECT_TRUE(mending.left.empty()) << told(mending.left);
    for (const auto& file : left)
        EXPECT_FALSE(QFile::exists(in_church(file))) << file.toStdString();
    EXPECT_TRUE(QFile::exists(in_church(u"Backup1/systembackup.kdl"_s)));
    EXPECT_TRUE(QFile::exists(in_church(u"mended/7.jpg unfinished"_s)));
}

} // namespace kindrel::test
