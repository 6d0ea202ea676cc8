#include "desktop/people/editor_rows.h"

#include "desktop/people/card_list_view.h"
#include "desktop/people/editor_rows_model.h"
#include "desktop/shell/add_line.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/in_place_editing.h"
#include "desktop/shell/list_view.h"
#include "desktop/shell/look.h"
#include "desktop/shell/typed_date.h"
#include "desktop/shell/value_form.h"

#include <QEvent>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QShortcut>
#include <QTableView>
#include <QToolButton>

#include <algorithm>
#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::RowList;

namespace {

constexpr int least_rows = 3;

bool has_dates(const RowListLook& look)
{
    return std::ranges::find(look.columns, Cell::date, &RowColumn::cell) != look.columns.end();
}

} // namespace

EditorRows::EditorRows(EditorBench& bench, RowList list)
    : m_bench(bench), m_look(row_list_look(list)), m_model(new EditorRowsModel(bench, m_look, this)),
      m_table(new QTableView), m_cells(new InPlaceEditing(*m_table)), m_words(new QLabel)
{
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field / 2);
    column->addLayout(make_heading_row());
    if (!m_look.items) {
        furnish_add_line();
        column->addWidget(m_add_line);
    }
    furnish_table();
    column->addWidget(m_table, 1);
    show_file();
}

QHBoxLayout* EditorRows::make_heading_row()
{
    auto* row = new QHBoxLayout;
    row->setSpacing(0);
    row->addWidget(make_heading(QString::fromLatin1(m_look.title)));
    row->addSpacing(space::field);
    row->addStretch(1);
    row->addStrut(space::control);
    add_command(*row, {"add", "Add\u2026", "list-add", "Add a row (Insert)", Qt::Key_Insert,
                       Qt::WidgetWithChildrenShortcut, &EditorRows::add});
    if (has_dates(m_look))
        add_command(*row, {"now",
                           "Today",
                           "view-calendar-day",
                           "Put in today's date",
                           {},
                           Qt::WidgetShortcut,
                           &EditorRows::set_today});
    add_command(*row, {"remove", nullptr, "edit-delete", "Remove (Delete)", Qt::Key_Delete, Qt::WidgetShortcut,
                       &EditorRows::remove});
    if (people::has_own_order(m_look.list)) {
        add_command(*row, {"move_up", nullptr, "go-up", "Move up (Alt+Up)", Qt::ALT | Qt::Key_Up,
                           Qt::WidgetWithChildrenShortcut, &EditorRows::move_up});
        add_command(*row, {"move_down", nullptr, "go-down", "Move down (Alt+Down)", Qt::ALT | Qt::Key_Down,
                           Qt::WidgetWithChildrenShortcut, &EditorRows::move_down});
    }
    return row;
}

void EditorRows::add_command(QHBoxLayout& row, const Command& command)
{
    const auto run = [this, run = command.run] {
        (this->*run)();
    };
    auto* button = new QToolButton;
    button->setObjectName(QLatin1String(command.name));
    button->setIcon(icon(QLatin1String(command.icon)));
    button->setToolTip(QLatin1String(command.tip));
    button->setAccessibleName(u"%1: %2"_s.arg(QLatin1String(m_look.title), QLatin1String(command.tip)));
    if (command.text) {
        button->setText(QString::fromUtf8(command.text));
        button->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
    }
    button->setAutoRaise(true);
    button->setFocusPolicy(Qt::NoFocus); // The keys work from the list, the only stop of the Tab key.
    connect(button, &QToolButton::clicked, this, run);
    row.addWidget(button);
    m_commands.push_back(button);
    if (command.key.isEmpty())
        return;
    QWidget* reach = command.reach == Qt::WidgetShortcut ? static_cast<QWidget*>(m_table) : this;
    auto* key = new QShortcut(command.key, reach);
    key->setContext(command.reach);
    connect(key, &QShortcut::activated, this, run);
}

void EditorRows::furnish_table()
{
    m_table->setObjectName(QLatin1String(m_look.name));
    m_table->setAccessibleName(QLatin1String(m_look.title));
    m_table->setModel(m_model);
    make_row_list(*m_table);
    m_table->setEditTriggers(QAbstractItemView::AnyKeyPressed);
    m_table->horizontalHeader()->setVisible(m_look.columns.size() > 1);
    m_table->horizontalHeader()->setObjectName(QLatin1String(m_look.name));
    m_table->setMinimumHeight(least_rows * row_height());
    std::vector<int> shares;
    for (const RowColumn& column : m_look.columns)
        shares.push_back(column.share);
    follow(m_bench.desk.remembered, *m_table->horizontalHeader(), shares);
    connect(m_table, &QTableView::activated, this, &EditorRows::open_cell);
    auto* space_bar = new QShortcut(Qt::Key_Space, m_table);
    space_bar->setContext(Qt::WidgetShortcut);
    connect(space_bar, &QShortcut::activated, this, &EditorRows::turn_over);

    dress(*m_words, TextSize::secondary);
    m_words->setForegroundRole(QPalette::WindowText); // In a list it would be the list's.
    m_words->setWordWrap(true);
    m_words->setAttribute(Qt::WA_TransparentForMouseEvents);
    m_table->installEventFilter(this);
    colour_choice();
    auto* inside = new QVBoxLayout(m_table->viewport());
    inside->setContentsMargins(space::field, space::field / 2, space::field, 0);
    inside->addWidget(m_words);
    inside->addStretch(1);
}

void EditorRows::furnish_add_line()
{
    QStringList captions;
    for (const Cell cell : m_look.typed)
        captions += m_look.caption_of(cell);
    m_add_line = new AddLine(captions);
    if (m_look.typed.back() == Cell::date) {
        auto* date = m_add_line->findChild<QLineEdit*>(u"new_%1"_s.arg(m_look.typed.size() - 1));
        date->setPlaceholderText(date_pattern(m_bench.desk.office.day_order()));
    }
    connect(m_add_line, &AddLine::entered, this, &EditorRows::add_typed);
}

bool EditorRows::eventFilter(QObject* target, QEvent* event)
{
    if (event->type() == QEvent::FocusIn || event->type() == QEvent::FocusOut)
        colour_choice();
    return QWidget::eventFilter(target, event);
}

void EditorRows::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::PaletteChange)
        colour_choice();
}

void EditorRows::colour_choice()
{
    QPalette colours;
    if (!m_table->hasFocus()) {
        colours.setColor(QPalette::Highlight, hover_colour(shade_of(palette())));
        colours.setColor(QPalette::HighlightedText, palette().color(QPalette::Text));
    }
    m_table->setPalette(colours);
}

int EditorRows::current() const
{
    return m_table->currentIndex().row();
}

void EditorRows::select(int row)
{
    const int column = std::max(0, m_table->currentIndex().column());
    const int there = std::min(row, m_model->rowCount() - 1);
    if (there >= 0)
        m_table->setCurrentIndex(m_model->index(there, column));
}

QString EditorRows::words_instead() const
{
    if (!m_model->open())
        return closed_words();
    if (is_of_person(m_look.list) && m_bench.person() < 0)
        return u"Enter a person first."_s;
    return m_model->rowCount() == 0 ? u"None"_s : QString();
}

void EditorRows::show_file()
{
    const int row = std::max(0, current());
    m_model->refresh(m_cells->altered() ? m_table->currentIndex() : QModelIndex());
    if (current() < 0)
        select(row);
    m_words->setText(words_instead());
    m_words->setVisible(!m_words->text().isEmpty());
    const bool editable = m_model->editable();
    for (QWidget* command : m_commands)
        command->setVisible(editable);
    if (m_add_line)
        m_add_line->setVisible(editable);
}

} // namespace kindrel::desktop
