#pragma once

#include "core/value.h"

#include <QStringList>

#include <functional>
#include <memory>
#include <vector>

struct sqlite3;

namespace kindrel::core {

/// A church file that the engine cannot read in the ordinary way, because parts of it are missing or overwritten.
class DamagedFile
{
public:
    using Sink = std::function<void(std::vector<Value>)>;

    enum class Opening {
        copy, ///< What an interrupted change left in the journal is taken back: the file may be changed by that.
        as_it_lies
    };

    /// Throws DatabaseError.
    DamagedFile(const QString& file, Opening opening);

    /// Empty when the file does not tell of the table.
    [[nodiscard]] QStringList fields_of(const QString& table);
    /// Hands on every row that can be read, in no order. False where a part could not be read.
    [[nodiscard]] bool read(const QString& table, const QStringList& fields, const Sink& sink);

private:
    struct Close
    {
        void operator()(sqlite3* database) const;
    };
    std::unique_ptr<sqlite3, Close> m_database;
};

} // namespace kindrel::core
