#pragma once

#include "core/session.h"

namespace kindrel::core {

/// Connects with libpq's keywords ("host=… dbname=… user=…"); a password comes from libpq's own means only.
/// Throws DatabaseError when the server cannot be reached, or when the keywords hold a password.
[[nodiscard]] std::unique_ptr<Session> open_postgres(const QString& connection);

} // namespace kindrel::core
