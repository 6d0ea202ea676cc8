#include "core/backup_reading.h"

#include "core/backup_files.h"
#include "core/backup_parts.h"
#include "core/files.h"
#include "core/sqlite_session.h"
#include "core/verified_copy.h"

#include <QCryptographicHash>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QSet>

#include <algorithm>
#include <array>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

/// Locks, counters, logs and the program's own notes grow and go without a person's doing.
bool keeps_itself(const QString& table)
{
    return table.startsWith("tbl_id_"_L1) || table.contains("lock"_L1) || table.endsWith("_archive"_L1) ||
           table == "tbl_setting"_L1;
}

BackupError damaged(const QString& what)
{
    return {BackupFault::damaged, u"The backup is damaged: %1."_s.arg(what)};
}

Manifest read_manifest(const ArchiveReader& reader)
{
    const ArchiveEntry* entry = reader.find(manifest_entry);
    if (!entry || entry->size > largest_manifest)
        throw BackupError(BackupFault::foreign, u"This file is not a Kindrel backup."_s);
    QByteArray json;
    reader.read(*entry, [&](QByteArrayView piece) { json += piece; });
    return Manifest::from_json(json);
}

/// Every file is listed once and lies where one may, and none is there that is not listed. Both lists are sorted.
void compare(const ArchiveReader& reader, const Manifest& manifest)
{
    auto listed = manifest.entries.begin();
    for (const ArchiveEntry& entry : reader.entries()) {
        if (entry.name == manifest_entry)
            continue;
        if (listed == manifest.entries.end() || listed->name != entry.name || listed->size != entry.size)
            throw damaged(u"its files are not those that it lists"_s);
        if (entry.name != database_entry && !part_of(entry.name))
            throw damaged(u"it holds a file that belongs nowhere"_s);
        ++listed;
    }
    if (listed != manifest.entries.end())
        throw damaged(u"a file is missing"_s);
    if (!reader.find(database_entry))
        throw damaged(u"the database is missing"_s);
}

class Target
{
public:
    explicit Target(const QString& path) : m_file(path)
    {
        make_private_folder(QFileInfo(path).path());
        if (!m_file.open(QIODevice::WriteOnly | QIODevice::NewOnly))
            fail();
        keep_private(path);
    }
    void write(QByteArrayView piece)
    {
        if (m_file.write(piece.data(), piece.size()) != piece.size())
            fail();
    }
    void close()
    {
        if (!m_file.flush())
            fail();
        m_file.close();
    }

private:
    [[noreturn]] void fail() const
    {
        throw FileError(
            u"Unable to write '%1': %2"_s.arg(QDir::toNativeSeparators(m_file.fileName()), m_file.errorString()));
    }
    QFile m_file;
};

void check_entry(const ArchiveReader& reader, const ManifestEntry& listed, Target* target, ByteMeter& meter)
{
    QCryptographicHash hash(QCryptographicHash::Sha256);
    reader.read(*reader.find(listed.name), [&](QByteArrayView piece) {
        hash.addData(piece);
        if (target)
            target->write(piece);
        meter.add(piece.size());
    });
    if (hash.result().toHex() != listed.sha256)
        throw damaged(u"a file differs from what was saved"_s);
}

bool holds_triggers(Session& church_file)
{
    auto rows = church_file.select(u"SELECT 1 FROM [sqlite_master] WHERE [type]='trigger' LIMIT 1;"_s);
    return rows.first() != nullptr;
}

bool is_as_described(const QString& file, const ChurchSummary& described)
{
    try {
        check_church_file(file);
        const auto session = open_sqlite(file);
        const ChurchSummary found = summary_of(*session, tables_of(*session));
        return found.rows == described.rows && found.schema == described.schema &&
               found.church_code == described.church_code && !holds_triggers(*session);
    } catch (const DatabaseError&) {
        return false;
    }
}

} // namespace

OpenBackup::OpenBackup(const QString& file, const QString& password)
    : reader(file, password), manifest(read_manifest(reader))
{
    compare(reader, manifest);
}

void unpack(const OpenBackup& backup, const QString& folder, Unpack what, ByteMeter& meter)
{
    for (const ManifestEntry& listed : backup.manifest.entries) {
        if (what == Unpack::everything || listed.name == database_entry) {
            Target target(folder + listed.name);
            check_entry(backup.reader, listed, &target, meter);
            target.close();
        } else {
            check_entry(backup.reader, listed, nullptr, meter);
        }
    }
    if (!is_as_described(folder + database_entry, backup.manifest.church))
        throw damaged(u"its database is not the one that was saved"_s);
    meter.step();
}

BackupContents read_backup(const QString& file, const QString& password)
{
    return contents_of(OpenBackup(file, password), file);
}

BackupContents contents_of(const OpenBackup& backup, const QString& file)
{
    const Manifest& manifest = backup.manifest;
    BackupContents contents{.file = file,
                            .made = manifest.made,
                            .church = manifest.church,
                            .edition = manifest.edition,
                            .encrypted = backup.reader.find(database_entry)->encrypted,
                            .bytes = manifest.bytes(),
                            .parts = {}};
    for (const BackupPart& part : backup_parts()) {
        if (!manifest.parts.contains(QStringView(part.name)))
            continue;
        PartContents& found = contents.parts.emplace_back(PartContents{QString::fromUtf16(part.words)});
        for (const ManifestEntry& entry : manifest.entries) {
            if (part_of(entry.name) == &part) {
                ++found.files;
                found.bytes += entry.size;
            }
        }
    }
    return contents;
}

std::vector<ComparedKind> compared_kinds(const ChurchSummary& then, const ChurchSummary& now)
{
    std::vector<ComparedKind> kinds;
    QSet<QString> counted;
    for (const CountedKind& kind : counted_kinds()) {
        const QString table = QString::fromUtf16(kind.table).toLower();
        counted.insert(table);
        kinds.push_back({QString::fromUtf16(kind.words), then.rows.value(table), now.rows.value(table)});
    }
    ComparedKind added{u"Other records added since"_s}, removed{u"Other records removed since"_s};
    QMap<QString, qint64> every = now.rows;
    every.insert(then.rows);
    for (const QString& table : every.keys()) {
        const qint64 before = then.rows.value(table), present = now.rows.value(table);
        if (before == present || counted.contains(table) || keeps_itself(table))
            continue;
        ComparedKind& others = before < present ? added : removed;
        others.then += before;
        others.now += present;
    }
    std::ranges::copy_if(std::array{added, removed}, std::back_inserter(kinds),
                         [](const ComparedKind& kind) { return kind.then != kind.now; });
    return kinds;
}

} // namespace kindrel::core
