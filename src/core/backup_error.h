#pragma once

#include <QString>

#include <stdexcept>

namespace kindrel::core {

/// Why an archive is no backup that can be used.
enum class BackupFault {
    missing,
    foreign, ///< Not one of this program's backups.
    damaged,
    hostile, ///< Made to do harm: names that climb out, links, duplicates, sizes beyond all measure.
    password_needed,
    wrong_password,
    newer, ///< Of a later edition of the program.
    older  ///< No upgrade leads from it.
};

/// A backup cannot be used; the text is for the person and names no file of the church.
class BackupError : public std::runtime_error
{
public:
    BackupError(BackupFault fault, const QString& what) : std::runtime_error(what.toStdString()), m_fault(fault) {}
    [[nodiscard]] BackupFault fault() const { return m_fault; }
    [[nodiscard]] QString text() const { return QString::fromUtf8(what()); }

private:
    BackupFault m_fault;
};

} // namespace kindrel::core
