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

/// Unique among all test programs that share the server.
QString next_schema_name()
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
    } else {
        m_schema = next_schema_name();
        core::open_postgres(server())->execute(u"CREATE SCHEMA [%1]"_s.arg(m_schema));
        m_connection = u"%1 options=-csearch_path=%2"_s.arg(server(), m_schema);
        m_session = core::open_postgres(m_connection);
    }
    core::create_schema(*m_session);
}

TestChurch::~TestChurch()
{
    m_session.reset();
    if (!m_schema.isEmpty())
        core::open_postgres(server())->execute(u"DROP SCHEMA [%1] CASCADE"_s.arg(m_schema));
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
