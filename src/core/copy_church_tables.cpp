#include "core/copy_church_tables.h"

#include "core/schema.h"
#include "core/sqlite_session.h"

#include <QCryptographicHash>
#include <QFile>
#include <QtEndian>

#include <algorithm>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr std::size_t rows_at_once = 5000;

/// One row as bytes that no other row has: each value with its kind and length, so that nothing and an empty text
/// differ, and so do a number and its digits.
class RowBytes
{
public:
    const QByteArray& of(std::span<const Value> values)
    {
        m_bytes.clear();
        for (const Value& value : values)
            std::visit([&](const auto& held) { add(held); }, value);
        return m_bytes;
    }

private:
    void add(std::monostate) { m_bytes += 'n'; }
    void add(qint64 number) { add_number('i', number); }
    void add(const QString& text) { add_bytes('t', text.toUtf8()); }
    void add(const QByteArray& bytes) { add_bytes('b', bytes); }
    void add_bytes(char kind, const QByteArray& bytes)
    {
        add_number(kind, bytes.size());
        m_bytes += bytes;
    }
    void add_number(char kind, qint64 number)
    {
        std::array<char, sizeof number> written{};
        qToLittleEndian(number, written.data());
        m_bytes += kind;
        m_bytes.append(written.data(), written.size());
    }

    QByteArray m_bytes;
};

void add_to(TableSum& sum, const QByteArray& row)
{
    const auto hash = QCryptographicHash::hash(row, QCryptographicHash::Sha256);
    ++sum.rows;
    for (std::size_t half = 0; half < sum.sum.size(); ++half)
        sum.sum[half] += qFromLittleEndian<quint64>(hash.constData() + half * sizeof(quint64));
}

/// In small letters and in their order, which is then that of both engines.
QStringList fields_of(Session& session, const QString& table)
{
    const auto rows = session.select(u"SELECT * FROM [%1] WHERE 1=0;"_s.arg(table));
    QStringList fields;
    for (int index = 0; index < rows.column_count(); ++index)
        fields += rows.column_name(index).toLower();
    fields.sort();
    return fields;
}

using Batch = std::vector<std::vector<Value>>;
using UseBatch = std::function<void(const Batch&)>;

std::vector<Value> values_of(const Row& row, qsizetype fields)
{
    std::vector<Value> values;
    values.reserve(static_cast<std::size_t>(fields));
    for (int index = 0; index < fields; ++index)
        values.push_back(row.value(Column{index}));
    return values;
}

/// A server's answer is held in memory as a whole: it is asked for in parts.
void read_server_table(Session& session, const QString& statement, qsizetype fields, const UseBatch& use)
{
    session.execute(u"DECLARE [copied_rows] NO SCROLL CURSOR FOR %1"_s.arg(statement));
    Batch batch;
    do {
        batch.clear();
        auto rows = session.select(u"FETCH FORWARD %1 FROM [copied_rows]"_s.arg(rows_at_once));
        for (const Row& row : rows)
            batch.push_back(values_of(row, fields));
        if (!batch.empty())
            use(batch);
    } while (batch.size() == rows_at_once);
    session.execute(u"CLOSE [copied_rows]"_s);
}

void read_file_table(Session& session, const QString& statement, qsizetype fields, const UseBatch& use)
{
    auto rows = session.select(statement);
    Batch batch;
    for (const Row& row : rows) {
        batch.push_back(values_of(row, fields));
        if (batch.size() < rows_at_once)
            continue;
        use(batch);
        batch.clear();
    }
    if (!batch.empty())
        use(batch);
}

/// Hands every row on, in batches, and sums them up.
TableSum read_table(Session& session, const QString& table, const QStringList& fields, const UseBatch& use)
{
    const auto statement = u"SELECT [%1] FROM [%2]"_s.arg(fields.join(u"],["_s), table);
    const auto read = session.engine() == EngineKind::postgres ? read_server_table : read_file_table;
    TableSum sum;
    RowBytes bytes;
    read(session, statement, fields.size(), [&](const Batch& batch) {
        for (const auto& row : batch)
            add_to(sum, bytes.of(row));
        use(batch);
    });
    return sum;
}

} // namespace

QStringList church_tables(Session& session)
{
    const auto of_file = u"SELECT [name] FROM [sqlite_master] WHERE [type]='table' AND substr([name],1,7)<>'sqlite_'"_s;
    const auto of_server = u"SELECT table_name FROM information_schema.tables WHERE table_schema=current_schema() AND "
                           "table_type='BASE TABLE'"_s;
    auto rows = session.select(session.engine() == EngineKind::postgres ? of_server : of_file);
    QStringList tables;
    for (const Row& row : rows)
        tables += row.text(Column{0}).toLower();
    tables.sort();
    return tables;
}

qint64 count_rows(Session& session)
{
    qint64 count = 0;
    for (const auto& table : church_tables(session)) {
        auto rows = session.select(u"SELECT COUNT(*) FROM [%1];"_s.arg(table));
        count += rows.first()->number(Column{0});
    }
    return count;
}

ChurchSums sums_of(Session& session, const RowsDone& done)
{
    ChurchSums sums;
    for (const auto& table : church_tables(session))
        sums[table] = read_table(session, table, fields_of(session, table),
                                 [&](const Batch& batch) { done(static_cast<int>(batch.size())); });
    return sums;
}

ChurchSums copy_tables(Session& from, Session& to, const RowsDone& done)
{
    ChurchSums sums;
    for (const auto& table : church_tables(from)) {
        const auto fields = fields_of(from, table);
        to.execute(u"DELETE FROM [%1];"_s.arg(table));
        sums[table] = read_table(from, table, fields, [&](const Batch& batch) {
            to.insert(table, fields, batch);
            done(static_cast<int>(batch.size()));
        });
    }
    demand_equal(sums, sums_of(to, done));
    return sums;
}

void copy_tables(Session& from, Session& to)
{
    copy_tables(from, to, [](int) {});
}

ChurchSums copy_to_new_file(Session& from, const QString& file, const RowsDone& done)
{
    auto to = create_sqlite(file);
    try {
        create_schema(*to);
        Transaction writing(*to);
        const auto sums = copy_tables(from, *to, done);
        writing.commit();
        return sums;
    } catch (...) {
        to.reset();
        QFile::remove(file);
        throw;
    }
}

void demand_equal(const ChurchSums& expected, const ChurchSums& found)
{
    for (const auto& table : expected.keys() + found.keys()) {
        const auto there = expected.value(table), here = found.value(table);
        if (there != here || !expected.contains(table) || !found.contains(table))
            throw DatabaseError(u"The copy was compared and differs in '%1': %2 rows instead of %3."_s.arg(
                table, QString::number(here.rows), QString::number(there.rows)));
    }
}

} // namespace kindrel::core
