#include "desktop/registers/project_setup_page.h"

#include <QTabWidget>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

SetupWords words()
{
    return {.save_tip = u"Save the projects (Ctrl+S)"_s,
            .cancel_tip = u"Drop every change since the projects were last saved"_s,
            .unable_to_save = u"Unable to save the projects"_s,
            .unable_to_read = u"Unable to read the projects"_s,
            .cancel_question = u"Do you wish to drop every change since the projects were saved?"_s,
            .leave_question = u"Do you wish to save the changes made to the projects?"_s};
}

} // namespace

ProjectSetupPage* ProjectSetupPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::project_setup);
    return entry ? new ProjectSetupPage(desk, std::move(*entry)) : nullptr;
}

ProjectSetupPage::ProjectSetupPage(Desk& desk, core::AreaEntry entry)
    : SetupTabsPage(desk, std::move(entry), u"Roll, Finance and Weekly Project Setup"_s, words(),
                    u"setup_projects_tab"_s),
      m_setup(std::make_unique<registers::ProjectSetup>(desk.office))
{
    setObjectName(u"setup_projects"_s);
    tabs().setObjectName(u"registers"_s);
    add_register(new RollProjectTab(m_setup), u"Roll"_s);
    add_register(new ProjectTab(m_setup, registers::Kind::finance, u"Finance &projects"_s), u"Finance"_s);
    add_register(new WeeklyProjectTab(m_setup), u"Weekly Statistics"_s);
    start();
}

ProjectSetupPage::~ProjectSetupPage() = default;

void ProjectSetupPage::add_register(ProjectTab* tab, const QString& title)
{
    connect(tab, &ProjectTab::changed, this, &ProjectSetupPage::show_state);
    add_tab(tab, title,
            {.focus_list = [tab] { tab->focus_list(); },
             .show = [tab] { tab->show_projects(); },
             .typing = [tab] { return tab->typing(); },
             .finish_typing = [tab] { return tab->finish_typing(); },
             .drop_typing =
                 [tab] {
                     tab->drop_typing();
                 }});
    m_registers.push_back(tab);
}

void ProjectSetupPage::reread()
{
    m_setup->drop(); // What cannot be read again must not stay incomplete.
    m_setup = std::make_unique<registers::ProjectSetup>(desk().office);
}

void ProjectSetupPage::go_to_fault()
{
    const auto& faulty = m_setup->faulty();
    if (!faulty)
        return;
    tabs().setCurrentIndex(int(faulty->kind));
    m_registers[static_cast<std::size_t>(faulty->kind)]->go_to_fault(faulty->project);
}

} // namespace kindrel::desktop
