#pragma once

#include <QDir>
#include <QProcess>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <unistd.h>

namespace kindrel::test {

/// A database server that a test starts and stops as it likes, beside the one that all tests share.
class OwnServer
{
public:
    OwnServer()
    {
        using namespace Qt::StringLiterals;
        EXPECT_TRUE(!as_root() || ran(u"chown"_s, {u"postgres"_s, m_folder.path()}));
        EXPECT_TRUE(ran_as_owner(u"initdb"_s, {u"-D"_s, data(), u"-U"_s, u"kindrel"_s, u"--auth=trust"_s,
                                               u"--encoding=UTF8"_s, u"--locale=C"_s}));
        start();
    }
    OwnServer(const OwnServer&) = delete;
    OwnServer& operator=(const OwnServer&) = delete;
    ~OwnServer() { stop(); }

    void start()
    {
        using namespace Qt::StringLiterals;
        const auto options = u"-c listen_addresses='' -c unix_socket_directories='%1' -c fsync=off"_s;
        EXPECT_TRUE(ran_as_owner(u"pg_ctl"_s, {u"-D"_s, data(), u"-w"_s, u"-l"_s, m_folder.filePath(u"log"_s), u"-o"_s,
                                               options.arg(m_folder.path()), u"start"_s}));
    }
    /// As if its machine lost power.
    void stop()
    {
        using namespace Qt::StringLiterals;
        EXPECT_TRUE(ran_as_owner(u"pg_ctl"_s, {u"-D"_s, data(), u"-w"_s, u"-m"_s, u"immediate"_s, u"stop"_s}));
    }
    [[nodiscard]] QString connection() const
    {
        using namespace Qt::StringLiterals;
        return u"host=%1 dbname=postgres user=kindrel"_s.arg(m_folder.path());
    }

private:
    [[nodiscard]] static bool as_root() { return geteuid() == 0; }
    [[nodiscard]] QString data() const { return m_folder.filePath(QStringLiteral("data")); }
    [[nodiscard]] static bool ran(const QString& program, const QStringList& words)
    {
        QProcess process;
        process.setWorkingDirectory(QStringLiteral("/"));
        process.setStandardOutputFile(QProcess::nullDevice());
        process.setStandardErrorFile(QProcess::nullDevice());
        process.start(program, words);
        return process.waitForFinished(-1) && process.exitCode() == 0;
    }
    /// The server refuses to run as root.
    [[nodiscard]] static bool ran_as_owner(const QString& program, const QStringList& words)
    {
        using namespace Qt::StringLiterals;
        const QDir versions(u"/usr/lib/postgresql"_s);
        const auto newest = versions.entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name | QDir::Reversed).value(0);
        const auto path = versions.filePath(newest + u"/bin/"_s + program);
        if (!as_root())
            return ran(path, words);
        return ran(u"runuser"_s, QStringList{u"-u"_s, u"postgres"_s, u"--"_s, path} + words);
    }

    QTemporaryDir m_folder;
};

} // namespace kindrel::test
