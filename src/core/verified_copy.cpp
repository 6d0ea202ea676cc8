#include "core/verified_copy.h"

#include "core/files.h"
#include "core/sqlite_session.h"

#include <QFile>

namespace kindrel::core {

using namespace Qt::StringLiterals;

void verified_copy(Session& session, const QString& file)
{
    const QString unfinished = file + u".unfinished"_s;
    remove_file(unfinished);
    try {
        session.copy_to(unfinished);
        check_church_file(unfinished);
        move_file(unfinished, file);
    } catch (...) {
        QFile::remove(unfinished);
        throw;
    }
}

void check_church_file(const QString& file)
{
    const auto copy = open_sqlite(file);
    auto faults = copy->select(u"PRAGMA integrity_check;"_s);
    const Row* found = faults.first();
    const QString verdict = found ? found->text(Column{0}) : QString();
    if (verdict != u"ok")
        throw DatabaseError(u"'%1' is damaged: %2"_s.arg(file, verdict));
    auto startup = copy->select(u"SELECT [Version] FROM [tbl_startup];"_s);
    if (!startup.first())
        throw DatabaseError(u"'%1' is empty."_s.arg(file));
}

} // namespace kindrel::core
