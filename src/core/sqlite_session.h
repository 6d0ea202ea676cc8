#pragma once

#include "core/session.h"

namespace kindrel::core {

/// Opens an existing .kdl file. Throws DatabaseError when it is missing, is no database, or cannot be written.
[[nodiscard]] std::unique_ptr<Session> open_sqlite(const QString& file);
/// Makes an empty database file, readable by its owner and group alone; the file must not exist yet.
[[nodiscard]] std::unique_ptr<Session> create_sqlite(const QString& file);

} // namespace kindrel::core
