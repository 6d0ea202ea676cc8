#pragma once

#include "desktop/registers/project_tab.h"
#include "desktop/shell/setup_tabs_page.h"

namespace kindrel::desktop {

/// The projects of roll, giving and weekly statistics, a tab each. The page cannot be left while a project is
/// incomplete.
class ProjectSetupPage : public SetupTabsPage
{
    Q_OBJECT

public:
    /// Null, after saying why, when the area cannot be entered.
    [[nodiscard]] static ProjectSetupPage* open(Desk& desk);
    ~ProjectSetupPage() override;

    [[nodiscard]] QString help() const override { return QStringLiteral("setup_projects"); }

protected:
    [[nodiscard]] bool list_altered() const override { return m_setup->altered(); }
    [[nodiscard]] bool store() override { return m_setup->save(); }
    void reread() override;
    [[nodiscard]] bool complete() override { return m_setup->check(); }
    void go_to_fault() override;

private:
    ProjectSetupPage(Desk& desk, core::AreaEntry entry);

    void add_register(ProjectTab* tab, const QString& title);

    SharedSetup m_setup;
    std::vector<ProjectTab*> m_registers; ///< In their order, as the tabs are.
};

} // namespace kindrel::desktop
