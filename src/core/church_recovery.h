#pragma once

#include "core/session.h"

namespace kindrel::core {

/// What came of one table.
struct RecoveredTable
{
    QString table;
    int rows = 0;      ///< That stand in the new file.
    int refused = 0;   ///< That could be read but are no rows of a church.
    bool whole = true; ///< False where a part could not be read.
};

/// Reads what can be read of a damaged church file into a new one: table by table, around the places that cannot be
/// read. The damaged file is not touched, and nothing is written over: `fresh` must not exist. Throws DatabaseError
/// or FileError when nothing at all can be read, and leaves nothing behind.
[[nodiscard]] std::vector<RecoveredTable> recover_church(const QString& damaged, const QString& fresh);

/// The code that tells the church of a damaged file apart from every other; empty where it has none or cannot be read.
[[nodiscard]] QString code_of_damaged(const QString& damaged);

} // namespace kindrel::core
