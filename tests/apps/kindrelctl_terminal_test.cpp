#include "apps/kindrelctl_fixture.h"

#include "core/sqlite_session.h"

#include <pty.h>
#include <sys/ioctl.h>
#include <unistd.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

constexpr auto prompt = "[y/N] ";

/// A terminal without a window; what is typed there comes from the test.
class Terminal
{
public:
    Terminal() { EXPECT_EQ(openpty(&m_keyboard, &m_program_side, nullptr, nullptr, nullptr), 0); }
    Terminal(const Terminal&) = delete;
    Terminal& operator=(const Terminal&) = delete;
    ~Terminal()
    {
        close(m_keyboard);
        close(m_program_side);
    }
    [[nodiscard]] int program_side() const { return m_program_side; }
    void type(const QByteArray& keys) const
    {
        EXPECT_EQ(write(m_keyboard, keys.constData(), keys.size()), keys.size());
    }

private:
    int m_keyboard = -1, m_program_side = -1;
};

} // namespace

/// Somebody sits at the program.
class KindrelctlTerminalTest : public KindrelctlTest
{
protected:
    void SetUp() override
    {
        make_church(20);
        const auto made = run({u"backup"_s});
        backup = QString::fromUtf8(made.out).section(u": "_s, 1).trimmed();
        in_database(u"UPDATE [tbl_surname] SET [surname]='Changed';"_s);
        in_database(u"UPDATE [tbl_startup] SET [church_code]=NULL;"_s); // Which is one question more.
    }
    void in_database(const QString& statement) const
    {
        core::open_sqlite(drive.filePath(u"Kindrel_10_Data/church1/KR10_records.kdl"_s))->execute(statement);
    }
    /// Types what comes next whenever the program asks.
    [[nodiscard]] Ended run_and_type(const QStringList& words, const QByteArrayList& keys)
    {
        const Terminal terminal;
        QProcess program;
        program.setChildProcessModifier([&] {
            dup2(terminal.program_side(), STDIN_FILENO);
            setsid();
            ioctl(STDIN_FILENO, TIOCSCTTY, 0); // Or Ctrl+C would be a letter like others.
        });
        program.start(qEnvironmentVariable("KINDREL_BIN") + u"/kindrelctl"_s,
                      QStringList{u"--data-drive"_s, drive.path()} + words);
        program.setReadChannel(QProcess::StandardError);
        QByteArray told;
        for (qsizetype asked = 0; asked < keys.size(); ++asked) {
            while (told.count(prompt) <= asked && program.waitForReadyRead(60'000))
                told += program.readAllStandardError();
            EXPECT_EQ(told.count(prompt), asked + 1) << told.toStdString();
            terminal.type(keys[asked]);
        }
        EXPECT_TRUE(program.waitForFinished(60'000)) << told.toStdString();
        return {program.exitCode(), program.readAllStandardOutput(), told + program.readAllStandardError()};
    }

    QString backup;
};

TEST_F(KindrelctlTerminalTest, OnlyWhatIsTypedAfterAQuestionAnswersIt)
{
    struct Case
    {
        QByteArrayList keys;
        int status;
    };
    const auto now = list({u"families"_s});
    for (const auto& [keys, status] : {Case{{"y\ny\n", "n\n"}, 1},
                                       {{"y\ny\n", "\n"}, 1},
                                       {{"y\n", "\x03"}, 1},      // Ctrl+C
                                       {{"y\n", "\x04"}, 1},      // Ctrl+D
                                       {{"y\n", "y\x04\x04"}, 1}, // Not ended with Enter.
                                       {{"n\ny\n"}, 1},
                                       {{"\x03"}, 1},
                                       {{"y\ny\n", "y\n"}, 0}}) {
        const auto ended = run_and_type({u"restore"_s, backup}, keys);
        EXPECT_EQ(ended.status, status) << ended;
        EXPECT_EQ(list({u"families"_s}) == now, status != 0) << ended;
    }
}

} // namespace kindrel::test
