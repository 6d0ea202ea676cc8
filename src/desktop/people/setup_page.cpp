#include "desktop/people/setup_page.h"

#include "desktop/people/group_details_dialog.h"
#include "desktop/people/setup_operations.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/command_side.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/ordered_list_editor.h"

#include <QAction>
#include <QCheckBox>
#include <QHeaderView>
#include <QPushButton>
#include <QShortcut>
#include <QTabWidget>
#include <QTableView>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::SetupKind;

namespace {

constexpr auto tab_key = "setup_tab";

} // namespace

SetupPage* SetupPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::family_setup);
    return entry ? new SetupPage(desk, std::move(*entry)) : nullptr;
}

SetupPage::SetupPage(Desk& desk, core::AreaEntry entry)
    : Page(u"Setup Lists"_s), m_desk(desk), m_entry(std::move(entry)),
      m_editor(std::make_unique<people::SetupEditor>(desk.office)), m_tabs(new QTabWidget)
{
    setObjectName(u"setup_family"_s);
    m_tabs->setObjectName(u"lists"_s);
    m_tabs->setDocumentMode(true);
    for (const auto& list : people::setup_lists())
        add_tab(list);
    add_group_controls(groups());
    add_actions();
    set_content(m_tabs);
    m_tabs->setCurrentIndex(desk.remembered.value(QLatin1String(tab_key), 0).toInt());
    connect(m_tabs, &QTabWidget::currentChanged, this, [this](int tab) {
        m_desk.remembered.keep(QLatin1String(tab_key), tab);
        list_in_front().focus_list();
        show_state();
    });
    show_state();
}

SetupPage::~SetupPage() = default;

void SetupPage::add_tab(const people::SetupList& list)
{
    auto* editor =
        new OrderedListEditor(std::make_unique<SetupOperations>(m_editor, list.kind), QString::fromLatin1(list.table));
    editor->table().horizontalHeader()->setObjectName(QString::fromLatin1(list.table));
    follow(m_desk.remembered, *editor->table().horizontalHeader(), setup_shares(list.kind));
    connect(editor, &OrderedListEditor::changed, this, &SetupPage::show_state);
    connect(editor, &OrderedListEditor::told, this, [this](const QString& words) { note().say(words); });
    m_tabs->addTab(editor, list.caption.toString());
    m_lists.push_back(editor);
}

void SetupPage::add_group_controls(OrderedListEditor& list)
{
    m_not_active = new QCheckBox(u"No longer m&eets"_s);
    m_not_active->setObjectName(u"not_active"_s);
    m_not_active->setToolTip(u"The group is kept for its history"_s);
    connect(m_not_active, &QCheckBox::clicked, this, &SetupPage::set_group_not_active);
    auto* details = new QPushButton(icon(u"view-list-details"_s), u"&Group details"_s);
    details->setObjectName(u"details"_s);
    connect(details, &QPushButton::clicked, this, &SetupPage::open_group_details);
    list.side().add_control(details);
    list.side().add_control(m_not_active);
    connect(&list, &OrderedListEditor::chosen, this, &SetupPage::show_group);
    show_group(list.current());
}

void SetupPage::add_actions()
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
    auto* save_all = add_action(u"Save"_s, u"document-save"_s, u"Save the lists (Ctrl+S)"_s);
    connect(save_all, &QAction::triggered, this, &SetupPage::save);
    auto* cancel_all = add_action(u"Cancel"_s, u"edit-undo"_s, u"Drop every change since the lists were last saved"_s);
    connect(cancel_all, &QAction::triggered, this, &SetupPage::cancel);
}

OrderedListEditor& SetupPage::list_in_front() const
{
    return *m_lists.at(std::size_t(m_tabs->currentIndex()));
}

OrderedListEditor& SetupPage::groups() const
{
    return *m_lists.at(static_cast<std::size_t>(SetupKind::groups));
}

void SetupPage::entered()
{
    list_in_front().focus_list();
}

void SetupPage::find()
{
    list_in_front().focus_list();
}

bool SetupPage::altered() const
{
    return m_editor->altered() || std::ranges::any_of(m_lists, &OrderedListEditor::typing);
}

void SetupPage::show_state()
{
    const bool unsaved = altered();
    m_saved = m_saved && !unsaved;
    chip().set(unsaved ? u"not saved"_s : QString(), State::altered);
    set_status(m_saved ? u"Saved"_s : QString());
    Q_EMIT state_changed();
}

void SetupPage::show_lists()
{
    for (OrderedListEditor* list : m_lists)
        list->show_list(std::max(list->current(), 0));
}

bool SetupPage::finish_typing()
{
    const int in_front = m_tabs->currentIndex();
    for (std::size_t tab = 0; tab < m_lists.size(); ++tab) {
        if (!m_lists[tab]->typing())
            continue;
        m_tabs->setCurrentIndex(int(tab)); // What is refused is in sight, and the cursor stays with it.
        if (!m_lists[tab]->finish_typing())
            return false;
    }
    m_tabs->setCurrentIndex(in_front);
    return true;
}

bool SetupPage::save()
{
    if (!finish_typing())
        return false;
    bool saved = false;
    try {
        saved = m_editor->save();
    } catch (const core::DatabaseError& error) {
        m_desk.office.dialogue.show({u"Unable to save the setup lists"_s, error.text()});
    }
    m_saved = saved;
    show_lists();
    return saved;
}

void SetupPage::cancel()
{
    if (altered() && m_desk.office.dialogue.confirm({u"Do you wish to drop every change since the lists were saved?"_s},
                                                    core::Answer::no))
        drop();
}

void SetupPage::drop()
{
    for (OrderedListEditor* list : m_lists)
        list->drop_typing();
    m_editor = std::make_unique<people::SetupEditor>(m_desk.office);
    note().clear();
    show_lists();
}

bool SetupPage::leave()
{
    return save_or_drop(m_desk.office.dialogue, u"Do you wish to save the changes made to the setup lists?"_s,
                        [this] { drop(); });
}

void SetupPage::show_group(int row)
{
    const auto& list = m_editor->list(SetupKind::groups);
    m_not_active->setChecked(list.holds(row) && list[row].not_active);
}

void SetupPage::set_group_not_active(bool not_active)
{
    const int row = groups().current();
    if (m_editor->set_not_active(row, not_active))
        groups().show_list(row);
    else
        show_group(row);
}

void SetupPage::open_group_details()
{
    const int row = groups().current();
    const auto group_id = m_editor->group_for_details(row);
    groups().show_list(row);
    if (!group_id)
        return;
    auto* dialog = new GroupDetailsDialog(m_desk.office, *group_id, m_editor->list(SetupKind::groups)[row].text, this);
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    dialog->open();
}

} // namespace kindrel::desktop
