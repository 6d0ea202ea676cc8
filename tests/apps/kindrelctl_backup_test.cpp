#include "apps/kindrelctl_fixture.h"

#include "core/sqlite_session.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

class KindrelctlBackupTest : public KindrelctlTest
{
protected:
    void SetUp() override { make_church(20); }
    /// Tells the archive that was made; empty when there is none.
    [[nodiscard]] QString back_up(const QStringList& options = {})
    {
        const auto ended = run(QStringList{u"backup"_s} + options);
        EXPECT_EQ(ended.status, 0) << ended;
        EXPECT_TRUE(ended.err.isEmpty()) << ended;
        return QString::fromUtf8(ended.out).section(u": "_s, 1).trimmed();
    }
    void in_database(const QString& statement) const
    {
        core::open_sqlite(drive.filePath(u"Kindrel_10_Data/church1/KR10_records.kdl"_s))->execute(statement);
    }
    void rename_families() const { in_database(u"UPDATE [tbl_surname] SET [surname]='Changed';"_s); }
    [[nodiscard]] QString file_of(const QString& name, const QByteArray& content) const
    {
        const auto file = drive.filePath(name);
        QFile written(file);
        EXPECT_TRUE(written.open(QFile::WriteOnly) && written.write(content) == content.size());
        return file;
    }
    void expect_refusal(const QStringList& words, const QByteArray& message)
    {
        const auto before = list({u"families"_s});
        const auto ended = run(words);
        EXPECT_EQ(ended.status, 1) << ended;
        EXPECT_TRUE(ended.err.contains(message)) << ended;
        EXPECT_TRUE(ended.out.isEmpty()) << ended;
        EXPECT_EQ(list({u"families"_s}), before);
    }
};

TEST_F(KindrelctlBackupTest, ARestoredChurchIsAsItWasAndTheRestoreCanBeTakenBack)
{
    const auto then = list({u"families"_s});
    const auto backup = back_up();
    rename_families();
    const auto now = list({u"families"_s});
    ASSERT_NE(then, now);

    const auto restored = run({u"restore"_s, backup, u"--yes"_s});

    ASSERT_EQ(restored.status, 0) << restored;
    EXPECT_EQ(list({u"families"_s}), then);
    EXPECT_FALSE(restored.err.contains('%')) << "No progress where nobody watches: " << restored.err.toStdString();
    const auto before = QString::fromUtf8(restored.out).section(u"is kept in "_s, 1).trimmed();
    const auto back = run({u"restore"_s, before, u"--yes"_s});
    EXPECT_EQ(back.status, 0) << back;
    EXPECT_EQ(list({u"families"_s}), now);
}

TEST_F(KindrelctlBackupTest, AnEncryptedBackupNeedsItsPassword)
{
    const auto password = file_of(u"secret"_s, "Käse 7\nnot this line\n");
    const auto wrong = file_of(u"wrong"_s, "kaese\n");
    const auto then = list({u"families"_s});
    const auto backup = back_up({u"--encrypt"_s, u"--backup-password-file"_s, password});
    rename_families();

    for (const auto& command : {u"restore"_s, u"show-backup"_s}) {
        expect_refusal({command, backup}, "This backup can only be read with its password.");
        expect_refusal({command, backup, u"--backup-password-file"_s, wrong}, "The password of the backup is wrong.");
    }
    const auto restored = run({u"restore"_s, backup, u"--backup-password-file"_s, password, u"--yes"_s});

    EXPECT_EQ(restored.status, 0) << restored;
    EXPECT_EQ(list({u"families"_s}), then);
}

TEST_F(KindrelctlBackupTest, WithoutAUsablePasswordNothingIsMade)
{
    const auto empty = file_of(u"empty"_s, "\nthe second line\n");
    const QStringList backup{u"backup"_s, u"--to"_s, drive.path(), u"--encrypt"_s, u"--backup-password-file"_s};

    expect_refusal(backup + QStringList{empty}, "is empty");
    expect_refusal(backup + QStringList{drive.filePath(u"nowhere"_s)}, "is not there");

    EXPECT_TRUE(QDir(drive.path()).entryList({u"*.zip"_s}).isEmpty());
}

TEST_F(KindrelctlBackupTest, WhatIsNoBackupOfThisChurchChangesNothing)
{
    const auto backup = back_up();
    in_database(u"UPDATE [tbl_startup] SET [church_code]='another';"_s);

    expect_refusal({u"restore"_s, backup, u"--yes"_s}, "This backup was made of another church.");
    expect_refusal({u"restore"_s, file_of(u"letter.zip"_s, "Dear all,"), u"--yes"_s}, "Restoring files failed");
    expect_refusal({u"restore"_s, drive.filePath(u"nowhere.zip"_s), u"--yes"_s}, "Restoring files failed");
    const auto shown = run({u"show-backup"_s, backup});
    EXPECT_EQ(shown.status, 0) << shown;
    EXPECT_TRUE(shown.out.contains("another church than this")) << shown;
}

TEST_F(KindrelctlBackupTest, WithoutAnAnswerNothingIsReplaced)
{
    const auto backup = back_up();
    rename_families();

    expect_refusal({u"restore"_s, backup}, "Do you wish to replace the data of");
}

TEST_F(KindrelctlBackupTest, CtrlCGivesUpAndLeavesTheChurchOpenAndAsItWas)
{
    const auto backup = back_up();
    rename_families();
    const auto now = list({u"families"_s});
    for (const auto& words : {QStringList{u"backup"_s}, {u"restore"_s, backup, u"--yes"_s}}) {
        const auto ended = run(words, press_ctrl_c);
        EXPECT_EQ(ended.status, 1) << ended;
        EXPECT_TRUE(ended.err.contains("Given up; nothing was changed.")) << ended;
        EXPECT_EQ(list({u"families"_s}), now);
        EXPECT_EQ(list({u"backups"_s}).size(), 1);
    }
}

TEST_F(KindrelctlBackupTest, EveryKnownBackupIsListedWithItsState)
{
    const auto own = back_up();
    ASSERT_TRUE(QDir(drive.path()).mkdir(u"stick"_s));
    const auto taken_along = back_up({u"--to"_s, drive.filePath(u"stick"_s)});
    ASSERT_TRUE(taken_along.startsWith(drive.filePath(u"stick/"_s)));
    QFile changed(taken_along);
    ASSERT_TRUE(changed.open(QFile::Append) && changed.write("x") == 1);
    changed.close();

    const auto found = list({u"backups"_s});

    ASSERT_EQ(found.size(), 2);
    for (const auto& backup : found) {
        const auto file = backup[u"file"_s].toString();
        EXPECT_TRUE(file == own || file == taken_along) << file.toStdString();
        EXPECT_EQ(backup[u"verified"_s].toBool(), file == own);
        EXPECT_TRUE(backup[u"present"_s].toBool());
    }
}

TEST_F(KindrelctlBackupTest, ABackupIsShownBesideThePresent)
{
    const auto backup = back_up({u"--without"_s, u"pictures,letters"_s});
    in_database(u"DELETE FROM [tbl_surname] WHERE [Surname_ID]>15;"_s);

    const auto shown = run({u"show-backup"_s, backup});

    EXPECT_EQ(shown.status, 0) << shown;
    EXPECT_TRUE(QRegularExpression(u"Families +20 +15\n"_s).match(QString::fromUtf8(shown.out)).hasMatch()) << shown;
    EXPECT_FALSE(shown.out.contains("Letters")) << shown;
}

} // namespace kindrel::test
