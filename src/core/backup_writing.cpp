#include "core/backup_writing.h"

#include "core/backup_files.h"
#include "core/copy_church_tables.h"
#include "core/files.h"
#include "core/open_church.h"
#include "core/sqlite_session.h"
#include "core/startup.h"
#include "core/verified_copy.h"

#include <QCryptographicHash>
#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <algorithm>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr qint64 bytes_to_spare = 4'000'000;
constexpr qint64 hashed_at_once = 1 << 18;
constexpr qint64 days_unfinished_kept = 1;
constexpr int attempts = 2; ///< At files that somebody changes meanwhile.
const QString unfinished = u".unfinished"_s;

/// A file of the church and the name that it bears in the archive.
struct Source
{
    QString name;
    QString path;
    qint64 size = 0;
};

std::vector<Source> sources_of(const Office& office, const BackupChoice& choice)
{
    std::vector<Source> sources;
    for (const BackupPart& part : backup_parts()) {
        if (!chosen(part, choice))
            continue;
        const QString folder = office.paths.folder(part.folder);
        for (const auto& name : files_within(folder))
            sources.push_back({QString::fromUtf16(part.name) + name, folder + name, QFileInfo(folder + name).size()});
    }
    return sources;
}

qint64 bytes_in(const std::vector<Source>& sources)
{
    qint64 sum = 0;
    for (const auto& source : sources)
        sum += source.size;
    return sum;
}

ManifestEntry hashed(const Source& source, ByteMeter& meter)
{
    if (!stays_inside(source.name))
        throw FileError(u"'%1' cannot be backed up under this name."_s.arg(QDir::toNativeSeparators(source.path)));
    QFile file(source.path);
    QCryptographicHash hash(QCryptographicHash::Sha256);
    qint64 size = 0;
    bool readable = file.open(QIODevice::ReadOnly);
    while (readable && !file.atEnd()) {
        const QByteArray piece = file.read(hashed_at_once);
        readable = !piece.isEmpty();
        hash.addData(piece);
        size += piece.size();
        meter.add(piece.size());
    }
    if (!readable)
        throw FileError(u"Unable to read '%1': %2"_s.arg(QDir::toNativeSeparators(source.path), file.errorString()));
    return {source.name, size, hash.result().toHex()};
}

/// Copies row by row, over a connection that belongs to this run alone: steps are made while it reads one moment.
void copy_from_server(const Office& office, const QString& copy, Progress& progress)
{
    constexpr int works_per_row = 2; // Each is written and compared.
    const auto server = connect_to_read(office.paths);
    const Transaction reading(*server);
    ByteMeter meter(progress, works_per_row * count_rows(*server));
    copy_to_new_file(*server, copy, [&](int rows) { meter.add(rows); });
}

/// A sound copy of the database that bears the church's code.
QString copy_database(const Office& office, const QString& church_code, const WorkFolder& work, Progress& progress)
{
    const QString copy = work.file(u"KR10_records.kdl"_s);
    if (office.session->engine() == EngineKind::postgres) {
        copy_from_server(office, copy, progress);
        check_church_file(copy);
    } else {
        verified_copy(*office.session, copy);
    }
    const auto session = open_sqlite(copy);
    if (summary_of(*session, {}).church_code.isEmpty())
        write_setting(*session, u"church_code"_s, church_code);
    return copy;
}

ChurchSummary summary_of_copy(const Office& office, const QString& copy)
{
    const auto session = open_sqlite(copy);
    ChurchSummary church = summary_of(*session, tables_of(*session));
    church.church = office.church;
    church.church_name = office.church_name;
    return church;
}

/// Removes what killed backups left in a folder that is the church's own, or has lain about for a day elsewhere.
void clear_unfinished(const Office& office, const QString& folder)
{
    const bool own = folder.startsWith(office.paths.folder(Folder::church));
    const QDateTime now = QDateTime::currentDateTime();
    const QString pattern = u"Kindrel_church%1_*.zip%2*"_s.arg(QString::number(office.church), unfinished);
    for (const auto& file : QDir(folder).entryInfoList({pattern}, QDir::Files)) {
        if (own || file.lastModified().daysTo(now) > days_unfinished_kept)
            QFile::remove(file.filePath());
    }
}

/// The unfinished archive, gone at the end unless it got its name.
class Draft
{
public:
    explicit Draft(const QString& target) : m_target(target), m_path(target + unfinished)
    {
        write_file(m_path, {});
        keep_private(m_path);
    }
    Draft(const Draft&) = delete;
    Draft& operator=(const Draft&) = delete;
    ~Draft() { QFile::remove(m_path); }

    [[nodiscard]] QString path() const { return m_path; }
    void appear() { move_file(m_path, m_target); }

private:
    QString m_target;
    QString m_path;
};

Manifest describe(const Office& office, const BackupChoice& choice, const QString& copy,
                  const std::vector<Source>& sources, ByteMeter& meter)
{
    Manifest manifest{.church = summary_of_copy(office, copy),
                      .made = office.clock.now(),
                      .edition = program_edition,
                      .parts = {},
                      .entries = {}};
    for (const BackupPart& part : backup_parts()) {
        if (chosen(part, choice))
            manifest.parts += QString::fromUtf16(part.name);
    }
    for (const auto& source : sources)
        manifest.entries.push_back(hashed(source, meter));
    std::ranges::sort(manifest.entries, {}, &ManifestEntry::name);
    return manifest;
}

void fill_archive(const QString& path, const ArchiveJob& job, const Manifest& manifest,
                  const std::vector<Source>& sources, ByteMeter& meter)
{
    ArchiveWriter writer(path, job.password, meter);
    writer.add_content(manifest_entry, manifest.to_json());
    for (const auto& source : sources)
        writer.add_file(source.name, source.path);
    meter.step();
    writer.finish();
    meter.step();
}

/// The archive as it lies on the disk.
BackupContents check_archive(const QString& path, const ArchiveJob& job, const Manifest& manifest,
                             const WorkFolder& work, ByteMeter& meter)
{
    keep_private(path);
    flush_to_disk(path);
    const OpenBackup backup(path, job.password);
    if (backup.manifest.entries != manifest.entries)
        throw BackupError(BackupFault::damaged, u"The backup holds something else than was written."_s);
    meter.step();
    const WorkFolder checked(work.file(u"check"_s));
    unpack(backup, checked.file({}), Unpack::database, meter);
    return contents_of(backup, job.folder + job.name);
}

/// What an archive is made of.
struct Content
{
    std::vector<Source> sources;
    Manifest manifest = {};
};

BackupContents put_together(const Office& office, const ArchiveJob& job, Content& content, const WorkFolder& work,
                            ByteMeter& meter)
{
    const QString copy = content.sources.back().path;
    content.manifest = describe(office, job.choice, copy, content.sources, meter);
    Draft draft(job.folder + job.name);
    fill_archive(draft.path(), job, content.manifest, content.sources, meter);
    const BackupContents contents = check_archive(draft.path(), job, content.manifest, work, meter);
    draft.appear();
    return contents;
}

bool was_changed(const Source& source, const Manifest& manifest, ByteMeter& meter)
{
    if (!QFileInfo::exists(source.path))
        return true;
    const auto listed = std::ranges::lower_bound(manifest.entries, source.name, {}, &ManifestEntry::name);
    try {
        return listed != manifest.entries.end() && listed->name == source.name && hashed(source, meter) != *listed;
    } catch (const FileError&) {
        return false; // It cannot be read, which was told.
    }
}

/// In words, what kind of file is not as it was when it was described; empty when all are.
QString changed_kind(const Content& content, ByteMeter& meter)
{
    const auto changed = std::ranges::find_if(
        content.sources, [&](const Source& source) { return was_changed(source, content.manifest, meter); });
    const BackupPart* part = changed == content.sources.end() ? nullptr : part_of(changed->name);
    return part ? QString::fromUtf16(part->words) : QString();
}

} // namespace

int archive_steps(const Session& session)
{
    constexpr int single = 4; // The database is copied; all files entered, the archive written, and opened again.
    const int rows_copied = session.engine() == EngineKind::postgres ? ByteMeter::meter_steps : 0;
    return rows_copied + single + ByteMeter::meter_steps + database_check_steps;
}

BackupContents write_archive(Office& office, const ArchiveJob& job, Progress& progress)
{
    const QString church = office.paths.folder(Folder::church);
    demand_work_space(office);
    const WorkFolder work(church + u"backup_work"_s);
    clear_unfinished(office, job.folder);
    const QString copy = copy_database(office, job.church_code, work, progress);
    if (!progress.step())
        throw Cancelled();

    Content content{sources_of(office, job.choice)};
    const Source database{database_entry, copy, QFileInfo(copy).size()};
    content.sources.push_back(database);
    demand_space(office, job.folder, bytes_in(content.sources) + database.size);
    constexpr int times_read = 3; // Described, written and compared.
    ByteMeter meter(progress, times_read * bytes_in(content.sources));
    for (int attempt = 1;; ++attempt) {
        try {
            return put_together(office, job, content, work, meter);
        } catch (const std::runtime_error&) {
            const QString kind = changed_kind(content, meter);
            if (kind.isEmpty())
                throw;
            if (attempt == attempts)
                throw FileError(u"One of the %1 was changed while the backup was made. Make it again when nobody is "
                                "working on them."_s.arg(kind.toLower()));
        }
        content = {sources_of(office, job.choice)};
        content.sources.push_back(database);
    }
}

QString archive_name(const Office& office, const QString& folder)
{
    const QString base =
        u"Kindrel_church%1_%2"_s.arg(QString::number(office.church), office.clock.now().toString(u"yyyy-MM-dd_HHmmss"));
    QString name = base + u".zip"_s;
    for (int copy = 2; QFileInfo::exists(folder + name); ++copy)
        name = u"%1_%2.zip"_s.arg(base).arg(copy);
    return name;
}

QStringList archives_in(const QString& folder, int church)
{
    const QString whose = church == 0 ? u"*"_s : QString::number(church);
    QStringList names = QDir(folder).entryList({u"Kindrel_church%1_*.zip"_s.arg(whose)}, QDir::Files, QDir::Name);
    std::ranges::reverse(names);
    return names;
}

qint64 bytes_of_church(const Office& office, const BackupChoice& choice)
{
    return bytes_in(sources_of(office, choice)) + QFileInfo(office.paths.database()).size();
}

void demand_work_space(const Office& office)
{
    demand_space(office, office.paths.folder(Folder::church), 2 * QFileInfo(office.paths.database()).size());
}

void demand_space(const Office& office, const QString& folder, qint64 bytes)
{
    const qint64 needed = bytes + bytes_to_spare;
    if (office.workstation.free_bytes(folder) >= needed)
        return;
    constexpr qint64 megabyte = 1'000'000;
    throw FileError(u"There is too little free space in '%1': %2 Meg are needed."_s.arg(
        QDir::toNativeSeparators(folder), QString::number((needed + megabyte - 1) / megabyte)));
}

} // namespace kindrel::core
