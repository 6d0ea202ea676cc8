#include "core/backup.h"

#include "core/backup_files.h"
#include "core/backup_writing.h"
#include "core/compaction.h"
#include "core/entry.h"
#include "core/files.h"
#include "core/marker.h"
#include "core/open_church.h"
#include "core/restore_swap.h"
#include "core/windows1252.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr qsizetype longest_path = 250; ///< That the settings can hold.

const QString failed = u"Backup failed because:-"_s;
const QString cancel_question = u"Do you wish to stop the backup?"_s;
const QString not_noted = u"The backup is made, but its settings could not be kept."_s;

/// Of `Backup1` to `Backup5` the one whose turn it is.
int folder_in_turn(const Office& office)
{
    const int next = office.side.backup.number("next_folder");
    return next >= 1 && next <= own_backup_folders ? next : 1;
}

/// Throws FileError when the folder that the person chose is not there.
QString target_folder(const Office& office, const BackupRequest& request)
{
    if (request.folder.isEmpty()) {
        const QString folder = own_backup_folder(office.paths, folder_in_turn(office));
        make_private_folder(folder);
        return folder;
    }
    const QString folder = as_folder(request.folder);
    if (!QFileInfo(folder).isDir())
        throw FileError(u"The folder '%1' cannot be found."_s.arg(folder));
    if (!QFileInfo(folder).isWritable())
        throw FileError(u"The folder '%1' does not allow files to be written."_s.arg(folder));
    return folder;
}

/// Whether it went through; a backup of the uncompacted database is as good.
bool compacted(Office& office)
{
    try {
        compact_held_church(office);
        return true;
    } catch (const DatabaseError&) {
        return false;
    } catch (const FileError&) {
        return false;
    }
}

void remove_older(const Office& office, const QString& folder, const QString& kept)
{
    for (const auto& name : archives_in(folder, office.church)) {
        if (name != kept)
            remove_file(folder + name);
    }
}

/// Read anew: another workstation may have made a backup since the program was started.
SideRecord stored_settings(const Office& office)
{
    return read_side_file(office.paths, side_files::backup).value_or(SideRecord(side_files::backup));
}

void keep_settings(Office& office, const BackupRequest& request)
{
    SideRecord record = office.side.backup;
    const auto path = to_windows1252(request.folder);
    if (request.folder.isEmpty())
        record.set_number("next_folder", folder_in_turn(office) % own_backup_folders + 1);
    else if (path && path->size() <= longest_path) // Any other is chosen anew each time.
        record.set_text("path", request.folder);
    record.set_flag("with_pictures", request.choice.with_pictures);
    record.set_flag("with_documents", request.choice.with_documents);
    record.set_flag("with_letters", request.choice.with_letters);
    record.set_text("last_backup", Date::from(office.clock.today()).stored());
    write_side_file(office.paths, record);
    office.side.backup = record;
}

/// What follows a finished backup can fail without harm to it: in words then why, else empty.
QString note(Office& office, const BackupRequest& request, const BackupContents& contents, const QString& folder)
{
    try {
        backup_rules::remember(office, contents);
        if (request.folder.isEmpty())
            remove_older(office, folder, QFileInfo(contents.file).fileName());
        keep_settings(office, request);
        return {};
    } catch (const FileError& error) {
        return error.text();
    }
}

struct MadeBackup
{
    BackupReport report;
    QString not_noted; ///< Why; to be told once nobody is kept out any more.
};

MadeBackup back_up(Office& office, const BackupRequest& request, Progress& progress)
{
    settle_interrupted_restore(office.paths, *office.session);
    office.side.backup = stored_settings(office);
    const QString folder = target_folder(office, request);
    demand_work_space(office);
    const ProgressRun run(progress, u"Backing up"_s, archive_steps(*office.session) + 1, cancel_question);
    BackupReport report;
    report.compacted = compacted(office);
    if (!progress.step())
        throw Cancelled();
    const QString code = provide_church_code(*office.session);
    report.contents = write_archive(office,
                                    {.folder = folder,
                                     .name = archive_name(office, folder),
                                     .password = request.password,
                                     .choice = request.choice,
                                     .church_code = code},
                                    progress);
    return {report, note(office, request, report.contents, folder)};
}

/// Table by table: one that is missing or damaged counts nothing.
ChurchSummary readable_state(Session& session, const QStringList& tables)
{
    ChurchSummary church = summary_of(session, {});
    for (const QString& table : tables) {
        try {
            const auto counted = summary_of(session, {table});
            church.rows.insert(counted.rows);
            if (counted.last_change)
                church.last_change = counted.last_change;
        } catch (const DatabaseError&) {
        }
    }
    return church;
}

} // namespace

std::optional<BackupReport> make_backup(Office& office, const BackupRequest& request, Progress& progress)
{
    if (!enter(office, AreaId::backup))
        return std::nullopt;
    std::optional<MadeBackup> made;
    (void)backup_rules::attempt(office, failed, [&] {
        if (const auto marker = Marker::take(office.paths, side_files::busy))
            made = back_up(office, request, progress);
        else
            office.dialogue.show(backup_rules::busy(failed));
    });
    if (!made)
        return std::nullopt;
    if (!made->not_noted.isEmpty())
        office.dialogue.show(information(not_noted, made->not_noted));
    return made->report;
}

ChurchSummary present_state(const Office& office)
{
    const QStringList tables = tables_of(*office.session);
    ChurchSummary church;
    try {
        church = summary_of(*office.session, tables);
    } catch (const DatabaseError&) {
        church = readable_state(*office.session, tables);
    }
    church.church = office.church;
    church.church_name = office.church_name;
    return church;
}

namespace backup_rules {

QString safety_folder(const Office& office)
{
    return as_folder(office.paths.file(Folder::church, u"Before_restore"_s));
}

bool attempt(const Office& office, const QString& sentence, const std::function<void()>& work)
{
    QString why;
    try {
        work();
        return true;
    } catch (const DatabaseError& error) {
        why = error.text();
    } catch (const FileError& error) {
        why = error.text();
    } catch (const BackupError& error) {
        why = error.text();
    } catch (const Cancelled&) {
        return false;
    }
    office.dialogue.show({.text = sentence, .more = why});
    return false;
}

Message busy(const QString& sentence)
{
    return {.text = sentence, .more = busy_notice().more};
}

} // namespace backup_rules

} // namespace kindrel::core
