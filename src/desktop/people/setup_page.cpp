#include "desktop/people/setup_page.h"

#include "desktop/people/group_details_dialog.h"
#include "desktop/people/setup_operations.h"
#include "desktop/shell/command_side.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/ordered_list_editor.h"

#include <QCheckBox>
#include <QHeaderView>
#include <QPushButton>
#include <QTabWidget>
#include <QTableView>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::SetupKind;

namespace {

SetupWords words()
{
    return {.save_tip = u"Save the lists (Ctrl+S)"_s,
            .cancel_tip = u"Drop every change since the lists were last saved"_s,
            .unable_to_save = u"Unable to save the setup lists"_s,
            .unable_to_read = u"Unable to read the setup lists"_s,
            .cancel_question = u"Do you wish to drop every change since the lists were saved?"_s,
            .leave_question = u"Do you wish to save the changes made to the setup lists?"_s};
}

SetupTab tab_of(OrderedListEditor& list)
{
    return {.focus_list = [&list] { list.focus_list(); },
            .show = [&list] { list.show_list(std::max(list.current(), 0)); },
            .typing = [&list] { return list.typing(); },
            .finish_typing = [&list] { return list.finish_typing(); },
            .drop_typing =
                [&list] {
                    list.drop_typing();
                }};
}

} // namespace

SetupPage* SetupPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::family_setup);
    return entry ? new SetupPage(desk, std::move(*entry)) : nullptr;
}

SetupPage::SetupPage(Desk& desk, core::AreaEntry entry)
    : SetupTabsPage(desk, std::move(entry), u"Setup Lists"_s, words(), u"setup_tab"_s),
      m_editor(std::make_unique<people::SetupEditor>(desk.office))
{
    setObjectName(u"setup_family"_s);
    tabs().setObjectName(u"lists"_s);
    for (const auto& list : people::setup_lists()) {
        auto* editor = make_list(list);
        add_tab(editor, list.caption.toString(), tab_of(*editor));
        if (list.kind == SetupKind::groups)
            add_group_controls(*editor);
    }
    start();
}

SetupPage::~SetupPage() = default;

OrderedListEditor* SetupPage::make_list(const people::SetupList& list)
{
    auto* editor =
        new OrderedListEditor(std::make_unique<SetupOperations>(m_editor, list.kind), QString::fromLatin1(list.table));
    editor->table().horizontalHeader()->setObjectName(QString::fromLatin1(list.table));
    follow(desk().remembered, *editor->table().horizontalHeader(), setup_shares(list.kind));
    connect(editor, &OrderedListEditor::changed, this, &SetupPage::show_state);
    connect(editor, &OrderedListEditor::told, this, [this](const QString& told) { note().say(told); });
    return editor;
}

void SetupPage::reread()
{
    m_editor->drop(); // The changes go also when the lists cannot be read again.
    m_editor = std::make_unique<people::SetupEditor>(desk().office);
}

void SetupPage::add_group_controls(OrderedListEditor& list)
{
    m_groups = &list;
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

void SetupPage::show_group(int row)
{
    const auto& list = m_editor->list(SetupKind::groups);
    m_not_active->setChecked(list.holds(row) && list[row].not_active);
}

void SetupPage::set_group_not_active(bool not_active)
{
    const int row = m_groups->current();
    if (m_editor->set_not_active(row, not_active))
        m_groups->show_list(row);
    else
        show_group(row);
}

void SetupPage::open_group_details()
{
    const int row = m_groups->current();
    const auto group_id = m_editor->group_for_details(row);
    m_groups->show_list(row);
    if (!group_id)
        return;
    auto* dialog = new GroupDetailsDialog(desk().office, *group_id, m_editor->list(SetupKind::groups)[row].text, this);
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    dialog->open();
}

} // namespace kindrel::desktop
