#pragma once

#include "core/backup_parts.h"
#include "core/backup_reading.h"

namespace kindrel::core {

/// An archive to be written.
struct ArchiveJob
{
    QString folder; ///< Ends in the separator.
    QString name;
    QString password = {};
    BackupChoice choice = {};
    QString church_code; ///< Of a church that has none of its own yet.
};

/// The steps that write_archive() takes of a progress.
[[nodiscard]] int archive_steps(const Session& session);

/// Writes the church into an archive that appears under its name only after it was opened again and everything in it
/// compared. The caller holds the busy marker. Throws DatabaseError, FileError, BackupError or Cancelled and leaves
/// nothing behind.
[[nodiscard]] BackupContents write_archive(Office& office, const ArchiveJob& job, Progress& progress);

/// A name for an archive that is made now, which no file in the folder bears.
[[nodiscard]] QString archive_name(const Office& office, const QString& folder);
/// The archives of a folder by their names, the newest first; of one church where `church` is not 0.
[[nodiscard]] QStringList archives_in(const QString& folder, int church = 0);

/// What the church's database and folders hold in bytes, before compression; of a server church without the database.
[[nodiscard]] qint64 bytes_of_church(const Office& office, const BackupChoice& choice);
/// Throws FileError, in plain words, when the folder's volume has less room.
void demand_space(const Office& office, const QString& folder, qint64 bytes);
/// The same for what is put in the church folder while an archive is made.
void demand_work_space(const Office& office);

} // namespace kindrel::core
