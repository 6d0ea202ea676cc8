#include "core/open_church.h"
#include "core/startup.h"
#include "core/verified_copy.h"
#include "support/data_folder.h"
#include "support/test_church.h"

#include <QDir>
#include <QFile>

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

QString unreachable(const QString& path)
{
    return QStringList{
        u"Kindrel is in Network mode and is unable to access the Kindrel Data Files on '%1'. The problem may be "
        "caused by "
        "one of the following:"_s.arg(path),
        u"(1) Your PC is not logged onto the network. (Network connection might be down)"_s,
        u"(2) The Kindrel data files have been moved to a new location on the network server and you need to set a "
        "new path "
        "for this PC to access them."_s,
        u"(3) Your PC doesn't have read / write privileges to the folder on the network that has the Kindrel files."_s,
        u"(4) This computer has not been mapped yet for the drive that has the Kindrel network files"_s,
    }
        .join(u'\n');
}

const QString leaving =
    u"\nKindrel is now removing itself from the network, and setting access to a local database. You are unable to "
    "use any "
    "Kindrel data files that are saved on the network. You need to contact your network administrator and inform him "
    "of this "
    "message."_s;
const QString help =
    u"Full network installation instructions are available on the Kindrel installation CD in the document 'Network "
    "Installation.Doc'"_s;
const QString offer =
    u"Kindrel is unable to access the network. Do you wish to work on the booked out data that is held on this "
    "computer?"_s;
const QString security_lock =
    u"Unable to Enter Kindrel as a security lock is on, please use the Kindrel Mender Program to reset the security "
    "lock so "
    "that access can be granted into the program"_s;

} // namespace

class StartupNetworkTest : public testing::Test, protected TestStart
{
protected:
    QString network = join_network();
    QString switch_file = data.root() + u"Local_settings/network.dat"_s;
};

TEST_F(StartupNetworkTest, AReachableNetworkHoldsTheDataAndTheWorkstationItsOwnSettings)
{
    const auto office = start();

    ASSERT_TRUE(office);
    EXPECT_EQ(office->mode, Mode::network);
    EXPECT_EQ(office->caption_suffix, u" (Network Mode)  (Church1)"_s);
    EXPECT_EQ(office->paths.database(), network + u"church1/KR10_records.kdl"_s);
    EXPECT_EQ(office->paths.folder(Folder::local_settings), data.root() + u"Local_settings/"_s);
    EXPECT_EQ(DataFolder::read(network + u"test.dat"_s), "1234567890");
    EXPECT_FALSE(QFile::exists(network + u"church1/security.dat"_s));
}

TEST_F(StartupNetworkTest, AnUnreachableNetworkIsLeftForTheLocalDataAndItsPathCleared)
{
    QDir(network).removeRecursively();
    dialogue.expect_box(unreachable(network) + leaving, help);

    const auto office = start();

    ASSERT_TRUE(office);
    EXPECT_EQ(office->mode, Mode::normal);
    EXPECT_EQ(office->paths.folder(Folder::church), data.root() + u"church1/"_s);
    EXPECT_EQ(DataFolder::read(switch_file), SideRecord(side_files::network).bytes());
    EXPECT_TRUE(start()) << "The next start must not look for the network again.";
}

TEST_F(StartupNetworkTest, ANetworkWithoutCommonOptionsOrWritingCountsAsUnreachable)
{
    QFile::remove(network + u"Global/Common.Dat"_s);
    dialogue.expect_box(unreachable(network) + leaving, help);
    EXPECT_TRUE(start());

    join_network();
    ASSERT_TRUE(QDir().mkdir(network + u"test.dat"_s));
    dialogue.expect_box(unreachable(network) + leaving, help);
    EXPECT_TRUE(start());
}

TEST_F(StartupNetworkTest, BookedOutDataAreOfferedInPlaceOfTheNetwork)
{
    QDir(network).removeRecursively();
    DataFolder::make_church(data.root() + u"booked out/"_s);
    const QByteArray settings = DataFolder::read(switch_file);
    dialogue.expect_confirm(offer, Answer::yes, Answer::yes);

    const auto office = start();

    ASSERT_TRUE(office);
    EXPECT_EQ(office->church, booked_out_church);
    EXPECT_EQ(office->mode, Mode::booked_out);
    EXPECT_EQ(office->paths.database(), data.root() + u"booked out/KR10_records.kdl"_s);
    EXPECT_EQ(DataFolder::read(switch_file), settings) << "The network is sought again next time.";
}

TEST_F(StartupNetworkTest, DecliningTheBookedOutDataLeavesTheNetwork)
{
    QDir(network).removeRecursively();
    DataFolder::make_church(data.root() + u"booked out/"_s);
    dialogue.expect_confirm(offer, Answer::no);
    dialogue.expect_box(unreachable(network) + leaving, help);

    const auto office = start();

    ASSERT_TRUE(office);
    EXPECT_EQ(office->church, 1);
}

TEST_F(StartupNetworkTest, ACommandEndsWithoutTheNetworkAndKeepsItsPath)
{
    QDir(network).removeRecursively();
    const QByteArray settings = DataFolder::read(switch_file);
    dialogue.expect_box(unreachable(network));

    EXPECT_FALSE(start({.purpose = Purpose::command_line}));

    EXPECT_EQ(DataFolder::read(switch_file), settings);
}

TEST_F(StartupNetworkTest, TheNewestEditionIsRecordedAndAnOlderOneTold)
{
    ASSERT_TRUE(start());
    auto office = start();
    EXPECT_EQ(number_of(*office->session, u"SELECT [network_Version] FROM [tbl_startup];"_s), program_edition);
    office->session->execute(u"UPDATE [tbl_startup] SET [network_Version]=?;"_s, program_edition + 1);
    dialogue.expect_box(
        u"A newer edition of Kindrel has been installed on your network."_s,
        u"At least one of the workstations on your network has been upgraded with a new edition of Kindrel; most "
        "likely from "
        "obtaining the latest update from the Internet. It is highly recommended that you upgrade all workstations "
        "with the "
        "latest update."_s);

    office = start();

    ASSERT_TRUE(office);
    EXPECT_EQ(office->settings.network_Version, program_edition + 1);
}

TEST_F(StartupNetworkTest, TheSeventhLookAtASecurityLockEndsTheProgram)
{
    DataFolder::write(network + u"church1/Security.dat"_s, "1234567890");
    dialogue.expect_box(security_lock);

    EXPECT_FALSE(start());

    EXPECT_EQ(clock.waits(), QList<std::chrono::milliseconds>(6, std::chrono::seconds(1)));
    EXPECT_EQ(dialogue.played(), QStringList(QString()));
    EXPECT_TRUE(QFile::exists(network + u"church1/Security.dat"_s));
}

TEST_F(StartupNetworkTest, ASecurityLockGoneByTheSeventhLookLetsIn)
{
    const QString lock = network + u"church1/security.dat"_s;
    DataFolder::write(lock, "1234567890");
    clock.on_wait([&](int number) {
        if (number == 6)
            QFile::remove(lock);
    });

    EXPECT_TRUE(start());

    EXPECT_EQ(clock.waits().size(), 6);
    EXPECT_FALSE(QFile::exists(lock));
}

TEST_F(StartupNetworkTest, ASecurityLockMeansNothingOutsideTheNetwork)
{
    QFile::remove(switch_file);
    DataFolder::write(data.root() + u"church1/security.dat"_s, "1234567890");

    EXPECT_TRUE(start());
}

TEST_F(StartupNetworkTest, TheMarkerOfAFailedOpeningIsTakenAway)
{
    DataFolder::write(network + u"church1/KR10_records.kdl"_s, "damaged");
    DataFolder::write(network + u"church1/Backup1/systembackup.kdl"_s, "kept");
    dialogue.expect_box(unable_to_connect({}).text);

    EXPECT_FALSE(start());

    EXPECT_FALSE(QFile::exists(network + u"church1/security.dat"_s));
}

TEST_F(StartupNetworkTest, TheGuardTellsWhenTheDatabaseIsNoLongerFound)
{
    const auto office = start();
    ASSERT_TRUE(office);
    EXPECT_TRUE(network_guard(*office));

    QFile::rename(network + u"church1/KR10_records.kdl"_s, network + u"church1/away"_s);
    dialogue.expect_box(u"Unable to access your network files."_s,
                        u"A break in the connection between this computer and your network server has occured."_s);
    EXPECT_FALSE(network_guard(*office));

    QFile::rename(network + u"church1/away"_s, network + u"church1/kr10_records.kdl"_s);
    EXPECT_TRUE(network_guard(*office));
}

TEST_F(StartupNetworkTest, AConnectionFileIsUsedInPlaceOfTheChurchFileAndMustHoldNoPassword)
{
    DataFolder::write(network + u"church1/KR10_records.SERVER"_s, "host=/nowhere dbname=church password=secret\n");
    DataFolder::write(network + u"church1/Backup1/systembackup.kdl"_s, "kept");
    dialogue.expect_box(unable_to_connect({}).text,
                        u"The connection file holds a password. Remove it and use libpq's password file."_s);

    EXPECT_FALSE(start());

    EXPECT_FALSE(QFile::exists(network + u"church1/KR10_records.kdl"_s)) << "A server's church needs no master copy.";
}

TEST_F(StartupNetworkTest, AChurchOnAServerStartsIsCountedBackedUpAndGuarded)
{
    if (!TestChurch::available(EngineKind::postgres))
        GTEST_SKIP() << "No server: run through ./test, or tests/support/with-postgres.";
    TestChurch church(EngineKind::postgres);
    DataFolder::write(network + u"church1/KR10_records.server"_s, church.connection().toUtf8() + '\n');
    SideRecord common(side_files::common);
    common.set_number("starts_between_compactions", 2);
    DataFolder::write(network + u"Global/Common.Dat"_s, common.bytes());
    workstation.free = 0;

    const auto office = start();

    ASSERT_TRUE(office);
    EXPECT_EQ(office->session->engine(), EngineKind::postgres);
    EXPECT_EQ(office->settings.compact_count, 1);
    EXPECT_TRUE(network_guard(*office));
    check_church_file(network + u"church1/Backup1/systembackup.kdl"_s);
    EXPECT_FALSE(QFile::exists(network + u"church1/KR10_records.kdl"_s));
    EXPECT_EQ(start()->settings.compact_count, 0) << "The server tidies up by itself; the count begins anew.";
}

} // namespace kindrel::test
