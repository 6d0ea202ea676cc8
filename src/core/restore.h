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

/// A restore that ended at a moment when nobody can tell whether the backup is in place. Whoever opens the church next
/// settles it; the office must not be worked in.
class RestoreUnsettled : public std::runtime_error
{
public:
    explicit RestoreUnsettled(const QString& what) : std::runtime_error(what.toStdString()) {}
    [[nodiscard]] QString text() const { return QString::fromUtf8(what()); }
};

/// Replaces the church by a backup of it, after asking and after backing up the present state. Everything in the
/// backup was compared before anything changes; killed at any moment, the church is the old one or the new one once
/// settle_interrupted_restore() ran. The office shows the old church's settings afterwards and must be built anew.
/// Nullopt after telling why nothing changed, and when the person declined or gave up. Throws RestoreUnsettled.
[[nodiscard]] std::optional<RestoreReport> restore_backup(Office& office, const RestoreRequest& request,
                                                          Progress& progress);

/// Brings the database of an older backup to version `to`; throws BackupError when `chain` does not lead there, or
/// when it is newer.
void bring_up_to_date(Session& church_file, std::span<const Upgrade> chain, int to);

} // namespace kindrel::core
