#pragma once

#include "core/backup.h"
#include "core/entry.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"

#include <array>

class QBoxLayout;
class QCheckBox;
class QLabel;

namespace kindrel::desktop {

class BackupList;
class BackupPassword;
class BackupTarget;

/// Makes a backup of the church, and lists those that were made.
class BackupPage : public Page
{
    Q_OBJECT

public:
    /// Null after telling why the area stays closed.
    [[nodiscard]] static BackupPage* open(Desk& desk);

    [[nodiscard]] QString help() const override { return QStringLiteral("backup"); }
    void entered() override;
    void find() override;
    void print() override;
    /// The program is to end once a backup is made here, unless the person goes to another page first.
    void exit_afterwards();

Q_SIGNALS:
    void exit_wanted();

protected:
    void hideEvent(QHideEvent* event) override;

private:
    BackupPage(Desk& desk, core::AreaEntry entry);
    [[nodiscard]] QBoxLayout* make_form();
    [[nodiscard]] QBoxLayout* make_known();
    void add_choices(QBoxLayout& column);
    [[nodiscard]] core::BackupChoice choice() const;
    void show_known();
    void run();
    void tell(const core::BackupReport& report);

    Desk& m_desk;
    core::AreaEntry m_entry;
    BackupTarget* m_target;
    BackupPassword* m_password;
    std::array<QCheckBox*, 3> m_choices{};
    QLabel* m_last;
    QLabel* m_last_place;
    BackupList* m_known;
    bool m_exit_afterwards = false;
};

} // namespace kindrel::desktop
