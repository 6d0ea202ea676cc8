#include "kindrelctl_fixture.h"

#include "core/locks.h"
#include "core/sqlite_session.h"

namespace kindrel::test {

using namespace core;

/// The real program on a church that the command line made.
class MenderProgramTest : public KindrelctlTest
{
protected:
    void SetUp() override { make_church(30); }

    [[nodiscard]] Ended mender(const QStringList& words)
    {
        QProcess program;
        auto environment = QProcessEnvironment::systemEnvironment();
        for (const auto& display : {u"DISPLAY"_s, u"WAYLAND_DISPLAY"_s})
            environment.remove(display); // Where there is one, a window opens when no command is given.
        program.setProcessEnvironment(environment);
        program.start(qEnvironmentVariable("KINDREL_BIN") + u"/kindrel-mender"_s,
                      QStringList{u"--data-drive"_s, drive.path()} + words);
        program.closeWriteChannel();
        if (!program.waitForFinished(120'000) || program.exitStatus() != QProcess::NormalExit)
            return {-1, {}, program.errorString().toUtf8()};
        return {program.exitCode(), program.readAllStandardOutput(), program.readAllStandardError()};
    }
    [[nodiscard]] QString church() const { return drive.filePath(u"Kindrel_10_Data/church1/"_s); }
    [[nodiscard]] QString database() const { return church() + u"KR10_records.kdl"_s; }
    void in_church(const QString& statement) { open_sqlite(database())->execute(statement); }
    [[nodiscard]] int count(const QString& statement)
    {
        const auto session = open_sqlite(database());
        auto rows = session->select(statement);
        return rows.first()->integer(Column{0});
    }
    [[nodiscard]] int families() { return count(u"SELECT COUNT(*) FROM [tbl_surname];"_s); }
    [[nodiscard]] int hanging_on_people()
    {
        return count(u"SELECT (SELECT COUNT(*) FROM [tbl_status])+(SELECT COUNT(*) FROM [tbl_group])+"
                     "(SELECT COUNT(*) FROM [tbl_ministry])+(SELECT COUNT(*) FROM [tbl_individual_date]);"_s);
    }
};

TEST_F(MenderProgramTest, AChurchAndTheTrainingChurchAreSound)
{
    for (const auto& church : {u"1"_s, u"8"_s}) {
        const auto ended = mender({u"--church"_s, church, u"check"_s});
        EXPECT_EQ(ended.status, 0) << ended;
        EXPECT_TRUE(ended.out.contains("is sound.")) << ended;
        EXPECT_EQ(QJsonDocument::fromJson(mender({u"--church"_s, church, u"check"_s, u"--json"_s}).out).array(),
                  QJsonArray());
    }
}

TEST_F(MenderProgramTest, FindingsAreToldMendedWhenAgreedAndGoneAfterwards)
{
    in_church(u"DELETE FROM [tbl_address];"_s);
    const auto found = mender({u"check"_s, u"--json"_s});
    EXPECT_EQ(found.status, 1) << found;
    const auto findings = QJsonDocument::fromJson(found.out).array();
    ASSERT_EQ(findings.size(), 1) << found;
    EXPECT_EQ(findings[0][u"kind"_s], u"companions"_s);
    EXPECT_EQ(findings[0][u"count"_s], 30);
    EXPECT_EQ(findings[0][u"cure"_s], u"mend"_s);

    const auto unasked = mender({u"mend"_s}); // Nobody is there to say yes.
    EXPECT_EQ(unasked.status, 1) << unasked;
    EXPECT_EQ(mender({u"check"_s}).status, 1);

    const auto mended = mender({u"mend"_s, u"--yes"_s});
    EXPECT_EQ(mended.status, 0) << mended;
    EXPECT_TRUE(mended.out.contains("KR10_records before mending")) << mended;
    EXPECT_TRUE(mended.out.contains("30 families without an address record.")) << mended;
    EXPECT_EQ(mender({u"check"_s}).status, 0);
}

TEST_F(MenderProgramTest, UnlockLetsPeopleIntoAChurchThatStartUpRefuses)
{
    FakeWorkstation other;
    other.machine = u"office-2"_s;
    FixedClock clock;
    ASSERT_TRUE(Locks(*open_sqlite(database()), other, clock).take(LockKind::area, AreaCode::setup));
    DataFolder::write(church() + u"lock.dat"_s, "1234567890");
    EXPECT_EQ(run({u"totals"_s}).status, 1);
    EXPECT_EQ(mender({u"check"_s}).status, 1);
    EXPECT_EQ(mender({u"unlock"_s}).status, 1);
    EXPECT_TRUE(QFile::exists(church() + u"lock.dat"_s));

    const auto unlocked = mender({u"unlock"_s, u"--yes"_s});
    EXPECT_EQ(unlocked.status, 0) << unlocked;
    EXPECT_TRUE(unlocked.out.contains("office-2")) << unlocked;
    EXPECT_TRUE(unlocked.out.contains("'lock.dat'")) << unlocked;
    EXPECT_EQ(run({u"totals"_s}).status, 0);
    EXPECT_EQ(mender({u"check"_s}).status, 0);
}

TEST_F(MenderProgramTest, MendingWaitsForTheLocksOfOthersUnlessToldToRemoveThem)
{
    in_church(u"DELETE FROM [tbl_address];"_s);
    in_church(u"INSERT INTO [tbl_locked_family_files] ([surname_id],[workstation]) VALUES (1,'office-2');"_s);
    const auto refused = mender({u"mend"_s, u"--yes"_s});
    EXPECT_EQ(refused.status, 1) << refused;
    EXPECT_TRUE(refused.err.contains("office-2")) << refused;
    const auto mended = mender({u"mend"_s, u"--yes"_s, u"--remove-locks"_s});
    EXPECT_EQ(mended.status, 0) << mended;
    EXPECT_TRUE(mended.out.contains("Removed: ")) << mended;
}

TEST_F(MenderProgramTest, ADatabaseThatCannotBeOpenedIsRecoveredIntoANewFileAndTakenUpAgain)
{
    QByteArray content = DataFolder::read(database());
    content.chop(content.size() / 20);
    DataFolder::write(database(), content);
    EXPECT_EQ(run({u"totals"_s}).status, 1);
    const auto found = mender({u"check"_s, u"--json"_s});
    EXPECT_EQ(found.status, 1) << found;
    EXPECT_EQ(QJsonDocument::fromJson(found.out).array()[0][u"cure"_s], u"recover"_s) << found;
    EXPECT_EQ(mender({u"mend"_s, u"--yes"_s}).status, 1);

    const QString fresh = drive.filePath(u"fresh.kdl"_s);
    const auto recovered = mender({u"recover"_s, fresh, u"--yes"_s});
    ASSERT_TRUE(QFile::exists(fresh)) << recovered;
    EXPECT_TRUE(recovered.out.contains("tbl_surname: ")) << recovered;
    EXPECT_TRUE(recovered.out.contains("kindrel-mender put-in-place")) << recovered;
    EXPECT_EQ(DataFolder::read(database()), content);

    ASSERT_TRUE(QFile::rename(database(), database() + u".damaged"_s) && QFile::rename(fresh, database()));
    const int hanging = hanging_on_people();
    ASSERT_GT(hanging, 0);
    const auto mended = mender({u"mend"_s, u"--yes"_s});
    EXPECT_EQ(mended.status, 1) << mended;
    EXPECT_TRUE(mended.out.contains("Most of 'people' is gone")) << "What was cut off held them. " << mended;
    EXPECT_EQ(run({u"totals"_s}).status, 0);
    EXPECT_GT(families(), 0);
    EXPECT_EQ(hanging_on_people(), hanging) << "They wait for the people to come back.";
}

TEST_F(MenderProgramTest, AChurchThatDoesNotOpenIsSetAsideAndComesBackFromItsBackup)
{
    const auto made = run({u"backup"_s});
    const QString backup = QString::fromUtf8(made.out).section(u": "_s, 1).trimmed();
    EXPECT_EQ(mender({u"set-aside"_s, u"--yes"_s}).status, 1) << "It is sound.";
    DataFolder::write(database(), "no database");
    EXPECT_EQ(run({u"restore"_s, backup, u"--yes"_s}).status, 1);
    EXPECT_TRUE(mender({u"check"_s}).out.contains("kindrel-mender set-aside"));

    const auto aside = mender({u"set-aside"_s, u"--yes"_s});
    ASSERT_EQ(aside.status, 0) << aside;
    EXPECT_EQ(DataFolder::read(QString::fromUtf8(aside.out).section(u'\'', 1, 1)), "no database") << aside;
    const auto restored = run({u"restore"_s, backup, u"--yes"_s});
    EXPECT_EQ(restored.status, 0) << restored;
    EXPECT_EQ(families(), 30);
}

TEST_F(MenderProgramTest, ARecoveredFileIsPutInPlaceOnceNobodyWritesInTheDamagedOne)
{
    in_church(u"CREATE TABLE [unused] ([a]);"_s);
    const int page = count(u"SELECT [rootpage] FROM sqlite_master WHERE [name]='unused';"_s);
    QByteArray content = DataFolder::read(database());
    content.replace(qsizetype(page - 1) * 4096, 8, QByteArray(8, 'x'));
    DataFolder::write(database(), content);
    const QString fresh = drive.filePath(u"fresh.kdl"_s);
    ASSERT_EQ(mender({u"recover"_s, fresh, u"--yes"_s}).status, 0);
    auto writer = open_sqlite(database());
    writer->execute(u"BEGIN IMMEDIATE;"_s);
    for (const auto& act : {QStringList{u"set-aside"_s}, {u"put-in-place"_s, fresh}}) {
        const auto refused = mender(act + QStringList{u"--yes"_s});
        EXPECT_EQ(refused.status, 1) << refused;
        EXPECT_TRUE(refused.err.contains("Somebody is reading or writing in the church just now.")) << refused;
        EXPECT_TRUE(QFile::exists(database()) && QFile::exists(fresh));
    }
    writer.reset();
    const auto put = mender({u"put-in-place"_s, fresh, u"--yes"_s});
    EXPECT_EQ(put.status, 0) << put;
    EXPECT_TRUE(put.out.contains("KR10_records set aside")) << put;
    EXPECT_EQ(families(), 30);
    EXPECT_FALSE(QFile::exists(fresh));
}

TEST_F(MenderProgramTest, AFileRecoveredFromASoundChurchIsNotSaidToComeInItsPlace)
{
    const auto recovered = mender({u"recover"_s, drive.filePath(u"fresh.kdl"_s), u"--yes"_s});
    EXPECT_EQ(recovered.status, 0) << recovered;
    EXPECT_TRUE(recovered.out.contains("The new church file is")) << recovered;
    EXPECT_FALSE(recovered.out.contains("put-in-place")) << recovered;
}

TEST_F(MenderProgramTest, WrongUsageIsToldAndNothingIsDone)
{
    for (const QStringList& words : {QStringList{},
                                     {u"heal"_s},
                                     {u"recover"_s},
                                     {u"check"_s, u"more"_s},
                                     {u"set-aside"_s, u"more"_s},
                                     {u"--church"_s, u"10"_s, u"check"_s},
                                     {u"--nonsense"_s, u"check"_s}}) {
        const auto ended = mender(words);
        EXPECT_EQ(ended.status, 2) << words.join(u' ').toStdString() << ended;
        EXPECT_TRUE(ended.err.contains("kindrel-mender --help")) << ended;
    }
    EXPECT_EQ(mender({u"--help"_s}).status, 0);
}

} // namespace kindrel::test
