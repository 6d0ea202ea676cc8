#pragma once

#include "core/backup_reading.h"
#include "core/office.h"
#include "core/upgrade.h"

namespace kindrel::core {

struct RestoreRequest
{
    QString file;
    QString password = {};
    bool with_shared_files = true; ///< Settings, pictures, letters and documents that all churches share.
};

struct RestoreReport
{
    BackupContents restored;
    QString before; ///< The backup of the state before, by which this restore can be taken back; empty without one.
    QString before_unchecked = {}; ///< Without one: the folder of the files before, copied as they were.
};

/// Replaces the church by a backup of it, after asking and after backing up the present state. Everything in the
/// backup was compared before anything changes; killed at any moment, the church is the old one or the new one once
/// settle_interrupted_restore() ran. The office shows the old church's settings afterwards and must be built anew.
/// Nullopt after telling why nothing changed, and when the person declined or gave up.
[[nodiscard]] std::optional<RestoreReport> restore_backup(Office& office, const RestoreRequest& request,
                                                          Progress& progress);

/// Brings the database of an older backup to version `to`; throws BackupError when `chain` does not lead there, or
/// when it is newer.
void bring_up_to_date(Session& church_file, std::span<const Upgrade> chain, int to);

} // namespace kindrel::core
