#include "backup_place.h"
#include "core/sqlite_session.h"
#include "support/processes.h"

#include <QElapsedTimer>
#include <QFileInfo>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;
using std::chrono::microseconds;

namespace {

constexpr int kills = 30;

void remove_marker(const Paths& paths)
{
    QFile::remove(paths.file(Folder::church, u"lock.dat"_s));
}

} // namespace

class BackupKillTest : public BackupPlaceTest
{
protected:
    /// How long one run of the work takes, so that the kills are spread over it.
    template <class Work>
    static microseconds duration_of(Work&& work)
    {
        QElapsedTimer timer;
        timer.start();
        work();
        return microseconds(timer.nsecsElapsed() / 1000);
    }
    [[nodiscard]] static microseconds moment(microseconds whole, int kill) { return whole * kill / kills; }
};
KINDREL_ON_BOTH_ENGINES(BackupKillTest);

TEST_P(BackupKillTest, AKillDuringABackupLeavesTheChurchAndSoundBackupsOnly)
{
    const Paths paths = place->paths();
    const auto state = place->state();
    const auto whole = duration_of([&] { (void)place->back_up(); });
    const auto back_up_for_ever = [&paths](const Ready& ready) {
        StartedOffice started(paths);
        ready();
        while (make_backup(started.office, {}, started.silent)) {
        }
    };
    for (int kill = 0; kill < kills; ++kill) {
        run_and_kill(back_up_for_ever, moment(whole * 2, kill));
        remove_marker(paths);

        EXPECT_EQ(place->state(), state) << "kill " << kill;
        EXPECT_FALSE(place->archives().isEmpty());
        for (const auto& archive : place->archives()) {
            const QTemporaryDir scratch;
            const OpenBackup backup(archive, {});
            ByteMeter meter(place->started->silent, backup.manifest.bytes());
            EXPECT_NO_THROW(unpack(backup, scratch.path() + u'/', Unpack::everything, meter));
        }
    }
    for (int folder = 1; folder <= 5; ++folder)
        (void)place->back_up();
    EXPECT_TRUE(place->leftovers().isEmpty()) << place->leftovers().join(u' ').toStdString();
}

TEST_P(BackupKillTest, AKillDuringARestoreLeavesTheOldChurchOrTheNewOne)
{
    const Paths paths = place->paths();
    std::array<QMap<QString, QByteArray>, 2> states;
    std::array<QString, 2> backups;
    for (const std::size_t which : {0U, 1U}) {
        place->write_church(which == 0 ? u"first"_s : u"second"_s);
        states[which] = place->state();
        backups[which] = place->back_up();
    }
    const auto whole =
        duration_of([&] { (void)restore_backup(place->office(), {.file = backups[0]}, place->started->silent); });
    ASSERT_EQ(place->state(), states[0]);
    int found_first = 0;
    for (int kill = 0; kill < kills; ++kill) {
        const auto restore_for_ever = [&](const Ready& ready) {
            StartedOffice started(paths);
            ready();
            for (int turn = place->state(*started.office.session) == states[0] ? 1 : 0;; turn = 1 - turn) {
                if (!restore_backup(started.office, {.file = backups[static_cast<std::size_t>(turn)]}, started.silent))
                    throw std::runtime_error(started.dialogue.told.join(u'\n').toStdString());
            }
        };
        run_and_kill(restore_for_ever, moment(whole * 2, kill));
        const auto session = connect_church(paths);
        settle_interrupted_restore(paths, *session);
        remove_marker(paths);

        const auto found = place->state(*session);
        EXPECT_TRUE(found == states[0] || found == states[1]) << "kill " << kill;
        found_first += found == states[0] ? 1 : 0;
        EXPECT_FALSE(QFile::exists(place->church() + u"restore_work"_s));
    }
    EXPECT_GT(found_first, 0);
    EXPECT_LT(found_first, kills);
}

TEST_P(BackupKillTest, AKillBetweenTheFilesAndTheDatabaseIsTakenBack)
{
    const QString backup = place->back_up();
    place->write_church(u"second"_s);
    const auto state = place->state();
    const Paths paths = place->paths();
    const auto restore_once = [&](const Ready& ready) {
        StartedOffice started(paths);
        ready();
        (void)restore_backup(started.office, {.file = backup}, started.silent);
    };
    {
        // The files are exchanged; the database waits for one who is writing, and never gets its turn.
        Transaction writing(place->session());
        place->session().execute(u"UPDATE [tbl_surname] SET [surname]='held';"_s);
        run_and_kill(restore_once, std::chrono::seconds(4));
    }
    EXPECT_TRUE(QFile::exists(place->church() + u"restore_work/journal.json"_s));
    EXPECT_NE(DataFolder::read(place->church() + u"Portrait/1.jpg"_s), state[u"church1/Portrait/1.jpg"_s]);

    remove_marker(paths);
    (void)place->back_up(); // Settles what was left, before it backs up a mixture.

    EXPECT_EQ(place->state(), state);
    EXPECT_TRUE(place->leftovers().isEmpty()) << place->leftovers().join(u' ').toStdString();
}

/// Every place at which moving the files can be cut off, and the database before and after.
TEST_P(BackupKillTest, AnExchangeThatWasCutOffIsTakenBackOrFinished)
{
    const auto old_state = place->state();
    const QString root = place->data.root();
    for (const bool committed : {false, true}) {
        for (int moved = 0; moved <= (committed ? 0 : 2); ++moved) {
            {
                RestoreWork work(place->paths());
                DataFolder::write(work.unpacked() + u"church/Portrait/1.jpg"_s, "fresh");
                DataFolder::write(work.unpacked() + u"shared/letter/welcome.ltr"_s, "fresh");
                DataFolder::write(work.unpacked() + u"shared/letter/added.ltr"_s, "fresh");
                work.swap({{u"unpacked/church/Portrait/"_s, Folder::portrait, {}},
                           {u"unpacked/shared/letter/welcome.ltr"_s, Folder::letter, u"welcome.ltr"_s},
                           {u"unpacked/shared/letter/added.ltr"_s, Folder::letter, u"added.ltr"_s}});
                if (committed)
                    work.mark(place->session());
            }
            EXPECT_EQ(DataFolder::read(root + u"letter/added.ltr"_s), "fresh");
            if (moved == 1) // The kill came between the two moves of one exchange.
                QFile::rename(root + u"letter/welcome.ltr"_s,
                              place->church() + u"restore_work/unpacked/shared/letter/welcome.ltr"_s);
            if (moved == 2)
                QFile::rename(root + u"letter/added.ltr"_s,
                              place->church() + u"restore_work/unpacked/shared/letter/added.ltr"_s);

            EXPECT_TRUE(settle_interrupted_restore(place->paths(), place->session()));
            EXPECT_FALSE(settle_interrupted_restore(place->paths(), place->session()));

            EXPECT_EQ(place->state() == old_state, !committed) << moved;
            EXPECT_EQ(QFile::exists(root + u"letter/added.ltr"_s), committed);
            EXPECT_EQ(DataFolder::read(place->church() + u"Portrait/1.jpg"_s) == "fresh", committed);
        }
    }
}

TEST_P(BackupKillTest, WhatWasKeptStaysWhenTheRecordOfAnExchangeIsDamaged)
{
    const QString kept = place->church() + u"restore_work/kept/0"_s;
    const QString journal = place->church() + u"restore_work/journal.json"_s;
    for (const char* content : {"", "{", "{\"id\":\"a\",\"swaps\":[{\"folder\":99}]}"}) {
        DataFolder::write(kept, "the church's own");
        DataFolder::write(journal, content);

        EXPECT_THROW(settle_interrupted_restore(place->paths(), place->session()), FileError);

        EXPECT_FALSE(settle_interrupted_restore(place->paths(), place->session())) << "It was set aside.";
        EXPECT_EQ(DataFolder::read(place->church() + u"mended/restore_work/kept/0"_s), "the church's own");
        QDir(place->church() + u"mended"_s).removeRecursively();
    }
}

} // namespace kindrel::test
