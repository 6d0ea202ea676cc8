#include "desktop/people/search_page.h"

#include "desktop/output/list_report.h"
#include "desktop/people/data_search_tab.h"
#include "desktop/people/family_search_tab.h"
#include "desktop/shell/table_text.h"

#include <QAction>
#include <QShortcut>
#include <QTabWidget>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

SearchPage* SearchPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::search);
    return entry ? new SearchPage(desk, std::move(*entry)) : nullptr;
}

SearchPage::SearchPage(Desk& desk, core::AreaEntry entry)
    : Page(u"Search"_s), m_desk(desk), m_entry(std::move(entry)), m_tabs(new QTabWidget)
{
    setObjectName(u"Search"_s);
    m_tabs->setObjectName(u"searches"_s);
    m_tabs->setDocumentMode(true);
    add_tab<FamilySearchTab>(u"Families"_s);
    add_tab<DataSearchTab>(u"Data Search"_s);
    connect(m_tabs, &QTabWidget::currentChanged, this, [this] {
        tab().entered();
        show_count();
    });
    add_actions();
    add_keys();
    set_content(m_tabs);
}

template <class Tab>
void SearchPage::add_tab(const QString& title)
{
    auto* made = new Tab(m_desk);
    connect(made, &Tab::counted, this, &SearchPage::show_count);
    m_tabs->addTab(made, title);
}

void SearchPage::add_actions()
{
    const auto action = [this](const QString& text, const QString& icon_name, const QString& tip, auto act) {
        connect(add_action(text, icon_name, tip), &QAction::triggered, this, act);
    };
    action(u"Open"_s, u"document-open-folder"_s, u"Open the chosen family (Enter in the list)"_s,
           [this] { tab().open(); });
    action(u"Card"_s, u"view-list-details"_s,
           u"Look at the chosen family without opening its file (Space in the list)"_s, [this] { tab().look(); });
    action(u"Print"_s, u"document-print"_s, u"Print this list (Ctrl+P)"_s, [this] { print(); });
    action(u"Save as CSV"_s, u"document-save"_s, u"Save this list as comma-separated text"_s, [this] { save_list(); });
}

void SearchPage::add_keys()
{
    for (const auto key : {Qt::Key_PageUp, Qt::Key_PageDown}) {
        auto* turn = new QShortcut(Qt::CTRL | key, this);
        turn->setContext(Qt::WidgetWithChildrenShortcut);
        connect(turn, &QShortcut::activated, this,
                [this] { m_tabs->setCurrentIndex((m_tabs->currentIndex() + 1) % m_tabs->count()); });
    }
}

SearchTab& SearchPage::tab() const
{
    return dynamic_cast<SearchTab&>(*m_tabs->currentWidget());
}

void SearchPage::entered()
{
    tab().entered();
}

void SearchPage::find()
{
    tab().entered();
}

void SearchPage::show_count()
{
    set_status(tab().count_words());
}

void SearchPage::print()
{
    tab().lend_list([this](const QString& title, const QAbstractItemModel& list) { print_list(m_desk, title, list); });
}

void SearchPage::save_list()
{
    if (core::permitted(m_desk.office, core::Area::export_text))
        tab().lend_list([this](const QString& title, const QAbstractItemModel& list) {
            save_as_csv(list, title, m_desk.office.dialogue);
        });
}

} // namespace kindrel::desktop
