#include "people/setup_editor.h"

#include "core/entry.h"
#include "core/open_church.h"
#include "people/setup_import.h"
#include "people/setup_rows.h"
#include "people/sort_key.h"

#include <QSet>

#include <tuple>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::Answer;
using core::Message;

SetupItem made_of(SetupItem item, SetupKind kind, const QString& text, const QString& postcode)
{
    item.text = tidy(text);
    if (kind == SetupKind::suburbs)
        item.postcode = tidy(postcode);
    return item;
}

/// As the list shows it: a suburb with its postcode.
QString shown(const SetupItem& item)
{
    return item.postcode.isEmpty() ? item.text : item.text + u' ' + item.postcode;
}

QString number_of_users(const SetupList& list, int users)
{
    if (list.of_families())
        return users == 1 ? u"1 family"_s : u"%1 families"_s.arg(users);
    return users == 1 ? u"1 person"_s : u"%1 people"_s.arg(users);
}

/// Who carries an item that is to go, and what becomes of that; empty when nobody does.
QString told_of_users(const SetupList& list, const SetupItem& item)
{
    if (item.users == 0)
        return {};
    const auto carried = u"Carried by %1. "_s.arg(number_of_users(list, item.users));
    if (list.kind == SetupKind::groups)
        return carried + u"They leave it when the list is saved, and their history keeps it."_s;
    return carried +
           (list.carriers.by_text ? u"It stays with them."_s : u"It is taken from them when the list is saved."_s);
}

Message removal_question(const SetupList& list, const SetupItem& item)
{
    const auto users = told_of_users(list, item);
    if (list.kind != SetupKind::suburbs)
        return {u"Please confirm that you wish to remove this item '%1'"_s.arg(item.text), users};
    return {u"Please confirm that you wish to remove this suburb"_s,
            users.isEmpty() ? shown(item) : shown(item) + u'\n' + users};
}

/// What to say of an empty suburb, postcode or any other item, when adding one and when renaming one.
struct Missing
{
    QStringView suburb, postcode, item;
};
constexpr Missing missing_to_add{u"Please enter a suburb before attempting to add a new suburb to the list",
                                 u"Please enter a suburb postcode before attempting to add a new suburb to the list",
                                 u"Please enter an item before attempting to add a new item to the list"};
constexpr Missing missing_to_rename{u"Please enter a suburb", u"Please enter a postcode", u"Please enter an item"};

/// Null when nothing is missing.
QStringView missing(SetupKind kind, const SetupItem& item, const Missing& words)
{
    if (item.text.isEmpty())
        return kind == SetupKind::suburbs ? words.suburb : words.item;
    return kind == SetupKind::suburbs && item.postcode.isEmpty() ? words.postcode : QStringView();
}

} // namespace

QString ImportCount::words() const
{
    const auto words = added == 1 ? u"1 item was added"_s : u"%1 items were added"_s.arg(added);
    if (existing == 0)
        return words + u'.';
    return words + (existing == 1 ? u", 1 exists already."_s : u", %1 exist already."_s.arg(existing));
}

SetupEditor::SetupEditor(core::Office& office) : m_office(office)
{
    for (const auto& list : setup_lists())
        at(list.kind) = List(read_setup_items_with_users(*office.session, list.kind));
}

QString SetupEditor::count_line(SetupKind kind) const
{
    return u"%1 items exist"_s.arg(list(kind).size());
}

bool SetupEditor::refuse(const Message& message) const
{
    m_office.dialogue.show(message);
    return false;
}

bool SetupEditor::fits(SetupKind kind, const SetupItem& item, int except) const
{
    if (const auto message = too_long(item))
        return refuse(*message);
    const auto same = sameness(item);
    const auto& items = list(kind);
    for (int index = 0; index < items.size(); ++index) {
        if (index != except && sameness(items[index]) == same)
            return refuse({kind == SetupKind::suburbs ? u"This suburb already exists in the list"_s
                                                      : u"This item already exists in the list"_s,
                           shown(items[index])});
    }
    return true;
}

bool SetupEditor::add(SetupKind kind, const QString& text, const QString& postcode)
{
    auto item = made_of({}, kind, text, postcode);
    if (const auto words = missing(kind, item, missing_to_add); !words.isNull())
        return refuse({words.toString()});
    if (!fits(kind, item, -1))
        return false;
    at(kind).add(std::move(item));
    return true;
}

bool SetupEditor::rename(SetupKind kind, int index, const QString& text, const QString& postcode)
{
    if (!list(kind).holds(index))
        return refuse({u"Please select an item for renaming"_s});
    auto item = made_of(list(kind)[index], kind, text, postcode);
    if (const auto words = missing(kind, item, missing_to_rename); !words.isNull())
        return refuse({words.toString()});
    if (!fits(kind, item, index))
        return false;
    at(kind).replace(index, std::move(item));
    return true;
}

bool SetupEditor::remove(SetupKind kind, int index)
{
    if (list(kind).empty())
        return refuse({u"Unable to remove any items until you first add a new item"_s});
    if (!list(kind).holds(index))
        return refuse({u"Please select an item for removing"_s});
    const auto& item = list(kind)[index];
    if (!m_office.dialogue.confirm(removal_question(setup_list(kind), item), Answer::no))
        return false;
    const bool has_members = kind == SetupKind::groups && item.users > 0;
    if (has_members && !m_office.dialogue.confirm({u"Do you wish to remove everybody attached to this group?"_s,
                                                   told_of_users(setup_list(kind), item)},
                                                  Answer::no))
        return false;
    at(kind).remove(index);
    return true;
}

bool SetupEditor::move_up(SetupKind kind, int index)
{
    if (!list(kind).holds(index))
        return refuse({u"Please select an item for moving"_s});
    return at(kind).move_up(index) || refuse({u"This is the highest position this item can be moved to"_s});
}

bool SetupEditor::move_down(SetupKind kind, int index)
{
    if (!list(kind).holds(index))
        return refuse({u"Please select an item for moving"_s});
    return at(kind).move_down(index) || refuse({u"This is the lowest position this item can be moved to"_s});
}

bool SetupEditor::sort(SetupKind kind)
{
    if (list(kind).size() < 2)
        return refuse({u"Not Enough groups available to conduct a sort"_s});
    const Message question{u"Please confirm that you wish to sort this group into an alphabetical order."_s};
    if (!m_office.dialogue.confirm(question, Answer::no))
        return false;
    at(kind).sort_by([](const SetupItem& item) { return std::tuple(sort_key(item.text), item.text, item.postcode); });
    return true;
}

bool SetupEditor::set_not_active(int group_index, bool not_active)
{
    auto& groups = at(SetupKind::groups);
    if (!groups.holds(group_index))
        return refuse({u"Please select a group first"_s});
    auto group = groups[group_index];
    group.not_active = not_active;
    groups.replace(group_index, std::move(group));
    return true;
}

std::optional<ImportCount> SetupEditor::import(SetupKind kind)
{
    const auto file = m_office.dialogue.choose_file({.title = u"Import %1"_s.arg(setup_list(kind).caption),
                                                     .filter = u"Text files (*.txt *.csv);;All files (*)"_s,
                                                     .suggested = {}});
    return file ? import_file(kind, *file) : std::nullopt;
}

std::optional<ImportCount> SetupEditor::import_file(SetupKind kind, const QString& file)
{
    auto items = read_setup_file(m_office.dialogue, kind, file);
    if (!items)
        return std::nullopt;
    QSet<QString> existing;
    for (const auto& item : list(kind))
        existing.insert(sameness(item));
    ImportCount count;
    for (auto& item : *items) {
        if (existing.contains(sameness(item))) {
            ++count.existing;
        } else {
            at(kind).add(std::move(item));
            ++count.added;
        }
    }
    return count;
}

std::optional<int> SetupEditor::group_for_details(int group_index)
{
    const auto& groups = list(SetupKind::groups);
    if (!groups.holds(group_index)) {
        m_office.dialogue.show({u"Please select a group first"_s});
        return std::nullopt;
    }
    if (groups[group_index].key == 0) {
        const Message question{u"Unable to access this groups details as this is a new group and needs to be created "
                               "and saved first. Save this group now and then access this groups details?"_s};
        if (!m_office.dialogue.confirm(question, Answer::no) || !may_save())
            return std::nullopt;
        save_list(SetupKind::groups);
    }
    return groups[group_index].key;
}

bool SetupEditor::altered() const
{
    return std::ranges::any_of(m_lists, &List::altered);
}

void SetupEditor::drop()
{
    for (auto& items : m_lists)
        items = List(items.stored());
}

bool SetupEditor::may_save() const
{
    return core::permitted(m_office, core::Area::family_file_setup) && core::network_guard(m_office);
}

bool SetupEditor::save()
{
    if (!may_save())
        return false;
    for (const auto& list : setup_lists())
        save_list(list.kind);
    return true;
}

void SetupEditor::save_list(SetupKind kind)
{
    auto& items = at(kind);
    if (items.altered())
        items = List(save_setup_list(*m_office.session, setup_list(kind), items, m_office.clock.today()));
}

} // namespace kindrel::people
