#include "core/backup_rotation.h"

#include "core/open_church.h"
#include "core/settings.h"
#include "core/sqlite_session.h"
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

const QDate today{2024, 5, 15};

}

class BackupRotationTest : public testing::Test
{
protected:
    void SetUp() override { DataFolder::make_church(church); }

    /// A backup of `age` days that holds only its own name.
    void keep(const QString& name, int age)
    {
        DataFolder::write(backups + name, name.toUtf8());
        QFile file(backups + name);
        ASSERT_TRUE(file.open(QIODevice::ReadWrite));
        ASSERT_TRUE(file.setFileTime(QDateTime(today.addDays(-age), {23, 59}), QFile::FileModificationTime));
    }
    /// The backups that are there, newest first, "database" for a copy of the church.
    [[nodiscard]] QStringList found() const
    {
        QStringList contents;
        const QStringList names{u"systembackup.kdl"_s, u"systembackup_old_1.kdl"_s, u"systembackup_old_2.kdl"_s,
                                u"systembackup_old_3.kdl"_s};
        for (const auto& name : names) {
            const bool there = QFile::exists(backups + name);
            const QByteArray content = there ? DataFolder::read(backups + name) : "-";
            contents += content.startsWith("SQLite format 3") ? u"database"_s : QString::fromUtf8(content);
        }
        return contents;
    }

    DataFolder data;
    QString church = data.root() + u"church1/"_s;
    QString backups = church + u"Backup1/"_s;
};

TEST_F(BackupRotationTest, TheFirstBackupMakesItsFolder)
{
    QDir(backups).removeRecursively();

    rotate_system_backups(data.paths(), 1, today);

    EXPECT_EQ(found(), QStringList({u"database"_s, u"-"_s, u"-"_s, u"-"_s}));
    EXPECT_EQ(read_version(*open_sqlite(backups + u"systembackup.kdl"_s)), 1);
    EXPECT_EQ(QDir(backups).entryList(QDir::Files).size(), 1);
    EXPECT_FALSE(QFile::exists(church + u"lock.dat"_s));
}

TEST_F(BackupRotationTest, ABackupOfThirtyDaysIsKeptAndOneOfThirtyOneGivesWay)
{
    keep(u"systembackup.kdl"_s, 30);
    rotate_system_backups(data.paths(), 1, today);
    EXPECT_EQ(found().first(), u"systembackup.kdl"_s);

    keep(u"systembackup.kdl"_s, 31);
    keep(u"systembackup_old_1.kdl"_s, 62);
    keep(u"systembackup_old_2.kdl"_s, 93);
    keep(u"systembackup_old_3.kdl"_s, 124);
    rotate_system_backups(data.paths(), 1, today);
    EXPECT_EQ(found(), QStringList({u"database"_s, u"systembackup.kdl"_s, u"systembackup_old_1.kdl"_s,
                                    u"systembackup_old_2.kdl"_s}));
}

TEST_F(BackupRotationTest, AGapInTheSetIsCarriedOn)
{
    keep(u"systembackup.kdl"_s, 40);
    keep(u"systembackup_old_3.kdl"_s, 200);

    rotate_system_backups(data.paths(), 1, today);

    EXPECT_EQ(found(), QStringList({u"database"_s, u"systembackup.kdl"_s, u"-"_s, u"-"_s}));
}

TEST_F(BackupRotationTest, TrainingBookedOutMissingAndBusyChurchesAreLeftAlone)
{
    for (const int number : {training_church, booked_out_church}) {
        const auto mode = number == training_church ? Mode::training : Mode::booked_out;
        const Paths paths = data.paths(mode, number);
        DataFolder::make_church(paths.folder(Folder::church));
        rotate_system_backups(paths, number, today);
        EXPECT_FALSE(paths.exists(Folder::church, u"Backup1"_s));
    }

    rotate_system_backups(data.paths(Mode::normal, 2), 2, today);
    EXPECT_FALSE(QFile::exists(data.root() + u"church2/Backup1/systembackup.kdl"_s));

    DataFolder::write(church + u"Lock.dat"_s, "1234567890");
    rotate_system_backups(data.paths(), 1, today);
    EXPECT_EQ(found().first(), u"-"_s);
    EXPECT_TRUE(QFile::exists(church + u"Lock.dat"_s));
}

TEST_F(BackupRotationTest, ADamagedDatabaseNeverPushesOutGoodBackups)
{
    keep(u"systembackup.kdl"_s, 50);
    keep(u"systembackup_old_1.kdl"_s, 90);
    QByteArray content = DataFolder::read(church + u"KR10_records.kdl"_s);
    content.replace(8192, 4096, QByteArray(4096, '?'));
    DataFolder::write(church + u"KR10_records.kdl"_s, content);

    EXPECT_THROW(rotate_system_backups(data.paths(), 1, today), DatabaseError);

    EXPECT_EQ(found(), QStringList({u"systembackup.kdl"_s, u"systembackup_old_1.kdl"_s, u"-"_s, u"-"_s}));
    EXPECT_EQ(QDir(backups).entryList(QDir::Files).size(), 2);
    EXPECT_FALSE(QFile::exists(church + u"lock.dat"_s));
}

TEST_F(BackupRotationTest, AKillDuringTheRotationLeavesSoundBackupsOnly)
{
    rotate_system_backups(data.paths(), 1, today);
    const auto rotate_for_ever = [this](const Ready& ready) {
        ready();
        for (int months = 2;; ++months) {
            QFile::remove(church + u"lock.dat"_s);
            rotate_system_backups(data.paths(), 1, QDate::currentDate().addMonths(months));
        }
    };
    for (int after = 0; after < 40'000; after += 4'000) {
        run_and_kill(rotate_for_ever, std::chrono::microseconds(after));

        const QStringList names = QDir(backups).entryList({u"*.kdl"_s});
        EXPECT_FALSE(names.isEmpty());
        for (const auto& name : names)
            check_church_file(backups + name);
    }
}

TEST_F(BackupRotationTest, TheBackupHoldsWhatOtherWorkstationsHaveCommitted)
{
    const auto other = open_sqlite(church + u"KR10_records.kdl"_s);
    write_setting(*other, u"vision"_s, u"To serve"_s);

    rotate_system_backups(data.paths(), 1, today);

    EXPECT_EQ(read_settings(*open_sqlite(backups + u"systembackup.kdl"_s)).vision, u"To serve"_s);
    write_setting(*other, u"vision"_s, u"still open"_s);
}

TEST_F(BackupRotationTest, AChurchOnAServerIsBackedUpAsAChurchFileWithEveryRow)
{
    if (!TestChurch::available(EngineKind::postgres))
        GTEST_SKIP() << "No server: run through ./test, or tests/support/with-postgres.";
    TestChurch server(EngineKind::postgres);
    std::vector<std::vector<Value>> families;
    for (qint64 key = 1; key <= 12'000; ++key)
        families.push_back({key, to_value(u"Ö %1"_s.arg(key))});
    server.session().insert(u"tbl_surname"_s, {u"Surname_ID"_s, u"surname"_s}, families);
    QFile::remove(church + u"KR10_records.kdl"_s);
    DataFolder::write(church + connection_file.toString(), server.connection().toUtf8());
    keep(u"systembackup.kdl"_s, 31);
    {
        Transaction somebody_writes(server.session());
        server.session().execute(u"UPDATE [tbl_surname] SET [surname]='later';"_s);
        rotate_system_backups(data.paths(), 1, today);
    }
    EXPECT_EQ(found(), QStringList({u"database"_s, u"systembackup.kdl"_s, u"-"_s, u"-"_s}));
    const auto backup = open_sqlite(backups + u"systembackup.kdl"_s);
    EXPECT_EQ(number_of(*backup, u"SELECT COUNT(*) FROM [tbl_surname] WHERE [surname]='Ö '||[Surname_ID];"_s), 12'000);

    DataFolder::write(church + connection_file.toString(), "host=/nowhere dbname=church");
    keep(u"systembackup.kdl"_s, 31);
    EXPECT_THROW(rotate_system_backups(data.paths(), 1, today), DatabaseError);
    EXPECT_EQ(found(), QStringList({u"systembackup.kdl"_s, u"systembackup.kdl"_s, u"-"_s, u"-"_s}));
    EXPECT_FALSE(QFile::exists(church + u"lock.dat"_s));
}

} // namespace kindrel::test
