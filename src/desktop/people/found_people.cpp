#include "desktop/people/found_people.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/list_view.h"
#include "desktop/shell/look.h"

#include <QHeaderView>
#include <QKeyEvent>
#include <QLineEdit>
#include <QLocale>
#include <QTableView>
#include <QVBoxLayout>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array column_shares{40, 30, 30};

}

FoundPeople::FoundPeople(Remembered& remembered, QWidget* parent)
    : QWidget(parent), m_model(new FoundPeopleModel(this)), m_line(new QLineEdit), m_table(new QTableView)
{
    set_up_line();
    set_up_table(remembered);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(m_line);
    column->addWidget(m_table, 1);
}

void FoundPeople::set_up_line()
{
    m_line->setObjectName(u"find_person"_s);
    m_line->setAccessibleName(u"Find a person"_s);
    m_line->setPlaceholderText(u"Name, family or suburb"_s);
    m_line->setClearButtonEnabled(true);
    m_line->addAction(icon(u"edit-find"_s), QLineEdit::LeadingPosition);
    m_line->installEventFilter(this);
    connect(m_line, &QLineEdit::textChanged, this, &FoundPeople::typed);
    connect(m_line, &QLineEdit::returnPressed, this, &FoundPeople::open_chosen);
}

void FoundPeople::set_up_table(Remembered& remembered)
{
    m_table->setObjectName(u"people"_s);
    m_table->setAccessibleName(u"People found"_s);
    m_table->setModel(m_model);
    make_row_list(*m_table);
    m_table->horizontalHeader()->setObjectName(u"found_people"_s);
    follow(remembered, *m_table->horizontalHeader(), column_shares);
    m_table->installEventFilter(this);
    connect(m_table, &QTableView::doubleClicked, this, &FoundPeople::open_chosen);
}

void FoundPeople::show_people(std::vector<FoundPerson> people)
{
    m_model->set_people(std::move(people));
    m_line->clear();
    typed({});
}

void FoundPeople::typed(const QString& text)
{
    m_model->narrow(text);
    m_table->setCurrentIndex(m_model->index(0, 0));
    Q_EMIT shown_changed();
}

void FoundPeople::focus_line()
{
    m_line->setFocus(Qt::ShortcutFocusReason);
    m_line->selectAll();
}

QString FoundPeople::count_words() const
{
    const QLocale locale;
    const QString shown = locale.toString(m_model->rowCount());
    if (m_model->rowCount() == m_model->total())
        return m_model->total() == 1 ? u"1 person"_s : u"%1 people"_s.arg(shown);
    return u"%1 of %2 people"_s.arg(shown, locale.toString(m_model->total()));
}

void FoundPeople::open_chosen()
{
    const QModelIndex chosen = m_table->currentIndex();
    if (chosen.isValid())
        Q_EMIT opened(m_model->person(chosen.row()).surname_id);
}

bool FoundPeople::line_key(const QKeyEvent& key)
{
    if (key.key() != Qt::Key_Down && key.key() != Qt::Key_PageDown)
        return false;
    // The first person stands chosen already: Down goes to it, not past it.
    m_table->setFocus(Qt::TabFocusReason);
    return true;
}

bool FoundPeople::eventFilter(QObject* target, QEvent* event)
{
    if (event->type() != QEvent::KeyPress)
        return QWidget::eventFilter(target, event);
    const auto& key = static_cast<const QKeyEvent&>(*event);
    if (target == m_table && (key.key() == Qt::Key_Return || key.key() == Qt::Key_Enter)) {
        open_chosen();
        return true;
    }
    return (target == m_line && line_key(key)) || QWidget::eventFilter(target, event);
}

} // namespace kindrel::desktop
