#include "core/backup.h"

#include "backup_place.h"
#include "core/backup_writing.h"
#include "support/processes.h"

#include <QFileInfo>

#include <unistd.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

const QString failed = u"Backup failed because:-"_s;

} // namespace

class BackupTest : public BackupPlaceTest
{
protected:
    /// No backup comes about; the first thing told holds the words, and nothing is left behind.
    void expect_failure(const BackupRequest& request, const QString& words)
    {
        const auto before = place->archives();
        EXPECT_FALSE(make_backup(place->office(), request, place->started->silent));
        ASSERT_EQ(place->dialogue().told.size(), 1);
        EXPECT_TRUE(place->dialogue().told.first().contains(words)) << place->dialogue().told.first().toStdString();
        EXPECT_EQ(place->archives(), before);
        EXPECT_TRUE(place->leftovers().isEmpty()) << place->leftovers().join(u' ').toStdString();
    }
};
KINDREL_ON_BOTH_ENGINES(BackupTest);

TEST_P(BackupTest, ABackupTellsWhatIsInIt)
{
    place->session().execute(u"INSERT INTO [tbl_visitation] ([Surname_ID],[visitor]) VALUES (1,'A');"_s);
    const QString file = place->back_up();

    const auto contents = read_backup(file, {});
    EXPECT_EQ(contents.made, place->started->clock.now());
    EXPECT_EQ(contents.church.church_name, u"Morning"_s);
    EXPECT_EQ(contents.church.last_change, (Date{2024, 5, 1}));
    EXPECT_EQ(contents.church.rows[u"tbl_surname"_s], 20);
    EXPECT_EQ(contents.church.rows[u"tbl_visitation"_s], 1);
    QMap<QString, int> files;
    for (const auto& part : contents.parts)
        files[part.words] = part.files;
    EXPECT_EQ(files.size(), 12);
    for (const auto& [words, number] : files.asKeyValueRange()) {
        const int expected = words == u"Photographs" ? 2 : words == u"Settings" ? 0 : 1;
        EXPECT_EQ(number, expected) << words.toStdString();
    }
    EXPECT_TRUE(place->leftovers().isEmpty());
}

TEST_P(BackupTest, EveryKindOfRecordThatCameOrWentSinceIsCompared)
{
    place->session().execute(u"INSERT INTO [tbl_address] ([surname_id]) VALUES (1),(2);"_s);
    const auto contents = read_backup(place->back_up(), {});
    const auto kinds = compared_kinds(contents.church, present_state(place->office())).size();
    place->session().execute(u"INSERT INTO [tbl_weekly_amount] ([date_id],[group_id],[amount]) VALUES (1,2,3);"_s);
    place->session().execute(u"INSERT INTO [tbl_family_date] ([Surname_ID],[family_date_id]) VALUES (1,2),(2,2);"_s);
    place->session().execute(u"DELETE FROM [tbl_surname] WHERE [Surname_ID]=20;"_s);
    place->session().execute(u"DELETE FROM [tbl_address];"_s);
    place->session().execute(u"INSERT INTO [tbl_setting] ([setting],[value]) VALUES ('last_restore','x');"_s);

    QMap<QString, std::pair<qint64, qint64>> found;
    for (const auto& kind : compared_kinds(contents.church, present_state(place->office()))) {
        if (kind.then != kind.now)
            found[kind.words] = {kind.then, kind.now};
    }
    EXPECT_EQ(found, (QMap<QString, std::pair<qint64, qint64>>{{u"Families"_s, {20, 19}},
                                                               {u"Weekly figures"_s, {0, 1}},
                                                               {u"Other records added since"_s, {0, 2}},
                                                               {u"Other records removed since"_s, {2, 0}}}));
    EXPECT_EQ(compared_kinds(contents.church, present_state(place->office())).size(), kinds + 2)
        << "Where nothing differs no line says so.";
}

TEST_P(BackupTest, AListOfBackupsThatCannotBeReadIsForgotten)
{
    const QString file = place->back_up();
    const QString list = place->church() + u"backups.json"_s;
    ASSERT_TRUE(QFile::remove(list) && QDir().mkdir(list));
    const auto known = backups_of(place->office());
    ASSERT_EQ(known.size(), 1U);
    EXPECT_EQ(known.front().file, file);
}

TEST_P(BackupTest, WhatCouldNotBeNotedIsToldOnceNobodyIsKeptOut)
{
    ASSERT_TRUE(QDir().mkdir(place->church() + u"backups.json"_s));
    QStringList there;
    place->dialogue().on_show = [&] {
        there += place->leftovers();
    };

    (void)place->back_up();

    ASSERT_EQ(place->dialogue().told.size(), 1);
    EXPECT_TRUE(place->dialogue().told.first().startsWith(u"The backup is made, but its settings could not be kept."));
    EXPECT_EQ(there, QStringList());
}

/// How much of a folder is written between two steps at the most.
class GrowthProgress : public SilentProgress
{
public:
    explicit GrowthProgress(const QString& folder) : m_folder(folder) {}
    bool step(const QString&) override
    {
        qint64 size = 0;
        for (const auto& file : QDir(m_folder).entryInfoList(QDir::Files))
            size += file.size();
        largest = std::max(largest, size - m_before);
        m_before = size;
        return true;
    }
    qint64 largest = 0;

private:
    QString m_folder;
    qint64 m_before = 0;
};

TEST_P(BackupTest, OneLargeFileAmongSmallOnesIsWrittenInManySteps)
{
    const QTemporaryDir disk;
    DataFolder::write(place->church() + u"Portrait/large.jpg"_s, QByteArray(8'000'000, 'x'));
    GrowthProgress progress(disk.path());

    ASSERT_TRUE(make_backup(place->office(), {.folder = disk.path()}, progress));

    EXPECT_GT(progress.largest, 0);
    EXPECT_LT(progress.largest, 1'000'000);
}

TEST_P(BackupTest, AChurchGetsItsCodeOnceAndForAll)
{
    const auto first = read_backup(place->back_up(), {}).church.church_code;
    const auto second = read_backup(place->back_up(), {}).church.church_code;

    EXPECT_EQ(first.size(), 32);
    EXPECT_EQ(first, second);
    EXPECT_EQ(present_state(place->office()).church_code, first);
}

TEST_P(BackupTest, TheFiveFoldersTakeTurnsAndTheOldestBackupGoes)
{
    DataFolder::write(place->church() + u"Backup1/systembackup.kdl"_s, "system");
    const QString first = place->back_up();
    for (int folder = 2; folder <= 5; ++folder)
        EXPECT_TRUE(place->back_up().contains(u"/Backup%1/"_s.arg(folder)));
    place->started->clock.set(QDate(2024, 5, 16));
    const QString sixth = place->back_up();

    EXPECT_TRUE(sixth.contains(u"/Backup1/"));
    EXPECT_FALSE(QFile::exists(first));
    EXPECT_EQ(place->archives().size(), 5);
    EXPECT_EQ(DataFolder::read(place->church() + u"Backup1/systembackup.kdl"_s), "system");
    const auto settings = read_side_file(place->paths(), side_files::backup);
    EXPECT_EQ(settings->number("next_folder"), 2);
    EXPECT_EQ(settings->text("last_backup"), u"2024-05-16"_s);
}

/// Looks at every file of a backup folder at each step.
class WatchingProgress : public SilentProgress
{
public:
    explicit WatchingProgress(const QString& folder) : m_folder(folder) {}
    bool step(const QString&) override
    {
        for (const auto& file : QDir(m_folder).entryInfoList(QDir::Files)) {
            ++seen;
            const auto others = QFile::ReadOther | QFile::WriteOther | QFile::ExeOther;
            EXPECT_FALSE(file.permissions() & others) << file.filePath().toStdString();
        }
        return true;
    }
    int seen = 0;

private:
    QString m_folder;
};

TEST_P(BackupTest, OnlyOwnerAndGroupCanReadABackupAtAnyMoment)
{
    const QTemporaryDir disk;
    WatchingProgress progress(disk.path());

    ASSERT_TRUE(make_backup(place->office(), {.folder = disk.path()}, progress));

    EXPECT_GT(progress.seen, 0);
    EXPECT_TRUE(progress.step({}));
    const auto list = QFile::permissions(place->church() + u"backups.json"_s);
    EXPECT_FALSE(list & (QFile::ReadOther | QFile::WriteOther));
}

TEST_P(BackupTest, WithAPasswordNothingIsReadWithoutIt)
{
    const QTemporaryDir disk;
    const QString file = place->back_up({.folder = disk.path(), .password = u"für uns"_s});

    EXPECT_TRUE(read_backup(file, u"für uns"_s).encrypted);
    EXPECT_FALSE(DataFolder::read(file).contains("Morning"));
    const auto fault_with = [&](const QString& password) {
        try {
            (void)read_backup(file, password);
        } catch (const BackupError& error) {
            return error.fault();
        }
        return BackupFault::older;
    };
    EXPECT_EQ(fault_with({}), BackupFault::password_needed);
    EXPECT_NE(fault_with(u"fur uns"_s), BackupFault::older);
    EXPECT_EQ(read_side_file(place->paths(), side_files::backup)->text("path"), disk.path());
}

TEST_P(BackupTest, GivenUpAtAnyStepNothingIsLeft)
{
    PhaseProgress whole(place->church());
    ASSERT_TRUE(make_backup(place->office(), {}, whole));
    EXPECT_EQ(whole.taken, whole.announced);
    const auto before = place->archives();
    for (const int last : whole.stops()) {
        StoppingProgress progress(last);
        EXPECT_FALSE(make_backup(place->office(), {}, progress)) << "after step " << last;
        EXPECT_TRUE(progress.ended);
        EXPECT_TRUE(place->leftovers().isEmpty()) << "after step " << last;
        EXPECT_EQ(place->archives(), before) << "after step " << last;
    }
    EXPECT_TRUE(place->dialogue().told.isEmpty());
}

/// Somebody saves a photograph anew at each of these steps.
class ChangingProgress : public SilentProgress
{
public:
    ChangingProgress(const QString& file, int first, int last) : m_file(file), m_first(first), m_last(last) {}
    bool step(const QString&) override
    {
        if (++m_step >= m_first && m_step <= m_last)
            DataFolder::write(m_file, QByteArray(m_step, 'x'));
        return true;
    }

private:
    QString m_file;
    int m_first, m_last, m_step = 0;
};

TEST_P(BackupTest, AFileThatChangesMeanwhileIsReadOnceMoreAndThenToldByItsKind)
{
    const QString photograph = place->church() + u"Portrait/1.jpg"_s;
    ChangingProgress once(photograph, 6, 6);
    const auto report = make_backup(place->office(), {}, once);
    ASSERT_TRUE(report) << place->dialogue().told.join(u'\n').toStdString();
    EXPECT_TRUE(place->leftovers().isEmpty());

    const auto before = place->archives();
    ChangingProgress always(photograph, 6, 1000);
    EXPECT_FALSE(make_backup(place->office(), {}, always));
    ASSERT_EQ(place->dialogue().told.size(), 1);
    EXPECT_TRUE(place->dialogue().told.first().contains(u"One of the photographs was changed while the backup"))
        << place->dialogue().told.first().toStdString();
    EXPECT_EQ(place->archives(), before);
    EXPECT_TRUE(place->leftovers().isEmpty());
}

TEST_P(BackupTest, ABusyChurchIsNotBackedUp)
{
    DataFolder::write(place->church() + u"Lock.dat"_s, "1234567890");

    EXPECT_FALSE(make_backup(place->office(), {}, place->started->silent));

    EXPECT_TRUE(place->dialogue().told.first().contains(u"Another user is either compacting files"));
    EXPECT_TRUE(QFile::exists(place->church() + u"Lock.dat"_s));
    EXPECT_TRUE(place->archives().isEmpty());
}

TEST_P(BackupTest, WithoutTheRightThereIsNoBackup)
{
    place->office().rights = {};

    expect_failure({}, u"Your password does not give access"_s);
}

TEST_P(BackupTest, AMissingFolderIsToldAndNotMade)
{
    const QTemporaryDir disk;

    expect_failure({.folder = disk.filePath(u"gone"_s)}, u"cannot be found"_s);

    EXPECT_FALSE(QFile::exists(disk.filePath(u"gone"_s)));
}

TEST_P(BackupTest, TooLittleRoomIsToldBeforehand)
{
    place->started->workstation.free = 3'000'000;

    expect_failure({}, u"too little free space"_s);
}

TEST_P(BackupTest, AFolderThatCannotBeWrittenIsTold)
{
    if (geteuid() == 0)
        GTEST_SKIP() << "Nothing keeps the superuser from writing.";
    const QTemporaryDir disk;
    QFile::setPermissions(disk.path(), QFile::ReadOwner | QFile::ExeOwner);

    expect_failure({.folder = disk.path()}, u"does not allow files to be written"_s);

    QFile::setPermissions(disk.path(), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
}

QByteArray back_up_on_full_disk(const Paths& paths, rlim_t bytes)
{
    StartedOffice started(paths);
    fill_disk(bytes);
    const bool made = make_backup(started.office, {}, started.silent).has_value();
    return made ? "made" : started.dialogue.told.join(u'\n').toUtf8();
}

TEST_P(BackupTest, AFullDiskLeavesTheOlderBackupsAndNothingElse)
{
    const QString older = place->back_up();
    DataFolder::write(place->church() + u"Portrait/2.jpg"_s, QByteArray(3'000'000, 'x'));
    const Paths paths = place->paths();
    for (const rlim_t bytes : {4'096, 60'000, 1'000'000, 2'900'000}) {
        const auto told = run_together({[&] {
                              return back_up_on_full_disk(paths, bytes);
                          }}).front();

        EXPECT_TRUE(told.startsWith(failed.toUtf8())) << bytes << ": " << told.toStdString();
        EXPECT_EQ(place->archives(), QStringList(older));
        EXPECT_TRUE(place->leftovers().isEmpty()) << place->leftovers().join(u' ').toStdString();
    }
}

TEST_P(BackupTest, KnownBackupsAreListedAndChangedOnesAreNotVerified)
{
    const QTemporaryDir disk;
    const QString own = place->back_up();
    place->started->clock.set(QDate(2024, 5, 20));
    const QString on_disk = place->back_up({.folder = disk.path()});
    place->started->clock.set(QDate(2024, 5, 21));
    const QString changed = place->back_up();
    DataFolder::write(changed, DataFolder::read(changed) + "x");
    QFile::remove(on_disk);

    const auto known = backups_of(place->office());

    ASSERT_EQ(known.size(), 3U);
    EXPECT_EQ(known[0].file, changed);
    EXPECT_FALSE(known[0].verified);
    EXPECT_EQ(known[1].file, on_disk);
    EXPECT_FALSE(known[1].present);
    EXPECT_EQ(known[2].file, own);
    EXPECT_TRUE(known[2].verified);
    EXPECT_EQ(known[2].size, QFileInfo(own).size());
}

} // namespace kindrel::test
