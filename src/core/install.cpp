#include "core/install.h"

#include "core/files.h"
#include "core/paths.h"

#include <QDir>
#include <QDirIterator>
#include <QFileInfo>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr int church_folders = 7;
constexpr int backup_folders = 5;

void make_folders(const Paths& paths)
{
    for (int folder = 0; folder < folder_count; ++folder) {
        if (static_cast<Folder>(folder) != Folder::program)
            make_folder(paths.folder(static_cast<Folder>(folder)));
    }
}

void make_church_folders(const Paths& paths)
{
    make_folders(paths);
    make_folder(paths.file(Folder::church, u"compact"_s));
    for (int number = 1; number <= backup_folders; ++number)
        make_folder(paths.file(Folder::church, u"Backup%1"_s.arg(number)));
}

/// Files that are there already stay as they are.
void copy_tree(const QString& from, const QString& to)
{
    QDirIterator found(from, QDir::Files, QDirIterator::Subdirectories);
    while (found.hasNext()) {
        const QString source = found.next();
        const QString target = to + existing_name(to, QDir(from).relativeFilePath(source));
        if (QFileInfo::exists(target))
            continue;
        make_folder(QFileInfo(target).path());
        copy_file(source, target);
    }
}

} // namespace

void install(const QString& program_folder, const QString& data_drive)
{
    const QString root = as_folder(data_drive) + existing_name(as_folder(data_drive), data_folder.toString());
    for (int church = 1; church <= church_folders; ++church)
        make_church_folders(Paths(program_folder, data_drive, root, Mode::normal, church));
    make_folders(Paths(program_folder, data_drive, root, Mode::booked_out, booked_out_church));

    const Paths training(program_folder, data_drive, root, Mode::training, training_church);
    make_folders(training);
    copy_tree(training.file(Folder::program, u"Training"_s), training.folder(Folder::data_root));
}

} // namespace kindrel::core
