#include "core/mender_hold.h"

#include "core/files.h"
#include "core/mender_obstacle.h"

#include <sqlite3.h>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

/// Below its statements, since the engine runs none on a file that it does not take for a database.
int lock(sqlite3* database)
{
    sqlite3_file* file = nullptr;
    int code = sqlite3_file_control(database, "main", SQLITE_FCNTL_FILE_POINTER, &file);
    for (const int level : {SQLITE_LOCK_SHARED, SQLITE_LOCK_RESERVED, SQLITE_LOCK_EXCLUSIVE}) {
        if (code == SQLITE_OK)
            code = file->pMethods->xLock(file, level);
    }
    return code;
}

} // namespace

void HeldFile::Close::operator()(sqlite3* database) const
{
    sqlite3_close_v2(database);
}

HeldFile::HeldFile(const QString& file)
{
    sqlite3* database = nullptr;
    int code = sqlite3_open_v2(file.toUtf8().constData(), &database, SQLITE_OPEN_READWRITE, nullptr);
    m_database.reset(database);
    if (code == SQLITE_OK)
        code = lock(database);
    if (code == SQLITE_BUSY) {
        Finding held = mender_checks::in_use();
        held.words = u"Somebody is reading or writing in the church just now."_s;
        throw FileError(in_one_line(held));
    }
    if (code != SQLITE_OK)
        throw FileError(in_one_line(mender_checks::forbidden()));
}

void HeldFile::make_movable()
{
#ifdef Q_OS_WIN
    m_database.reset();
#endif
}

} // namespace kindrel::core
