#include "desktop/people/editor_book.h"

#include "desktop/people/editor_family_tab.h"
#include "desktop/people/editor_person_tab.h"
#include "desktop/people/editor_tabs.h"

#include <QScrollArea>
#include <QTabBar>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

EditorBook::EditorBook(EditorBench& bench, NoteBar& note)
    : m_family(new EditorFamilyTab(bench, note)), m_person(new EditorPersonTab(bench))
{
    setObjectName(u"editor_tabs"_s);
    setDocumentMode(true);
    tabBar()->setFocusPolicy(Qt::ClickFocus); // Each tab has a key; Tab leads from field to field.
    add(m_family, u"&Family"_s);
    add(m_person, u"&Person"_s);
    add(make_groups_tab(bench), u"&Groups"_s);
    add(make_dates_tab(bench), u"&Dates and flexi"_s);
    add(make_events_tab(bench), u"&Events"_s);
    add(make_notes_tab(bench), u"&Notes"_s);
    connect(this, &QTabWidget::currentChanged, this, &EditorBook::turned);
}

void EditorBook::add(EditorTab* tab, const QString& title)
{
    auto* scroll = new QScrollArea;
    scroll->setWidgetResizable(true);
    scroll->setFrameShape(QFrame::NoFrame);
    scroll->setFocusPolicy(Qt::NoFocus);
    scroll->setWidget(tab);
    m_parts.push_back(tab);
    addTab(scroll, title);
}

void EditorBook::turned()
{
    show_file();
    EditorTab& tab = *m_parts.at(std::size_t(currentIndex()));
    if (!isVisible() || tab.isAncestorOf(window()->focusWidget()))
        return;
    const auto takes_cursor = [&tab](const QWidget* field) {
        return tab.isAncestorOf(field) && (field->focusPolicy() & Qt::TabFocus) && field->isEnabled() &&
               field->isVisibleTo(&tab);
    };
    QWidget* field = tab.nextInFocusChain();
    while (field != &tab && !takes_cursor(field))
        field = field->nextInFocusChain();
    field->setFocus(Qt::TabFocusReason);
}

void EditorBook::read_lists()
{
    m_family->read_suburbs();
    m_person->read_titles();
}

void EditorBook::show_file()
{
    m_parts.at(std::size_t(currentIndex()))->show_file();
}

bool EditorBook::finish_typing()
{
    const auto refuses = [](EditorTab* part) {
        return !part->finish_typing();
    };
    const auto found = std::ranges::find_if(m_parts, refuses);
    if (found == m_parts.end())
        return true;
    setCurrentIndex(int(found - m_parts.begin()));
    return false;
}

void EditorBook::focus_guilty(people::SaveRefusal::Where where)
{
    for (std::size_t place = 0; place < m_parts.size(); ++place)
        if (m_parts[place]->focus_guilty(where)) {
            setCurrentIndex(int(place));
            (void)m_parts[place]->focus_guilty(where); // Now that it can be seen.
        }
}

void EditorBook::open_person()
{
    setCurrentIndex(int(std::ranges::find(m_parts, m_person) - m_parts.begin()));
    m_person->focus_name();
}

QWidget* EditorBook::first_field() const
{
    return m_family->first_field();
}

} // namespace kindrel::desktop
