#include "core/startup.h"

#include "core/open_church.h"
#include "core/schema.h"
#include "core/sqlite_session.h"
#include "core/system_workstation.h"
#include "support/data_folder.h"
#include "support/test_church.h"

#include <QDir>
#include <QFile>

#include <gtest/gtest.h>

#include <functional>

#include <unistd.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

const QString connect_sentence =
    u"Unable to connect to the family database file, this could have occurred if the database file has become "
    "corrupted, "
    "(use the Kindrel Mender utility that came with Kindrel to fix this) or the database file has been deleted, or "
    "another program has locked you out of the database file, if this is so try rebooting your computer. Kindrel is "
    "now "
    "going to shut down."_s;
const QString older_database =
    u"Please Note - You are trying to load a database that was created in a previous version. Please use the "
    "conversion "
    "program to convert your data files."_s;

/// A fault that ends the program.
struct Fault
{
    const char* name;
    std::function<void(TestStart&)> bring_about;
    QString text;
    std::optional<QString> more = {};
    QString caption = u"Caution"_s;
};

/// In the order in which start-up looks for them.
const std::vector<Fault>& faults()
{
    static const std::vector<Fault> all{
        {"the data folder is gone",
         [](TestStart& start) { QDir(start.data.root() + u"Local_settings"_s).removeRecursively(); },
         u"Kindrel is unable to establish connection to its data folder at '%1Kindrel_10_Data' Please confirm this "
         "folder "
         "has not been removed from your computer, if it has then Kindrel will require to be installed again."_s},
        {"another copy runs", [](TestStart& start) { start.workstation.first_copy = false; },
         u"Only one instance of Kindrel is permitted to run on a workstation. Kindrel is a complete network solution "
         "where "
         "many computers can run Kindrel at the same time."_s,
         QString(), u"System Information"_s},
        {"dates are written with dots", [](TestStart& start) { start.workstation.pattern = u"dd.MM.yyyy"_s; },
         u"Currently you have Windows date configured to have a separator other than a forward slash, for example "
         "you have "
         "DD.MM.YYYY or DD-MM-YYYY, you need to configure your date separator to have DD/MM/YYYYY (forward slash) for "
         "Kindrel to correctly work. Kindrel is now going to shut down. After you have changed the Windows setting "
         "to a "
         "slash separator you will need to reboot Windows."_s},
        {"the network settings are damaged",
         [](TestStart& start) { DataFolder::write(start.data.root() + u"Local_settings/network.dat"_s, "x"); },
         u"The settings file 'network.dat' is damaged: it holds 1 bytes instead of 202."_s,
         u"Kindrel is now going to shut down."_s},
        {"no database and no master",
         [](TestStart& start) {
             QFile::remove(start.data.root() + u"church1/KR10_records.kdl"_s);
             QFile::remove(start.data.program() + u"master/KR10_records.kdl"_s);
         },
         u"Unable to access your master database file because it is missing from your system, please reload Kindrel "
         "again "
         "from the installation CD to recover the master database file."_s},
        {"the church is busy",
         [](TestStart& start) { DataFolder::write(start.data.root() + u"church1/Lock.Dat"_s, "1234567890"); },
         u"Unable to Enter Kindrel"_s,
         u"Another user is either compacting files, upgrading them, backing them up, restoring files or booking out "
         "families. Please try latter. If you are permanently locked out of Kindrel then use the Kindrel Mender "
         "program to "
         "unlock Kindrel"_s},
        {"the database is none of ours",
         [](TestStart& start) { DataFolder::write(start.data.root() + u"church1/KR10_records.kdl"_s, "no database"); },
         connect_sentence},
        {"the database is older",
         [](TestStart& start) { start.in_database(u"UPDATE [tbl_startup] SET [Version]=0;"_s); }, older_database},
    };
    return all;
}

QString text_of(const Fault& fault, const TestStart& start)
{
    return fault.text.contains(u"%1"_s) ? fault.text.arg(start.data.drive()) : fault.text;
}

} // namespace

class StartupTest : public testing::Test, protected TestStart
{
};

TEST_F(StartupTest, AnInstalledProgramOpensChurchOneWithADatabaseMadeFromTheMaster)
{
    const auto office = start();

    ASSERT_TRUE(office);
    EXPECT_EQ(office->mode, Mode::normal);
    EXPECT_EQ(office->church, 1);
    EXPECT_EQ(office->caption_suffix, u" (Church1)"_s);
    EXPECT_EQ(office->paths.database(), data.root() + u"church1/KR10_records.kdl"_s);
    EXPECT_EQ(office->settings.Version, schema_version);
    EXPECT_TRUE(office->may(Area::security));
    EXPECT_EQ(QFile::permissions(office->paths.database()) & (QFile::ReadOther | QFile::WriteOther), 0);
}

TEST(StartupOrderTest, TheFirstOfSeveralFaultsIsToldAndEndsTheProgram)
{
    for (auto fault = faults().begin(); fault != faults().end(); ++fault) {
        SCOPED_TRACE(fault->name);
        TestStart start;
        for (auto later = faults().rbegin(); later.base() != fault; ++later)
            later->bring_about(start);
        start.dialogue.expect_box(text_of(*fault, start), fault->more, fault->caption);

        EXPECT_FALSE(start.start());

        ASSERT_EQ(start.dialogue.seen().size(), 1u);
        EXPECT_EQ(start.dialogue.seen().front().icon, Icon::information);
    }
}

TEST_F(StartupTest, ADatabaseOfANewerProgramIsRefused)
{
    in_database(u"UPDATE [tbl_startup] SET [Version]=2000;"_s);
    dialogue.expect_box(
        u"Your database files are newer than the program edition of Kindrel installed on this computer, you "
        "need to obtain the latest update of Kindrel from the person or web page that supplied Kindrel to "
        "you."_s);

    EXPECT_FALSE(start());
}

TEST_F(StartupTest, AChurchWithoutItsSettingsRowIsRefusedAsUnreadable)
{
    in_database(u"DELETE FROM [tbl_startup];"_s);
    dialogue.expect_box(u"Kindrel was unable to renew the system backup of this church."_s);
    dialogue.expect_box(connect_sentence);

    EXPECT_FALSE(start());
}

TEST_F(StartupTest, ABackupThatCannotBeRenewedIsToldOnceTheChurchIsOpen)
{
    ASSERT_TRUE(start());
    ASSERT_TRUE(QDir(data.root() + u"church1/Backup1"_s).removeRecursively());
    DataFolder::write(data.root() + u"church1/Backup1"_s, "a file in the folder's place");
    dialogue.expect_box(u"Kindrel was unable to renew the system backup of this church."_s);

    EXPECT_TRUE(start());
}

TEST_F(StartupTest, AFileThatIsNoSoundChurchIsLeftByteForByteAsItWas)
{
    const QString file = data.root() + u"church1/KR10_records.kdl"_s;
    DataFolder::make_church(data.root() + u"church1/"_s);
    const QByteArray sound = DataFolder::read(file);
    QByteArray of_another_program = sound;
    of_another_program.replace(68, 4, QByteArray(4, '\0'));
    QByteArray corrupt = sound;
    corrupt.replace(100, 4000, QByteArray(4000, '?'));
    const QByteArray contents[]{{},      "text",           QByteArray(8192, 'x'),       of_another_program,
                                corrupt, sound.left(1000), sound.left(sound.size() / 4)};
    for (const auto& content : contents) {
        DataFolder::write(file, content);
        dialogue.expect_box(connect_sentence);

        EXPECT_FALSE(start());

        EXPECT_EQ(DataFolder::read(file), content) << content.size();
        EXPECT_EQ(QDir(data.root() + u"church1"_s).entryList({u"KR10*"_s}), QStringList(u"KR10_records.kdl"_s));
    }
}

TEST_F(StartupTest, ADatabaseThatCannotBeWrittenIsRefused)
{
    if (geteuid() == 0)
        GTEST_SKIP() << "Nothing keeps the superuser from writing.";
    DataFolder::make_church(data.root() + u"church1/"_s);
    const QString file = data.root() + u"church1/KR10_records.kdl"_s;
    ASSERT_TRUE(QFile::setPermissions(file, QFile::ReadOwner));
    dialogue.expect_box(connect_sentence);

    EXPECT_FALSE(start());
}

TEST_F(StartupTest, TheDataDriveOfTheProgramFolderHoldsUnlessItIsTooShort)
{
    struct Case
    {
        QByteArray content;
        QString drive;
    };
    const QString elsewhere = data.drive() + u"elsewhere"_s;
    const Case cases[]{
        {" " + elsewhere.toUtf8() + " \r\nsecond line", elsewhere + u'/'},
        {"D:", data.drive()},
        {"", data.drive()},
    };
    for (const auto& expected : cases) {
        DataFolder::write(data.program() + u"Local_Data_Drive.dat"_s, expected.content);
        workstation.first_copy = false;
        const bool there = expected.drive == data.drive();
        dialogue.expect_box(there ? faults()[1].text : faults()[0].text.arg(expected.drive));
        EXPECT_FALSE(start());
        dialogue.verify();
    }
    DataFolder::write(data.program() + u"Local_Data_Drive.dat"_s, elsewhere.toUtf8());
    workstation.first_copy = true;
    EXPECT_TRUE(start({.data_drive = data.drive()}));
}

TEST_F(StartupTest, ChurchNamesAreWrittenWhenTheirFileIsMissing)
{
    const auto office = start();

    ASSERT_TRUE(office);
    EXPECT_EQ(office->church_names, QStringList({u"Church1"_s, u"Church2"_s, u"Church3"_s, u"Church4"_s, u"Church5"_s,
                                                 u"Church6"_s, u"Church7"_s}));
    EXPECT_EQ(DataFolder::read(data.root() + u"Global/Church_S.Dat"_s), SideRecord(side_files::church_names).bytes());
    EXPECT_EQ(DataFolder::read(data.root() + u"Global/Enter_sound.Dat"_s), SideRecord(side_files::sounds).bytes());
    EXPECT_EQ(DataFolder::read(data.root() + u"Global/Common.Dat"_s), SideRecord(side_files::common).bytes());
}

TEST_F(StartupTest, ADamagedSettingsFileIsToldReplacedForThisStartAndLeftAlone)
{
    DataFolder::write(data.root() + u"Global/Common.Dat"_s, "short");
    dialogue.expect_box(u"The settings file 'Common.Dat' is damaged: it holds 5 bytes instead of 600."_s,
                        u"Kindrel uses its own values instead until the file is put right or saved anew."_s);

    const auto office = start();

    ASSERT_TRUE(office);
    EXPECT_EQ(office->side.common.text("logo"), u"logo.jpg"_s);
    EXPECT_EQ(DataFolder::read(data.root() + u"Global/Common.Dat"_s), "short");
}

TEST_F(StartupTest, TheChurchFollowsTheRequestElseTheMarkersElseTheChooser)
{
    struct Case
    {
        int requested;
        std::vector<int> set_up;
        std::optional<QStringList> offered;
        int church;
        QString caption;
    };
    const Case cases[]{
        {0, {}, {}, 1, u" (Church1)"_s},
        {0, {4}, {}, 4, u" (Church4)"_s},
        {0, {2, 4, 7}, QStringList{u"Church2"_s, u"Church4"_s, u"Church7"_s}, 4, u" (Church4)"_s},
        {3, {2, 4, 7}, {}, 3, u" (Church3)"_s},
        {8, {2, 4, 7}, {}, 8, u" (Training Mode)"_s},
        {9, {2, 4, 7}, {}, 9, u" (Remote Access Mode)"_s},
    };
    for (const auto& expected : cases) {
        for (int church = 1; church <= 7; ++church)
            QFile::remove(data.root() + u"church%1/loaded.dat"_s.arg(church));
        for (const int church : expected.set_up)
            DataFolder::write(data.root() + u"church%1/loaded.dat"_s.arg(church), "1234567890");
        if (expected.offered)
            dialogue.expect_choice(u"Please choose the church to load"_s, 1, expected.offered);

        const auto office = start({.church = expected.requested});

        ASSERT_TRUE(office) << expected.requested;
        EXPECT_EQ(office->church, expected.church);
        EXPECT_EQ(office->caption_suffix, expected.caption);
        dialogue.verify();
    }
}

TEST_F(StartupTest, ClosingTheChooserEndsTheProgram)
{
    DataFolder::write(data.root() + u"church1/loaded.dat"_s, "1234567890");
    DataFolder::write(data.root() + u"church2/loaded.dat"_s, "1234567890");
    dialogue.expect_choice(u"Please choose the church to load"_s, std::nullopt);

    EXPECT_FALSE(start());
}

TEST_F(StartupTest, OneWorkstationRunsOneCopyWhichMayStartAgain)
{
    const QString local_settings = data.paths().folder(Folder::local_settings);
    auto first = std::make_unique<SystemWorkstation>();
    SystemWorkstation second;

    EXPECT_TRUE(first->claim_single_instance(local_settings));
    EXPECT_TRUE(first->claim_single_instance(local_settings)) << "Switching church starts again.";
    EXPECT_FALSE(second.claim_single_instance(local_settings));
    first.reset();
    EXPECT_TRUE(second.claim_single_instance(local_settings));
}

TEST_F(StartupTest, AMonthFirstSystemIsToldUnlessTheChurchWritesDatesSo)
{
    const QString month_first =
        u"Please note: Kindrel has found your Windows system settings not set to Australian Date format "
        "(DD-MM-YYYY). Please "
        "change your settings so that Kindrel can correctly analyse dates, this is done in the regional settings of "
        "the "
        "windows control panel"_s;
    struct Case
    {
        QString pattern;
        bool american;
        bool told;
    };
    const Case cases[]{{u"M/d/yy"_s, false, true},
                       {u"M/d/yy"_s, true, false},
                       {u"dd/MM/yyyy"_s, false, false},
                       {u"yyyy/MM/dd"_s, false, true},
                       {QString(), false, false}};
    for (const auto& expected : cases) {
        workstation.pattern = expected.pattern;
        in_database(u"UPDATE [tbl_startup] SET [American_date]=%1;"_s.arg(expected.american ? -1 : 0));
        if (expected.told)
            dialogue.expect_box(month_first);
        EXPECT_TRUE(start());
        dialogue.verify();
    }
}

TEST_F(StartupTest, APoorDisplayIsToldAndDoesNotEndTheProgram)
{
    workstation.depth = 8;
    workstation.size = {1024, 767};
    dialogue.expect_box(
        u"Your display shows 256 colours or fewer. Please set it to more colours so that Kindrel can be seen "
        "as it should."_s);
    dialogue.expect_box(
        u"Your display is smaller than 1024 X 768. Please set it to at least this size so that every part of "
        "Kindrel can be seen."_s);
    EXPECT_TRUE(start());

    workstation.depth = 9;
    workstation.size = {1024, 768};
    EXPECT_TRUE(start());
}

TEST_F(StartupTest, TheLogoIsTheWorkstationsElseTheProgramsElseTheChurches)
{
    DataFolder::write(data.root() + u"images/LOGO.jpg"_s, "church");
    EXPECT_EQ(start()->logo, data.root() + u"images/LOGO.jpg"_s);

    DataFolder::write(data.program() + u"logo.jpg"_s, "program");
    EXPECT_EQ(start()->logo, data.program() + u"logo.jpg"_s);

    SideRecord own(side_files::workstation_logo);
    own.set_text("logo", u"own.png"_s);
    write_side_file(data.paths(), own);
    DataFolder::write(data.root() + u"images/own.png"_s, "own");
    EXPECT_EQ(start()->logo, data.root() + u"images/own.png"_s);
}

TEST_F(StartupTest, ACommandNeitherAsksNorCountsNorTouchesBackups)
{
    workstation.first_copy = false;
    workstation.pattern = u"dd.MM.yyyy"_s;
    workstation.size = {};
    workstation.depth = 0;
    DataFolder::write(data.root() + u"church2/loaded.dat"_s, "1234567890");
    DataFolder::write(data.root() + u"church5/loaded.dat"_s, "1234567890");
    in_database(u"UPDATE [tbl_startup] SET [compact_count]=500;"_s, 2);

    const auto office = start({.purpose = Purpose::command_line});

    ASSERT_TRUE(office);
    EXPECT_EQ(office->church, 2);
    EXPECT_EQ(number_of(*office->session, u"SELECT [compact_count] FROM [tbl_startup];"_s), 500);
    EXPECT_FALSE(QFile::exists(data.root() + u"church2/Backup1/systembackup.kdl"_s));
}

} // namespace kindrel::test
