#pragma once

#include "core/backup.h"

#include <QTableWidget>

namespace kindrel::desktop {

class EmptyPanel;

/// The backups that a church made, the newest first.
class BackupList : public QTableWidget
{
    Q_OBJECT

public:
    BackupList();

    /// What was chosen stays chosen while it is listed.
    void show_backups(std::vector<core::KnownBackup> backups, core::DayOrder order);
    [[nodiscard]] const std::vector<core::KnownBackup>& backups() const { return m_backups; }
    /// Null while none is chosen.
    [[nodiscard]] const core::KnownBackup* chosen() const;

    /// The cursor comes here; the newest is chosen where none was.
    void start();

protected:
    void changeEvent(QEvent* event) override;

private:
    void colour_states();

    std::vector<core::KnownBackup> m_backups;
    EmptyPanel* m_nothing;
};

} // namespace kindrel::desktop
