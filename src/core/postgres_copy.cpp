#include "core/postgres_copy.h"

#include "core/copy_church_tables.h"
#include "core/schema.h"
#include "core/sqlite_session.h"

#include <QFile>

namespace kindrel::core {

void copy_to_file(Session& server, const QString& file)
{
    auto target = create_sqlite(file);
    try {
        create_schema(*target);
        const Transaction reading(server);
        Transaction writing(*target);
        copy_tables(server, *target);
        writing.commit();
    } catch (const DatabaseError&) {
        target.reset();
        QFile::remove(file);
        throw;
    }
}

void replace_from_file(Session& server, const QString& file)
{
    const auto source = open_sqlite(file);
    Transaction writing(server);
    copy_tables(*source, server);
    writing.commit();
}

} // namespace kindrel::core
