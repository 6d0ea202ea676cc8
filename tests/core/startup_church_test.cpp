#include "core/compaction.h"
#include "core/open_church.h"
#include "core/schema.h"
#include "core/sqlite_session.h"
#include "core/startup_steps.h"
#include "core/verified_copy.h"
#include "support/data_folder.h"
#include "support/processes.h"
#include "support/test_church.h"

#include <QDir>
#include <QFile>

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

const QString count_statement = u"SELECT [compact_count] FROM [tbl_startup];"_s;

}

class StartupChurchTest : public testing::Test, protected TestStart
{
protected:
    void compact_every(int starts)
    {
        SideRecord record(side_files::common);
        record.set_number("starts_between_compactions", starts);
        write_side_file(data.paths(), record);
    }
    QString church = data.root() + u"church1/"_s;
};

TEST_F(StartupChurchTest, EveryStartIsCountedAtOnce)
{
    for (int expected = 1; expected <= 3; ++expected) {
        const auto office = start();
        ASSERT_TRUE(office);
        EXPECT_EQ(office->settings.compact_count, expected);
        EXPECT_EQ(number_of(*open_sqlite(office->paths.database()), count_statement), expected);
    }
}

TEST_F(StartupChurchTest, ARefusedStartIsNotCounted)
{
    in_database(u"UPDATE [tbl_startup] SET [Version]=0;"_s);
    dialogue.expect_box(
        u"Please Note - You are trying to load a database that was created in a previous version. Please use "
        "the conversion program to convert your data files."_s);

    EXPECT_FALSE(start());

    EXPECT_EQ(number_of(*open_sqlite(church + u"KR10_records.kdl"_s), count_statement), 0);
}

TEST_F(StartupChurchTest, TheSettingsAreThoseOfTheOneRow)
{
    in_database(u"UPDATE [tbl_startup] SET [American_date]=-1, [vision]='To serve', [search_position]=3;"_s);

    const auto office = start();

    ASSERT_TRUE(office);
    EXPECT_EQ(office->day_order(), DayOrder::month_first);
    EXPECT_EQ(office->settings.vision, u"To serve"_s);
    EXPECT_EQ(office->settings.search_position, 3);
    EXPECT_TRUE(office->may(Area::security));
    EXPECT_FALSE(office->may(Area::read_only_family_data)) << "What restricts is not granted by having no security.";
}

TEST_F(StartupChurchTest, OneSettingIsWrittenWithoutTouchingTheOthers)
{
    const auto office = start();
    office->session->execute(u"UPDATE [tbl_startup] SET [vision]='of another workstation';"_s);

    write_setting(*office->session, u"Security"_s, true);

    const Settings settings = read_settings(*office->session);
    EXPECT_TRUE(settings.Security);
    EXPECT_EQ(settings.vision, u"of another workstation"_s);
}

TEST_F(StartupChurchTest, TheDatabaseIsCompactedAtTheIntervalAndTheOldContentKept)
{
    compact_every(2);
    ASSERT_TRUE(start());
    in_database(u"CREATE TABLE [ballast] ([content] TEXT);"_s);
    in_database(u"INSERT INTO [ballast] ([content]) VALUES ('%1');"_s.arg(QString(500'000, u'x')));
    in_database(u"DROP TABLE [ballast];"_s);
    const qint64 before = QFile(church + u"KR10_records.kdl"_s).size();

    const auto office = start();

    ASSERT_TRUE(office);
    EXPECT_LT(QFile(church + u"KR10_records.kdl"_s).size(), before - 400'000);
    EXPECT_EQ(QFile(church + u"compact/KR10_records.kdl"_s).size(), before);
    EXPECT_EQ(number_of(*open_sqlite(church + u"compact/KR10_records.kdl"_s), count_statement), 2);
    EXPECT_EQ(number_of(*office->session, count_statement), 0);
    EXPECT_EQ(office->settings.compact_count, 0);
    EXPECT_FALSE(QFile::exists(church + u"lock.dat"_s));
    EXPECT_EQ(start()->settings.compact_count, 1);
}

TEST_F(StartupChurchTest, AnIntervalOfZeroNeverCompacts)
{
    compact_every(0);
    in_database(u"UPDATE [tbl_startup] SET [compact_count]=5000;"_s);

    EXPECT_EQ(start()->settings.compact_count, 5001);
}

TEST_F(StartupChurchTest, TooLittleSpaceLeavesOutTheCompactionAndTheStartGoesOn)
{
    const QString low =
        u"Your hard disk space is getting low. You need to have at least 40 Meg free before the compacting "
        "function will work, please exit Kindrel and make free some disk space."_s;
    compact_every(1);
    workstation.free = 3'999'999;
    dialogue.expect_box(low);
    const auto office = start();
    ASSERT_TRUE(office);
    EXPECT_EQ(number_of(*office->session, count_statement), 1);
    EXPECT_FALSE(QFile::exists(church + u"lock.dat"_s));

    for (const qint64 free : {qint64{4'000'000}, (qint64{1} << 32) + 1}) {
        workstation.free = free;
        EXPECT_EQ(start()->settings.compact_count, 0) << free;
    }
}

TEST_F(StartupChurchTest, ACompactionThatFailsIsToldAndLeavesTheChurchOpen)
{
    compact_every(1);
    ASSERT_TRUE(QDir(church + u"compact"_s).removeRecursively());
    DataFolder::write(church + u"compact"_s, "a file in the folder's place");
    dialogue.expect_box(u"Kindrel was unable to compact the database, your data is as it was before."_s);

    const auto office = start();

    ASSERT_TRUE(office);
    EXPECT_EQ(number_of(*office->session, count_statement), 1);
    EXPECT_FALSE(QFile::exists(church + u"lock.dat"_s));
}

TEST_F(StartupChurchTest, CompactionKeepsTheNewestThousandEntriesOfEachLog)
{
    compact_every(1);
    DataFolder::make_church(church);
    {
        const auto session = open_sqlite(church + u"KR10_records.kdl"_s);
        std::vector<std::vector<Value>> rows;
        for (int second = 0; second < 1200; ++second)
            rows.push_back({qint64{second}, QDateTime({2024, 1, 1}, {0, 0}).addSecs(second).toString(Qt::ISODate)});
        session->insert(u"tbl_security_archive"_s, {u"user_id"_s, u"entered"_s}, rows);
        rows.resize(900);
        session->insert(u"tbl_wardline_security_archive"_s, {u"security_id"_s, u"entered"_s}, rows);
    }

    const auto office = start();

    EXPECT_EQ(number_of(*office->session, u"SELECT COUNT(*) FROM [tbl_security_archive];"_s), 1000);
    EXPECT_EQ(number_of(*office->session, u"SELECT MIN([user_id]) FROM [tbl_security_archive];"_s), 200);
    EXPECT_EQ(number_of(*office->session, u"SELECT COUNT(*) FROM [tbl_wardline_security_archive];"_s), 900);
}

TEST_F(StartupChurchTest, AWorkstationThatIsInsideGoesOnAfterTheCompaction)
{
    DataFolder::make_church(church);
    const auto inside = open_sqlite(church + u"KR10_records.kdl"_s);
    const Settings before = read_settings(*inside);
    compact_every(1);

    const auto office = start();

    write_setting(*inside, u"vision"_s, u"To serve"_s);
    EXPECT_EQ(before.vision, QString());
    EXPECT_EQ(read_settings(*office->session).vision, u"To serve"_s);
}

TEST_F(StartupChurchTest, AKillDuringCompactionLeavesTheChurchWhole)
{
    DataFolder::make_church(church);
    in_database(u"UPDATE [tbl_startup] SET [vision]='%1';"_s.arg(QString(200'000, u'v')));
    const auto compact_for_ever = [this](const Ready& ready) {
        const auto office = start({.purpose = Purpose::command_line});
        ready();
        for (;;)
            compact_held_church(*office);
    };
    for (int after = 0; after < 40'000; after += 4'000) {
        run_and_kill(compact_for_ever, std::chrono::microseconds(after));

        check_church_file(church + u"KR10_records.kdl"_s);
        EXPECT_EQ(read_settings(*open_sqlite(church + u"KR10_records.kdl"_s)).vision.size(), 200'000) << after;
    }
}

class UpgradeTest : public StartupChurchTest
{
protected:
    bool bring_to(int version, std::span<const Upgrade> chain)
    {
        startup_steps::State state{.request = request, .progress = progress, .office = *office};
        return startup_steps::bring_to_version(state, version, chain);
    }
    StartRequest request;
    std::unique_ptr<Office> office = start();
    QString copy = church + u"KR10_records_version_%1.kdl"_s.arg(schema_version);
};

TEST_F(UpgradeTest, AnOlderChurchRunsThroughAllUpgradesWithAVerifiedCopyKept)
{
    const Upgrade chain[]{{schema_version + 1, "CREATE TABLE [tbl_new] ([first] INTEGER) STRICT;\n"},
                          {schema_version + 2, "INSERT INTO [tbl_new] ([first]) VALUES (7);\n"}};

    EXPECT_TRUE(bring_to(schema_version + 2, chain));

    EXPECT_EQ(number_of(*office->session, u"SELECT [first] FROM [tbl_new];"_s), 7);
    EXPECT_EQ(read_version(*office->session), schema_version + 2);
    EXPECT_EQ(read_version(*open_sqlite(copy)), schema_version);
    EXPECT_FALSE(QFile::exists(church + u"lock.dat"_s));
}

TEST_F(UpgradeTest, AFailingUpgradeLeavesNothingHalfDone)
{
    const Upgrade chain[]{{schema_version + 1, "CREATE TABLE [tbl_new] ([first] INTEGER) STRICT;\n"},
                          {schema_version + 2, "INSERT INTO [tbl_absent] ([first]) VALUES (7);\n"}};
    dialogue.expect_box(
        u"Kindrel was unable to upgrade your data files, they are as they were before. Kindrel is now going "
        "to shut down."_s);

    EXPECT_FALSE(bring_to(schema_version + 2, chain));

    EXPECT_EQ(read_version(*office->session), schema_version);
    EXPECT_THROW((void)office->session->select(u"SELECT * FROM [tbl_new];"_s), DatabaseError);
    EXPECT_FALSE(QFile::exists(church + u"lock.dat"_s));
}

TEST_F(UpgradeTest, AChainWithAGapIsNotBegun)
{
    const Upgrade chain[]{{schema_version + 2, "CREATE TABLE [tbl_new] ([first] INTEGER) STRICT;\n"}};
    dialogue.expect_box(
        u"Please Note - You are trying to load a database that was created in a previous version. Please use "
        "the conversion program to convert your data files."_s);

    EXPECT_FALSE(bring_to(schema_version + 2, chain));

    EXPECT_FALSE(QFile::exists(copy));
}

TEST_F(UpgradeTest, ABusyChurchIsNotUpgraded)
{
    const Upgrade chain[]{{schema_version + 1, "CREATE TABLE [tbl_new] ([first] INTEGER) STRICT;\n"}};
    DataFolder::write(church + u"lock.dat"_s, "1234567890");
    dialogue.expect_box(u"Unable to Enter Kindrel"_s);

    EXPECT_FALSE(bring_to(schema_version + 1, chain));

    EXPECT_EQ(read_version(*office->session), schema_version);
}

TEST_F(UpgradeTest, TheProgramsOwnUpgradesLeadToItsVersion)
{
    EXPECT_TRUE(schema_version == 1 || leads(upgrades(), 1, schema_version));
    EXPECT_EQ(read_version(*office->session), schema_version);
}

class CompanionRowsTest : public EngineTest
{
};
KINDREL_ON_BOTH_ENGINES(CompanionRowsTest);

TEST_P(CompanionRowsTest, MissingRowsAreAddedOnceAndHoldOnlyTheKey)
{
    ensure_companion_rows(session(), 7, 3);
    ensure_companion_rows(session(), 7, 3);
    ensure_companion_rows(session(), 0, 4);
    ensure_companion_rows(session(), 8, 0);

    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_personal_details];"_s), 2);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_address];"_s), 2);
    EXPECT_EQ(number_of(session(), u"SELECT SUM([surname_id]) FROM [tbl_address];"_s), 7);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_personal_details] WHERE [person_id] IN (7,8);"_s), 2);
}

TEST_P(CompanionRowsTest, ACopyIsKeptOnlyWhenItIsSound)
{
    const QTemporaryDir folder;
    const QString file = folder.filePath(u"copy.kdl"_s);
    DataFolder::write(file, "an older copy");

    verified_copy(session(), file);

    EXPECT_EQ(read_version(*open_sqlite(file)), schema_version);
    session().execute(u"DELETE FROM [tbl_startup];"_s);
    const QByteArray kept = DataFolder::read(file);
    EXPECT_THROW(verified_copy(session(), file), DatabaseError);
    EXPECT_EQ(DataFolder::read(file), kept);
    EXPECT_EQ(QDir(folder.path()).entryList(QDir::Files), QStringList(u"copy.kdl"_s));
}

} // namespace kindrel::test
