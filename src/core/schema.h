#pragma once

#include "core/session.h"

namespace kindrel::core {

/// The version of the schema that this program writes, kept in `tbl_startup.Version`.
inline constexpr int schema_version = 1;

/// Lays the whole schema into an empty database, in one transaction. The text is compiled into the program.
void create_schema(Session& session);

} // namespace kindrel::core
