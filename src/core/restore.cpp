#include "core/restore.h"

#include "core/backup.h"
#include "core/backup_files.h"
#include "core/backup_writing.h"
#include "core/entry.h"
#include "core/files.h"
#include "core/locks.h"
#include "core/marker.h"
#include "core/restore_swap.h"
#include "core/schema.h"
#include "core/sqlite_session.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <algorithm>
#include <ranges>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr std::size_t most_holders_named = 5;
constexpr qsizetype safety_backups_kept = 3;
constexpr qint64 read_at_once = 1 << 20;

const QString failed = u"Restoring files failed because:-"_s;
const QString cancel_question = u"Do you wish to stop restoring?"_s;
const QString exchanging = u"The church is replaced, which cannot be stopped any more"_s;
const QString somebody_inside = u"Unable to restore a backup while somebody is working in this church."_s;
const QString another_church = u"This backup was made of another church."_s;
const QString church_unknown =
    u"This church was never backed up, so it cannot be told whether the backup was made of it. Do you wish to restore "
    "it nevertheless?"_s;
const QString replace_question = u"Do you wish to replace the data of '%1' by the backup of %2?"_s;
const QString present_unkept =
    u"Unable to back up the present data, so restoring could not be taken back. Do you wish to restore nevertheless? "
    "The present files are copied as they are."_s;
const QString inside_unknown =
    u"It cannot be told whether somebody is working in this church. Do you wish to restore nevertheless?"_s;
const QString cannot_be_told =
    u"It cannot be told yet whether the backup is in place. Start Kindrel again: it settles it."_s;
const QString unchecked = u"unchecked_"_s;
const QString newer = u"This backup was made by a newer edition of Kindrel, you need to obtain the latest update."_s;
const QString older = u"This backup was made by an edition of Kindrel that is too old to be restored."_s;

/// True when nobody holds a lock. Those that a program of this workstation left behind when it failed do not count.
/// Tells who is inside. Locks that cannot be read are a damage that the restore would take away.
bool nobody_known_inside(Office& office)
{
    std::vector<HeldLock> held;
    try {
        held = Locks(office).all();
    } catch (const DatabaseError&) {
        return true;
    }
    std::erase_if(held, &HeldLock::stale);
    if (held.empty())
        return true;
    QStringList lines;
    for (const HeldLock& lock : held | std::views::take(most_holders_named))
        lines += held_line(lock, office.day_order());
    if (held.size() > most_holders_named)
        lines += u"And %1 more."_s.arg(held.size() - most_holders_named);
    office.dialogue.show({.text = somebody_inside, .more = lines.join(u'\n')});
    return false;
}

bool nobody_inside(Office& office)
{
    try {
        (void)Locks(office).all();
    } catch (const DatabaseError& error) {
        return office.dialogue.confirm({.text = inside_unknown, .more = error.text(), .icon = Icon::question},
                                       Answer::no);
    }
    return nobody_known_inside(office);
}

void check_version(int version, std::span<const Upgrade> chain, int to)
{
    if (version > to)
        throw BackupError(BackupFault::newer, newer);
    if (version < to && !leads(chain, version, to))
        throw BackupError(BackupFault::older, older);
}

/// True when the backup is of this church. One that has no code yet can take any: nothing tells it apart.
bool of_this_church(const Office& office, const ChurchSummary& present, const Manifest& manifest)
{
    const QString& code = present.church_code;
    if (!code.isEmpty() && code != manifest.church.church_code)
        throw BackupError(BackupFault::foreign, another_church);
    const bool unknown = code.isEmpty() && present.rows.value(u"tbl_surname"_s) > 0;
    return !unknown || office.dialogue.confirm({.text = church_unknown, .icon = Icon::question}, Answer::no);
}

/// "Families: 120 in the backup, 118 now", kind by kind.
QString comparison(const ChurchSummary& present, const Manifest& manifest)
{
    QStringList lines;
    for (const ComparedKind& kind : compared_kinds(manifest.church, present)) {
        if (kind.now != 0 || kind.then != 0)
            lines += u"%1: %2 in the backup, %3 now"_s.arg(kind.words, QString::number(kind.then),
                                                           QString::number(kind.now));
    }
    return lines.join(u'\n');
}

bool wanted(const Office& office, const ChurchSummary& present, const Manifest& manifest)
{
    const QString day = Date::from(manifest.made.date()).shown(office.day_order());
    const QString made = u"%1 %2"_s.arg(day, manifest.made.toString(u"HH:mm"));
    return office.dialogue.confirm({.text = replace_question.arg(office.church_name, made),
                                    .more = comparison(present, manifest),
                                    .icon = Icon::question},
                                   Answer::no);
}

/// The locks of those who were inside when the backup was made, and of nobody now.
void empty_lock_tables(Office& office, Session& fresh)
{
    Locks locks(fresh, office.workstation, office.clock);
    for (const HeldLock& lock : locks.all())
        locks.unlock(lock.kind, lock.key);
}

void prepare_database(Office& office, const RestoreWork& work)
{
    const auto fresh = open_sqlite(work.unpacked() + database_entry);
    bring_up_to_date(*fresh, upgrades(), schema_version);
    empty_lock_tables(office, *fresh);
    work.mark(*fresh);
}

/// The names of the other churches and the turn of the backup folders belong to this machine.
bool stays_as_it_is(const QString& name)
{
    const auto is = [&](const SideFile& file) {
        return name.compare(u"shared/Global/"_s + QLatin1String(file.name), Qt::CaseInsensitive) == 0;
    };
    return is(side_files::church_names) || is(side_files::backup);
}

/// The church gets the name that it had.
void add_church_name(const Office& office, const Manifest& manifest, const RestoreWork& work, std::vector<Swap>& swaps)
{
    if (office.church >= training_church || manifest.church.church >= training_church)
        return;
    SideRecord names =
        read_side_file(office.paths, side_files::church_names).value_or(SideRecord(side_files::church_names));
    names.set_text(u"church_%1"_s.arg(office.church).toStdString(), manifest.church.church_name);
    const QString fresh = u"unpacked/church_names.dat"_s;
    write_file(work.unpacked() + u"church_names.dat"_s, names.bytes());
    keep_private(work.unpacked() + u"church_names.dat"_s);
    const QString name = QLatin1String(side_files::church_names.name);
    swaps.push_back({fresh, Folder::global, existing_name(office.paths.folder(Folder::global), name)});
}

/// The church's own folders are exchanged as a whole; into those that other churches share the files go one by one.
std::vector<Swap> swaps_for(const Office& office, const Manifest& manifest, const RestoreWork& work, bool shared)
{
    std::vector<Swap> swaps;
    for (const auto& name : manifest.parts) {
        const BackupPart* part = part_of(name);
        if (part && !part->shared) {
            make_private_folder(work.unpacked() + name);
            swaps.push_back({u"unpacked/"_s + name, part->folder, {}});
        }
    }
    if (!shared)
        return swaps;
    for (const ManifestEntry& entry : manifest.entries) {
        const BackupPart* part = part_of(entry.name);
        if (!part || !part->shared || stays_as_it_is(entry.name))
            continue;
        const QString within = entry.name.mid(QStringView(part->name).size());
        swaps.push_back(
            {u"unpacked/"_s + entry.name, part->folder, existing_name(office.paths.folder(part->folder), within)});
    }
    add_church_name(office, manifest, work, swaps);
    return swaps;
}

bool reads_through(const QString& file)
{
    QFile source(file);
    bool sound = source.open(QIODevice::ReadOnly);
    while (sound && !source.atEnd())
        sound = !source.read(read_at_once).isEmpty();
    return sound;
}

/// Leaves out what cannot be read.
void copy_readable(const QString& from, const QString& to)
{
    if (!QFile(from).open(QIODevice::ReadOnly))
        return;
    make_private_folder(QFileInfo(to).path());
    try {
        copy_file(from, to);
    } catch (const FileError&) {
        if (reads_through(from))
            throw;
    }
}

/// The database must be among the copies; of the files those that can be read.
void copy_as_it_is(const Office& office, const QString& target)
{
    make_private_folder(QFileInfo(target + database_entry).path());
    if (office.session->engine() == EngineKind::postgres)
        office.session->copy_to(target + database_entry);
    else
        copy_file(office.paths.database(), target + database_entry);
    copy_readable(office.paths.database() + u"-journal"_s, target + database_entry + u"-journal"_s);
    for (const BackupPart& part : backup_parts()) {
        const QString from = office.paths.folder(part.folder);
        for (const auto& name : files_within(from))
            copy_readable(from + name, target + QString::fromUtf16(part.name) + name);
    }
}

/// The present database and files as they are, in a folder of their own. Throws FileError, and DatabaseError where the
/// church of a server cannot be copied; nothing stays then.
QString copy_unchecked(const Office& office, const QString& folder)
{
    demand_space(office, folder, bytes_of_church(office, {}));
    const QString target = folder + unchecked + QFileInfo(archive_name(office, folder)).completeBaseName();
    const QString unfinished = target + u".unfinished"_s;
    try {
        copy_as_it_is(office, as_folder(unfinished));
        move_file(unfinished, target);
    } catch (...) {
        QDir(unfinished).removeRecursively();
        throw;
    }
    return as_folder(target);
}

/// The list is a convenience: without it the archive is found where it lies.
void remember(const Office& office, const BackupContents& kept)
{
    try {
        backup_rules::remember(office, kept);
    } catch (const FileError&) {
    }
}

/// Keeps the present state: compared like any backup, or as it is when it is too damaged for that and the person goes
/// on.
void keep_present(Office& office, RestoreReport& report, Progress& progress)
{
    const QString folder = backup_rules::safety_folder(office);
    make_private_folder(folder);
    QString why;
    BackupContents kept;
    try {
        kept = write_archive(
            office,
            {.folder = folder, .name = archive_name(office, folder), .church_code = report.restored.church.church_code},
            progress);
        report.before = kept.file;
    } catch (const std::runtime_error& error) { // Of the database, a file or the archive.
        why = QString::fromUtf8(error.what());
    }
    if (!report.before.isEmpty()) {
        remember(office, kept);
        return;
    }
    if (!office.dialogue.confirm({.text = present_unkept, .more = why}, Answer::no))
        throw Cancelled();
    report.before_unchecked = copy_unchecked(office, folder);
}

/// The person gave up after all: what was kept of the present would only push older states out.
void drop_kept(const Office& office, const RestoreReport& report)
{
    if (!report.before_unchecked.isEmpty())
        QDir(report.before_unchecked).removeRecursively();
    if (report.before.isEmpty() || !QFile::remove(report.before))
        return;
    try {
        backup_rules::forget(office, report.before);
    } catch (const FileError&) { // Of the church's own folders only what is there is listed.
    }
}

/// What cannot be removed stays.
void remove_oldest_safety_backups(const Office& office, const QString& just_restored)
{
    const QString folder = backup_rules::safety_folder(office);
    for (const auto& name : archives_in(folder, office.church).mid(safety_backups_kept)) {
        if (QFileInfo(folder + name) != QFileInfo(just_restored))
            QFile::remove(folder + name);
    }
    QStringList copies = QDir(folder).entryList({unchecked + u'*'}, QDir::Dirs, QDir::Name | QDir::Reversed);
    for (const auto& name : copies.mid(safety_backups_kept))
        QDir(folder + name).removeRecursively();
}

/// True when the backup is in place though replacing the church failed: the answer may have been lost alone.
bool in_place_nevertheless(const Office& office, RestoreWork& work)
{
    try {
        return work.settle(*office.session);
    } catch (const std::runtime_error& error) { // Of the database or a file; a damaged record was moved away.
        throw RestoreUnsettled(restore_unsettled(office.paths) ? cannot_be_told : QString::fromUtf8(error.what()));
    }
}

/// From here on nothing is asked and nothing can be stopped. What fails once the database has its new content is no
/// failure of the restore.
void exchange(Office& office, RestoreWork& work, const std::vector<Swap>& swaps)
{
    try {
        work.swap(swaps);
        work.demand_undisturbed();
        office.session->replace_content(work.unpacked() + database_entry);
        work.demand_undisturbed();
    } catch (...) {
        if (!in_place_nevertheless(office, work))
            throw;
        return;
    }
    try {
        work.settle(*office.session);
    } catch (const std::runtime_error&) { // The backup is in place; whoever opens the church next clears up.
    }
}

void demand_space_for(const Office& office, const Manifest& manifest)
{
    const ManifestEntry& database = *std::ranges::find(manifest.entries, database_entry, &ManifestEntry::name);
    const qint64 present = bytes_of_church(office, {});
    demand_space(office, office.paths.folder(Folder::church), manifest.bytes() + database.size + 2 * present);
}

int steps_of_restore(const Session& session)
{
    constexpr int single = 2; // The database is prepared, and all is ready for the exchange.
    return ByteMeter::meter_steps + database_check_steps + single + archive_steps(session);
}

RestoreReport replace(Office& office, const OpenBackup& backup, const RestoreRequest& request, Progress& progress)
{
    const Manifest& manifest = backup.manifest;
    demand_space_for(office, manifest);
    const ProgressRun run(progress, u"Restoring"_s, steps_of_restore(*office.session), cancel_question);
    RestoreWork work(office.paths);
    ByteMeter meter(progress, manifest.bytes());
    unpack(backup, work.unpacked(), Unpack::everything, meter);
    prepare_database(office, work);
    meter.step();
    const auto swaps = swaps_for(office, manifest, work, request.with_shared_files);

    RestoreReport report{.restored = contents_of(backup, request.file), .before = {}};
    keep_present(office, report, progress);
    if (!progress.step(exchanging)) {
        drop_kept(office, report);
        throw Cancelled();
    }
    exchange(office, work, swaps);
    remove_oldest_safety_backups(office, request.file);
    return report;
}

/// Nobody is kept out while the person thinks it over.
bool agreed(Office& office, const Manifest& manifest)
{
    if (!nobody_inside(office))
        return false;
    const ChurchSummary present = present_state(office);
    check_version(manifest.church.schema, upgrades(), schema_version);
    return of_this_church(office, present, manifest) && wanted(office, present, manifest);
}

std::optional<RestoreReport> restore(Office& office, const RestoreRequest& request, Progress& progress)
{
    const OpenBackup backup(request.file, request.password);
    if (!agreed(office, backup.manifest))
        return std::nullopt;
    const auto marker = Marker::take(office.paths, side_files::busy);
    if (!marker) {
        office.dialogue.show(backup_rules::busy(failed));
        return std::nullopt;
    }
    settle_interrupted_restore(office.paths, *office.session);
    return nobody_known_inside(office) ? std::optional(replace(office, backup, request, progress)) : std::nullopt;
}

} // namespace

std::optional<RestoreReport> restore_backup(Office& office, const RestoreRequest& request, Progress& progress)
{
    if (!enter(office, AreaId::restore))
        return std::nullopt;
    std::optional<RestoreReport> report;
    const bool done = backup_rules::attempt(office, failed, [&] {
        if (office.paths.exists(Folder::church, QLatin1String(side_files::busy.name)))
            office.dialogue.show(backup_rules::busy(failed));
        else
            report = restore(office, request, progress);
    });
    return done ? report : std::nullopt;
}

void bring_up_to_date(Session& church_file, std::span<const Upgrade> chain, int to)
{
    const int from = read_version(church_file);
    check_version(from, chain, to);
    if (from == to)
        return;
    Transaction transaction(church_file);
    for (const Upgrade& step : chain) {
        if (step.to > from && step.to <= to)
            church_file.run_script(QString::fromUtf8(step.script));
    }
    write_setting(church_file, u"Version"_s, to);
    transaction.commit();
}

} // namespace kindrel::core
