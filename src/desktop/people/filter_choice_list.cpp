#include "desktop/people/filter_choice_list.h"

#include "desktop/shell/empty_panel.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/list_view.h"
#include "desktop/shell/look.h"

#include <QHeaderView>
#include <QKeyEvent>
#include <QLineEdit>
#include <QStackedWidget>
#include <QTableView>
#include <QVBoxLayout>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array column_shares{62, 38};

bool is_enter(const QKeyEvent& key)
{
    return key.key() == Qt::Key_Return || key.key() == Qt::Key_Enter;
}

} // namespace

FilterChoiceList::FilterChoiceList(Remembered& remembered, const QString& title, const QString& heading,
                                   FilterChoiceModel::Use use)
    : m_model(new FilterChoiceModel(heading, std::move(use), this)), m_line(new QLineEdit), m_table(new QTableView),
      m_stack(new QStackedWidget), m_empty(new EmptyPanel)
{
    set_up_line(title);
    set_up_table(remembered, title);
    m_stack->addWidget(m_table);
    m_stack->addWidget(m_empty);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(m_line);
    column->addWidget(m_stack, 1);
    setFocusProxy(m_line);
}

void FilterChoiceList::set_up_line(const QString& title)
{
    m_line->setObjectName(u"wanted"_s);
    m_line->setAccessibleName(u"Find in %1"_s.arg(title));
    m_line->setPlaceholderText(u"Type to find"_s);
    m_line->setClearButtonEnabled(true);
    m_line->addAction(icon(u"edit-find"_s), QLineEdit::LeadingPosition);
    m_line->installEventFilter(this);
    connect(m_line, &QLineEdit::textChanged, this, &FilterChoiceList::typed);
}

void FilterChoiceList::set_up_table(Remembered& remembered, const QString& title)
{
    m_table->setObjectName(u"items"_s);
    m_table->setAccessibleName(title);
    m_table->setModel(m_model);
    make_row_list(*m_table);
    m_table->horizontalHeader()->setObjectName(u"filter_items"_s);
    follow(remembered, *m_table->horizontalHeader(), column_shares);
    m_table->installEventFilter(this);
    connect(m_table->selectionModel(), &QItemSelectionModel::currentRowChanged, this,
            &FilterChoiceList::chosen_changed);
    connect(m_table, &QTableView::clicked, this, [this](const QModelIndex& cell) {
        if (cell.column() == FilterChoiceModel::use_column)
            Q_EMIT step_wanted();
    });
    connect(m_table, &QTableView::doubleClicked, this, [this](const QModelIndex& cell) {
        if (cell.column() == FilterChoiceModel::item_column)
            Q_EMIT step_wanted();
    });
}

void FilterChoiceList::set_items(std::vector<people::FilterItem> items)
{
    const auto before = chosen() ? std::optional(*chosen()) : std::nullopt;
    m_model->set_items(std::move(items));
    select(before ? std::max(m_model->row_of(*before), 0) : 0);
}

void FilterChoiceList::forget_typed()
{
    m_line->clear();
}

const people::FilterItem* FilterChoiceList::chosen() const
{
    const int row = m_table->currentIndex().row();
    return row < 0 || row >= m_model->rowCount() ? nullptr : &m_model->item(row);
}

void FilterChoiceList::focus_line()
{
    m_line->setFocus(Qt::ShortcutFocusReason);
    m_line->selectAll();
}

void FilterChoiceList::typed(const QString& text)
{
    m_model->narrow(text);
    select(0);
}

void FilterChoiceList::select(int row)
{
    const bool none = m_model->rowCount() == 0;
    if (m_model->empty())
        m_empty->say(u"This list is empty"_s, m_when_empty);
    else if (none)
        m_empty->say(u"Nothing is called \u201c%1\u201d"_s.arg(m_line->text()), u"Shorten what is typed."_s);
    m_stack->setCurrentIndex(none ? 1 : 0);
    const QModelIndex cell = m_model->index(row, 0);
    m_table->setCurrentIndex(cell);
    m_table->scrollTo(cell);
    Q_EMIT chosen_changed();
}

bool FilterChoiceList::line_key(const QKeyEvent& key)
{
    if (is_enter(key) && !(key.modifiers() & ~Qt::KeypadModifier)) {
        m_line->selectAll();
        Q_EMIT step_wanted();
        return true;
    }
    if (m_line->text().isEmpty() && use_key(key))
        return true;
    if (key.key() != Qt::Key_Down && key.key() != Qt::Key_PageDown)
        return false;
    // The first item stands chosen already: Down goes to it, not past it.
    m_table->setFocus(Qt::TabFocusReason);
    return true;
}

bool FilterChoiceList::use_key(const QKeyEvent& key)
{
    if (key.modifiers() & ~(Qt::ShiftModifier | Qt::KeypadModifier))
        return false;
    if (key.key() == Qt::Key_Space || is_enter(key))
        Q_EMIT step_wanted();
    else if (key.key() == Qt::Key_Plus)
        Q_EMIT plus_wanted();
    else if (key.key() == Qt::Key_Minus)
        Q_EMIT minus_wanted();
    else
        return false;
    return true;
}

bool FilterChoiceList::list_key(const QKeyEvent& key)
{
    if (key.modifiers() & ~(Qt::ShiftModifier | Qt::KeypadModifier))
        return false;
    return use_key(key) || back_to_line(key);
}

bool FilterChoiceList::back_to_line(const QKeyEvent& key)
{
    const bool up = key.key() == Qt::Key_Up && m_table->currentIndex().row() <= 0;
    const bool erased = key.key() == Qt::Key_Backspace;
    const bool written = !key.text().isEmpty() && key.text()[0].isPrint();
    if (!up && !erased && !written)
        return false;
    m_line->setFocus();
    if (erased)
        m_line->backspace();
    else if (written)
        m_line->insert(key.text());
    return true;
}

bool FilterChoiceList::eventFilter(QObject* target, QEvent* event)
{
    if (event->type() != QEvent::KeyPress)
        return QWidget::eventFilter(target, event);
    const auto& key = static_cast<const QKeyEvent&>(*event);
    const bool used = target == m_line ? line_key(key) : list_key(key);
    return used || QWidget::eventFilter(target, event);
}

} // namespace kindrel::desktop
