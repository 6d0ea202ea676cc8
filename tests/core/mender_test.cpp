#include "mender_place.h"

#include "core/locks.h"
#include "core/restore_swap.h"
#include "core/sqlite_session.h"

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
    RowDamage{{u"DELETE FROM [tbl_roll_date];"_s},
              u"orphans"_s,
              u"1 entry in 'roll attendance' without an owner: what stood in 'roll date' is gone."_s,
              u"SELECT COUNT(*) FROM [tbl_roll_attendance];"_s,
              0},
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
    run({u"DELETE FROM [tbl_roll_date];"_s, u"UPDATE [tbl_people] SET [position]=9 WHERE [person_id]=20;"_s});
    const auto mending = mend_church(*place, {});
    const auto copy = open_sqlite(mending.copy);
    EXPECT_EQ(number_of(*copy, u"SELECT COUNT(*) FROM [tbl_roll_attendance];"_s), 1);
    EXPECT_EQ(number_of(*copy, u"SELECT [position] FROM [tbl_people] WHERE [person_id]=20;"_s), 9);
    EXPECT_EQ(mended_files(), QStringList{u"KR10_records before mending 2024-05-15 103000.kdl"_s});
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
