#include "desktop/registers/project_setup_page.h"

#include "desktop/shell/chip.h"
#include "desktop/shell/note_bar.h"

#include <QAction>
#include <QShortcut>
#include <QTabWidget>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr auto tab_key = "setup_projects_tab";

} // namespace

ProjectSetupPage* ProjectSetupPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::project_setup);
    return entry ? new ProjectSetupPage(desk, std::move(*entry)) : nullptr;
}

ProjectSetupPage::ProjectSetupPage(Desk& desk, core::AreaEntry entry)
    : Page(u"Roll, Finance and Weekly Project Setup"_s), m_desk(desk), m_entry(std::move(entry)),
      m_setup(std::make_unique<registers::ProjectSetup>(desk.office)), m_tabs(new QTabWidget)
{
    setObjectName(u"setup_projects"_s);
    m_tabs->setObjectName(u"registers"_s);
    m_tabs->setDocumentMode(true);
    add_tab(new RollProjectTab(m_setup), u"Roll"_s);
    add_tab(new ProjectTab(m_setup, registers::Kind::finance, u"Finance &projects"_s), u"Finance"_s);
    add_tab(new WeeklyProjectTab(m_setup), u"Weekly Statistics"_s);
    add_actions();
    set_content(m_tabs);
    m_tabs->setCurrentIndex(desk.remembered.value(QLatin1String(tab_key), 0).toInt());
    connect(m_tabs, &QTabWidget::currentChanged, this, [this](int tab) {
        m_desk.remembered.keep(QLatin1String(tab_key), tab);
        find();
    });
    show_projects();
}

ProjectSetupPage::~ProjectSetupPage() = default;

void ProjectSetupPage::add_tab(ProjectTab* tab, const QString& title)
{
    connect(tab, &ProjectTab::changed, this, &ProjectSetupPage::show_state);
    m_tabs->addTab(tab, title);
    m_registers.push_back(tab);
}

void ProjectSetupPage::add_actions()
{
    const auto turn = [this](const QKeySequence& keys, int by) {
        auto* key = new QShortcut(keys, this);
        key->setContext(Qt::WidgetWithChildrenShortcut);
        connect(key, &QShortcut::activated, this, [this, by] {
            m_tabs->setCurrentIndex((m_tabs->currentIndex() + by + m_tabs->count()) % m_tabs->count());
        });
    };
    turn(Qt::CTRL | Qt::Key_PageUp, -1);
    turn(Qt::CTRL | Qt::Key_PageDown, 1);
    auto* save_all = add_action(u"Save"_s, u"document-save"_s, u"Save the projects (Ctrl+S)"_s);
    connect(save_all, &QAction::triggered, this, &ProjectSetupPage::save);
    auto* cancel_all =
        add_action(u"Cancel"_s, u"edit-undo"_s, u"Drop every change since the projects were last saved"_s);
    connect(cancel_all, &QAction::triggered, this, &ProjectSetupPage::cancel);
}

void ProjectSetupPage::entered()
{
    find();
}

void ProjectSetupPage::find()
{
    m_registers[std::size_t(m_tabs->currentIndex())]->focus_list();
}

bool ProjectSetupPage::altered() const
{
    return m_setup->altered() || std::ranges::any_of(m_registers, &ProjectTab::typing);
}

void ProjectSetupPage::show_state()
{
    const bool unsaved = altered();
    m_saved = m_saved && !unsaved;
    chip().set(unsaved ? u"not saved"_s : QString(), State::altered);
    set_status(m_saved ? u"Saved"_s : QString());
    Q_EMIT state_changed();
}

void ProjectSetupPage::show_projects()
{
    for (ProjectTab* tab : m_registers)
        tab->show_projects();
    show_state();
}

bool ProjectSetupPage::finish_typing()
{
    const int in_front = m_tabs->currentIndex();
    for (std::size_t tab = 0; tab < m_registers.size(); ++tab) {
        if (!m_registers[tab]->typing())
            continue;
        m_tabs->setCurrentIndex(int(tab)); // What is refused is in sight, and the cursor stays with it.
        if (!m_registers[tab]->finish_typing())
            return false;
    }
    m_tabs->setCurrentIndex(in_front);
    return true;
}

void ProjectSetupPage::go_to_fault()
{
    const auto& faulty = m_setup->faulty();
    if (!faulty)
        return;
    m_tabs->setCurrentIndex(int(faulty->kind));
    m_registers[static_cast<std::size_t>(faulty->kind)]->go_to_fault(faulty->project);
}

bool ProjectSetupPage::save()
{
    if (!finish_typing())
        return false;
    bool saved = false;
    try {
        saved = m_setup->save();
    } catch (const core::DatabaseError& error) {
        m_desk.office.dialogue.show({u"Unable to save the projects"_s, error.text()});
    }
    m_saved = saved;
    show_projects();
    if (!saved)
        go_to_fault();
    return saved;
}

void ProjectSetupPage::cancel()
{
    if (altered() && m_desk.office.dialogue.confirm(
                         {u"Do you wish to drop every change since the projects were saved?"_s}, core::Answer::no))
        drop();
}

void ProjectSetupPage::drop()
{
    for (ProjectTab* tab : m_registers)
        tab->drop_typing();
    m_setup = std::make_unique<registers::ProjectSetup>(m_desk.office);
    show_projects();
}

bool ProjectSetupPage::leave()
{
    if (!save_or_drop(m_desk.office.dialogue, u"Do you wish to save the changes made to the projects?"_s,
                      [this] { drop(); }))
        return false;
    if (m_setup->check())
        return true;
    go_to_fault();
    return false;
}

} // namespace kindrel::desktop
