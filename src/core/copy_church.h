#pragma once

#include "core/office.h"
#include "core/progress.h"

namespace kindrel::core {

/// Where a church is copied to: a church file or a database on a server. One of the two is empty.
struct CopyEnd
{
    QString file = {};
    QString connection = {};
};

/// Understands a path, a server's libpq keywords ("host=… dbname=…"), and a file ending in ".server" that holds such.
/// Throws FileError when that file cannot be read.
[[nodiscard]] CopyEnd copy_end(const QString& words);

struct CopyRequest
{
    CopyEnd to;
    bool replace = false; ///< Take the place of an older copy of the same church, after asking.
};

struct CopyReport
{
    qsizetype tables = 0;
    qint64 rows = 0;
};

/// Copies the church's database, under the busy marker and while nobody is inside, and compares every table of the copy
/// before it appears. The copy is there as a whole or not at all, whenever the run is cut off; the church itself is
/// only read. Nullopt after telling why there is no copy, and when the person gave up.
///
/// Steps of the progress are made while transactions are open, on connections that belong to this run alone.
[[nodiscard]] std::optional<CopyReport> copy_church(Office& office, const CopyRequest& request, Progress& progress);

} // namespace kindrel::core
