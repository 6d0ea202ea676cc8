#pragma once

#include "core/backup_archive.h"
#include "core/backup_error.h"
#include "core/backup_manifest.h"

namespace kindrel::core {

/// The longest description that is read, in bytes. That of a church with 300,000 photographs is as long.
inline constexpr qint64 largest_manifest = 64 << 20;

/// A backup whose description was read and agrees with the archive's directory. Throws BackupError.
struct OpenBackup
{
    OpenBackup(const QString& file, const QString& password);

    ArchiveReader reader;
    Manifest manifest;
};

enum class Unpack { database, everything };

inline constexpr int database_check_steps = 1;

/// Reads every file of the backup and compares it with its checksum; puts the database, or everything, under `folder`
/// by the names that they bear in the archive. Then opens the database, checks it and compares its rows. Throws
/// BackupError, DatabaseError, FileError or Cancelled; what was unpacked counts for nothing then. Takes, beside those
/// of the bytes, `database_check_steps` steps.
void unpack(const OpenBackup& backup, const QString& folder, Unpack what, ByteMeter& meter);

/// What of one folder is in a backup.
struct PartContents
{
    QString words;
    int files = 0;
    qint64 bytes = 0;
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

/// Of one kind of record.
struct ComparedKind
{
    QString words;
    qint64 then = 0, now = 0;
};
/// What a person compares a backup and the church by, in a fixed order; at the end, where there are such, the records
/// of all other kinds of which there are more than then, and those of which there are fewer: what would be lost must
/// not hide behind what would come back. Changes inside records are not to be seen in it.
[[nodiscard]] std::vector<ComparedKind> compared_kinds(const ChurchSummary& then, const ChurchSummary& now);

} // namespace kindrel::core
