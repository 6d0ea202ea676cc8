#pragma once

#include "core/backup_parts.h"
#include "core/backup_reading.h"

namespace kindrel::core {

struct BackupRequest
{
    QString folder = {};   ///< Empty: the next of the church's own folders `Backup1` to `Backup5`.
    QString password = {}; ///< Empty: the archive is not encrypted.
    BackupChoice choice = {};
};

struct BackupReport
{
    BackupContents contents;
    bool compacted = false; ///< False when the database could not be compacted; the backup is whole all the same.
};

/// Backs the church up under the busy marker. The archive appears under its name after everything in it was compared;
/// one that lay in the church's own folder before then goes. Nullopt after telling why there is none, and when the
/// person gave up; nothing is left behind then.
[[nodiscard]] std::optional<BackupReport> make_backup(Office& office, const BackupRequest& request, Progress& progress);

/// A backup that this church made.
struct KnownBackup
{
    QString file;
    QDateTime made;
    qint64 size = 0;
    bool verified = false; ///< It is the very file that was compared after it was written.
    bool present = true;   ///< False: on a disk that is not there, moved, or deleted.
    bool before_restore = false;
};

/// The newest first. Reads no archive. Throws FileError.
[[nodiscard]] std::vector<KnownBackup> backups_of(const Office& office);

/// The present state of the church, to be compared with a backup; tables that cannot be read count nothing. Throws
/// DatabaseError when not even the settings can be read.
[[nodiscard]] ChurchSummary present_state(const Office& office);

/// What whole-database operations share: the sentences, the folders and the record of what was made.
namespace backup_rules {

/// Notes a compared archive, so that it is known again. Throws FileError.
void remember(const Office& office, const BackupContents& contents);
/// Takes an archive that is gone off the list. Throws FileError.
void forget(const Office& office, const QString& file);
/// The folder of the backups that are made before a restore.
[[nodiscard]] QString safety_folder(const Office& office);
/// Runs `work`; tells a failure under `sentence`, and nothing when the person gave up. True when it went through.
[[nodiscard]] bool attempt(const Office& office, const QString& sentence, const std::function<void()>& work);
/// That somebody else works on the whole database.
[[nodiscard]] Message busy(const QString& sentence);

} // namespace backup_rules

} // namespace kindrel::core
