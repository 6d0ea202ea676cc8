#pragma once

#include "core/paths.h"

#include <QStringList>

namespace kindrel::core {

/// Keeps a file from everyone but its owner and the data folder's group. Throws FileError.
void keep_private(const QString& file);
/// Makes the folder and those above it, open to its owner and group alone.
void make_private_folder(const QString& folder);
/// Moves a file, and closes it to everyone else where its owner and the disk allow that. Throws FileError.
void move_privately(const QString& from, const QString& to);
/// A place of its own in the church's folder `mended`, which is made, for a file or folder of this name.
[[nodiscard]] QString mended_place(const Paths& paths, const QString& name);
/// One of the church's own folders for backups, by its number from 1; ends in the separator.
[[nodiscard]] QString own_backup_folder(const Paths& paths, int number);
inline constexpr int own_backup_folders = 5;
/// Returns once all that was written to the file or folder would survive a power cut, as far as the system can tell.
void flush_to_disk(const QString& path);
/// The files of a folder and its subfolders by their names within it, with "/" between the parts; links to folders are
/// not followed.
[[nodiscard]] QStringList files_within(const QString& folder);
/// Whether a name, with "/" between its parts, stays inside the folder that it is put into, on any system.
[[nodiscard]] bool stays_inside(const QString& name);

/// A folder for unfinished work that is empty at first and gone at the end, whatever a killed run left in it.
class WorkFolder
{
public:
    explicit WorkFolder(const QString& folder);
    WorkFolder(const WorkFolder&) = delete;
    WorkFolder& operator=(const WorkFolder&) = delete;
    ~WorkFolder();

    [[nodiscard]] QString file(const QString& name) const { return m_folder + name; }

private:
    QString m_folder;
};

} // namespace kindrel::core
