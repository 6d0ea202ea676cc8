#include "core/damaged_file.h"

#include "core/session.h"

#include <sqlite3.h>

#include <algorithm>
#include <limits>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

using RowId = qint64;
constexpr RowId first_row = std::numeric_limits<RowId>::min();
constexpr RowId last_row = std::numeric_limits<RowId>::max();
/// How far to look behind the last row that can be read from the front, where none can be read from the back.
constexpr RowId looked_ahead = 65536;

struct Finalize
{
    void operator()(sqlite3_stmt* statement) const { sqlite3_finalize(statement); }
};
using Statement = std::unique_ptr<sqlite3_stmt, Finalize>;

Statement prepared(sqlite3* database, const QString& text)
{
    sqlite3_stmt* statement = nullptr;
    sqlite3_prepare_v2(database, text.toUtf8().constData(), -1, &statement, nullptr);
    return Statement(statement);
}

Value value_at(sqlite3_stmt* row, int column)
{
    switch (sqlite3_column_type(row, column)) {
    case SQLITE_NULL:
        return {};
    case SQLITE_INTEGER:
        return qint64{sqlite3_column_int64(row, column)};
    case SQLITE_BLOB: {
        const auto* start = static_cast<const char*>(sqlite3_column_blob(row, column));
        return QByteArray(start, sqlite3_column_bytes(row, column));
    }
    default: {
        const auto* start = reinterpret_cast<const char*>(sqlite3_column_text(row, column));
        return QString::fromUtf8(start, sqlite3_column_bytes(row, column));
    }
    }
}

/// Walks through one table around what cannot be read.
class Walk
{
public:
    Walk(sqlite3* database, const QString& table, const QStringList& fields, const DamagedFile::Sink& sink)
        : m_upward(prepared(database, text(table, fields, u"ASC"_s))),
          m_downward(prepared(database, text(table, fields, u"DESC"_s))), m_sink(sink)
    {
    }

    /// True when nothing was left out.
    bool run()
    {
        if (!m_upward || !m_downward)
            return false;
        const auto front = pass(*m_upward, first_row, last_row);
        if (front.whole)
            return true;
        const RowId low = front.any ? front.last + 1 : first_row;
        const auto back = pass(*m_downward, low, last_row);
        if (back.whole)
            return true;
        if (back.any)
            between(low, back.last - 1);
        else
            between(std::max<RowId>(low, 1), std::max<RowId>(low, 1) + looked_ahead);
        return m_whole;
    }

private:
    struct Pass
    {
        bool whole = false;
        bool any = false;
        RowId last = 0;
    };

    static QString text(const QString& table, const QStringList& fields, const QString& direction)
    {
        return u"SELECT rowid,[%1] FROM [%2] NOT INDEXED WHERE rowid BETWEEN ?1 AND ?2 ORDER BY rowid %3"_s.arg(
            fields.join(u"],["_s), table, direction);
    }

    Pass pass(sqlite3_stmt& statement, RowId from, RowId to)
    {
        sqlite3_bind_int64(&statement, 1, from);
        sqlite3_bind_int64(&statement, 2, to);
        Pass result;
        int code = SQLITE_ROW;
        while ((code = sqlite3_step(&statement)) == SQLITE_ROW) {
            result.any = true;
            result.last = sqlite3_column_int64(&statement, 0);
            hand_on(statement);
        }
        sqlite3_reset(&statement);
        result.whole = code == SQLITE_DONE;
        return result;
    }

    /// Halves the range until what cannot be read stands alone.
    void between(RowId from, RowId to)
    {
        while (from <= to) {
            const auto found = pass(*m_upward, from, to);
            if (found.whole)
                return;
            if (found.any)
                from = found.last + 1;
            if (from >= to) {
                m_whole = false;
                return;
            }
            const RowId middle = from + (to - from) / 2;
            between(from, middle);
            from = middle + 1;
        }
        m_whole = false;
    }

    void hand_on(sqlite3_stmt& row)
    {
        std::vector<Value> values;
        for (int column = 1; column < sqlite3_column_count(&row); ++column)
            values.push_back(value_at(&row, column));
        m_sink(std::move(values));
    }

    Statement m_upward, m_downward;
    const DamagedFile::Sink& m_sink;
    bool m_whole = true;
};

} // namespace

void DamagedFile::Close::operator()(sqlite3* database) const
{
    sqlite3_close_v2(database);
}

DamagedFile::DamagedFile(const QString& file)
{
    sqlite3* database = nullptr;
    const int code = sqlite3_open_v2(file.toUtf8().constData(), &database, SQLITE_OPEN_READWRITE, nullptr);
    m_database.reset(database);
    if (code != SQLITE_OK)
        throw DatabaseError(u"'%1' cannot be opened."_s.arg(file));
    // With this the engine puts up with a file that is shorter than it says.
    sqlite3_exec(database, "PRAGMA writable_schema=ON;", nullptr, nullptr, nullptr);
}

QStringList DamagedFile::fields_of(const QString& table)
{
    const auto statement = prepared(m_database.get(), u"SELECT * FROM [%1]"_s.arg(table));
    QStringList fields;
    for (int column = 0; statement && column < sqlite3_column_count(statement.get()); ++column)
        fields += QString::fromUtf8(sqlite3_column_name(statement.get(), column));
    return fields;
}

bool DamagedFile::read(const QString& table, const QStringList& fields, const Sink& sink)
{
    return Walk(m_database.get(), table, fields, sink).run();
}

} // namespace kindrel::core
