#pragma once

#include <QStringList>

namespace kindrel::core {

/// A statement of the house's dialect as PostgreSQL reads it: `[Name]` becomes a quoted lower-case name, the n-th `?`
/// becomes `$n`. What stands between single quotes is left alone.
[[nodiscard]] QString for_postgres(const QString& statement);
/// A statement of the schema as PostgreSQL reads it: column types and table options too.
[[nodiscard]] QString schema_for_postgres(const QString& statement);
/// The statement that makes a temporary table of whole numbers, the first of which is its key.
[[nodiscard]] QString temporary_table(const QString& table, const QStringList& columns);
/// The statements of a script, without comments. A statement ends with a semicolon at the end of a line.
[[nodiscard]] QStringList split_script(const QString& script);

} // namespace kindrel::core
