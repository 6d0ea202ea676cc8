#include "desktop/people/working_people.h"

#include "desktop/people/person_finder.h"
#include "desktop/shell/list_view.h"
#include "desktop/shell/look.h"

#include <QHeaderView>
#include <QKeyEvent>
#include <QTableView>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array column_shares{42, 30, 28};

} // namespace

WorkingPeople::WorkingPeople(Desk& desk)
    : m_desk(desk), m_model(new WorkingPeopleModel(this)), m_finder(new PersonFinder(desk)), m_table(new QTableView)
{
    set_up_table();
    connect(m_finder, &PersonFinder::chosen, this, &WorkingPeople::added);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(m_finder);
    column->addWidget(m_table, 1);
}

void WorkingPeople::set_up_table()
{
    m_table->setObjectName(u"working_people"_s);
    m_table->setAccessibleName(u"People of the list"_s);
    m_table->setModel(m_model);
    make_row_list(*m_table);
    m_table->setSelectionMode(QAbstractItemView::ExtendedSelection);
    m_table->horizontalHeader()->setObjectName(u"working_people"_s);
    follow(m_desk.remembered, *m_table->horizontalHeader(), column_shares);
    m_table->installEventFilter(this);
    connect(m_table, &QTableView::doubleClicked, this,
            [this](const QModelIndex& index) { Q_EMIT opened(m_model->person(index.row()).member.surname_id); });
}

void WorkingPeople::show_people(const std::vector<people::ListedPerson>& people)
{
    const int row = m_table->currentIndex().row();
    m_model->set_people(people);
    m_table->setCurrentIndex(m_model->index(std::clamp(row, 0, std::max(0, m_model->rowCount() - 1)), 0));
}

void WorkingPeople::focus_list()
{
    m_table->setFocus(Qt::OtherFocusReason);
}

void WorkingPeople::focus_line()
{
    m_finder->focus_line();
}

void WorkingPeople::strike_chosen()
{
    std::vector<int> people;
    const auto rows = m_table->selectionModel()->selectedRows();
    for (const QModelIndex& row : rows)
        people.push_back(m_model->person(row.row()).member.person_id);
    if (!people.empty())
        Q_EMIT struck(people);
}

bool WorkingPeople::eventFilter(QObject* target, QEvent* event)
{
    if (target != m_table || event->type() != QEvent::KeyPress)
        return QWidget::eventFilter(target, event);
    switch (static_cast<QKeyEvent*>(event)->key()) {
    case Qt::Key_Delete:
        strike_chosen();
        return true;
    case Qt::Key_Insert:
        focus_line();
        return true;
    case Qt::Key_Return:
    case Qt::Key_Enter:
        if (m_table->currentIndex().isValid())
            Q_EMIT opened(m_model->person(m_table->currentIndex().row()).member.surname_id);
        return true;
    default:
        return QWidget::eventFilter(target, event);
    }
}

} // namespace kindrel::desktop
