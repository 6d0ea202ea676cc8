#include "people/saved_filters.h"

#include "core/entry.h"
#include "core/open_church.h"
#include "people/filter_json.h"
#include "people/filter_texts.h"
#include "people/sort_key.h"

#include <algorithm>
#include <tuple>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

bool refuse(const core::Office& office, const QString& words)
{
    office.dialogue.show({words});
    return false;
}

bool fits(const core::Office& office, const QString& name)
{
    if (name.isEmpty())
        return refuse(office, u"Please enter a name for this filter"_s);
    if (name.size() > longest_setup_text)
        return refuse(office, u"Please enter no more than %1 characters"_s.arg(longest_setup_text));
    return core::network_guard(office);
}

/// The saved filter that bears the name.
std::optional<SavedFilter> named(core::Session& session, const QString& name)
{
    const auto all = saved_filters(session);
    const auto same = std::ranges::find(all, sameness(name), [](const auto& saved) { return sameness(saved.name); });
    return same == all.end() ? std::nullopt : std::optional(*same);
}

bool may_replace(const core::Office& office, const SavedFilter& saved)
{
    const core::Message question{u"A filter named '%1' exists already, do you wish to replace it?"_s.arg(saved.name)};
    return office.dialogue.confirm(question, core::Answer::no);
}

/// The list has no counter of keys. Free for as long as the transaction that asks.
int next_key(core::Session& session)
{
    auto rows = session.select(u"SELECT MAX([filter_id]) FROM [tbl_filter_memory];"_s);
    return rows.first()->integer(core::Column{0}) + 1;
}

int insert_new(core::Session& session, const QString& name, const QString& content)
{
    core::Transaction transaction(session);
    const int key = next_key(session);
    session.execute(u"INSERT INTO [tbl_filter_memory] ([filter_id],[filter_name],[content]) VALUES (?,?,?);"_s, key,
                    name, content);
    transaction.commit();
    return key;
}

std::optional<QString> content_of(core::Session& session, int filter_id)
{
    auto rows = session.select(u"SELECT [content] FROM [tbl_filter_memory] WHERE [filter_id]=?;"_s, filter_id);
    const auto* row = rows.first();
    return row ? std::optional(row->text(core::Column{0})) : std::nullopt;
}

bool may_ask(const core::Office& office, const Filter& filter)
{
    return (!asks_for_birth_dates(filter) || core::permitted(office, core::Area::birth_dates)) &&
           (!asks_for_visits(filter) || core::permitted(office, core::Area::visitation_tab));
}

QString words_of(FilterFault fault)
{
    if (fault == FilterFault::newer)
        return u"Unable to use this filter as it was saved by a newer version of the program"_s;
    return u"Unable to use this filter as it cannot be read, please create it again"_s;
}

} // namespace

std::vector<SavedFilter> saved_filters(core::Session& session)
{
    auto rows = session.select(u"SELECT [filter_id],[filter_name] FROM [tbl_filter_memory];"_s);
    std::vector<SavedFilter> all;
    for (const core::Row& row : rows)
        all.push_back({row.integer(core::Column{0}), row.text(core::Column{1})});
    std::ranges::sort(all, {}, [](const auto& saved) { return std::tuple(sort_key(saved.name), saved.filter_id); });
    return all;
}

std::optional<int> save_filter(core::Office& office, const QString& name, const Filter& filter)
{
    const auto tidied = tidy(name);
    if (!fits(office, tidied))
        return std::nullopt;
    auto& session = *office.session;
    const auto content = QString::fromUtf8(to_json(filter));
    const auto existing = named(session, tidied);
    if (!existing)
        return insert_new(session, tidied, content);
    if (!may_replace(office, *existing))
        return std::nullopt;
    // While the question stood, its key may have gone to another filter.
    const int touched = session.execute(
        u"UPDATE [tbl_filter_memory] SET [filter_name]=?,[content]=? WHERE [filter_id]=? AND [filter_name]=?;"_s,
        tidied, content, existing->filter_id, existing->name);
    return touched > 0 ? existing->filter_id : insert_new(session, tidied, content);
}

std::optional<Filter> load_filter(core::Office& office, int filter_id)
{
    const auto content = content_of(*office.session, filter_id);
    if (!content) {
        office.dialogue.show({u"Unable to use this filter as another user has removed it"_s});
        return std::nullopt;
    }
    auto read = filter_from_json(content->toUtf8());
    if (read.fault) {
        office.dialogue.show({words_of(*read.fault)});
        return std::nullopt;
    }
    if (!may_ask(office, read.filter))
        return std::nullopt;
    refresh_texts(*office.session, read.filter);
    return std::move(read.filter);
}

bool replace_filter(core::Office& office, const SavedFilter& saved, const Filter& filter)
{
    if (!core::network_guard(office))
        return false;
    const int touched = office.session->execute(
        u"UPDATE [tbl_filter_memory] SET [content]=? WHERE [filter_id]=? AND [filter_name]=?;"_s,
        QString::fromUtf8(to_json(filter)), saved.filter_id, saved.name);
    return touched > 0 || refuse(office, u"Unable to save this filter as another user has removed or renamed it"_s);
}

bool rename_filter(core::Office& office, const SavedFilter& saved, const QString& name)
{
    const auto tidied = tidy(name);
    if (!fits(office, tidied))
        return false;
    const auto other = named(*office.session, tidied);
    if (other && other->filter_id != saved.filter_id)
        return refuse(office, u"A filter with this name already exists"_s);
    const int touched = office.session->execute(
        u"UPDATE [tbl_filter_memory] SET [filter_name]=? WHERE [filter_id]=? AND [filter_name]=?;"_s, tidied,
        saved.filter_id, saved.name);
    return touched > 0 || refuse(office, u"Unable to rename this filter as another user has removed or renamed it"_s);
}

bool remove_filter(core::Office& office, const SavedFilter& saved)
{
    const core::Message question{u"Are you sure that you wish to delete the filter '%1'?"_s.arg(saved.name)};
    if (!core::network_guard(office) || !office.dialogue.confirm(question, core::Answer::no))
        return false;
    const int touched = office.session->execute(
        u"DELETE FROM [tbl_filter_memory] WHERE [filter_id]=? AND [filter_name]=?;"_s, saved.filter_id, saved.name);
    return touched > 0 || refuse(office, u"Unable to remove this filter as another user has removed or renamed it"_s);
}

} // namespace kindrel::people
