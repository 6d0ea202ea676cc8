#pragma once

#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"

class QLabel;
class QVBoxLayout;

namespace kindrel::desktop {

class FamilyListWidget;
class FamilyTotals;

/// The first page: the church with its vision statement, the family totals, the ways to other areas and churches, and
/// the list of families.
class MainMenu : public Page
{
    Q_OBJECT

public:
    explicit MainMenu(Desk& desk);

    [[nodiscard]] QString help() const override { return QStringLiteral("main_menu"); }
    void entered() override;
    void find() override;
    void print() override;

protected:
    void changeEvent(QEvent* event) override;

private:
    [[nodiscard]] QWidget* make_side();
    [[nodiscard]] QWidget* make_list();
    void add_tasks(QVBoxLayout& column);
    void add_list_actions();
    void show_vision();
    void load();
    void load_if_changed();
    void open(int row);
    void look_at(int row);
    /// Unsaved work of an earlier run, once.
    void offer_draft();

    Desk& m_desk;
    QLabel* m_vision = nullptr;
    FamilyTotals* m_totals = nullptr;
    FamilyListWidget* m_families = nullptr;
    bool m_drafts_offered = false;
    std::optional<qint64> m_change_mark; ///< Nothing until the first reading.
};

} // namespace kindrel::desktop
