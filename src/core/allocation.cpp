#include "core/session.h"

#include <deque>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr std::size_t rows_before_pruning = 50;
constexpr qint64 rows_kept_below = 10;

/// The keys that a counter table holds, lowest first.
std::deque<qint64> handed_out(Session& session, QStringView table)
{
    auto rows = session.select(u"SELECT [id_found] FROM [%1] ORDER BY [id_found];"_s.arg(table));
    const Column id_found = rows.column(u"id_found");
    std::deque<qint64> keys;
    for (const Row& row : rows)
        keys.push_back(row.number(id_found));
    return keys;
}

} // namespace

int Session::allocate(Entity entity, int count)
{
    const auto table = counter_table(entity);
    if (table.isEmpty() || count < 1)
        return 0;
    Transaction transaction(*this);
    auto keys = handed_out(*this, table);
    const qint64 first = keys.empty() ? 1 : keys.back() + 1;
    for (qint64 key = first; key < first + count; ++key) {
        keys.push_back(key);
        if (keys.size() <= rows_before_pruning)
            continue;
        while (keys.front() < key - rows_kept_below)
            keys.pop_front();
    }
    execute(u"DELETE FROM [%1] WHERE [id_found] < ?;"_s.arg(table), keys.front());
    std::vector<std::vector<Value>> added;
    for (const qint64 key : keys) {
        if (key >= first)
            added.push_back({key});
    }
    insert(table.toString(), {u"id_found"_s}, added);
    transaction.commit();
    return static_cast<int>(first);
}

} // namespace kindrel::core
