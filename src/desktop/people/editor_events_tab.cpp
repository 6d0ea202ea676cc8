#include "desktop/people/card_list_view.h"
#include "desktop/people/card_text.h"
#include "desktop/people/editor_rows_tab.h"
#include "desktop/people/editor_tabs.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"

#include <QPushButton>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::RowList;

namespace {

class EventsTab : public EditorRowsTab
{
public:
    explicit EventsTab(EditorBench& bench);

    void show_file() override;

private:
    void add_visits(QVBoxLayout& column);
    void add_to_visitation();

    CardListView* m_visits = nullptr; ///< Null without the right to them.
    QPushButton* m_add_visit = nullptr;
};

EventsTab::EventsTab(EditorBench& bench) : EditorRowsTab(bench)
{
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(space::margin, space::field, space::margin, space::margin);
    column->setSpacing(space::field);
    column->addWidget(add(RowList::events), 1);
    column->addWidget(add(RowList::other_contacts), 1);
    if (bench.desk.office.may(core::Area::visitation_tab))
        add_visits(*column);
    show_file();
}

void EventsTab::add_visits(QVBoxLayout& column)
{
    m_visits = new CardListView(QString::fromLatin1(visit_list().title), visit_list().columns);
    m_add_visit = new QPushButton(icon(u"list-add"_s), u"Add to &visitation list"_s);
    m_add_visit->setObjectName(u"add_to_visitation"_s);
    m_add_visit->setToolTip(u"Adds a visit of today with the family's people, address and phone"_s);
    connect(m_add_visit, &QPushButton::clicked, this, &EventsTab::add_to_visitation);
    column.addWidget(m_visits, 1);
    column.addWidget(m_add_visit, 0, Qt::AlignLeft);
}

void EventsTab::show_file()
{
    EditorRowsTab::show_file();
    if (!m_visits)
        return;
    const bool open = file().access.*visit_list().open;
    m_add_visit->setVisible(open && editor().may_edit());
    if (open)
        m_visits->show_rows(visit_list().rows(file(), {.disclosure = people::Disclosure::of(bench().desk.office)}));
    else
        m_visits->show_closed();
}

void EventsTab::add_to_visitation()
{
    if (!finish_typing())
        return;
    (void)editor().add_to_visitation();
    bench().show_again(); // It may have been saved on the way, whatever came of the visit.
}

} // namespace

EditorTab* make_events_tab(EditorBench& bench)
{
    return new EventsTab(bench);
}

} // namespace kindrel::desktop
