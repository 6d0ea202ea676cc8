#pragma once

#include "core/entry.h"
#include "core/restore.h"
#include "desktop/backup/comparison.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"

class QBoxLayout;
class QCheckBox;
class QLabel;
class QLineEdit;

namespace kindrel::desktop {

class BackupList;
class Chip;
class ComparisonTable;

/// Shows what a backup holds beside what it would replace. Restoring itself takes the whole program anew, so it is left
/// to whoever runs it.
class RestorePage : public Page
{
    Q_OBJECT

public:
    /// Null after telling why the area stays closed.
    [[nodiscard]] static RestorePage* open(Desk& desk);

    [[nodiscard]] QString help() const override { return QStringLiteral("restore"); }
    void entered() override;
    void find() override;
    void print() override;
    [[nodiscard]] core::RestoreRequest request() const;
    /// After a restore that did not come about.
    void say_unchanged();

Q_SIGNALS:
    /// The person wishes what request() tells.
    void restore_wanted();

private:
    RestorePage(Desk& desk, core::AreaEntry entry);
    [[nodiscard]] QBoxLayout* make_choice();
    [[nodiscard]] QBoxLayout* make_file();
    [[nodiscard]] QWidget* make_password();
    [[nodiscard]] QBoxLayout* make_contents();
    void show_known();
    void choose_row();
    void browse();
    /// Reads the file that is named and shows what is in it, or why it cannot be read.
    void look_inside();
    void show_fault(const QString& words, bool password_helps);
    void restore();

    Desk& m_desk;
    core::AreaEntry m_entry;
    BackupList* m_known;
    QLineEdit* m_file;
    QWidget* m_password_row;
    QLineEdit* m_password;
    Chip* m_verdict;
    ComparisonTable* m_comparison;
    QCheckBox* m_shared;
    PresentState m_present;
};

} // namespace kindrel::desktop
