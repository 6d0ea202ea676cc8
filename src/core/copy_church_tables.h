#pragma once

#include "core/session.h"

#include <QMap>

#include <functional>

namespace kindrel::core {

/// What a table holds: the number of its rows, and a sum over everything that stands in them, whatever their order.
struct TableSum
{
    qint64 rows = 0;
    std::array<quint64, 2> sum{};

    friend bool operator==(const TableSum&, const TableSum&) = default;
};

/// Every table of a church under its name in small letters. Equal for two churches that hold the same, whichever their
/// engines.
using ChurchSums = QMap<QString, TableSum>;

/// Told again and again how many rows have been dealt with since. May throw to end the work.
using RowsDone = std::function<void(int rows)>;

/// The names of the church's own tables in small letters. Empty for a database that holds none.
[[nodiscard]] QStringList church_tables(Session& session);
[[nodiscard]] qint64 count_rows(Session& session);

/// Reads every table, inside a transaction.
[[nodiscard]] ChurchSums sums_of(Session& session, const RowsDone& done);
/// Puts every row of `from` in place of those of `to`, which has the same tables, and compares what `to` then holds
/// with what was read. Both are inside a transaction. Throws DatabaseError where they differ.
ChurchSums copy_tables(Session& from, Session& to, const RowsDone& done);
/// The same without a report.
void copy_tables(Session& from, Session& to);
/// Makes a church file, which must not be there yet, of every row of `from`, which is inside a transaction, and
/// compares them in the same way. What throws leaves no file behind.
ChurchSums copy_to_new_file(Session& from, const QString& file, const RowsDone& done);

/// Throws DatabaseError that names a table in which the two differ.
void demand_equal(const ChurchSums& expected, const ChurchSums& found);

} // namespace kindrel::core
