#include "core/backup_rotation.h"

#include "core/backup_files.h"
#include "core/marker.h"
#include "core/open_church.h"
#include "core/side_files.h"
#include "core/verified_copy.h"

#include <QDateTime>
#include <QFileInfo>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr int days_kept = 30;

/// The newest first.
const std::array backup_names{u"systembackup.kdl"_s, u"systembackup_old_1.kdl"_s, u"systembackup_old_2.kdl"_s,
                              u"systembackup_old_3.kdl"_s};

QString backup_path(const QString& folder, std::size_t age)
{
    return folder + existing_name(folder, backup_names[age]);
}

bool due(const QString& newest, const QDate& today)
{
    const QFileInfo file(newest);
    return !file.exists() || file.lastModified().date().daysTo(today) > days_kept;
}

/// Every backup takes the name of the next older one.
void age_backups(const QString& folder)
{
    remove_file(backup_path(folder, backup_names.size() - 1));
    for (std::size_t age = backup_names.size() - 1; age > 0; --age) {
        const QString younger = backup_path(folder, age - 1);
        if (QFileInfo::exists(younger))
            move_file(younger, backup_path(folder, age));
    }
}

} // namespace

void rotate_system_backups(const Paths& paths, int church, const QDate& today)
{
    if (church < 1 || church >= training_church || !church_present(paths))
        return;
    const QString folder = own_backup_folder(paths, 1);
    if (!due(backup_path(folder, 0), today))
        return;
    const auto busy = Marker::take(paths, side_files::busy);
    if (!busy)
        return;
    make_private_folder(folder);
    const QString fresh = folder + u"systembackup.new"_s;
    verified_copy(*connect_church(paths), fresh);
    if (QFileInfo::exists(backup_path(folder, 0)))
        age_backups(folder);
    move_file(fresh, folder + backup_names[0]);
}

} // namespace kindrel::core
