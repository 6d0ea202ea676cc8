#include "desktop/backup/exit_question.h"

#include "desktop/backup/backup_words.h"

#include <QDir>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

const QString exit_question = u"Backup %1 files before exiting?"_s.arg(core::product);
const QString restored = u"'%1' is as it was on %2."_s;
const QString take_back =
    u"The state before was kept. To take this back, restore this backup, which is marked \"made before a restore\":"_s;
const QString kept_unchecked =
    u"The state before could not be backed up. Its files were copied as they were, into this folder:"_s;
const QString nothing_kept = u"The state before could not be kept."_s;

QString way_back(const core::RestoreReport& report)
{
    if (!report.before.isEmpty())
        return take_back + u'\n' + QDir::toNativeSeparators(report.before);
    if (!report.before_unchecked.isEmpty())
        return kept_unchecked + u'\n' + QDir::toNativeSeparators(report.before_unchecked);
    return nothing_kept;
}

/// Nothing keeps a person from leaving, a damaged list of backups least of all.
QString last_backup_words(const core::Office& office)
{
    try {
        const auto backups = core::backups_of(office);
        const auto* last = last_verified(backups);
        return last ? u"The last backup was made on %1."_s.arg(moment_words(last->made, office.day_order()))
                    : u"No backup was made yet."_s;
    } catch (const core::FileError&) {
        return {};
    }
}

} // namespace

std::optional<bool> wants_backup_before_exit(const core::Office& office)
{
    if (!office.may(core::Area::backup_data))
        return false;
    return office.dialogue.confirm_or_cancel({.text = exit_question,
                                              .more = last_backup_words(office),
                                              .caption = core::product.toString(),
                                              .icon = core::Icon::question});
}

core::Message restored_message(const core::RestoreReport& report, core::DayOrder order)
{
    const core::BackupContents& backup = report.restored;
    return core::information(restored.arg(backup.church.church_name, moment_words(backup.made, order)),
                             way_back(report));
}

} // namespace kindrel::desktop
