#include "desktop/shell/ordered_list_editor.h"

#include "desktop/shell/add_line.h"
#include "desktop/shell/command_side.h"
#include "desktop/shell/empty_panel.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/in_place_editing.h"
#include "desktop/shell/list_view.h"
#include "desktop/shell/look.h"

#include <QGridLayout>
#include <QHeaderView>
#include <QLabel>
#include <QPushButton>
#include <QShortcut>
#include <QStackedWidget>
#include <QTableView>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

OrderedListEditor::OrderedListEditor(std::unique_ptr<ListOperations> list, const QString& name, QWidget* parent)
    : QWidget(parent), m_list(std::move(list)), m_model(*m_list), m_add_line(new AddLine(m_list->captions().fields)),
      m_table(new QTableView), m_cells(new InPlaceEditing(*m_table)), m_side(new CommandSide), m_count(new QLabel)
{
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(space::margin, space::margin, space::margin, space::margin);
    grid->setHorizontalSpacing(space::group);
    grid->setVerticalSpacing(space::field);
    grid->setColumnStretch(0, 1);
    grid->setRowStretch(1, 1);
    grid->addWidget(m_add_line, 0, 0);
    grid->addWidget(make_list(name), 1, 0);
    grid->addWidget(m_side, 1, 1);
    dress(*m_count, TextSize::secondary);
    m_count->setObjectName(u"count_line"_s);
    grid->addWidget(m_count, 2, 0);
    furnish_add_line();
    add_commands();
    show_list(0);
}

OrderedListEditor::~OrderedListEditor() = default;

void OrderedListEditor::furnish_add_line()
{
    auto* button = new QPushButton(icon(u"list-add"_s), u"&Add"_s);
    button->setObjectName(u"add"_s);
    button->setToolTip(u"Add what is typed to the end of the list (Enter)"_s);
    m_add_line->add_button(button);
    connect(button, &QPushButton::clicked, this, &OrderedListEditor::add);
    connect(m_add_line, &AddLine::entered, this, &OrderedListEditor::add);
    connect(m_add_line, &AddLine::edited, this, &OrderedListEditor::changed);
}

QStackedWidget* OrderedListEditor::make_list(const QString& name)
{
    m_table->setObjectName(name);
    m_table->setAccessibleName(m_list->captions().fields.front());
    m_table->setModel(&m_model);
    make_row_list(*m_table);
    connect(m_table, &QTableView::activated, this, &OrderedListEditor::rename);
    connect(m_table->selectionModel(), &QItemSelectionModel::currentRowChanged, this,
            [this](const QModelIndex& row) { Q_EMIT chosen(row.row()); });
    connect(&m_model, &QAbstractItemModel::dataChanged, this, &OrderedListEditor::changed);
    auto* empty = new EmptyPanel;
    empty->say(u"This list is empty"_s, u"Type its first item into the line above and press Enter."_s);
    m_stack = new QStackedWidget;
    m_stack->addWidget(m_table);
    m_stack->addWidget(empty);
    return m_stack;
}

void OrderedListEditor::add_commands()
{
    const auto add = [this](const CommandSide::Command& command, void (OrderedListEditor::*run)()) {
        m_side->add(command, *this, Qt::WidgetWithChildrenShortcut, [this, run] { (this->*run)(); });
    };
    // Enter comes from the list itself, and Delete works in it alone: in fields and cells both belong to the text.
    add({"rename", "Re&name", "edit-rename"}, &OrderedListEditor::rename);
    m_side->add({"remove", "&Remove", "edit-delete", Qt::Key_Delete}, *m_table, Qt::WidgetShortcut,
                [this] { remove(); });
    m_side->start_group();
    add({"move_up", "Move &up", "go-up", Qt::ALT | Qt::Key_Up}, &OrderedListEditor::move_up);
    add({"move_down", "Move &down", "go-down", Qt::ALT | Qt::Key_Down}, &OrderedListEditor::move_down);
    m_side->start_group();
    if (m_list->has_tools()) {
        add({"sort", "&Sort", "view-sort-ascending-name"}, &OrderedListEditor::sort);
        add({"import", "&Import", "document-import"}, &OrderedListEditor::import);
        m_side->start_group();
    }
    auto* insert = new QShortcut(Qt::Key_Insert, this);
    insert->setContext(Qt::WidgetWithChildrenShortcut);
    connect(insert, &QShortcut::activated, this, &OrderedListEditor::focus_add_line);
}

void OrderedListEditor::drop_letters()
{
    for (auto* button : findChildren<QAbstractButton*>())
        button->setText(button->text().remove(u'&'));
}

int OrderedListEditor::current() const
{
    return m_table->currentIndex().row();
}

void OrderedListEditor::show_list(int wanted)
{
    m_model.refresh();
    const int row = std::clamp(wanted, -1, m_list->count() - 1);
    m_table->setCurrentIndex(m_model.index(row, 0));
    m_stack->setCurrentIndex(m_list->count() == 0 ? 1 : 0);
    m_count->setText(m_list->count_line());
    Q_EMIT chosen(row);
    Q_EMIT changed();
}

void OrderedListEditor::focus_list()
{
    if (m_list->count() == 0)
        focus_add_line();
    else
        m_table->setFocus();
}

void OrderedListEditor::focus_add_line()
{
    if (m_cells->finish())
        m_add_line->focus_lacking_field();
}

bool OrderedListEditor::typing() const
{
    return m_cells->altered() || !m_add_line->is_empty();
}

bool OrderedListEditor::finish_typing()
{
    if (!m_cells->finish())
        return false;
    return m_add_line->is_empty() || add();
}

void OrderedListEditor::drop_typing()
{
    m_cells->give_up();
    m_add_line->clear();
}

bool OrderedListEditor::add()
{
    if (!m_cells->finish())
        return false;
    if (!m_list->add(m_add_line->texts())) {
        m_add_line->focus_field(m_list->faulty_field(m_add_line->texts()));
        return false;
    }
    drop_typing();
    show_list(m_list->count() - 1);
    m_add_line->focus_field(0);
    return true;
}

void OrderedListEditor::rename()
{
    QModelIndex cell = m_table->currentIndex();
    if (!m_cells->finish())
        return;
    if (!cell.isValid())
        return done(m_list->rename(-1, m_add_line->texts()), -1);
    if (!(cell.flags() & Qt::ItemIsEditable))
        cell = cell.siblingAtColumn(0);
    m_table->setFocus();
    m_table->setCurrentIndex(cell);
    m_table->edit(cell);
}

void OrderedListEditor::done(bool made, int row)
{
    if (made)
        show_list(row);
    else
        focus_list();
}

void OrderedListEditor::remove()
{
    const int row = current();
    if (m_cells->finish())
        done(m_list->remove(row), row);
}

void OrderedListEditor::move_up()
{
    const int row = current();
    if (m_cells->finish())
        done(m_list->move_up(row), row - 1);
}

void OrderedListEditor::move_down()
{
    const int row = current();
    if (m_cells->finish())
        done(m_list->move_down(row), row + 1);
}

void OrderedListEditor::sort()
{
    if (!m_cells->finish())
        return;
    const int row = current();
    const QStringList chosen_item = row < 0 ? QStringList() : m_list->row(row).texts;
    if (!m_list->sort())
        return focus_list();
    int place = 0;
    while (place < m_list->count() && m_list->row(place).texts != chosen_item)
        ++place;
    show_list(place);
}

void OrderedListEditor::import()
{
    if (!m_cells->finish())
        return;
    const int first_new = m_list->count();
    const auto words = m_list->import();
    if (!words)
        return focus_list();
    show_list(m_list->count() > first_new ? first_new : current());
    Q_EMIT told(*words);
}

} // namespace kindrel::desktop
