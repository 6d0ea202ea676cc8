#pragma once

#include "core/backup.h"
#include "desktop/shell/desk.h"

#include <QWidget>

class QBoxLayout;
class QCheckBox;
class QLabel;
class QLineEdit;

namespace kindrel::desktop {

/// Where a backup goes: into the church's own folder whose turn it is, or into any other.
class BackupTarget : public QWidget
{
    Q_OBJECT

public:
    explicit BackupTarget(Desk& desk);

    /// Reads the settings again and tells what lies in the own folder.
    void show_own_folder(const std::vector<core::KnownBackup>& backups);
    /// Empty: the church's own folder.
    [[nodiscard]] QString folder() const;
    /// False, after saying so, when another folder is wanted and none is named.
    [[nodiscard]] bool named();
    void start();

private:
    [[nodiscard]] QBoxLayout* make_path();
    void choose(bool elsewhere);
    void browse();
    void show_space();

    Desk& m_desk;
    QLabel* m_own;
    QCheckBox* m_elsewhere;
    QLabel* m_holds;
    QLineEdit* m_path;
    QLabel* m_space;
};

/// The settings of backups as they are stored now; another workstation may have made one meanwhile.
[[nodiscard]] core::SideRecord stored_backup_settings(const core::Office& office);

} // namespace kindrel::desktop
