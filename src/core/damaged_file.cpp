#include "core/damaged_file.h"

#include "core/session.h"

#include <QUrl>

#include <sqlite3.h>

#include <algorithm>
#include <deque>
#include <limits>
#include <numeric>
#include <optional>
#include <unordered_set>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

using RowId = qint64;
constexpr RowId first_row = std::numeric_limits<RowId>::min();
constexpr RowId last_row = std::numeric_limits<RowId>::max();
constexpr RowId highest_key = std::numeric_limits<int>::max();
constexpr RowId looked_closely = 16384;
constexpr int most_disorders = 1024;

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
        if (const auto rest = trimmed({first_row, last_row}))
            search(*rest);
        return m_whole;
    }

private:
    struct Range
    {
        RowId from, to;
    };
    struct Row
    {
        RowId key;
        std::vector<Value> values;
    };

    static QString text(const QString& table, const QStringList& fields, const QString& direction)
    {
        return u"SELECT rowid,[%1] FROM [%2] NOT INDEXED WHERE rowid BETWEEN ?1 AND ?2 ORDER BY rowid %3"_s.arg(
            fields.join(u"],["_s), table, direction);
    }

    /// Hands on the rows of the range up to the first that cannot be read and tells where what is left begins; nullopt
    /// when nothing is. Damaged pages may lead anywhere: a key counts once the next row is in turn behind it, and a row
    /// without which its neighbours would be in turn has a wrong key and is left out.
    std::optional<RowId> pass(sqlite3_stmt& statement, const Range& range, bool upward)
    {
        const RowId end = upward ? range.to : range.from;
        const auto in_turn = [upward](RowId row, RowId next) {
            return upward ? row < next : next < row;
        };
        sqlite3_bind_int64(&statement, 1, range.from);
        sqlite3_bind_int64(&statement, 2, range.to);
        std::optional<RowId> before;
        std::optional<Row> held;
        int code = SQLITE_ROW;
        while (!(held && held->key == end) && (code = sqlite3_step(&statement)) == SQLITE_ROW) {
            Row row = read(statement);
            const bool orderly = !held || in_turn(held->key, row.key);
            if ((!orderly || row.key < range.from || row.key > range.to) && !tolerated())
                break;
            const bool held_in_turn = orderly && (!before || in_turn(*before, held->key));
            if (held && (held_in_turn || !before || !in_turn(*before, row.key))) {
                before = held->key;
                hand_on(std::move(*held));
            }
            held = std::move(row);
        }
        sqlite3_reset(&statement);
        const bool ended = code == SQLITE_DONE || (held && held->key == end);
        if (held)
            hand_on(std::move(*held));
        m_whole = m_whole && ended;
        return ended ? std::nullopt : std::optional(behind(before, range, upward));
    }

    /// Where the range goes on behind the row; at its beginning without one.
    static RowId behind(std::optional<RowId> row, const Range& range, bool upward)
    {
        if (!row)
            return upward ? range.from : range.to;
        return std::clamp(*row, range.from + (upward ? 0 : 1), range.to - (upward ? 1 : 0)) + (upward ? 1 : -1);
    }

    /// What is left of the range once both its ends were read; nullopt when all of it was. Where wrong keys let the
    /// ends meet although something could not be read, all of it is left.
    std::optional<Range> trimmed(const Range& range)
    {
        const auto from = pass(*m_upward, range, true);
        const auto to = from ? pass(*m_downward, range, false) : std::nullopt;
        if (!from || !to)
            return std::nullopt;
        return *from <= *to ? Range{*from, *to} : range;
    }

    /// Disorder is damage; so often only, lest pages that lead in a circle hold up the walk.
    bool tolerated()
    {
        m_whole = false;
        return ++m_disorders <= most_disorders;
    }

    /// Keys count from 1 and most follow each other: what is farther off is not looked through as closely.
    void search(Range range)
    {
        if (range.from < 1)
            (void)trimmed({range.from, std::min<RowId>(range.to, 0)});
        if (range.to < 1)
            return;
        range.from = std::max<RowId>(range.from, 1);
        if (range.to == last_row)
            range.to = std::max(range.from, highest_key);
        const RowId reach = range.to - range.from;
        RowId width = std::min(reach, looked_closely);
        halve({{range.from, range.from + width}}, 4 * looked_closely);
        std::deque<Range> far;
        while (width < reach) {
            const RowId next = width > reach / 2 ? reach : 2 * width;
            far.push_back({range.from + width + 1, range.from + next});
            width = next;
        }
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

    static Row read(sqlite3_stmt& statement)
    {
        Row row{sqlite3_column_int64(&statement, 0), {}};
        for (int column = 1; column < sqlite3_column_count(&statement); ++column)
            row.values.push_back(value_at(&statement, column));
        return row;
    }

    /// Ways around damage cross: no key is handed on twice.
    void hand_on(Row row)
    {
        if (m_handed_on.insert(row.key).second)
            m_sink(std::move(row.values));
    }

    Statement m_upward, m_downward;
    const DamagedFile::Sink& m_sink;
    std::unordered_set<RowId> m_handed_on;
    int m_disorders = 0;
    bool m_whole = true;
};

} // namespace

void DamagedFile::Close::operator()(sqlite3* database) const
{
    sqlite3_close_v2(database);
}

DamagedFile::DamagedFile(const QString& file, Opening opening)
{
    const bool copy = opening == Opening::copy;
    const QByteArray name = copy ? file.toUtf8() : QUrl::fromLocalFile(file).toEncoded() + "?immutable=1";
    const int mode = copy ? SQLITE_OPEN_READWRITE : SQLITE_OPEN_READONLY | SQLITE_OPEN_URI;
    sqlite3* database = nullptr;
    const int code = sqlite3_open_v2(name.constData(), &database, mode, nullptr);
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
