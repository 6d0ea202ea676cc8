#include "apps/kindrelctl_fixture.h"

#include "core/backup_manifest.h"
#include "core/postgres_session.h"
#include "core/sqlite_session.h"
#include "support/test_church.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

class KindrelctlCopyTest : public KindrelctlTest
{
protected:
    void SetUp() override
    {
        if (!TestChurch::available(core::EngineKind::postgres))
            GTEST_SKIP() << "No server: run through ./test, or tests/support/with-postgres.";
        make_church(20);
        (void)core::provide_church_code(*core::open_sqlite(own_file()));
        server.emplace(core::EngineKind::postgres);
        server->session().execute(u"DROP SCHEMA public CASCADE"_s);
        server->session().execute(u"CREATE SCHEMA public"_s);
        server->close();
    }
    [[nodiscard]] QString church() const { return drive.filePath(u"Kindrel_10_Data/church1/"_s); }
    [[nodiscard]] QString own_file() const { return church() + u"KR10_records.kdl"_s; }
    [[nodiscard]] QString server_file() const { return church() + u"KR10_records.server"_s; }
    void use_server() const
    {
        QFile written(server_file());
        ASSERT_TRUE(written.open(QFile::WriteOnly) && written.write(server->connection().toUtf8() + '\n') > 0);
    }
    [[nodiscard]] Ended copy(const QString& to, const QStringList& options = {})
    {
        return run(QStringList{u"copy-church"_s, u"--from"_s, u"1"_s, u"--to"_s, to} + options);
    }

    std::optional<TestChurch> server;
};

TEST_F(KindrelctlCopyTest, AChurchGoesToTheServerAndComesBack)
{
    const auto before = list({u"families"_s});

    const auto there = copy(server->connection());
    ASSERT_EQ(there.status, 0) << there;
    EXPECT_TRUE(there.out.contains("is copied and compared: ")) << there;
    EXPECT_TRUE(there.out.contains("write the server's keywords into")) << there;
    use_server();
    ASSERT_TRUE(QFile::remove(own_file()));
    EXPECT_EQ(list({u"families"_s}), before);

    const auto back = copy(own_file());
    ASSERT_EQ(back.status, 0) << back;
    ASSERT_TRUE(QFile::remove(server_file()));
    EXPECT_EQ(list({u"families"_s}), before);
}

TEST_F(KindrelctlCopyTest, AnOlderCopyIsReplacedOnRequestAndOnlyWithAYes)
{
    const auto keywords = drive.filePath(u"new.server"_s);
    use_server();
    ASSERT_TRUE(QFile::rename(server_file(), keywords));
    ASSERT_EQ(copy(keywords).status, 0);
    core::open_sqlite(own_file())->execute(u"UPDATE [tbl_surname] SET [surname]='Changed';"_s);
    const auto changed = [&] {
        return number_of(*core::open_postgres(server->connection()),
                         u"SELECT COUNT(*) FROM [tbl_surname] WHERE [surname]='Changed';"_s);
    };
    for (const auto& options : {QStringList{}, {u"--yes"_s}, {u"--replace"_s}}) {
        const auto refused = copy(keywords, options);
        EXPECT_EQ(refused.status, 1) << refused;
        EXPECT_EQ(changed(), 0);
    }
    const auto replaced = copy(keywords, {u"--replace"_s, u"--yes"_s});
    EXPECT_EQ(replaced.status, 0) << replaced;
    EXPECT_EQ(changed(), 20);
}

TEST_F(KindrelctlCopyTest, CtrlCGivesUpAndLeavesNoCopy)
{
    const auto ended = run({u"copy-church"_s, u"--to"_s, server->connection()}, press_ctrl_c);
    EXPECT_EQ(ended.status, 1);
    EXPECT_TRUE(ended.err.contains("Given up; there is no copy.")) << ended;
    EXPECT_EQ(copy(server->connection()).status, 0) << "Nothing may be left of the first run.";
}

TEST_F(KindrelctlCopyTest, WhatIsNoEndIsToldAndNothingIsCopied)
{
    const std::vector<std::tuple<QStringList, int, QByteArray>> cases{
        {{}, 2, "--to names where the church is copied to."},
        {{u"--to"_s, u"a.kdl"_s, u"--from"_s, u"ten"_s}, 2, "--from is a church's number"},
        {{u"--to"_s, drive.filePath(u"none.server"_s)}, 1, "is not there"},
        {{u"--to"_s, u"host=/nowhere dbname=church"_s}, 1, "Copying the church failed because:-"},
        {{u"--to"_s, u"host=here password=secret"_s}, 1, "holds a password"},
        {{u"--to"_s, own_file()}, 1, "This is the church's own file."},
        {{u"--to"_s, drive.filePath(u"none/copy.kdl"_s)}, 1, "Copying the church failed because:-"},
    };
    const auto before = content(own_file());
    for (const auto& [words, status, message] : cases) {
        const auto ended = run(QStringList{u"copy-church"_s} + words);
        EXPECT_EQ(ended.status, status) << ended;
        EXPECT_TRUE(ended.err.contains(message)) << ended;
        EXPECT_TRUE(ended.out.isEmpty()) << ended;
        EXPECT_EQ(content(own_file()), before);
        EXPECT_FALSE(QFile::exists(church() + u"lock.dat"_s));
    }
}

} // namespace kindrel::test
