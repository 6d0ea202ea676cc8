#pragma once

#include "core/backup_archive.h"
#include "core/backup_error.h"
#include "core/backup_manifest.h"

namespace kindrel::core {

/// A backup whose description was read and agrees with the archive's directory. Throws BackupError.
struct OpenBackup
{
    OpenBackup(const QString& file, const QString& password);

    ArchiveReader reader;
    Manifest manifest;
};

enum class Unpack { database, everything };

/// Reads every file of the backup and compares it with its checksum; puts the database, or everything, under `folder`
/// by the names that they bear in the archive. Then opens the database, checks it and compares its rows. Throws
/// BackupError, DatabaseError, FileError or Cancelled; what was unpacked counts for nothing then.
void unpack(const OpenBackup& backup, const QString& folder, Unpack what, ByteMeter& meter);

/// What of one folder is in a backup.
struct PartContents
{
    QString words;
    int files = 0;
    qint64 bytes = 0;
};

/// A kind of record and how many there are.
struct KindCount
{
    QString words;
    qint64 rows = 0;
};

/// What stands in a backup.
struct BackupContents
{
    QString file;
    QDateTime made;
    ChurchSummary church;
    int edition = 0;
    bool encrypted = false;
    qint64 bytes = 0; ///< Unpacked.
    std::vector<PartContents> parts;
};

/// Reads what is in a backup, without reading all of it. Throws BackupError.
[[nodiscard]] BackupContents read_backup(const QString& file, const QString& password);
[[nodiscard]] BackupContents contents_of(const OpenBackup& backup, const QString& file);

/// The counts that a person compares, in a fixed order.
[[nodiscard]] std::vector<KindCount> kinds_of(const ChurchSummary& church);

} // namespace kindrel::core
