#pragma once

#include <QString>

#include <memory>

struct sqlite3;

namespace kindrel::core {

/// Keeps a church file from everybody else by the engine's own locks, whatever is wrong with its content.
class HeldFile
{
public:
    /// Throws FileError when somebody is reading or writing it just now, or when this user may not.
    explicit HeldFile(const QString& file);
    /// To be called before the file gets another name: some systems move no file that is open, and so guard it.
    void make_movable();

private:
    struct Close
    {
        void operator()(sqlite3* database) const;
    };
    std::unique_ptr<sqlite3, Close> m_database;
};

} // namespace kindrel::core
