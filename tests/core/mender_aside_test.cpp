#include "mender_place.h"

#include "core/church_recovery.h"
#include "core/locks.h"
#include "core/sqlite_session.h"
#include "support/processes.h"

#include <QStorageInfo>

#include <unistd.h>

// A church file that makes way, and one that only seems to have to.
namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

class MenderAsideTest : public MenderPlaceTest
{
protected:
    /// The church lies where the mender looks for it.
    void SetUp() override
    {
        MenderPlaceTest::SetUp();
        session().execute(u"UPDATE [tbl_startup] SET [church_code]='ours';"_s);
        session().execute(u"CREATE TABLE [unused] ([a]);"_s);
        m_unused = number_of(session(), u"SELECT [rootpage] FROM sqlite_master WHERE [name]='unused';"_s);
        place->session.reset();
        church->close();
        ASSERT_TRUE(QFile::rename(church->file(), file()));
        open_to_mend(*place);
    }
    [[nodiscard]] QString file() const { return in_church(u"KR10_records.kdl"_s); }
    [[nodiscard]] QString recovered() const { return folder.filePath(u"recovered.kdl"_s); }
    void lay(const QByteArray& content)
    {
        place->session.reset();
        DataFolder::write(file(), content);
        open_to_mend(*place);
    }
    /// Every table but an unused one stays whole.
    void damage()
    {
        QByteArray content = DataFolder::read(file());
        content.replace(static_cast<qsizetype>(m_unused - 1) * 4096, 8, QByteArray(8, 'x'));
        lay(content);
    }
    /// Whoever waits for this church gives up at once.
    void wait_for_nobody()
    {
        auto rows = place->session->select(u"PRAGMA busy_timeout=0;"_s);
        (void)rows.first();
    }
    [[nodiscard]] std::unique_ptr<Session> somebody_who(const QString& statement)
    {
        auto other = open_sqlite(file());
        other->execute(statement);
        return other;
    }
    void expect_left_alone(const QString& why)
    {
        const QByteArray before = DataFolder::read(file());
        try {
            (void)set_database_aside(*place);
            ADD_FAILURE() << "It was moved away.";
        } catch (const FileError& error) {
            EXPECT_TRUE(error.text().startsWith(why)) << error.what();
        }
        EXPECT_EQ(DataFolder::read(file()), before);
        EXPECT_FALSE(QFile::exists(in_church(u"lock.dat"_s)));
    }
    void expect_not_damaged(const QString& kind, const QString& words)
    {
        const auto found = examine();
        ASSERT_EQ(found.size(), 1U) << told(found);
        EXPECT_EQ(found.front().kind, kind) << told(found);
        EXPECT_EQ(found.front().cure, Cure::by_hand);
        EXPECT_TRUE(found.front().words.startsWith(words)) << told(found);
        EXPECT_TRUE(mend_church(*place, {}).refusal.startsWith(words));
    }

private:
    qint64 m_unused = 0;
};
INSTANTIATE_TEST_SUITE_P(Engines, MenderAsideTest, testing::Values(EngineKind::sqlite), engine_name);

namespace {

const QString writing = u"Somebody is writing in the church just now."_s;
const QString reading_or_writing = u"Somebody is reading or writing in the church just now."_s;
const QString forbidden = u"This user may not read and write the church's file."_s;

} // namespace

TEST_P(MenderAsideTest, AChurchThatSomebodyWritesInIsNotDamaged)
{
    wait_for_nobody();
    const auto other = somebody_who(u"BEGIN EXCLUSIVE;"_s);
    expect_not_damaged(u"in_use"_s, writing);
    expect_left_alone(writing);
}

TEST_P(MenderAsideTest, AChurchThatDoesNotOpenForSomebodyWhoWritesIsNotDamaged)
{
    place->session.reset();
    const auto other = somebody_who(u"BEGIN EXCLUSIVE;"_s);
    open_to_mend(*place); // After the engine's own time of waiting.
    EXPECT_EQ(place->session, nullptr);
    expect_not_damaged(u"in_use"_s, writing);
    expect_left_alone(writing);
}

TEST_P(MenderAsideTest, AFileThatThisUserMayNotReadIsNotDamaged)
{
    if (geteuid() == 0)
        GTEST_SKIP() << "Root may read everything.";
    place->session.reset();
    QFile::setPermissions(file(), {});
    open_to_mend(*place);
    expect_not_damaged(u"forbidden"_s, forbidden);
    EXPECT_THROW((void)set_database_aside(*place), FileError);
    EXPECT_TRUE(QFile::exists(file()));
    QFile::setPermissions(file(), QFile::ReadOwner);
    open_to_mend(*place);
    expect_not_damaged(u"forbidden"_s, forbidden);
}

TEST_P(MenderAsideTest, AServerThatCannotBeReachedIsNotDamaged)
{
    place->session.reset();
    DataFolder::write(in_church(u"KR10_records.server"_s), "host=127.0.0.1 port=1 dbname=church user=office");
    open_to_mend(*place);
    expect_not_damaged(u"server"_s, u"The server does not answer"_s);
    EXPECT_THROW((void)set_database_aside(*place), FileError);
}

TEST_P(MenderAsideTest, ADamagedFileIsNotMovedUnderSomebodyWhoReadsOrWritesIt)
{
    damage();
    {
        const auto writer = somebody_who(u"BEGIN IMMEDIATE;"_s);
        expect_left_alone(reading_or_writing);
    }
    open_to_mend(*place);
    {
        const auto reader = open_sqlite(file());
        auto rows = reader->select(u"SELECT [surname] FROM [tbl_surname];"_s);
        (void)rows.first();
        expect_left_alone(reading_or_writing);
    }
    open_to_mend(*place);
    EXPECT_TRUE(QFile::exists(set_database_aside(*place)));
    EXPECT_FALSE(QFile::exists(file()));
}

TEST_P(MenderAsideTest, ADamagedFileIsSetAsideWithItsJournalAndASoundOneIsNot)
{
    expect_left_alone(u"The church file is not damaged"_s);
    lay("no database");
    DataFolder::write(file() + u"-journal"_s, "its journal");
    const QString marker = in_church(u"lock.dat"_s);
    DataFolder::write(marker, "1234567890");
    EXPECT_THROW((void)set_database_aside(*place), FileError);
    EXPECT_TRUE(QFile::exists(file()));

    QFile::remove(marker);
    const QString aside = set_database_aside(*place);
    EXPECT_FALSE(QFile::exists(file()));
    EXPECT_FALSE(QFile::exists(file() + u"-journal"_s));
    EXPECT_EQ(DataFolder::read(aside), "no database");
    EXPECT_EQ(DataFolder::read(aside + u"-journal"_s), "its journal");
    EXPECT_TRUE(aside.startsWith(in_church(u"mended/"_s))) << aside.toStdString();
    EXPECT_EQ(examine().front().kind, u"missing"_s) << told(examine());
}

TEST_P(MenderAsideTest, AFileIsNotSetAsideUnderSomebodyWhoIsInside)
{
    FakeWorkstation other;
    other.machine = u"office-2"_s;
    ASSERT_TRUE(Locks(*place->session, other, clock).take(LockKind::family, 1));
    damage();
    expect_left_alone(u"Somebody may be working in the church"_s);

    place->session->execute(u"DELETE FROM [tbl_locked_family_files];"_s);
    (void)set_database_aside(*place);
    EXPECT_FALSE(QFile::exists(file()));
}

TEST_P(MenderAsideTest, ARecoveredFileTakesThePlaceOfTheDamagedOneAndTheChurchIsMended)
{
    place->session->execute(u"DELETE FROM [tbl_address];"_s);
    damage();
    (void)recover_church(file(), recovered());
    const QByteArray damaged = DataFolder::read(file());
    const auto placement = put_in_place(*place, recovered(), {});
    EXPECT_EQ(DataFolder::read(placement.aside), damaged);
    EXPECT_EQ(placement.mending.refusal, QString());
    EXPECT_EQ(placement.mending.mended.size(), 1U) << told(placement.mending.mended);
    EXPECT_TRUE(placement.mending.left.empty()) << told(placement.mending.left);
    EXPECT_EQ(number_of(*place->session, u"SELECT COUNT(*) FROM [tbl_people];"_s), 3);
    EXPECT_EQ(number_of(*place->session, u"SELECT COUNT(*) FROM [tbl_address];"_s), 2);
    EXPECT_FALSE(QFile::exists(recovered()));
}

TEST_P(MenderAsideTest, ARecoveredFileFillsThePlaceOfAMissingOne)
{
    damage();
    (void)recover_church(file(), recovered());
    (void)set_database_aside(*place);
    DataFolder::write(file() + u"-journal"_s, "of another database");
    const auto placement = put_in_place(*place, recovered(), {});
    EXPECT_EQ(placement.aside, QString());
    EXPECT_TRUE(placement.mending.left.empty()) << told(placement.mending.left);
    EXPECT_EQ(number_of(*place->session, u"SELECT COUNT(*) FROM [tbl_people];"_s), 3);
}

TEST_P(MenderAsideTest, ARecoveredFileTakesThePlaceOfAnEmptyChurchAndNotOfASoundOne)
{
    const auto refusal_of = [&] {
        try {
            (void)put_in_place(*place, recovered(), {});
            return QString();
        } catch (const FileError& error) {
            return error.text();
        }
    };
    (void)recover_church(file(), recovered());
    EXPECT_FALSE(gives_way(*place, false));
    EXPECT_TRUE(refusal_of().startsWith(u"A recovered file takes the place only of a church file that is damaged"));
    DataFolder::write(in_church(u"KR10_records.server"_s), "host=127.0.0.1 port=1 dbname=church user=office");
    EXPECT_FALSE(gives_way(*place, true));
    EXPECT_EQ(refusal_of(), u"This church lies on a server: there a recovered file cannot take its place."_s);
    QFile::remove(in_church(u"KR10_records.server"_s));

    place->session.reset();
    QFile::remove(file());
    DataFolder::make_church(in_church({})); // As a start does after the damaged file was set aside, and a backup then:
    open_sqlite(file())->execute(u"UPDATE [tbl_startup] SET [church_code]='fresh';"_s);
    const QByteArray empty = DataFolder::read(file());
    open_to_mend(*place);
    EXPECT_TRUE(gives_way(*place, false));
    const auto placement = put_in_place(*place, recovered(), {});
    EXPECT_EQ(DataFolder::read(placement.aside), empty);
    EXPECT_TRUE(placement.mending.left.empty()) << told(placement.mending.left);
    EXPECT_EQ(number_of(*place->session, u"SELECT COUNT(*) FROM [tbl_people];"_s), 3);
}

TEST_P(MenderAsideTest, ARecoveredFileOnAnotherDiskIsCopied)
{
    const QTemporaryDir other(u"/var/tmp/kindrel-XXXXXX"_s);
    if (QStorageInfo(other.path()).device() == QStorageInfo(folder.path()).device())
        GTEST_SKIP() << "There is no other disk.";
    damage();
    const QString far = other.filePath(u"recovered.kdl"_s);
    (void)recover_church(file(), far);
    {
        const auto writer = somebody_who(u"BEGIN IMMEDIATE;"_s);
        EXPECT_THROW((void)put_in_place(*place, far, {}), FileError);
        EXPECT_EQ(QDir(in_church({})).entryList({u"*.unfinished"_s}, QDir::Files), QStringList());
    }
    open_to_mend(*place);
    EXPECT_TRUE(put_in_place(*place, far, {}).mending.left.empty());
    EXPECT_EQ(number_of(*place->session, u"SELECT COUNT(*) FROM [tbl_people];"_s), 3);
    EXPECT_TRUE(QFile::exists(far));
}

TEST_P(MenderAsideTest, WhatIsNoSoundFileOfThisChurchIsNotPutInPlace)
{
    const QString other_church = in_church(u"../church2/KR10_records.kdl"_s);
    damage();
    (void)recover_church(file(), recovered());
    const QByteArray sound = DataFolder::read(recovered());
    DataFolder::write(other_church, sound);
    const QByteArray before = DataFolder::read(file());
    const auto expect_refused = [&](const QString& fresh, const char* why) {
        const QByteArray content = QFile::exists(fresh) ? DataFolder::read(fresh) : QByteArray();
        open_to_mend(*place);
        EXPECT_ANY_THROW((void)put_in_place(*place, fresh, {})) << why;
        EXPECT_EQ(DataFolder::read(file()), before) << why;
        EXPECT_EQ(QFile::exists(fresh) ? DataFolder::read(fresh) : QByteArray(), content) << why;
        EXPECT_FALSE(QFile::exists(in_church(u"lock.dat"_s))) << why;
    };
    expect_refused(folder.filePath(u"nothing.kdl"_s), "It is missing.");
    expect_refused(file(), "It is the church's own.");
    expect_refused(other_church, "It is in use as another church.");
    for (const auto& [statement, why] : {std::pair{u"UPDATE [tbl_startup] SET [church_code]='theirs';"_s, "Not ours."},
                                         {u"UPDATE [tbl_startup] SET [Version]=9;"_s, "Another version."},
                                         {u"ALTER TABLE [tbl_startup] DROP COLUMN [title_logo];"_s, "A field lacks."},
                                         {u"DELETE FROM [tbl_startup];"_s, "It is empty."}}) {
        DataFolder::write(recovered(), sound);
        open_sqlite(recovered())->execute(statement);
        expect_refused(recovered(), why);
    }
    DataFolder::write(recovered(), "no database");
    expect_refused(recovered(), "No database.");
    EXPECT_TRUE(mended_files().isEmpty());
}

TEST_P(MenderAsideTest, AKillWhileAFileIsPutInPlaceLosesNeitherFile)
{
    damage();
    (void)recover_church(file(), recovered());
    const QByteArray damaged = DataFolder::read(file());
    const QByteArray sound = DataFolder::read(recovered());
    const auto in_mended = [&](const QByteArray& content) {
        return std::ranges::any_of(mended_files(), [&](const QString& name) {
            return DataFolder::read(in_church(u"mended/"_s + name)) == content;
        });
    };
    const auto put_and_stay = [&](const Ready& ready) {
        open_to_mend(*place);
        ready();
        (void)put_in_place(*place, recovered(), {});
        while (true)
            pause();
    };
    place->session.reset();
    std::chrono::microseconds after{200};
    int kept = 0, put = 0;
    while (put < 2) {
        run_and_kill(put_and_stay, after);
        ASSERT_TRUE(QFile::exists(file())) << after.count();
        const bool is_put = DataFolder::read(file()) == sound;
        EXPECT_TRUE(is_put ? in_mended(damaged) : DataFolder::read(file()) == damaged) << after.count();
        EXPECT_NE(is_put, QFile::exists(recovered()) && DataFolder::read(recovered()) == sound) << after.count();
        ++(is_put ? put : kept);
        QDir(in_church(u"mended"_s)).removeRecursively();
        QFile::remove(in_church(u"lock.dat"_s));
        DataFolder::write(recovered(), sound);
        DataFolder::write(file(), damaged);
        after += after / 3;
    }
    EXPECT_GT(kept, 0);
}

} // namespace kindrel::test
