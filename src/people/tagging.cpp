#include "people/tagging.h"

#include "core/entry.h"
#include "core/open_church.h"
#include "people/group_history.h"
#include "people/link_tables.h"

#include <QHash>

#include <algorithm>
#include <array>

namespace kindrel::people {

using namespace Qt::StringLiterals;
using core::to_value;
using core::Value;

namespace {

struct Rule
{
    TagKind kind;
    const char16_t* words;
    const char* section; ///< Of `tbl_record_access`.
    std::vector<LinkRow> Person::*rows;
};

constexpr std::array rules{
    Rule{TagKind::status, u" Status ", "status", &Person::status},
    Rule{TagKind::group, u" Group ", "groups", &Person::groups},
    Rule{TagKind::ministry, u" Ministry ", "ministry", &Person::ministries},
    Rule{TagKind::date, u" Date Tag", "date", &Person::dates},
    Rule{TagKind::flexi, u" Flexi Tag", "flexi", &Person::flexi},
};

const Rule& rule_of(TagKind kind)
{
    return *std::ranges::find(rules, kind, &Rule::kind);
}

const LinkTable& table_of(TagKind kind)
{
    const auto links = person_links();
    return std::ranges::find(links, rule_of(kind).rows, &PersonLink::rows)->table;
}

/// Name and value side by side: what the kind stores of a row beside its key.
struct Content
{
    const char* name;
    Value value;
};

std::vector<Content> content_of(const LinkTable& table, const LinkRow& row)
{
    const std::array all{Content{table.date, to_value(row.date)}, Content{table.field, to_value(row.field)},
                         Content{table.tagged, to_value(row.tagged)}};
    std::vector<Content> found;
    std::ranges::copy_if(all, std::back_inserter(found), [](const Content& each) { return each.name != nullptr; });
    return found;
}

LinkRow row_of(const TagItem& item)
{
    LinkRow row;
    row.item = item.item;
    row.type = item.kind == TagKind::ministry ? static_cast<int>(item.ministry) : 0;
    if (item.kind == TagKind::date)
        row.date = item.date;
    if (item.kind == TagKind::flexi)
        row.field = item.field;
    row.tagged = item.tagged && (item.kind == TagKind::date || item.kind == TagKind::flexi);
    return row;
}

QString named(const char* name)
{
    return QString::fromLatin1(name);
}

/// A statement over the link rows of the item; the values of the row's key come first.
struct Keyed
{
    QString where;
    std::vector<Value> values;
};

Keyed key_of(const LinkTable& table, const LinkRow& row, const QString& alias = {})
{
    Keyed key{u"%1[%2]=?"_s.arg(alias, named(table.item)), {to_value(row.item)}};
    if (table.type) {
        key.where += u" AND %1[%2]=?"_s.arg(alias, named(table.type));
        key.values.push_back(to_value(row.type));
    }
    return key;
}

/// Why a person of the list is passed over.
enum class Skip { gone = 1, away, closed };

/// What a bulk change finds: whom it passes over, and who carries the item. Everybody else does not.
struct Findings
{
    QHash<int, Skip> skipped;
    QHash<int, BulkChange::Row> carried;
};

QHash<int, Skip> skipped_people(core::Office& office, TagKind kind)
{
    const auto away = office.mode == core::Mode::booked_out ? u"[active_in_book]=0"_s : u"[booked_out]=-1"_s;
    const auto in_away = u"p.[Surname_ID] IN (SELECT [Surname_ID] FROM [tbl_surname] WHERE %1)"_s.arg(away);
    const auto in_closed = u"p.[Surname_ID] IN (SELECT [surname_id] FROM [tbl_record_access] WHERE [%1]=0)"_s.arg(
        named(rule_of(kind).section));
    auto rows = office.session->select(
        u"SELECT w.[person_id],CASE WHEN p.[person_id] IS NULL THEN 1 WHEN %1 THEN 2 ELSE 3 END FROM [work_people] w "
        "LEFT JOIN [tbl_people] p ON p.[person_id]=w.[person_id] WHERE p.[person_id] IS NULL OR %1 OR %2;"_s.arg(
            in_away, in_closed));
    QHash<int, Skip> skipped;
    for (const core::Row& row : rows)
        skipped.insert(row.integer(core::Column{0}), static_cast<Skip>(row.integer(core::Column{1})));
    return skipped;
}

QString column_or_null(const char* name)
{
    return name ? u"[%1]"_s.arg(named(name)) : u"NULL"_s;
}

QHash<int, BulkChange::Row> carriers(core::Session& session, const TagItem& item)
{
    const LinkTable& table = table_of(item.kind);
    const Keyed key = key_of(table, row_of(item));
    auto rows = session.select_with(
        u"SELECT [person_id],%1,%2,%3,%4 FROM [%5] WHERE %6 AND [person_id] IN (SELECT [person_id] FROM [work_people]);"_s
            .arg(column_or_null(table.date), column_or_null(table.field), column_or_null(table.tagged),
                 column_or_null(table.position), named(table.table), key.where),
        key.values);
    QHash<int, BulkChange::Row> found;
    for (const core::Row& row : rows) {
        BulkChange::Row& carried = found[row.integer(core::Column{0})];
        carried = {row.integer(core::Column{0}), row_of(item), row.integer(core::Column{4})};
        carried.row.date = row.date(core::Column{1});
        carried.row.field = row.text(core::Column{2});
        carried.row.tagged = row.flag(core::Column{3});
    }
    return found;
}

/// Leaves the list lent in `work_people`.
Findings find(core::Office& office, const WorkingList& list, const TagItem& item)
{
    lend(*office.session, list);
    return {skipped_people(office, item.kind), carriers(*office.session, item)};
}

/// Whether something is lost when the row gets other content.
bool says_something(const LinkRow& row)
{
    return row.date || !row.field.isEmpty() || row.tagged;
}

/// Who gets a row, whose row gets other content, whose goes.
BulkChange plan(core::Office& office, const WorkingList& list, const TagItem& item, TagAct act)
{
    BulkChange change{.act = act, .item = item, .day = office.clock.today(), .count = {}, .added = {}, .before = {}};
    const LinkRow wanted = row_of(item);
    const Findings found = find(office, list, item);
    for (const auto& [person, family] : list.members) {
        if (const auto skip = found.skipped.find(person); skip != found.skipped.end()) {
            change.count.booked_out += *skip == Skip::away;
            change.count.closed += *skip == Skip::closed;
            continue;
        }
        const auto carried = found.carried.find(person);
        const bool carries = carried != found.carried.end();
        if (act == TagAct::give ? carries && carried->row == wanted : !carries) {
            ++change.count.as_it_was;
            continue;
        }
        ++change.count.changed;
        change.count.replaced += act == TagAct::give && carries && says_something(carried->row);
        if (carries)
            change.before.push_back(*carried);
        else
            change.added.push_back(person);
    }
    return change;
}

std::vector<int> people_of(const std::vector<BulkChange::Row>& rows)
{
    std::vector<int> people;
    std::ranges::transform(rows, std::back_inserter(people), &BulkChange::Row::person_id);
    return people;
}

/// The temporary table in which the people stand: that of the whole list where all of it is meant.
QString lend_people(core::Session& session, const std::vector<int>& people, int whole_list)
{
    if (std::ssize(people) == whole_list)
        return u"work_people"_s;
    std::vector<std::vector<Value>> rows;
    for (const int person : people)
        rows.push_back({to_value(person)});
    session.fill_temporary(u"work_tagged"_s, {u"person_id"_s}, rows);
    return u"work_tagged"_s;
}

void insert_rows(core::Session& session, const LinkTable& table, const std::vector<BulkChange::Row>& added)
{
    QStringList fields{u"person_id"_s, named(table.item)};
    if (table.type)
        fields += named(table.type);
    if (table.position)
        fields += named(table.position);
    for (const auto& content : content_of(table, {}))
        fields += named(content.name);
    std::vector<std::vector<Value>> rows;
    rows.reserve(added.size());
    for (const auto& [person, link, position] : added) {
        auto& row = rows.emplace_back();
        row.reserve(static_cast<std::size_t>(fields.size()));
        row.push_back(to_value(person));
        row.push_back(to_value(link.item));
        if (table.type)
            row.push_back(to_value(link.type));
        if (table.position)
            row.push_back(to_value(position));
        for (auto& content : content_of(table, link))
            row.push_back(std::move(content.value));
    }
    session.insert(named(table.table), fields, rows);
}

/// What a lent person's row gets in a field: a bound value, or the place after what the person carries already.
struct Filling
{
    const char* field;
    std::optional<Value> value; ///< Unset for the place.
};

QString expression(const Filling& filling, const LinkTable& table)
{
    if (!filling.value)
        return u"COALESCE((SELECT MAX(t.[%1]) FROM [%2] t WHERE t.[person_id]=w.[person_id]),0)+1"_s.arg(
            named(filling.field), named(table.table));
    return std::holds_alternative<qint64>(*filling.value) ? u"CAST(? AS BIGINT)"_s : u"CAST(? AS TEXT)"_s;
}

/// The same row for all these people, at the end of what each carries.
void add_rows(core::Session& session, const LinkTable& table, const LinkRow& row, const std::vector<int>& people,
              int whole_list)
{
    if (people.empty())
        return;
    std::vector<Filling> fillings{{table.item, to_value(row.item)}};
    if (table.type)
        fillings.push_back({table.type, to_value(row.type)});
    if (table.position)
        fillings.push_back({table.position, std::nullopt});
    for (auto& content : content_of(table, row))
        fillings.push_back({content.name, std::move(content.value)});
    QString fields = u"[person_id]"_s;
    QString selected = u"w.[person_id]"_s;
    std::vector<Value> values;
    for (const auto& filling : fillings) {
        fields += u",[%1]"_s.arg(named(filling.field));
        selected += u',' + expression(filling, table);
        if (filling.value)
            values.push_back(*filling.value);
    }
    session.execute_with(u"INSERT INTO [%1] (%2) SELECT %3 FROM [%4] w;"_s.arg(
                             named(table.table), fields, selected, lend_people(session, people, whole_list)),
                         values);
}

/// `whole_list` is the number of people who are lent in `work_people`.
void delete_rows(core::Session& session, const LinkTable& table, const LinkRow& row, const std::vector<int>& people,
                 int whole_list)
{
    if (people.empty())
        return;
    const Keyed key = key_of(table, row);
    session.execute_with(u"DELETE FROM [%1] WHERE %2 AND [person_id] IN (SELECT [person_id] FROM [%3]);"_s.arg(
                             named(table.table), key.where, lend_people(session, people, whole_list)),
                         key.values);
}

std::vector<Membership> memberships(const std::vector<int>& people, int group)
{
    std::vector<Membership> all;
    for (const int person : people)
        all.push_back({person, group});
    return all;
}

/// `whole_list` is the number of members of the list, those who are gone among them.
void carry_out(core::Session& session, const BulkChange& change, int whole_list)
{
    const LinkTable& table = table_of(change.item.kind);
    const LinkRow row = row_of(change.item);
    const auto had = people_of(change.before);
    if (change.item.kind == TagKind::group) {
        const bool giving = change.act == TagAct::give;
        write_group_history(session, giving ? memberships(change.added, row.item) : std::vector<Membership>{},
                            giving ? std::vector<Membership>{} : memberships(had, row.item), change.day);
    }
    delete_rows(session, table, row, had, whole_list);
    if (change.act == TagAct::take)
        return;
    auto rewritten = change.before;
    std::ranges::for_each(rewritten, [&](auto& each) { each.row = row; });
    insert_rows(session, table, rewritten);
    add_rows(session, table, row, change.added, whole_list);
}

bool refuse(const core::Office& office, const QString& text)
{
    office.dialogue.show({text});
    return false;
}

/// Whether the people's rows may be written at all.
bool may_write(core::Office& office)
{
    if (!core::permitted(office, core::Area::tagging) || !core::network_guard(office))
        return false;
    if (office.may(core::Area::read_only_family_data))
        return refuse(office, u"Unable to tag people as you only have read only access within family files"_s);
    return true;
}

bool may_tag(core::Office& office, const std::optional<WorkingList>& list, const TagItem& item, TagAct act)
{
    if (!may_write(office))
        return false;
    if (!list)
        return refuse(office, u"Unable to process the tagging function until you first select people to tag"_s);
    if (item.item == 0) {
        const auto begin =
            act == TagAct::give ? u"Unable to tag the people with a "_s : u"Unable to remove the people from the "_s;
        return refuse(office,
                      begin + QString::fromUtf16(rule_of(item.kind).words) + u" until you choose one from the list"_s);
    }
    if (list->members.empty())
        return refuse(office,
                      act == TagAct::give ? u"No people exist for tagging"_s : u"No people exist for un-tagging"_s);
    if (act == TagAct::give && item.lacks_date())
        return refuse(office, u"Please enter the date that the people are given"_s);
    return true;
}

QString counted(int people, const QString& one, const QString& many)
{
    return people == 1 ? one : many.arg(people);
}

/// The people whose rows are as the change left them.
std::vector<int> untouched(core::Office& office, const BulkChange& change, const std::vector<int>& people)
{
    WorkingList list;
    for (const int person : people)
        list.members.push_back({person, 0});
    std::optional<LinkRow> left;
    if (change.act == TagAct::give)
        left = row_of(change.item);
    std::vector<int> found;
    const Findings now = find(office, list, change.item);
    for (const int person : people) {
        if (now.skipped.contains(person))
            continue;
        const auto carried = now.carried.find(person);
        const auto row = carried == now.carried.end() ? std::nullopt : std::optional(carried->row);
        if (row == left)
            found.push_back(person);
    }
    std::ranges::sort(found);
    return found;
}

std::vector<int> among(const std::vector<int>& people, const std::vector<int>& sorted)
{
    std::vector<int> found;
    std::ranges::copy_if(people, std::back_inserter(found),
                         [&](int person) { return std::ranges::binary_search(sorted, person); });
    return found;
}

} // namespace

QString TagCount::words() const
{
    QStringList parts;
    if (replaced == 0)
        parts += counted(changed, u"1 person changes"_s, u"%1 people change"_s);
    else if (changed > replaced)
        parts += counted(changed - replaced, u"1 person gets it"_s, u"%1 people get it"_s);
    if (replaced > 0) {
        const QString who = parts.isEmpty() ? counted(replaced, u"1 person gets"_s, u"%1 people get"_s)
                                            : counted(replaced, u"1 gets"_s, u"%1 get"_s);
        parts += who + u" it in place of another value or mark"_s;
    }
    if (as_it_was > 0)
        parts += counted(as_it_was, u"1 stays as it is"_s, u"%1 stay as they are"_s);
    if (booked_out > 0)
        parts += u"%1 in booked out families skipped"_s.arg(booked_out);
    if (closed > 0)
        parts += u"%1 in closed family files skipped"_s.arg(closed);
    return parts.join(u", "_s);
}

TagCount count_tagging(core::Office& office, const WorkingList& list, const TagItem& item, TagAct act)
{
    return plan(office, list, item, act).count;
}

std::optional<BulkChange> tag(core::Office& office, const std::optional<WorkingList>& list, const TagItem& item,
                              TagAct act)
{
    if (!may_tag(office, list, item, act))
        return std::nullopt;
    core::Transaction transaction(*office.session);
    const auto change = plan(office, *list, item, act);
    carry_out(*office.session, change, static_cast<int>(list->members.size()));
    transaction.commit();
    if (change.count.people() == 0) {
        office.dialogue.show({u"No people have been found for tagging"_s});
        return std::nullopt;
    }
    office.dialogue.show(
        core::information(u"The tagging operation has successfully been completed"_s, change.count.words()));
    return change;
}

std::optional<int> undo_tagging(core::Office& office, const BulkChange& change)
{
    if (!may_write(office))
        return std::nullopt;
    core::Session& session = *office.session;
    const LinkTable& table = table_of(change.item.kind);
    const LinkRow row = row_of(change.item);
    auto had = people_of(change.before);
    auto all = had;
    all.insert(all.end(), change.added.begin(), change.added.end());

    core::Transaction transaction(session);
    const auto as_left = untouched(office, change, all);
    had = among(had, as_left);
    const auto added = among(change.added, as_left);
    if (change.act == TagAct::give) {
        const auto whole_list = static_cast<int>(all.size());
        delete_rows(session, table, row, added, whole_list);
        delete_rows(session, table, row, had, whole_list);
    }
    std::vector<BulkChange::Row> restored;
    std::ranges::copy_if(change.before, std::back_inserter(restored), [&](const BulkChange::Row& each) {
        return std::ranges::binary_search(as_left, each.person_id);
    });
    insert_rows(session, table, restored);
    if (change.item.kind == TagKind::group) {
        const bool giving = change.act == TagAct::give;
        take_back_group_history(session, memberships(giving ? added : had, row.item),
                                giving ? HistoryAct::joining : HistoryAct::leaving, change.day);
    }
    transaction.commit();
    return static_cast<int>(all.size() - as_left.size());
}

} // namespace kindrel::people
