#include "core/postgres_copy.h"

#include "core/copy_church_tables.h"
#include "core/sqlite_session.h"

namespace kindrel::core {

void copy_to_file(Session& server, const QString& file)
{
    const Transaction reading(server);
    copy_to_new_file(server, file, [](int) {});
}

void replace_from_file(Session& server, const QString& file)
{
    const auto source = open_sqlite(file);
    Transaction writing(server);
    copy_tables(*source, server);
    writing.commit();
}

} // namespace kindrel::core
