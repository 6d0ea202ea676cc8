#include "core/damaged_file.h"

#include "core/session.h"

#include <sqlite3.h>

#include <algorithm>
#include <deque>
#include <limits>
#include <numeric>
#include <optional>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

using RowId = qint64;
constexpr RowId first_row = std::numeric_limits<RowId>::min();
constexpr RowId last_row = std::numeric_limits<RowId>::max();
constexpr RowId highest_key = std::numeric_limits<int>::max();
constexpr RowId looked_closely = 16384;

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
        const std::optional<Range> rest = trimmed({first_row, last_row});
        if (!rest)
            return true;
        search(*rest);
        return false;
    }

private:
    struct Range
    {
        RowId from, to;
    };

    static QString text(const QString& table, const QStringList& fields, const QString& direction)
    {
        return u"SELECT rowid,[%1] FROM [%2] NOT INDEXED WHERE rowid BETWEEN ?1 AND ?2 ORDER BY rowid %3"_s.arg(
            fields.join(u"],["_s), table, direction);
    }

    /// Hands on the rows from one end of the range and leaves in it what lies behind the first that cannot be read.
    /// False when nothing is left. Damaged pages may lead anywhere: a row out of turn ends the pass.
    bool pass(sqlite3_stmt& statement, Range& range, bool upward)
    {
        sqlite3_bind_int64(&statement, 1, range.from);
        sqlite3_bind_int64(&statement, 2, range.to);
        int code = SQLITE_ROW;
        bool left = true;
        while (left && (code = sqlite3_step(&statement)) == SQLITE_ROW) {
            const RowId row = sqlite3_column_int64(&statement, 0);
            if (row < range.from || row > range.to)
                break;
            hand_on(statement);
            left = range.from < range.to && row != (upward ? range.to : range.from);
            if (left)
                (upward ? range.from : range.to) = upward ? row + 1 : row - 1;
        }
        sqlite3_reset(&statement);
        return left && code != SQLITE_DONE;
    }

    /// What is left of the range once both its ends were read; nullopt when all of it was.
    std::optional<Range> trimmed(Range range)
    {
        const bool left = pass(*m_upward, range, true) && pass(*m_downward, range, false);
        return left ? std::optional(range) : std::nullopt;
    }

    /// Keys count from 1 and most follow each other: what is farther off is not looked through as closely.
    void search(Range range)
    {
        if (range.from < 1)
            (void)trimmed({range.from, std::min<RowId>(range.to, 0)});
        range.from = std::max<RowId>(range.from, 1);
        if (range.to == last_row)
            range.to = std::max(range.from, highest_key);
        RowId width = looked_closely;
        halve({{range.from, std::min(range.to, range.from + width)}}, 4 * looked_closely);
        std::deque<Range> far;
        for (; range.to - range.from > width; width *= 2)
            far.push_back({range.from + width + 1, std::min(range.to, range.from + 2 * width)});
        halve(std::move(far), looked_closely);
    }

    /// Halves the ranges, the widest first, until what cannot be read stands alone or was looked for often enough.
    void halve(std::deque<Range> ranges, RowId most_looks)
    {
        for (RowId look = 0; !ranges.empty() && look < most_looks; ++look) {
            const auto left = trimmed(ranges.front());
            ranges.pop_front();
            if (!left || left->from == left->to)
                continue;
            const RowId middle = std::midpoint(left->from, left->to);
            ranges.push_back({left->from, middle});
            ranges.push_back({middle + 1, left->to});
        }
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
