#pragma once

#include <QString>

namespace kindrel::sample {

/// Lays the whole content of a `Training` folder: database, photographs, notebook pages and the mark of a church in
/// use. The database must not exist yet. Throws core::DatabaseError and core::FileError.
void lay_training_church(const QString& folder);
/// Makes the database that every new church is a copy of: the schema and the usual titles.
void make_master(const QString& file);

} // namespace kindrel::sample
