#pragma once

#include "core/session.h"

namespace kindrel::core {

/// Connects with libpq's keywords ("host=… dbname=… user=…"); a password comes from libpq's own means only.
/// Throws DatabaseError when the server cannot be reached, or when the keywords hold a password.
///
/// A connection that is lost later is made anew by the next statement, with the session's temporary tables. Reading is
/// repeated by itself. What may have changed something never is: it throws words that say whether it was stored.
[[nodiscard]] std::unique_ptr<Session> open_postgres(const QString& connection);

/// A session for reading alone: its transactions see the church as it was when they began and keep nobody from writing.
[[nodiscard]] std::unique_ptr<Session> open_postgres_snapshot(const QString& connection);

} // namespace kindrel::core
