#pragma once

#include "core/entry.h"
#include "desktop/registers/project_tab.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"

class QTabWidget;

namespace kindrel::desktop {

/// The projects of roll, giving and weekly statistics, a tab each. Nothing is stored before the page is saved, and it
/// cannot be left while a project is incomplete.
class ProjectSetupPage : public Page
{
    Q_OBJECT

public:
    /// Null, after saying why, when the area cannot be entered.
    [[nodiscard]] static ProjectSetupPage* open(Desk& desk);
    ~ProjectSetupPage() override;

    [[nodiscard]] QString help() const override { return QStringLiteral("setup_projects"); }
    void entered() override;
    void find() override;
    bool save() override;
    [[nodiscard]] bool altered() const override;
    [[nodiscard]] bool holds_lock() const override { return m_desk.office.shared(); }
    [[nodiscard]] bool leave() override;

private:
    ProjectSetupPage(Desk& desk, core::AreaEntry entry);

    void add_tab(ProjectTab* tab, const QString& title);
    void add_actions();
    /// What was typed and not entered yet goes into its list.
    [[nodiscard]] bool finish_typing();
    void go_to_fault();
    void cancel();
    void drop();
    void show_projects();
    void show_state();

    Desk& m_desk;
    core::AreaEntry m_entry;
    SharedSetup m_setup;
    QTabWidget* m_tabs;
    std::vector<ProjectTab*> m_registers; ///< In their order, as the tabs are.
    bool m_saved = false;
};

} // namespace kindrel::desktop
