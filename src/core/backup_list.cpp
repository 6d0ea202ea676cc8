#include "core/backup.h"
#include "core/backup_files.h"
#include "core/backup_writing.h"
#include "core/files.h"

#include <QDir>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <algorithm>

// The list of the backups that a church made, kept beside its database.
namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr qsizetype most_remembered = 50;

/// An archive as it was when it had been compared.
struct Remembered
{
    QString file;
    QDateTime made;
    QDateTime written;
    qint64 size = 0;
};

QString list_file(const Office& office)
{
    return office.paths.file(Folder::church, u"backups.json"_s);
}

/// What cannot be read is forgotten: the archives themselves are what matters.
QByteArray readable_list(const Office& office)
{
    try {
        return read_file(list_file(office)).value_or(QByteArray());
    } catch (const FileError&) {
        return {};
    }
}

std::vector<Remembered> read_list(const Office& office)
{
    std::vector<Remembered> list;
    for (const auto& value : QJsonDocument::fromJson(readable_list(office)).array()) {
        const QJsonObject object = value.toObject();
        list.push_back({object[u"file"_s].toString(), QDateTime::fromString(object[u"made"_s].toString(), Qt::ISODate),
                        QDateTime::fromString(object[u"written"_s].toString(), Qt::ISODateWithMs),
                        static_cast<qint64>(object[u"size"_s].toDouble())});
    }
    return list;
}

void write_list(const Office& office, const std::vector<Remembered>& list)
{
    QJsonArray array;
    for (const auto& each : list)
        array.append(QJsonObject{{u"file"_s, each.file},
                                 {u"made"_s, each.made.toString(Qt::ISODate)},
                                 {u"written"_s, each.written.toString(Qt::ISODateWithMs)},
                                 {u"size"_s, each.size}});
    write_file(list_file(office), QJsonDocument(array).toJson());
    keep_private(list_file(office));
}

KnownBackup known(const Remembered& each)
{
    const QFileInfo file(each.file);
    const bool same = file.exists() && file.size() == each.size &&
                      file.lastModified().toMSecsSinceEpoch() == each.written.toMSecsSinceEpoch();
    return {.file = each.file, .made = each.made, .size = each.size, .verified = same, .present = file.exists()};
}

/// The folders in which this church's backups lie, as far as start-up knows.
QStringList folders_of(const Office& office)
{
    QStringList folders{backup_rules::safety_folder(office)};
    for (int number = 1; number <= own_backup_folders; ++number)
        folders += own_backup_folder(office.paths, number);
    const QString chosen = office.side.backup.text("path");
    if (!chosen.isEmpty())
        folders += as_folder(chosen);
    return folders;
}

/// Archives that lie in the folders and are not on the list.
void add_found(const Office& office, std::vector<KnownBackup>& backups)
{
    for (const auto& folder : folders_of(office)) {
        for (const auto& name : archives_in(folder, office.church)) {
            const QFileInfo file(folder + name);
            if (std::ranges::find(backups, file.filePath(), &KnownBackup::file) == backups.end())
                backups.push_back({.file = file.filePath(), .made = file.lastModified(), .size = file.size()});
        }
    }
}

} // namespace

std::vector<KnownBackup> backups_of(const Office& office)
{
    std::vector<KnownBackup> backups;
    std::ranges::transform(read_list(office), std::back_inserter(backups), known);
    const QString own = office.paths.folder(Folder::church);
    std::erase_if(backups, [&](const KnownBackup& each) { return !each.present && each.file.startsWith(own); });
    add_found(office, backups);
    for (auto& backup : backups)
        backup.before_restore = backup.file.startsWith(backup_rules::safety_folder(office));
    std::ranges::stable_sort(backups, std::ranges::greater(), &KnownBackup::made);
    return backups;
}

void backup_rules::remember(const Office& office, const BackupContents& contents)
{
    auto list = read_list(office);
    std::erase_if(list, [&](const Remembered& each) { return each.file == contents.file; });
    const QFileInfo file(contents.file);
    list.insert(list.begin(), {contents.file, contents.made, file.lastModified(), file.size()});
    if (static_cast<qsizetype>(list.size()) > most_remembered)
        list.resize(most_remembered);
    write_list(office, list);
}

void backup_rules::forget(const Office& office, const QString& file)
{
    auto list = read_list(office);
    if (std::erase_if(list, [&](const Remembered& each) { return each.file == file; }) > 0)
        write_list(office, list);
}

} // namespace kindrel::core
