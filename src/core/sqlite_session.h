#pragma once

#include "core/session.h"

namespace kindrel::core {

/// Why the embedded engine refuses.
enum class FileTrouble {
    damage,    ///< What it reads is no database, or cannot be read.
    in_use,    ///< Somebody else has it locked.
    forbidden, ///< This user may not read or write it.
    other
};

/// What the embedded engine throws.
class FileDatabaseError : public DatabaseError
{
public:
    FileDatabaseError(const QString& what, FileTrouble trouble, bool constraint_broken = false)
        : DatabaseError(what, constraint_broken), m_trouble(trouble)
    {
    }
    [[nodiscard]] FileTrouble trouble() const { return m_trouble; }

private:
    FileTrouble m_trouble;
};

/// Opens an existing .kdl file. Throws DatabaseError when it is missing, is no database, or cannot be written.
[[nodiscard]] std::unique_ptr<Session> open_sqlite(const QString& file);
/// Makes an empty database file, readable by its owner and group alone; the file must not exist yet.
[[nodiscard]] std::unique_ptr<Session> create_sqlite(const QString& file);

} // namespace kindrel::core
