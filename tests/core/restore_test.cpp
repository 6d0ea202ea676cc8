#include "core/restore.h"

#include "backup_place.h"
#include "core/locks.h"
#include "core/sqlite_session.h"
#include "support/processes.h"

#include <QFileInfo>

#include <filesystem>

#include <dlfcn.h>

namespace {

/// What a test does when something is flushed to the disk.
std::function<void()> on_flush; // NOLINT: set and unset by one test.
/// A part of the names of files that cannot be removed.
QByteArray kept_name; // NOLINT: the same.

} // namespace

/// Stands in front of the system's own.
extern "C" int syncfs(int opened) noexcept
{
    if (on_flush)
        on_flush();
    static const auto own = reinterpret_cast<int (*)(int)>(dlsym(RTLD_NEXT, "syncfs"));
    return own(opened);
}

/// The same.
extern "C" int unlink(const char* name) noexcept
{
    if (!kept_name.isEmpty() && QByteArrayView(name).contains(kept_name)) {
        errno = EACCES;
        return -1;
    }
    static const auto own = reinterpret_cast<int (*)(const char*)>(dlsym(RTLD_NEXT, "unlink"));
    return own(name);
}

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

class RestoreTest : public BackupPlaceTest
{
protected:
    void SetUp() override
    {
        BackupPlaceTest::SetUp();
        if (!place)
            return;
        old_state = place->state();
        backup = place->back_up();
        place->started->clock.set(QDate(2024, 6, 1));
        place->write_church(u"second"_s);
        new_state = place->state();
        place->dialogue().told.clear();
    }
    std::optional<RestoreReport> restore(const RestoreRequest& request)
    {
        return restore_backup(place->office(), request, place->started->silent);
    }
    void TearDown() override
    {
        on_flush = nullptr;
        kept_name.clear();
    }
    void expect_refusal(const QString& words)
    {
        EXPECT_FALSE(restore({.file = backup}));
        ASSERT_EQ(place->dialogue().told.size(), 1);
        EXPECT_TRUE(place->dialogue().told.first().contains(words)) << place->dialogue().told.first().toStdString();
        EXPECT_EQ(place->state(), new_state);
        EXPECT_TRUE(place->leftovers().isEmpty()) << place->leftovers().join(u' ').toStdString();
    }

    QString backup;
    QMap<QString, QByteArray> old_state, new_state;
};
KINDREL_ON_BOTH_ENGINES(RestoreTest);

TEST_P(RestoreTest, EverythingIsAsItWasAndCanBeTakenBack)
{
    const auto report = restore({.file = backup});

    ASSERT_TRUE(report) << place->dialogue().told.join(u'\n').toStdString();
    EXPECT_EQ(place->state(), old_state);
    for (const auto& kind : compared_kinds(report->restored.church, present_state(place->office())))
        EXPECT_EQ(kind.then, kind.now) << kind.words.toStdString();
    EXPECT_EQ(report->restored.file, backup);
    EXPECT_TRUE(place->leftovers().isEmpty()) << place->leftovers().join(u' ').toStdString();

    const auto back = restore({.file = report->before});
    ASSERT_TRUE(back) << place->dialogue().told.join(u'\n').toStdString();
    EXPECT_EQ(place->state(), new_state);
}

TEST_P(RestoreTest, TheQuestionComparesTheBackupWithThePresent)
{
    ScriptedDialogue dialogue;
    StartedOffice asked(place->paths(), &dialogue);
    asked.office.session->execute(u"DELETE FROM [tbl_surname] WHERE [Surname_ID]>15;"_s);
    dialogue.expect_confirm(u"Do you wish to replace the data of 'Morning' by the backup of 15/05/2024 10:30?"_s,
                            Answer::no, Answer::no);

    EXPECT_FALSE(restore_backup(asked.office, {.file = backup}, asked.silent));

    EXPECT_EQ(dialogue.seen().front().more, u"Families: 20 in the backup, 15 now"_s);
    EXPECT_EQ(place->state()[u"letter/welcome.ltr"_s], new_state[u"letter/welcome.ltr"_s]);
}

TEST_P(RestoreTest, AnotherSessionSeesTheRestoredChurch)
{
    const auto other = connect_church(place->paths());
    EXPECT_EQ(place->state(*other), new_state);

    ASSERT_TRUE(restore({.file = backup}));

    EXPECT_EQ(place->state(*other), old_state);
}

TEST_P(RestoreTest, FilesThatOtherChurchesShareStayAndTheirNamesToo)
{
    SideRecord names(side_files::church_names);
    names.set_text("church_1", u"Renamed"_s);
    names.set_text("church_2", u"Neighbour"_s);
    write_side_file(place->paths(), names);
    DataFolder::write(place->data.root() + u"letter/neighbour.ltr"_s, "theirs");

    ASSERT_TRUE(restore({.file = backup}));

    const auto found = read_side_file(place->paths(), side_files::church_names);
    EXPECT_EQ(found->text("church_1"), u"Morning"_s);
    EXPECT_EQ(found->text("church_2"), u"Neighbour"_s);
    EXPECT_EQ(DataFolder::read(place->data.root() + u"letter/neighbour.ltr"_s), "theirs");
    EXPECT_EQ(read_side_file(place->paths(), side_files::backup)->number("next_folder"), 2);
}

TEST_P(RestoreTest, RestoredFilesAreForOwnerAndTheDataFoldersGroupAlone)
{
    using std::filesystem::perms;
    std::filesystem::permissions(place->church().toStdString(), perms::set_gid, std::filesystem::perm_options::add);

    ASSERT_TRUE(restore({.file = backup}));

    const auto permissions = [](const QString& path) {
        return std::filesystem::status(path.toStdString()).permissions();
    };
    const perms folder = permissions(place->church() + u"Portrait"_s);
    EXPECT_EQ(folder & (perms::set_gid | perms::all), perms::set_gid | perms::owner_all | perms::group_all);
    EXPECT_EQ(permissions(place->church() + u"Portrait/1.jpg"_s) & perms::all,
              perms::owner_read | perms::owner_write | perms::group_read | perms::group_write);
    EXPECT_EQ(permissions(place->data.root() + u"letter/welcome.ltr"_s) & perms::others_all, perms::none);
}

TEST_P(RestoreTest, WhatWasLeftOutOfTheBackupStays)
{
    const QString without = place->back_up({.choice = {.with_pictures = false, .with_letters = false}});
    const auto kept = place->state();
    place->write_church(u"first"_s);

    ASSERT_TRUE(restore({.file = without}));

    const auto found = place->state();
    EXPECT_EQ(found[u"families"_s], kept[u"families"_s]);
    EXPECT_EQ(found[u"church1/NBook/F1.fll"_s], kept[u"church1/NBook/F1.fll"_s]);
    EXPECT_EQ(found[u"church1/Portrait/1.jpg"_s], old_state[u"church1/Portrait/1.jpg"_s]);
    EXPECT_EQ(found[u"letter/welcome.ltr"_s], old_state[u"letter/welcome.ltr"_s]);
}

TEST_P(RestoreTest, SharedFilesStayWhenThePersonWantsSo)
{
    ASSERT_TRUE(restore({.file = backup, .with_shared_files = false}));

    EXPECT_EQ(place->state()[u"letter/welcome.ltr"_s], new_state[u"letter/welcome.ltr"_s]);
    EXPECT_EQ(place->state()[u"church1/Portrait/1.jpg"_s], old_state[u"church1/Portrait/1.jpg"_s]);
}

TEST_P(RestoreTest, TheBackupOfAnotherChurchIsRefused)
{
    place->session().execute(u"UPDATE [tbl_startup] SET [church_code]='another';"_s);

    expect_refusal(u"This backup was made of another church."_s);
}

TEST_P(RestoreTest, AChurchThatWasNeverBackedUpAsksUnlessItIsEmpty)
{
    const QString unknown = u"This church was never backed up"_s;
    place->session().execute(u"UPDATE [tbl_startup] SET [church_code]=NULL;"_s);
    ASSERT_TRUE(restore({.file = backup}));
    EXPECT_TRUE(place->dialogue().asked.first().startsWith(unknown));

    place->session().execute(u"UPDATE [tbl_startup] SET [church_code]=NULL;"_s);
    place->session().execute(u"DELETE FROM [tbl_surname];"_s);
    place->dialogue().asked.clear();
    const auto report = restore({.file = backup});
    ASSERT_TRUE(report);
    EXPECT_EQ(place->dialogue().asked.size(), 1);
    EXPECT_EQ(place->state(), old_state);
    EXPECT_TRUE(restore({.file = report->before})) << "The empty church can be had back.";
}

TEST_P(RestoreTest, ABackupOfAnotherVersionOfTheDatabaseIsRefused)
{
    for (const int version : {0, 99}) {
        write_setting(place->session(), u"Version"_s, version);
        backup = place->back_up();
        write_setting(place->session(), u"Version"_s, 1);

        expect_refusal(version == 0 ? u"too old to be restored"_s : u"a newer edition of Kindrel"_s);
        place->dialogue().told.clear();
    }
}

TEST_P(RestoreTest, AChurchMovesBetweenFileAndServerByItsBackup)
{
    const auto other_engine = GetParam() == EngineKind::sqlite ? EngineKind::postgres : EngineKind::sqlite;
    BackupPlace other(other_engine);
    other.write_church(u"second"_s);
    other.session().execute(u"UPDATE [tbl_startup] SET [church_code]=?;"_s, present_state(place->office()).church_code);

    ASSERT_TRUE(restore_backup(other.office(), {.file = backup}, other.started->silent))
        << other.dialogue().told.join(u'\n').toStdString();

    EXPECT_EQ(other.state(), old_state);
}

TEST_P(RestoreTest, ADamagedChurchIsReplacedAfterAsking)
{
    if (GetParam() != EngineKind::sqlite)
        GTEST_SKIP() << "A server looks after its own files.";
    place->started.reset();
    const QString file = place->paths().database();
    QByteArray content = DataFolder::read(file);
    content.replace(8192, 4096, QByteArray(4096, '?'));
    DataFolder::write(file, content);
    place->started.emplace(place->paths());

    const auto report = restore({.file = backup});

    ASSERT_TRUE(report) << place->dialogue().told.join(u'\n').toStdString();
    EXPECT_TRUE(place->dialogue().asked.last().startsWith(u"Unable to back up the present data"));
    EXPECT_TRUE(report->before.isEmpty());
    EXPECT_EQ(DataFolder::read(report->before_unchecked + u"database/KR10_records.kdl"_s), content);
    EXPECT_EQ(DataFolder::read(report->before_unchecked + u"church/Portrait/1.jpg"_s),
              new_state[u"church1/Portrait/1.jpg"_s]);
    EXPECT_EQ(place->state(), old_state);
}

TEST_P(RestoreTest, AFileThatCannotBeBackedUpDoesNotKeepTheBackupOut)
{
    const QString odd = u"Portrait/two\nlines.jpg"_s;
    DataFolder::write(place->church() + odd, "odd");

    const auto report = restore({.file = backup});

    ASSERT_TRUE(report) << place->dialogue().told.join(u'\n').toStdString();
    EXPECT_TRUE(place->dialogue().asked.last().startsWith(u"Unable to back up the present data"));
    EXPECT_EQ(DataFolder::read(report->before_unchecked + u"church/"_s + odd), "odd");
    const auto kept = open_sqlite(report->before_unchecked + u"database/KR10_records.kdl"_s);
    EXPECT_EQ(place->state(*kept)[u"families"_s], new_state[u"families"_s]);
    EXPECT_EQ(QDir(QFileInfo(QDir(report->before_unchecked).absolutePath()).path())
                  .entryList({u"*.unfinished"_s}, QDir::Dirs),
              QStringList());
    EXPECT_EQ(place->state(), old_state);
}

TEST_P(RestoreTest, WhatCannotBeClearedUpOrListedDoesNotMakeARestoreFail)
{
    for (int before = 0; before < 3; ++before) {
        place->started->clock.set(QDate(2024, 6, 2 + before));
        ASSERT_TRUE(restore({.file = backup}));
    }
    place->write_church(u"second"_s);
    ASSERT_TRUE(QFile::remove(place->church() + u"backups.json"_s) &&
                QDir().mkdir(place->church() + u"backups.json"_s));
    place->started->clock.set(QDate(2024, 6, 9));
    kept_name = "Before_restore";
    place->dialogue().told.clear();

    const auto report = restore({.file = backup});
    ASSERT_TRUE(report) << place->dialogue().told.join(u'\n').toStdString();
    EXPECT_TRUE(place->dialogue().told.isEmpty());
    EXPECT_EQ(place->state(), old_state);

    ASSERT_TRUE(restore({.file = report->before}));
    EXPECT_EQ(place->state()[u"families"_s], new_state[u"families"_s]);
}

TEST_P(RestoreTest, NobodyIsKeptOutWhileThePersonThinksItOver)
{
    QStringList seen;
    place->dialogue().on_confirm = [&] {
        seen += QFile::exists(place->church() + u"lock.dat"_s) ? u"locked"_s : u"open"_s;
    };
    ASSERT_TRUE(restore({.file = backup}));
    EXPECT_EQ(seen, QStringList{u"open"_s});
}

TEST_P(RestoreTest, TablesThatAreMissingComeBack)
{
    if (GetParam() != EngineKind::sqlite)
        GTEST_SKIP() << "The content of a server's tables is replaced, so the Mender makes them again first.";
    for (const auto& table : {u"tbl_finance_date"_s, u"tbl_locked_area"_s, u"tbl_surname"_s, u"tbl_setting"_s})
        place->session().execute(u"DROP TABLE [%1];"_s.arg(table));

    const auto report = restore({.file = backup});

    ASSERT_TRUE(report) << place->dialogue().told.join(u'\n').toStdString();
    EXPECT_EQ(place->state(), old_state);
    EXPECT_TRUE(Locks(place->office()).all().empty());
}

TEST_P(RestoreTest, WhatIsExchangedIsOnTheDiskBeforeTheDatabaseFollows)
{
    QStringList flushed;
    on_flush = [&] {
        const bool begun = QFile::exists(place->church() + u"restore_work/journal.json"_s);
        const bool exchanged =
            DataFolder::read(place->church() + u"Portrait/1.jpg"_s) == old_state[u"church1/Portrait/1.jpg"_s];
        flushed += begun ? exchanged ? u"exchanged"_s : u"begun"_s : u"prepared"_s;
    };

    ASSERT_TRUE(restore({.file = backup, .with_shared_files = false}));

    EXPECT_EQ(flushed.mid(flushed.indexOf(u"begun"_s)), (QStringList{u"begun"_s, u"exchanged"_s, u"exchanged"_s}));
}

TEST_P(RestoreTest, ARestoreThatSomebodyTookBackMeanwhileChangesNothing)
{
    on_flush = [&] { // As an older Mender would, between the exchange of the files and that of the database.
        const QString journal = place->church() + u"restore_work/journal.json"_s;
        const QString portrait = place->church() + u"Portrait"_s;
        if (!QFile::exists(journal) ||
            DataFolder::read(portrait + u"/1.jpg"_s) != old_state[u"church1/Portrait/1.jpg"_s])
            return;
        on_flush = nullptr;
        ASSERT_TRUE(QDir(portrait).removeRecursively());
        ASSERT_TRUE(QDir().rename(place->church() + u"restore_work/kept/0"_s, portrait));
        QFile::remove(journal);
    };

    EXPECT_FALSE(restore({.file = backup}));

    EXPECT_EQ(place->state()[u"families"_s], new_state[u"families"_s]);
    EXPECT_EQ(place->state()[u"church1/Portrait/1.jpg"_s], new_state[u"church1/Portrait/1.jpg"_s]);
    EXPECT_TRUE(place->dialogue().told.value(0).contains(u"Somebody else ended this restore meanwhile"));
}

TEST_P(RestoreTest, SomebodyInsideIsNamedAndNothingChanges)
{
    FakeWorkstation elsewhere;
    elsewhere.machine = u"office-2"_s;
    const auto session = connect_church(place->paths());
    Locks others(*session, elsewhere, place->started->clock);
    ASSERT_TRUE(others.take(LockKind::roll, 7));

    expect_refusal(u"office-2"_s);
}

TEST_P(RestoreTest, LocksThatTheBackupHoldsAreGoneAfterwards)
{
    ASSERT_TRUE(Locks(place->office()).take(LockKind::family, 3));
    const QString locked = place->back_up();
    Locks(place->office()).release(LockKind::family, 3);

    ASSERT_TRUE(restore({.file = locked}));

    EXPECT_TRUE(Locks(place->office()).all().empty());
}

TEST_P(RestoreTest, WithoutRoomNothingChanges)
{
    place->started->workstation.free = 4'100'000;

    expect_refusal(u"too little free space"_s);
}

TEST_P(RestoreTest, WithoutTheRightOrOnBookedOutDataNothingIsRestored)
{
    place->office().mode = Mode::booked_out;
    expect_refusal(u"Unable to perform this function as Kindrel is in Remote Access Mode"_s);
    place->dialogue().told.clear();
    place->office().mode = Mode::normal;
    place->office().rights.set(Area::restore_data, false);
    expect_refusal(u"Your password does not give access"_s);
}

TEST_P(RestoreTest, GivenUpAtAnyStepNothingChanges)
{
    PhaseProgress whole(place->church());
    ASSERT_TRUE(restore_backup(place->office(), {.file = backup}, whole));
    EXPECT_EQ(whole.taken, whole.announced);
    place->write_church(u"second"_s);
    const auto before = place->archives();
    for (const int last : whole.stops()) {
        StoppingProgress progress(last);
        EXPECT_FALSE(restore_backup(place->office(), {.file = backup}, progress)) << "after step " << last;
        EXPECT_TRUE(progress.ended);
        EXPECT_TRUE(place->leftovers().isEmpty()) << "after step " << last;
        EXPECT_EQ(place->state(), new_state) << "after step " << last;
        EXPECT_EQ(place->archives(), before) << "after step " << last;
    }
    EXPECT_EQ(DataFolder::read(place->church() + u"backups.json"_s).count("\"file\""), before.size());
    EXPECT_TRUE(place->dialogue().told.isEmpty());
}

TEST_P(RestoreTest, OnlyThreeBackupsOfStatesBeforeAreKept)
{
    for (int day = 1; day <= 5; ++day) {
        place->started->clock.set(QDate(2024, 7, day));
        ASSERT_TRUE(restore({.file = backup}));
    }

    const auto names = QDir(place->church() + u"Before_restore"_s).entryList({u"*.zip"_s}, QDir::Files, QDir::Name);
    ASSERT_EQ(names.size(), 3);
    EXPECT_TRUE(names.first().contains(u"2024-07-03"));
    EXPECT_TRUE(backups_of(place->office()).front().before_restore);
}

TEST_P(RestoreTest, AFullDiskChangesNothing)
{
    const Paths paths = place->paths();
    for (const rlim_t bytes : {4'096, 60'000, 400'000}) {
        const auto told = run_together({[&] {
                              StartedOffice started(paths);
                              fill_disk(bytes);
                              const bool done =
                                  restore_backup(started.office, {.file = backup}, started.silent).has_value();
                              return done ? "restored" : started.dialogue.told.join(u'\n').toUtf8();
                          }}).front();

        EXPECT_TRUE(told.startsWith("Restoring files failed because:-")) << bytes << ": " << told.toStdString();
        EXPECT_EQ(place->state(), new_state);
        EXPECT_TRUE(place->leftovers().isEmpty()) << place->leftovers().join(u' ').toStdString();
    }
}

TEST_P(RestoreTest, AFailureHalfwayPutsEverythingBack)
{
    // A folder where a letter should go can be moved, but a file cannot be put below another file.
    QDir(place->data.root() + u"custom"_s).removeRecursively();
    DataFolder::write(place->data.root() + u"custom"_s, "in the way");

    EXPECT_FALSE(restore({.file = backup}));

    ASSERT_EQ(place->dialogue().told.size(), 1);
    auto found = place->state();
    new_state.remove(u"custom/own.rpt"_s);
    EXPECT_EQ(found, new_state);
    EXPECT_EQ(DataFolder::read(place->data.root() + u"custom"_s), "in the way");
    EXPECT_TRUE(place->leftovers().isEmpty()) << place->leftovers().join(u' ').toStdString();
}

TEST(BringUpToDateTest, AnOlderDatabaseIsUpgradedOrRefused)
{
    const DataFolder data;
    DataFolder::make_church(data.root() + u"church1/"_s);
    const auto session = open_sqlite(data.paths().database());
    constexpr Upgrade chain[]{{2, "UPDATE [tbl_startup] SET [vision]='two';"},
                              {3, "UPDATE [tbl_startup] SET [footer_vision]='three';"}};

    EXPECT_THROW(bring_up_to_date(*session, chain, 4), BackupError);
    EXPECT_THROW(bring_up_to_date(*session, {}, 0), BackupError);
    bring_up_to_date(*session, chain, 3);

    const Settings found = read_settings(*session);
    EXPECT_EQ(found.Version, 3);
    EXPECT_EQ(found.vision, u"two"_s);
    EXPECT_EQ(found.footer_vision, u"three"_s);
}

} // namespace kindrel::test
