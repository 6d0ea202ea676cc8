#include "desktop/people/card_list_view.h"
#include "desktop/people/card_text.h"
#include "desktop/people/editor_rows_tab.h"
#include "desktop/people/editor_tabs.h"
#include "desktop/shell/look.h"

#include <QGridLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::RowList;

namespace {

constexpr int history_share = 58; ///< The column with the history needs room for its dates, in hundredths.

const PersonCardList& history_list()
{
    return group_lists().at(2);
}

class GroupsTab : public EditorRowsTab
{
public:
    explicit GroupsTab(EditorBench& bench);

    void show_file() override;

private:
    void read_history();

    CardListView* m_history_view;
    std::vector<people::HistoryEntry> m_history;
    people::FamilyFile m_history_of; ///< As it was stored when the history was read.
};

GroupsTab::GroupsTab(EditorBench& bench)
    : EditorRowsTab(bench),
      m_history_view(new CardListView(QString::fromLatin1(history_list().title), history_list().columns))
{
    // Heading and list stand where those of the list beside them do.
    const int slack = space::control - QFontMetrics(font_for(TextSize::group)).height();
    m_history_view->layout()->setContentsMargins(0, slack / 2, 0, 0);
    m_history_view->layout()->setSpacing(space::field / 2 + slack - slack / 2);
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(space::margin, space::field, space::margin, space::margin);
    grid->setHorizontalSpacing(2 * space::margin);
    grid->setVerticalSpacing(space::field);
    grid->addWidget(add(RowList::status), 0, 0);
    grid->addWidget(add(RowList::groups), 1, 0);
    grid->addWidget(m_history_view, 2, 0);
    grid->addWidget(add(RowList::ministries), 0, 1);
    grid->addWidget(add(RowList::occupations), 1, 1);
    grid->addWidget(add(RowList::family_groups), 2, 1);
    for (int row = 0; row < grid->rowCount(); ++row)
        grid->setRowStretch(row, 1);
    grid->setColumnStretch(0, history_share);
    grid->setColumnStretch(1, 100 - history_share);
    show_file();
}

void GroupsTab::read_history()
{
    const people::FamilyFile& stored = editor().stored();
    if (stored == m_history_of)
        return;
    m_history = people::read_group_history(*bench().desk.office.session, stored.family.Surname_ID);
    m_history_of = stored;
}

void GroupsTab::show_file()
{
    EditorRowsTab::show_file();
    read_history();
    const auto& people = file().people;
    const int person = bench().person();
    if (!(file().access.*history_list().open))
        m_history_view->show_closed();
    else if (person < 0 || person >= std::ssize(people))
        m_history_view->show_rows({});
    else
        m_history_view->show_rows(
            history_list().rows(people[std::size_t(person)],
                                {.disclosure = people::Disclosure::of(bench().desk.office), .history = m_history}));
}

} // namespace

EditorTab* make_groups_tab(EditorBench& bench)
{
    return new GroupsTab(bench);
}

} // namespace kindrel::desktop
