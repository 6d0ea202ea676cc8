#include "core/backup_files.h"

#include "core/files.h"

#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QFileInfo>

#include <algorithm>
#include <filesystem>

#ifdef Q_OS_LINUX
#include <fcntl.h>
#include <unistd.h>
#endif

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr QFile::Permissions for_file = QFile::ReadOwner | QFile::WriteOwner | QFile::ReadGroup | QFile::WriteGroup;

constexpr qsizetype longest_name = 1000;
constexpr qsizetype longest_part = 255;

bool usable_part(QStringView part)
{
    const bool drive = part.size() >= 2 && part[0].isLetter() && part[1] == u':';
    const bool control = std::ranges::any_of(part, [](QChar c) { return c < u' ' || c == u'\\' || c == QChar(0x7F); });
    return !part.isEmpty() && part.size() <= longest_part && part != u"." && part != u".." && !drive && !control;
}

void close_to_others(const QString& folder)
{
    using std::filesystem::perms;
    const auto path = QFileInfo(folder).filesystemFilePath();
    std::error_code ignored;                                                      // Some disks know no permissions.
    const perms inherited = std::filesystem::status(path, ignored).permissions(); // The data folder's group among them.
    const perms wanted = (inherited | perms::owner_all | perms::group_all) & ~perms::others_all;
    std::filesystem::permissions(path, wanted, ignored);
}

} // namespace

void keep_private(const QString& file)
{
    QFile target(file);
    if (!target.setPermissions(for_file))
        throw FileError(u"Unable to protect '%1': %2"_s.arg(QDir::toNativeSeparators(file), target.errorString()));
}

void make_private_folder(const QString& folder)
{
    if (QDir(folder).exists())
        return;
    make_folder(folder);
    close_to_others(folder);
}

void move_privately(const QString& from, const QString& to)
{
    move_file(from, to);
    QFile::setPermissions(to, for_file);
}

QString mended_place(const Paths& paths, const QString& name)
{
    const QString folder = as_folder(paths.file(Folder::church, u"mended"_s));
    make_private_folder(folder);
    close_to_others(folder); // It may be older than this rule.
    const QFileInfo wanted(name);
    const QString ending = wanted.suffix().isEmpty() ? QString() : u'.' + wanted.suffix();
    QString file = folder + name;
    for (int copy = 2; QFileInfo::exists(file); ++copy)
        file = folder + u"%1 (%2)%3"_s.arg(wanted.completeBaseName()).arg(copy).arg(ending);
    return file;
}

QString own_backup_folder(const Paths& paths, int number)
{
    return as_folder(paths.file(Folder::church, u"Backup%1"_s.arg(number)));
}

void flush_to_disk([[maybe_unused]] const QString& path)
{
#ifdef Q_OS_LINUX
    const int opened = open(QFile::encodeName(path).constData(), O_RDONLY | O_CLOEXEC);
    if (opened < 0)
        return;
    syncfs(opened); // One call for all files: one for each of 60,000 photographs would take minutes.
    close(opened);
#endif
}

QStringList files_within(const QString& folder)
{
    QStringList names;
    const auto start = as_folder(folder).size();
    QDirIterator walk(as_folder(folder), QDir::Files | QDir::Hidden, QDirIterator::Subdirectories);
    while (walk.hasNext())
        names += QDir::fromNativeSeparators(walk.next().mid(start));
    names.removeIf([](const QString& name) { return name.endsWith(u".unfinished"); });
    names.sort();
    return names;
}

bool stays_inside(const QString& name)
{
    const auto parts = QStringView(name).split(u'/');
    return name.size() <= longest_name && std::ranges::all_of(parts, usable_part);
}

WorkFolder::WorkFolder(const QString& folder) : m_folder(as_folder(folder))
{
    QDir(m_folder).removeRecursively();
    make_private_folder(m_folder);
}

WorkFolder::~WorkFolder()
{
    QDir(m_folder).removeRecursively();
}

} // namespace kindrel::core
