#include "core/network_setup.h"

#include "core/side_files.h"
#include "workplace.h"

#include <QDir>
#include <QFile>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

class NetworkSetupTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (!church)
            return;
        place.emplace(*church);
        QDir().mkpath(place->office.paths.folder(Folder::local_settings));
    }
    [[nodiscard]] NetworkSetup open()
    {
        auto setup = NetworkSetup::open(place->office);
        EXPECT_TRUE(setup);
        return std::move(*setup);
    }
    [[nodiscard]] SideRecord stored() { return *read_side_file(place->office.paths, side_files::network); }
    [[nodiscard]] ScriptedDialogue& dialogue() { return place->dialogue; }

    std::optional<Workplace> place;
    DataFolder data;
};
KINDREL_ON_BOTH_ENGINES(NetworkSetupTest);

TEST_P(NetworkSetupTest, ANetworkThatCanBeReachedAndWrittenIsSavedForTheNextStart)
{
    const QString network = data.make_network();
    auto setup = open();
    EXPECT_FALSE(setup.switched_on());
    setup.switch_on(true);
    setup.set_path(u' ' + network);
    EXPECT_TRUE(setup.altered());

    ASSERT_TRUE(setup.save());

    EXPECT_FALSE(setup.altered());
    EXPECT_TRUE(stored().flag("network"));
    EXPECT_EQ(stored().text("path"), network);
    EXPECT_EQ(DataFolder::read(network + u"test.dat"_s), "1234567890");
    EXPECT_EQ(open().path(), network);
}

TEST_P(NetworkSetupTest, ANetworkThatCannotBeUsedIsNotSaved)
{
    const QString network = data.make_network();
    auto setup = open();
    setup.switch_on(true);
    dialogue().expect_box(u"Please enter the path of the folder on the network that has the Kindrel files"_s);
    EXPECT_FALSE(setup.save());

    setup.set_path(network + u"elsewhere"_s);
    dialogue().expect_box(u"Unable to find the Kindrel Data Files on '%1elsewhere'."_s.arg(network));
    EXPECT_FALSE(setup.save());

    QDir().mkpath(network + u"test.dat"_s); // A folder is in the way of the file.
    setup.set_path(network);
    dialogue().expect_box(u"Unable to write to '%1'."_s.arg(network));
    EXPECT_FALSE(setup.save());
    EXPECT_TRUE(dialogue().seen().back().more.startsWith(
        u"Your PC needs read / write privileges to the folder on the network that has the Kindrel files.\n"_s));

    EXPECT_FALSE(read_side_file(place->office.paths, side_files::network));
}

TEST_P(NetworkSetupTest, SwitchingTheNetworkOffAsksForNoPathAndKeepsTheOneThatWasThere)
{
    auto setup = open();
    setup.set_path(u"/gone"_s);

    ASSERT_TRUE(setup.save());

    EXPECT_FALSE(stored().flag("network"));
    EXPECT_EQ(stored().text("path"), u"/gone"_s);
}

TEST_P(NetworkSetupTest, APathThatTheFileCannotHoldIsRefused)
{
    auto setup = open();
    setup.set_path(QString(201, u'x'));
    dialogue().expect_box(u"'%1' is too long for 'network.dat': there is room for 200 characters."_s.arg(setup.path()));

    EXPECT_FALSE(setup.save());
}

TEST_P(NetworkSetupTest, TheChosenLockIsUnlockedAndTheOthersStay)
{
    Workplace other(*church, u"office-2"_s);
    session().execute(u"INSERT INTO [tbl_surname] ([Surname_ID],[surname]) VALUES (7,'Naismith');"_s);
    ASSERT_TRUE(other.locks.take(LockKind::family, 7));
    ASSERT_TRUE(other.locks.take(LockKind::roll, 3));
    ASSERT_TRUE(other.locks.take(LockKind::custom_letter, u"Welcome"_s));
    auto setup = open();
    ASSERT_EQ(setup.locks().size(), 3U);
    EXPECT_EQ(setup.locks()[0].what, u"Family file 'Naismith'"_s);
    for (const auto& nothing : {std::optional<int>(), std::optional(-1), std::optional(3)}) {
        dialogue().expect_box(u"You need to choose what you wish to unlock before performing the unlock function."_s);
        EXPECT_FALSE(setup.unlock(nothing));
    }

    EXPECT_TRUE(setup.unlock(2));
    EXPECT_TRUE(setup.unlock(0));

    ASSERT_EQ(setup.locks().size(), 1U);
    EXPECT_EQ(setup.locks()[0].kind, LockKind::roll);
    EXPECT_FALSE(place->locks.check(LockKind::family, 7));
    EXPECT_FALSE(place->locks.check(LockKind::custom_letter, u"Welcome"_s));
}

TEST_P(NetworkSetupTest, WithoutTheRightTheSetupStaysClosed)
{
    place->grant_only({Area::security});
    dialogue().expect_box(u"Your password does not give access to \"Network Setup\""_s);

    EXPECT_FALSE(NetworkSetup::open(place->office));
}

} // namespace kindrel::test
