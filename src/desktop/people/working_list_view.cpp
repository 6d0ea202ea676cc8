#include "desktop/people/working_list_view.h"

#include "core/entry.h"
#include "desktop/output/list_report.h"
#include "desktop/people/working_people.h"
#include "desktop/shell/look.h"
#include "desktop/shell/table_text.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QLocale>
#include <QPushButton>
#include <QSet>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

const QString list_title = u"People of the list"_s;

} // namespace

WorkingListView::WorkingListView(Desk& desk, TaggingSheet& sheet)
    : m_desk(desk), m_sheet(sheet), m_state(new QLabel), m_as_filtered(new QPushButton(u"As filtered"_s)),
      m_people(new WorkingPeople(desk))
{
    m_state->setObjectName(u"state"_s);
    m_state->setTextFormat(Qt::PlainText);
    m_state->setWordWrap(true);
    m_state->setTextInteractionFlags(Qt::TextSelectableByMouse);
    m_as_filtered->setObjectName(u"as_filtered"_s);
    m_as_filtered->setToolTip(u"Forget who was added, struck or brought from Data Search"_s);
    connect(m_as_filtered, &QPushButton::clicked, this, &WorkingListView::drop_changes_by_hand);
    connect(m_people, &WorkingPeople::added, this, &WorkingListView::add);
    connect(m_people, &WorkingPeople::struck, this, &WorkingListView::strike);
    connect(m_people, &WorkingPeople::opened, this,
            [this](int family) { m_desk.navigation.open_family(family, list().families(), list_title); });
    auto* above = new QHBoxLayout;
    above->addWidget(m_state, 1);
    above->addWidget(m_as_filtered, 0, Qt::AlignTop);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addLayout(above);
    column->addWidget(m_people, 1);
}

QString people_words(qsizetype people)
{
    return people == 1 ? u"1 person"_s : u"%1 people"_s.arg(QLocale().toString(people));
}

QString WorkingListView::count_words() const
{
    return people_words(std::ssize(m_made.people));
}

void WorkingListView::focus_line()
{
    m_people->focus_line();
}

bool WorkingListView::can_make() const
{
    const auto& plan = m_sheet.plan;
    const auto right = people::right_for(plan.sort.by);
    return plan.filter.families && (!right || m_desk.office.may(*right)) && !people::sort_refusal(plan.sort);
}

void WorkingListView::make()
{
    if (!can_make())
        return;
    const auto& plan = m_sheet.plan;
    m_made = people::make_list(m_desk.office, plan);
    m_is_made = true;
    m_people->show_people(m_made.people);
    m_state->setText(u"%1: %2"_s.arg(count_words(), m_made.list.criteria));
    m_as_filtered->setVisible(plan.found || !plan.added.empty() || !plan.struck.empty());
    Q_EMIT made();
}

void WorkingListView::change_by_hand(const QString& words, const std::function<void()>& change)
{
    auto before = m_sheet.plan;
    change();
    make();
    if (m_sheet.plan.found)
        before.found.reset(); // Not for this act to bring back.
    Q_EMIT changed_by_hand(words, [this, before = std::move(before)] {
        auto& plan = m_sheet.plan;
        if (before.found && plan.filter == before.filter)
            plan.found = before.found;
        plan.added = before.added;
        plan.struck = before.struck;
        make();
    });
}

void WorkingListView::add(const people::ListedPerson& person)
{
    const auto& there = m_made.list.members;
    if (std::ranges::find(there, person.member.person_id, &people::Member::person_id) != there.end())
        return Q_EMIT told(u"\u201c%1, %2\u201d is on the list already."_s.arg(person.surname, person.name));
    change_by_hand(u"\u201c%1, %2\u201d was added to the list."_s.arg(person.surname, person.name),
                   [&] { people::add_by_hand(m_sheet.plan, {person.member}); });
}

void WorkingListView::add_people(const std::vector<people::Member>& members)
{
    QSet<int> there;
    for (const auto& member : m_made.list.members)
        there.insert(member.person_id);
    std::vector<people::Member> more;
    std::ranges::copy_if(members, std::back_inserter(more),
                         [&](const people::Member& member) { return !there.contains(member.person_id); });
    if (more.empty())
        return Q_EMIT told(u"All of them are on the list already."_s);
    const auto already = std::ssize(members) - std::ssize(more);
    QString words = u"%1 added to the list"_s.arg(people_words(std::ssize(more)));
    if (already > 0)
        words += u"; on it already: %1"_s.arg(QLocale().toString(already));
    change_by_hand(words + u'.', [&] { people::add_by_hand(m_sheet.plan, more); });
}

void WorkingListView::strike(const std::vector<int>& people)
{
    change_by_hand(u"%1 struck from the list."_s.arg(people_words(std::ssize(people))),
                   [&] { people::strike_by_hand(m_sheet.plan, people); });
}

void WorkingListView::drop_changes_by_hand()
{
    change_by_hand(u"The list is as it was filtered."_s, [this] {
        m_sheet.plan.found.reset();
        m_sheet.plan.added.clear();
        m_sheet.plan.struck.clear();
    });
    m_people->focus_list();
}

bool WorkingListView::has_people() const
{
    if (m_made.people.empty())
        m_desk.office.dialogue.show({u"No people found for creating a report"_s});
    return !m_made.people.empty();
}

void WorkingListView::print()
{
    if (has_people())
        print_list(m_desk, list_title, m_people->model());
}

void WorkingListView::save()
{
    if (core::permitted(m_desk.office, core::Area::export_text) && has_people())
        save_as_csv(m_people->model(), list_title, m_desk.office.dialogue);
}

} // namespace kindrel::desktop
