#include "core/postgres_copy.h"

#include "core/schema.h"
#include "core/sqlite_session.h"

#include <QFile>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr std::size_t rows_at_once = 5000;

QStringList tables_of(Session& church_file)
{
    auto rows = church_file.select(u"SELECT [name] FROM [sqlite_master] WHERE [type]='table' ORDER BY [name];"_s);
    QStringList tables;
    for (const Row& row : rows)
        tables += row.text(Column{0});
    return tables;
}

QStringList fields_of(Session& session, const QString& table)
{
    const auto rows = session.select(u"SELECT * FROM [%1] WHERE 1=0;"_s.arg(table));
    QStringList fields;
    for (int index = 0; index < rows.column_count(); ++index)
        fields += rows.column_name(index);
    return fields;
}

void copy_table(Session& from, Session& to, const QString& table, const QStringList& fields)
{
    to.execute(u"DELETE FROM [%1];"_s.arg(table));
    auto rows = from.select(u"SELECT [%1] FROM [%2];"_s.arg(fields.join(u"],["_s), table));
    std::vector<std::vector<Value>> batch;
    for (const Row& row : rows) {
        auto& values = batch.emplace_back();
        for (int index = 0; index < fields.size(); ++index)
            values.push_back(row.value(Column{index}));
        if (batch.size() == rows_at_once) {
            to.insert(table, fields, batch);
            batch.clear();
        }
    }
    to.insert(table, fields, batch);
}

/// The church file knows the tables; both sides hold the same schema.
void copy_tables(Session& from, Session& to, Session& church_file)
{
    for (const auto& table : tables_of(church_file))
        copy_table(from, to, table, fields_of(church_file, table));
}

} // namespace

void copy_to_file(Session& server, const QString& file)
{
    auto target = create_sqlite(file);
    try {
        create_schema(*target);
        Transaction reading(server);
        server.execute(u"SET TRANSACTION ISOLATION LEVEL REPEATABLE READ"_s);
        Transaction writing(*target);
        copy_tables(server, *target, *target);
        writing.commit();
    } catch (const DatabaseError&) {
        target.reset();
        QFile::remove(file);
        throw;
    }
}

void replace_from_file(Session& server, const QString& file)
{
    const auto source = open_sqlite(file);
    Transaction writing(server);
    copy_tables(*source, server, *source);
    writing.commit();
}

} // namespace kindrel::core
