#include "desktop/people/filters_page.h"

#include "core/entry.h"
#include "desktop/output/list_report.h"
#include "desktop/people/filter_panel.h"
#include "desktop/people/found_people.h"
#include "desktop/shell/elided_label.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/table_text.h"
#include "people/filter_search.h"

#include <QAction>
#include <QPushButton>
#include <QShortcut>
#include <QStackedWidget>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

const QString list_title = u"People of the filter"_s;

enum View { filter_view, people_view };

QVBoxLayout* make_column(QWidget& of)
{
    auto* column = new QVBoxLayout(&of);
    column->setContentsMargins(space::group, 0, space::group, space::margin);
    column->setSpacing(space::field);
    return column;
}

} // namespace

FiltersPage::FiltersPage(Desk& desk)
    : Page(u"Filters"_s), m_desk(desk), m_panel(new FilterPanel(desk)), m_people(new FoundPeople(desk.remembered)),
      m_stack(new QStackedWidget), m_criteria(new ElidedLabel)
{
    setObjectName(u"filters"_s);
    m_stack->addWidget(make_filter());
    m_stack->addWidget(make_people());
    set_content(m_stack);
    add_actions();
    connect(m_people, &FoundPeople::opened, this, &FiltersPage::open_family);
    connect(m_people, &FoundPeople::shown_changed, this, &FiltersPage::show_count);
}

QWidget* FiltersPage::make_filter()
{
    auto* find = new QPushButton(icon(u"edit-find"_s), u"Show &people"_s);
    find->setObjectName(u"show_people"_s);
    find->setToolTip(u"List the people whom the filter finds (Ctrl+Enter)"_s);
    connect(find, &QPushButton::clicked, this, &FiltersPage::show_people);
    auto* view = new QWidget;
    auto* column = make_column(*view);
    column->addWidget(m_panel, 1);
    column->addWidget(find, 0, Qt::AlignRight);
    for (const auto key : {Qt::Key_Return, Qt::Key_Enter}) {
        auto* enter = new QShortcut(Qt::CTRL | key, view);
        enter->setContext(Qt::WidgetWithChildrenShortcut);
        connect(enter, &QShortcut::activated, this, &FiltersPage::show_people);
    }
    return view;
}

QWidget* FiltersPage::make_people()
{
    auto* back = new QPushButton(icon(u"go-previous"_s), u"&Back to the filter"_s);
    back->setObjectName(u"back"_s);
    back->setToolTip(u"Escape"_s);
    connect(back, &QPushButton::clicked, this, &FiltersPage::show_filter);
    dress(*m_criteria, TextSize::secondary);
    m_criteria->setObjectName(u"criteria"_s);
    auto* view = new QWidget;
    auto* column = make_column(*view);
    column->addWidget(m_criteria);
    column->addWidget(m_people, 1);
    column->addWidget(back, 0, Qt::AlignLeft);
    auto* escape = new QShortcut(Qt::Key_Escape, view);
    escape->setContext(Qt::WidgetWithChildrenShortcut);
    connect(escape, &QShortcut::activated, this, &FiltersPage::show_filter);
    return view;
}

void FiltersPage::add_actions()
{
    auto* print_list = add_action(u"Print"_s, u"document-print"_s, u"Print the people found (Ctrl+P)"_s);
    connect(print_list, &QAction::triggered, this, &FiltersPage::print);
    auto* save = add_action(u"Save as CSV"_s, u"document-save"_s, u"Save the people found as comma-separated text"_s);
    connect(save, &QAction::triggered, this, &FiltersPage::save_list);
}

bool FiltersPage::shows_people() const
{
    return m_stack->currentIndex() == people_view;
}

void FiltersPage::entered()
{
    if (shows_people())
        return m_people->focus_line();
    m_panel->reload();
    m_panel->focus_kinds();
}

void FiltersPage::find()
{
    if (shows_people())
        m_people->focus_line();
    else
        m_panel->focus_kinds();
}

void FiltersPage::show_people()
{
    const bool complete = m_panel->finish();
    m_panel->count_now();
    if (!complete)
        return;
    const auto list = people::find_people(*m_desk.office.session, m_panel->filter(), filter_day(m_desk.office));
    if (list.members.empty())
        return; // The panel says so, and which criterion it is.
    auto found = read_people(m_desk, list);
    if (!found)
        return;
    m_criteria->setText(list.criteria);
    m_stack->setCurrentIndex(people_view);
    m_people->show_people(std::move(*found));
    m_people->focus_line();
}

void FiltersPage::show_filter()
{
    m_stack->setCurrentIndex(filter_view);
    show_count();
    entered();
}

void FiltersPage::show_count()
{
    set_status(shows_people() ? m_people->count_words() : QString());
}

bool FiltersPage::people_at_hand()
{
    if (!shows_people())
        show_people();
    return shows_people();
}

void FiltersPage::print()
{
    if (core::permitted(m_desk.office, core::Area::report_outputs) && people_at_hand())
        print_list(m_desk, list_title, m_people->model());
}

void FiltersPage::save_list()
{
    if (core::permitted(m_desk.office, core::Area::export_text) && people_at_hand())
        save_as_csv(m_people->model(), list_title, m_desk.office.dialogue);
}

void FiltersPage::open_family(int surname_id)
{
    m_desk.navigation.open_family(surname_id, m_people->model().surname_ids(), list_title);
}

} // namespace kindrel::desktop
