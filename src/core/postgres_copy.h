#pragma once

#include "core/session.h"

namespace kindrel::core {

/// Copies every table of a server church into a fresh church file and compares what is in it then. The server's
/// transactions should read one moment. Throws DatabaseError; a half-written file is removed.
void copy_to_file(Session& server, const QString& file);
/// Replaces every table's rows by those of a church file, in one transaction, and compares them before it ends.
void replace_from_file(Session& server, const QString& file);

} // namespace kindrel::core
