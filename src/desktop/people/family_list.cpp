#include "desktop/people/family_list.h"

#include "desktop/shell/empty_panel.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/list_view.h"
#include "desktop/shell/look.h"
#include "desktop/shell/table_text.h"

#include <QApplication>
#include <QComboBox>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QKeyEvent>
#include <QLineEdit>
#include <QLocale>
#include <QStackedWidget>
#include <QTableView>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array column_shares{23, 16, 22, 21, 18};

/// The keys that move in the list while the cursor stands in the filter.
bool moves_in_list(int key)
{
    return key == Qt::Key_Down || key == Qt::Key_Up || key == Qt::Key_PageDown || key == Qt::Key_PageUp;
}

bool is_enter(const QKeyEvent& key)
{
    return key.key() == Qt::Key_Return || key.key() == Qt::Key_Enter;
}

} // namespace

FamilyListWidget::FamilyListWidget(Desk& desk, QWidget* parent)
    : QWidget(parent), m_desk(desk), m_model(new FamilyListModel(this)), m_top(new QHBoxLayout),
      m_selector(new QComboBox), m_filter(new QLineEdit), m_view(new QTableView), m_stack(new QStackedWidget),
      m_empty(new EmptyPanel)
{
    for (int list = 0; list < people::family_list_count; ++list)
        m_selector->addItem(people::family_list_name(people::FamilyList(list)));
    m_selector->setCurrentIndex(int(people::FamilyList::active));
    m_selector->setObjectName(u"family_list"_s);
    m_selector->setAccessibleName(u"Which families"_s);
    connect(m_selector, &QComboBox::currentIndexChanged, this, [this] { reload(); });
    set_up_filter();
    set_up_view();
    m_stack->addWidget(m_view);
    m_stack->addWidget(m_empty);

    m_top->setSpacing(space::field);
    m_top->addWidget(m_filter, 1);
    m_top->addWidget(m_selector);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addLayout(m_top);
    column->addWidget(m_stack, 1);
}

void FamilyListWidget::set_up_filter()
{
    m_filter->setObjectName(u"filter"_s);
    m_filter->setPlaceholderText(u"Name, first name or suburb"_s);
    m_filter->setAccessibleName(u"Find a family"_s);
    m_filter->setClearButtonEnabled(true);
    m_filter->addAction(icon(u"edit-find"_s), QLineEdit::LeadingPosition);
    m_filter->installEventFilter(this);
    connect(m_filter, &QLineEdit::textChanged, this, &FamilyListWidget::typed);
    connect(m_filter, &QLineEdit::returnPressed, this, &FamilyListWidget::open_chosen);
}

void FamilyListWidget::set_up_view()
{
    m_view->setObjectName(u"families"_s);
    m_view->setAccessibleName(u"Families"_s);
    m_view->setModel(m_model);
    make_row_list(*m_view);
    m_view->horizontalHeader()->setObjectName(u"families"_s);
    m_view->horizontalHeader()->setSortIndicator(FamilyListModel::surname, Qt::AscendingOrder);
    follow(m_desk.remembered, *m_view->horizontalHeader(), column_shares);
    m_view->setSortingEnabled(true);
    m_view->installEventFilter(this);
    connect(m_view, &QTableView::doubleClicked, this, &FamilyListWidget::open_chosen);
    connect(m_model, &FamilyListModel::layoutChanged, this, [this] { m_view->scrollTo(m_view->currentIndex()); });
}

void FamilyListWidget::choose(people::FamilyList list)
{
    if (m_selector->currentIndex() == int(list))
        reload();
    else
        m_selector->setCurrentIndex(int(list));
}

people::FamilyList FamilyListWidget::list() const
{
    return people::FamilyList(m_selector->currentIndex());
}

void FamilyListWidget::reload()
{
    const int family = chosen_family();
    auto& office = m_desk.office;
    const auto group = m_family_group == 0 ? std::nullopt : std::optional(m_family_group);
    if (may_list())
        m_model->set_entries(
            people::read_address_book(*office.session, list(), office.settings.use_preferred_names, group));
    select(std::max(0, m_model->row_of(family)));
    show_outcome();
}

void FamilyListWidget::narrow_to_group(int family_group_id)
{
    m_family_group = family_group_id;
    reload();
}

void FamilyListWidget::replace_filter(QWidget* beside)
{
    m_filter->hide();
    m_when_empty = u"Choose another list above."_s;
    m_top->addWidget(beside);
    m_top->addStretch(1);
}

bool FamilyListWidget::choose_family(int surname_id)
{
    const int row = m_model->row_of(surname_id);
    if (row >= 0)
        select(row);
    return row >= 0;
}

bool FamilyListWidget::may_list() const
{
    return m_desk.office.may(core::Area::fast_find) || m_desk.office.may(core::Area::search_for_family);
}

void FamilyListWidget::focus_filter()
{
    m_filter->setFocus(Qt::ShortcutFocusReason);
    m_filter->selectAll();
}

void FamilyListWidget::typed(const QString& text)
{
    if (!m_model->narrow(text))
        return;
    select(0);
    show_outcome();
}

void FamilyListWidget::select(int row)
{
    if (row >= m_model->rowCount())
        return;
    const QModelIndex index = m_model->index(row, 0);
    m_view->setCurrentIndex(index);
    m_view->scrollTo(index);
}

int FamilyListWidget::chosen_family() const
{
    const QModelIndex index = m_view->currentIndex();
    return index.isValid() ? m_model->entry(index.row()).Surname_ID : 0;
}

int FamilyListWidget::chosen_row() const
{
    return m_view->currentIndex().row();
}

void FamilyListWidget::open_chosen()
{
    if (chosen_row() >= 0)
        Q_EMIT opened(chosen_row());
}

void FamilyListWidget::look_at_chosen()
{
    if (chosen_row() >= 0)
        Q_EMIT looked_at(chosen_row());
}

void FamilyListWidget::show_outcome()
{
    const bool none = m_model->rowCount() == 0;
    if (!may_list())
        m_empty->say(u"Your password does not open the list of families"_s, {});
    else if (none && m_model->total() > 0)
        m_empty->say(u"No family answers to \u201c%1\u201d"_s.arg(m_filter->text()),
                     u"Shorten the words, or choose another list beside them."_s);
    else if (none && m_family_group != 0)
        m_empty->say(u"No family of this family group is in this list"_s,
                     u"Choose another family group or another list above."_s);
    else if (none)
        m_empty->say(u"There are no families in this list"_s, m_when_empty);
    m_stack->setCurrentIndex(none ? 1 : 0);
    Q_EMIT shown_changed();
}

QString FamilyListWidget::count_words() const
{
    const QLocale locale;
    const QString shown = locale.toString(m_model->rowCount());
    if (m_model->rowCount() == m_model->total())
        return m_model->total() == 1 ? u"1 family"_s : u"%1 families"_s.arg(shown);
    return u"%1 of %2 families"_s.arg(shown, locale.toString(m_model->total()));
}

bool FamilyListWidget::key_in_view(const QKeyEvent& key)
{
    if (is_enter(key))
        open_chosen();
    else if (key.key() == Qt::Key_Space)
        look_at_chosen();
    else
        return false;
    return true;
}

bool FamilyListWidget::eventFilter(QObject* target, QEvent* event)
{
    if (event->type() != QEvent::KeyPress)
        return QWidget::eventFilter(target, event);
    auto* key = static_cast<QKeyEvent*>(event);
    if (is_enter(*key) && key->modifiers() == Qt::ControlModifier) {
        look_at_chosen();
        return true;
    }
    if (target == m_filter && moves_in_list(key->key())) {
        m_view->setFocus(Qt::TabFocusReason);
        // The first family stands chosen already: Down goes to it, not past it.
        return key->key() == Qt::Key_Down || QApplication::sendEvent(m_view, event);
    }
    if (target == m_view && key_in_view(*key))
        return true;
    return QWidget::eventFilter(target, event);
}

} // namespace kindrel::desktop
