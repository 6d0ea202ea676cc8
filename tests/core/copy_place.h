#pragma once

#include "backup_place.h"
#include "core/copy_church.h"
#include "core/copy_church_tables.h"
#include "core/postgres_session.h"
#include "core/settings.h"
#include "core/sqlite_session.h"

namespace kindrel::test {

[[nodiscard]] inline core::ChurchSums sums_in(core::Session& session)
{
    const core::Transaction reading(session);
    return core::sums_of(session, [](int) {});
}

/// A church to copy and, on the other engine, where to.
class CopyPlace
{
public:
    explicit CopyPlace(core::EngineKind from) : m_place(from)
    {
        using namespace Qt::StringLiterals;
        core::write_setting(m_place.session(), u"church_code"_s, u"our own code"_s);
        if (from == core::EngineKind::sqlite) {
            m_server.emplace(core::EngineKind::postgres);
            m_target = {.connection = m_server->connection()};
            m_server->close();
            remove_target();
        } else {
            m_target = {.file = m_place.data.drive() + u"copy.kdl"_s};
            m_place.server->close();
        }
        leave();
    }

    [[nodiscard]] const core::CopyEnd& target() const { return m_target; }
    [[nodiscard]] core::Paths paths() const { return m_place.paths(); }
    [[nodiscard]] QString folder() const { return m_place.church(); }
    /// The program of this church, started when it is needed.
    [[nodiscard]] StartedOffice& started(core::Dialogue* dialogue = nullptr)
    {
        if (!m_place.started || dialogue)
            m_place.started.emplace(paths(), dialogue);
        return *m_place.started;
    }
    /// Ends the program and everything else that is connected to a church on the server.
    void leave()
    {
        using namespace Qt::StringLiterals;
        m_place.started.reset();
        (void)number_of(*m_admin, u"SELECT COUNT(pg_terminate_backend(pid, 10000)) FROM pg_stat_activity WHERE "
                                  "datname IS NOT NULL AND backend_type='client backend' AND "
                                  "datname IN ('%1')"_s.arg(databases().join(u"','"_s)));
    }
    [[nodiscard]] std::unique_ptr<core::Session> open_target() const
    {
        return m_target.file.isEmpty() ? core::open_postgres(m_target.connection) : core::open_sqlite(m_target.file);
    }
    void remove_target() const
    {
        using namespace Qt::StringLiterals;
        if (!m_target.file.isEmpty()) {
            QFile::remove(m_target.file);
            return;
        }
        const auto session = open_target();
        core::Transaction transaction(*session);
        session->execute(u"DROP SCHEMA public CASCADE"_s);
        session->execute(u"CREATE SCHEMA public"_s);
        transaction.commit();
    }
    [[nodiscard]] bool target_present() const
    {
        return m_target.file.isEmpty() ? !core::church_tables(*open_target()).isEmpty() : QFile::exists(m_target.file);
    }
    [[nodiscard]] core::ChurchSums source_sums() const { return sums_in(*core::connect_church(paths())); }
    [[nodiscard]] core::ChurchSums target_sums() const { return sums_in(*open_target()); }
    /// Nothing of a run is left beside the copy and in the church.
    [[nodiscard]] bool tidy() const
    {
        return !QFile::exists(m_target.file + QStringLiteral(".unfinished")) &&
               !QFile::exists(folder() + QStringLiteral("lock.dat"));
    }

private:
    [[nodiscard]] QStringList databases() const
    {
        QStringList names;
        for (const auto& connection : {m_target.connection, m_place.server ? m_place.server->connection() : QString()})
            names += connection.section(QStringLiteral("dbname="), -1);
        return names;
    }

    BackupPlace m_place;
    std::optional<TestChurch> m_server;
    core::CopyEnd m_target;
    std::unique_ptr<core::Session> m_admin = core::open_postgres(qEnvironmentVariable("KINDREL_TEST_SERVER"));
};

/// A test of copying from either engine to the other.
class CopyTest : public testing::TestWithParam<core::EngineKind>
{
protected:
    void SetUp() override
    {
        if (!TestChurch::available(core::EngineKind::postgres))
            GTEST_SKIP() << "No server: run through ./test, or tests/support/with-postgres.";
        place.emplace(GetParam());
    }
    std::optional<CopyPlace> place;
};

} // namespace kindrel::test

#define KINDREL_COPIED_FROM_BOTH_ENGINES(suite)                                                                        \
    INSTANTIATE_TEST_SUITE_P(From, suite,                                                                              \
                             testing::Values(kindrel::core::EngineKind::sqlite, kindrel::core::EngineKind::postgres),  \
                             kindrel::test::engine_name)
