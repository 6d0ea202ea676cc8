#include "desktop/people/person_finder.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "people/search_words.h"

#include <QKeyEvent>
#include <QLineEdit>
#include <QListWidget>
#include <QVBoxLayout>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int place_role = Qt::UserRole;
constexpr int most_found = 50;
constexpr int most_in_sight = 8;

} // namespace

PersonFinder::PersonFinder(Desk& desk) : m_desk(desk), m_line(new QLineEdit), m_found(new QListWidget)
{
    m_line->setObjectName(u"add_person"_s);
    m_line->setAccessibleName(u"Add a person to the list"_s);
    m_line->setPlaceholderText(u"Add a person by hand: type a name (Insert)"_s);
    m_line->setClearButtonEnabled(true);
    m_line->addAction(icon(u"list-add"_s), QLineEdit::LeadingPosition);
    m_line->installEventFilter(this);
    m_found->setObjectName(u"persons"_s);
    m_found->setAccessibleName(u"People who answer"_s);
    m_found->setUniformItemSizes(true);
    m_found->setFocusPolicy(Qt::ClickFocus);
    m_found->hide();
    connect(m_line, &QLineEdit::textChanged, this, &PersonFinder::find);
    connect(m_found, &QListWidget::itemClicked, this, &PersonFinder::take);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);
    column->addWidget(m_line);
    column->addWidget(m_found);
}

void PersonFinder::focus_line()
{
    m_line->setFocus(Qt::ShortcutFocusReason);
    m_line->selectAll();
}

void PersonFinder::read()
{
    core::Session& session = *m_desk.office.session;
    const qint64 mark = session.change_mark();
    if (m_change_mark == mark)
        return;
    m_people = people::everybody(session, m_desk.office.settings.use_preferred_names);
    m_words.clear();
    m_words.reserve(m_people.size());
    for (const auto& person : m_people)
        m_words.push_back(people::search_words(person.name + u' ' + person.surname));
    m_change_mark = mark;
}

void PersonFinder::find(const QString& typed)
{
    const QStringList wanted = people::wanted_words(typed);
    m_found->clear();
    m_found->setVisible(!wanted.isEmpty());
    if (wanted.isEmpty())
        return;
    read();
    for (std::size_t place = 0; place < m_people.size() && m_found->count() < most_found; ++place) {
        if (!people::has_all(m_words[place], wanted))
            continue;
        const auto& person = m_people[place];
        auto* row = new QListWidgetItem(u"%1, %2"_s.arg(person.surname, person.name), m_found);
        row->setData(place_role, int(place));
    }
    if (m_found->count() == 0)
        (new QListWidgetItem(u"Nobody answers to this"_s, m_found))->setFlags(Qt::NoItemFlags);
    else
        m_found->setCurrentRow(0);
    const int rows = std::min(m_found->count(), most_in_sight);
    m_found->setFixedHeight(rows * m_found->sizeHintForRow(0) + 2 * m_found->frameWidth());
}

void PersonFinder::take()
{
    const auto* row = m_found->currentItem();
    if (!row || row->flags() == Qt::NoItemFlags)
        return;
    const auto person = m_people[std::size_t(row->data(place_role).toInt())];
    m_line->clear();
    m_line->setFocus(Qt::OtherFocusReason);
    Q_EMIT chosen(person);
}

bool PersonFinder::line_key(int key)
{
    const int rows = m_found->count();
    switch (key) {
    case Qt::Key_Return:
    case Qt::Key_Enter:
        take();
        return true;
    case Qt::Key_Escape:
        m_line->clear();
        return true;
    case Qt::Key_Down:
    case Qt::Key_Up:
        if (rows == 0 || !m_found->isVisible())
            return false;
        m_found->setCurrentRow(std::clamp(m_found->currentRow() + (key == Qt::Key_Down ? 1 : -1), 0, rows - 1));
        return true;
    default:
        return false;
    }
}

bool PersonFinder::eventFilter(QObject* target, QEvent* event)
{
    const bool pressed = target == m_line && event->type() == QEvent::KeyPress;
    return (pressed && line_key(static_cast<QKeyEvent*>(event)->key())) || QWidget::eventFilter(target, event);
}

} // namespace kindrel::desktop
