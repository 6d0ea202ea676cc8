#pragma once

#include "core/security_setup.h"
#include "support/data_folder.h"

#include <QDir>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>
#include <QProcessEnvironment>
#include <QRegularExpression>
#include <QSet>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <algorithm>
#include <csignal>

#include <sys/resource.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;

/// How a run of the program ended.
struct Ended
{
    int status = -1;
    QByteArray out, err;
};

inline std::ostream& operator<<(std::ostream& stream, const Ended& ended)
{
    return stream << "status " << ended.status << "\n" << ended.out.toStdString() << "\n" << ended.err.toStdString();
}

/// Room for a few pages, not for the PDF with its fonts.
inline void refuse_large_files()
{
    constexpr rlim_t most_bytes = 8 * 1024;
    const rlimit limit{most_bytes, most_bytes};
    setrlimit(RLIMIT_FSIZE, &limit);
    signal(SIGXFSZ, SIG_IGN);
}

/// As if Ctrl+C were pressed the moment that the program can be given up.
inline void press_ctrl_c()
{
    sigset_t set;
    sigemptyset(&set);
    sigaddset(&set, SIGINT);
    sigprocmask(SIG_BLOCK, &set, nullptr);
    raise(SIGINT);
}

/// The real program on a data drive of its own.
class KindrelctlTest : public testing::Test
{
protected:
    /// `beforehand` is done in the program's process before it begins.
    [[nodiscard]] Ended run(const QStringList& words, void (*beforehand)() = nullptr, const QByteArray& typed = {})
    {
        QProcess program;
        // The leak check at a program's end stumbles over the threads of Qt's painter, which may still be ending then.
        auto environment = QProcessEnvironment::systemEnvironment();
        environment.insert(u"ASAN_OPTIONS"_s, u"detect_leaks=0"_s);
        program.setProcessEnvironment(environment);
        if (beforehand)
            program.setChildProcessModifier(beforehand);
        program.start(qEnvironmentVariable("KINDREL_BIN") + u"/kindrelctl"_s,
                      QStringList{u"--data-drive"_s, drive.path()} + words);
        program.write(typed);
        program.closeWriteChannel();
        if (!program.waitForFinished(120'000) || program.exitStatus() != QProcess::NormalExit)
            return {-1, {}, program.errorString().toUtf8()};
        return {program.exitCode(), program.readAllStandardOutput(), program.readAllStandardError()};
    }
    /// Lays down the data folder and fills church 1.
    void make_church(int families)
    {
        const auto installed = run({u"install"_s});
        ASSERT_EQ(installed.status, 0) << installed;
        const auto made = run({u"make-church"_s, u"--families"_s, QString::number(families), u"--seed"_s, u"7"_s});
        ASSERT_EQ(made.status, 0) << made;
    }
    /// The password "finder" may look for families, "keeper" may set up passwords.
    void switch_security_on()
    {
        FakeWorkstation workstation;
        workstation.drive = drive.path();
        ScriptedDialogue dialogue;
        FixedClock clock;
        core::SilentProgress progress;
        const auto office = core::start_up({core::Purpose::command_line}, workstation, dialogue, clock, progress);
        ASSERT_TRUE(office);
        auto setup = core::SecuritySetup::open(*office);
        ASSERT_TRUE(setup);
        setup->switch_on(true);
        ASSERT_TRUE(setup->set_area(setup->add(u"finder"_s).value(), core::Area::search_for_family, true));
        ASSERT_TRUE(setup->set_area(setup->add(u"keeper"_s).value(), core::Area::security, true));
        dialogue.expect_box(u"Security will become operational the next time a user enters Kindrel"_s);
        ASSERT_TRUE(setup->leave());
    }
    [[nodiscard]] QJsonArray list(const QStringList& words, const QStringList& format = {u"--json"_s})
    {
        const auto ended = run(words + format);
        EXPECT_EQ(ended.status, 0) << ended;
        const auto document = QJsonDocument::fromJson(ended.out);
        EXPECT_TRUE(document.isArray()) << ended;
        return document.array();
    }
    /// A file that holds the password.
    [[nodiscard]] QString password_file(const QByteArray& password)
    {
        const auto file = drive.filePath(u"password"_s);
        QFile written(file);
        EXPECT_TRUE(written.open(QFile::WriteOnly) && written.write(password + '\n') > 0);
        return file;
    }
    /// Those that the help names.
    [[nodiscard]] QStringList commands()
    {
        static const QRegularExpression named(u"^  ([a-z][a-z-]+) "_s, QRegularExpression::MultilineOption);
        QStringList words;
        for (const auto& match : named.globalMatch(QString::fromUtf8(run({u"--help"_s}).out)))
            words += match.captured(1);
        return words;
    }
    [[nodiscard]] QString pdf() const { return drive.filePath(u"report.pdf"_s); }
    [[nodiscard]] static QByteArray content(const QString& file)
    {
        QFile opened(file);
        return opened.open(QFile::ReadOnly) ? opened.readAll() : QByteArray();
    }

    QTemporaryDir drive;
};

} // namespace kindrel::test
