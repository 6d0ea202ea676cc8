#pragma once

#include "core/session.h"

namespace kindrel::core {

/// Copies the whole content of the database to a .kdl file that appears under its name, in place of an older one, only
/// after it was opened and found sound. Throws DatabaseError or FileError and leaves nothing behind.
void verified_copy(Session& session, const QString& file);

/// Throws DatabaseError unless the file is a church database without a fault.
void check_church_file(const QString& file);

} // namespace kindrel::core
