#include "core/open_church.h"
#include "core/restore_swap.h"
#include "core/sqlite_session.h"
#include "core/startup_steps.h"
#include "support/data_folder.h"

#include <QFile>

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

QByteArray names_file(const QString& church_1)
{
    SideRecord names(side_files::church_names);
    names.set_text("church_1", church_1);
    return names.bytes();
}

} // namespace

/// A restore whose program was killed after it had exchanged the files.
class StartupRestoreTest : public testing::Test, protected TestStart
{
protected:
    void SetUp() override
    {
        ASSERT_TRUE(start());
        DataFolder::write(portrait, "old");
        DataFolder::write(names, names_file(u"Old"_s));
        const auto session = open_sqlite(data.paths().database());
        RestoreWork work(data.paths());
        DataFolder::write(work.unpacked() + u"Portrait/1.jpg"_s, "restored");
        DataFolder::write(work.unpacked() + u"church_names.dat"_s, names_file(u"Restored"_s));
        work.swap({{u"unpacked/Portrait/"_s, Folder::portrait, {}},
                   {u"unpacked/church_names.dat"_s, Folder::global, QLatin1String(side_files::church_names.name)}});
        ASSERT_EQ(DataFolder::read(portrait), "restored");
    }
    /// What the restore does together with the new content of the database.
    void commit()
    {
        in_database(u"INSERT INTO [tbl_setting] ([setting],[value]) VALUES ('last_restore','%1');"_s.arg(id()));
    }
    [[nodiscard]] QString id() const
    {
        return QString::fromUtf8(DataFolder::read(journal)).section(u"\"id\": \""_s, 1).section(u'"', 0, 0);
    }

    QString church = data.paths().folder(Folder::church);
    QString journal = church + u"restore_work/journal.json"_s;
    QString portrait = data.paths().file(Folder::portrait, u"1.jpg"_s);
    QString names = data.paths().file(Folder::global, QLatin1String(side_files::church_names.name));
};

TEST_F(StartupRestoreTest, ARestoreCutOffBeforeItsCommitIsTakenBack)
{
    const auto office = start();

    ASSERT_TRUE(office);
    EXPECT_EQ(DataFolder::read(portrait), "old");
    EXPECT_EQ(office->church_name, u"Old"_s);
    EXPECT_EQ(office->church_names.size(), qsizetype(side_files::church_names.fields.size()));
    EXPECT_FALSE(restore_unsettled(office->paths));
    EXPECT_FALSE(QFile::exists(church + u"lock.dat"_s));
}

TEST_F(StartupRestoreTest, ARestoreCutOffAfterItsCommitIsFinished)
{
    commit();

    const auto office = start({Purpose::command_line});

    ASSERT_TRUE(office);
    EXPECT_EQ(DataFolder::read(portrait), "restored");
    EXPECT_EQ(office->church_name, u"Restored"_s);
    EXPECT_FALSE(restore_unsettled(office->paths));
}

TEST_F(StartupRestoreTest, ARestoreUnderWayAtAnotherWorkstationIsLeftAlone)
{
    Office office{.paths = data.paths(),
                  .session = open_sqlite(data.paths().database()),
                  .workstation = workstation,
                  .dialogue = dialogue,
                  .clock = clock};
    const StartRequest request;
    startup_steps::State state{.request = request, .progress = progress, .office = office};
    DataFolder::write(church + u"lock.dat"_s, "1234567890"); // It began after start-up had looked.
    dialogue.expect_box(busy_notice().text);

    EXPECT_FALSE(startup_steps::settle_restore(state));

    EXPECT_EQ(DataFolder::read(portrait), "restored");
    EXPECT_TRUE(QFile::exists(journal));
}

TEST_F(StartupRestoreTest, ARestoreThatCannotBeSettledIsToldAndSetAsideForTheNextStart)
{
    DataFolder::write(journal, "{");
    dialogue.expect_box(
        u"The record of an interrupted restore is damaged, so that it cannot be told how far the restore came. What it "
        "had made ready and what it had replaced was moved to '%1mended/restore_work'. The church's database is whole "
        "and stays as it is; of the pictures, notebook pages, letters and settings some may be those of the backup. "
        "Look at them, or restore a backup once more."_s.arg(church),
        u"Kindrel is now going to shut down."_s);

    EXPECT_FALSE(start());

    EXPECT_EQ(DataFolder::read(church + u"mended/restore_work/kept/0/1.jpg"_s), "old");
    EXPECT_FALSE(QFile::exists(church + u"lock.dat"_s));
    EXPECT_TRUE(start());
}

} // namespace kindrel::test
