#pragma once

#include "core/paths.h"

#include <QStringList>

namespace kindrel::core {

/// Keeps a file from everyone but its owner and the data folder's group. Throws FileError.
void keep_private(const QString& file);
/// Makes the folder and those above it, open to its owner and group alone.
void make_private_folder(const QString& folder);
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
