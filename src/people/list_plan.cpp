#include "people/list_plan.h"

#include "people/filter_search.h"
#include "people/sort_key.h"

#include <QSet>

#include <algorithm>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

FilterDay day_of(const core::Office& office)
{
    return {office.clock.today(), office.day_order()};
}

QString span_words(const QString& what, const QString& first, const QString& last)
{
    if (first.isEmpty() && last.isEmpty())
        return {};
    if (last.isEmpty())
        return u"%1 from %2"_s.arg(what, first);
    return first.isEmpty() ? u"%1 up to %2"_s.arg(what, last) : u"%1 from %2 to %3"_s.arg(what, first, last);
}

QString number_words(const std::optional<int>& number)
{
    return number ? QString::number(*number) : QString();
}

QString hand_words(const ListPlan& plan)
{
    QStringList parts;
    if (!plan.added.empty())
        parts += u"%1 added"_s.arg(plan.added.size());
    if (!plan.struck.empty())
        parts += u"%1 struck"_s.arg(plan.struck.size());
    return parts.isEmpty() ? QString() : parts.join(u" and "_s) + u" by hand"_s;
}

/// The people of `members` who are not in the list, in their order, each once.
WorkingList lacking(const std::vector<Member>& list, const std::vector<Member>& members)
{
    QSet<int> there;
    for (const auto& member : list)
        there.insert(member.person_id);
    WorkingList found;
    for (const auto& member : members) {
        if (there.contains(member.person_id))
            continue;
        there.insert(member.person_id);
        found.members.push_back(member);
    }
    return found;
}

std::vector<Member> members_of(const std::vector<ListedPerson>& people)
{
    std::vector<Member> members;
    members.reserve(people.size());
    std::ranges::transform(people, std::back_inserter(members), &ListedPerson::member);
    return members;
}

/// Those who live now, whenever they were found.
WorkingList living(core::Session& session, const WorkingList& list)
{
    lend(session, list);
    auto rows = session.select(u"SELECT w.[person_id],w.[surname_id] FROM [work_people] w INNER JOIN [tbl_people] p "
                               "ON p.[person_id]=w.[person_id] WHERE p.[Decease]=0 ORDER BY w.[place];"_s);
    WorkingList alive{{}, list.criteria};
    for (const core::Row& row : rows)
        alive.members.push_back({row.integer(core::Column{0}), row.integer(core::Column{1})});
    return alive;
}

WorkingList in_order(core::Office& office, const ListPlan& plan)
{
    auto list =
        plan.found ? living(*office.session, *plan.found) : find_people(*office.session, plan.filter, day_of(office));
    if (!plan.found && plan.added.empty() && plan.sort == SortOrder{})
        return list; // The filter finds them in this order.
    const auto more = lacking(list.members, plan.added);
    list.members.insert(list.members.end(), more.members.begin(), more.members.end());
    return sorted(*office.session, list, plan.sort, office.clock.today());
}

} // namespace

QString range_words(const ListRange& range)
{
    QStringList parts{span_words(u"surnames"_s, range.first_letter, range.last_letter),
                      span_words(u"places"_s, number_words(range.first), number_words(range.last))};
    parts.removeAll(QString());
    return parts.join(u", "_s);
}

std::vector<ListedPerson> within(const ListRange& range, SortBy by, std::vector<ListedPerson> people)
{
    const auto key = by == SortBy::individual ? &ListedPerson::own_sort_key : &ListedPerson::sort_key;
    const QString first = sort_key(range.first_letter), last = sort_key(range.last_letter);
    std::erase_if(people, [&](const ListedPerson& person) {
        return person.*key < first || (!last.isEmpty() && (person.*key).left(last.size()) > last);
    });
    const auto size = static_cast<int>(people.size());
    const int begin = std::clamp(range.first.value_or(1) - 1, 0, size);
    const int end = std::clamp(range.last.value_or(size), begin, size);
    people.erase(people.begin() + end, people.end());
    people.erase(people.begin(), people.begin() + begin);
    return people;
}

MadeList make_list(core::Office& office, const ListPlan& plan)
{
    auto& session = *office.session;
    const bool preferred = office.settings.use_preferred_names;
    const auto found = having(session, in_order(office, plan), plan.needs);
    const QSet<int> struck(plan.struck.begin(), plan.struck.end());
    MadeList made;
    made.people = listed_people(session, found, preferred);
    std::erase_if(made.people, [&](const ListedPerson& person) { return struck.contains(person.member.person_id); });
    made.people = within(plan.range, plan.sort.by, std::move(made.people));
    const auto left_out = lacking(members_of(made.people), plan.added);
    if (!left_out.members.empty())
        std::ranges::move(listed_people(session, left_out, preferred), std::back_inserter(made.people));
    made.list = {members_of(made.people), sentence_of(office, plan)};
    return made;
}

QString sentence_of(core::Office& office, const ListPlan& plan)
{
    QStringList parts{plan.found ? plan.found->criteria : sentence(*office.session, plan.filter, day_of(office)),
                      sort_sentence(plan.sort, office.day_order()), needs_words(plan.needs), range_words(plan.range),
                      hand_words(plan)};
    parts.removeAll(QString());
    return parts.join(u"; "_s);
}

void add_by_hand(ListPlan& plan, const std::vector<Member>& members)
{
    QSet<int> added;
    for (const auto& member : members)
        added.insert(member.person_id);
    std::erase_if(plan.struck, [&](int person) { return added.contains(person); });
    std::ranges::copy(lacking(plan.added, members).members, std::back_inserter(plan.added));
}

void strike_by_hand(ListPlan& plan, const std::vector<int>& people)
{
    QSet<int> struck(people.begin(), people.end());
    std::erase_if(plan.added, [&](const Member& member) { return struck.contains(member.person_id); });
    for (const int person : plan.struck)
        struck.remove(person);
    plan.struck.insert(plan.struck.end(), struck.begin(), struck.end());
}

} // namespace kindrel::people
