#include "support/test_church.h"

#include "core/postgres_session.h"
#include "core/schema.h"
#include "core/sqlite_session.h"

#include <QCoreApplication>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

QString server()
{
    return qEnvironmentVariable("KINDREL_TEST_SERVER");
}

const QString template_database = u"kindrel_template"_s;

/// A connection to another database of the server; of two keywords the later one holds.
QString database(const QString& name)
{
    return u"%1 dbname=%2"_s.arg(server(), name);
}

/// What is done to whole databases stands outside any transaction, and what is executed never does.
void run_outside(core::Session& session, const QString& statement)
{
    (void)session.select(statement);
}

/// Laying the schema takes a second, copying it a fraction: the first test that needs it makes the template for all.
void provide_template(core::Session& server_session)
{
    const core::Transaction one_at_a_time(server_session);
    (void)server_session.select(u"SELECT pg_advisory_xact_lock(1)"_s);
    if (number_of(server_session, u"SELECT COUNT(*) FROM pg_database WHERE datname='%1'"_s.arg(template_database)) > 0)
        return;
    const QString half_made = template_database + u"_half"_s;
    const auto maker = core::open_postgres(server());
    run_outside(*maker, u"DROP DATABASE IF EXISTS [%1]"_s.arg(half_made));
    run_outside(*maker, u"CREATE DATABASE [%1]"_s.arg(half_made));
    core::create_schema(*core::open_postgres(database(half_made)));
    run_outside(*maker, u"ALTER DATABASE [%1] RENAME TO [%2]"_s.arg(half_made, template_database));
}

/// Unique among all test programs that share the server.
QString next_name()
{
    static int number = 0;
    return u"church_%1_%2"_s.arg(QCoreApplication::applicationPid()).arg(++number);
}

} // namespace

bool TestChurch::available(core::EngineKind engine)
{
    return engine == core::EngineKind::sqlite || !server().isEmpty();
}

TestChurch::TestChurch(core::EngineKind engine)
{
    if (engine == core::EngineKind::sqlite) {
        m_file = m_folder.filePath(u"KR10_records.kdl"_s);
        m_session = core::create_sqlite(m_file);
        core::create_schema(*m_session);
    } else {
        m_database = next_name();
        const auto server_session = core::open_postgres(server());
        provide_template(*server_session);
        run_outside(*server_session, u"CREATE DATABASE [%1] TEMPLATE [%2]"_s.arg(m_database, template_database));
        m_connection = database(m_database);
        m_session = core::open_postgres(m_connection);
    }
}

TestChurch::~TestChurch()
{
    m_session.reset();
    if (!m_database.isEmpty())
        run_outside(*core::open_postgres(server()), u"DROP DATABASE [%1] WITH (FORCE)"_s.arg(m_database));
}

std::unique_ptr<core::Session> TestChurch::another() const
{
    return m_file.isEmpty() ? core::open_postgres(m_connection) : core::open_sqlite(m_file);
}

std::string engine_name(const testing::TestParamInfo<core::EngineKind>& info)
{
    return info.param == core::EngineKind::sqlite ? "Sqlite" : "Postgres";
}

qint64 number_of(core::Session& session, const QString& statement)
{
    auto rows = session.select(statement);
    const auto* row = rows.first();
    return row ? row->number(core::Column{0}) : -1;
}

} // namespace kindrel::test
