#include "people/move_items.h"

#include "people/link_tables.h"
#include "people/setup_rows.h"

#include <QSet>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::Session;

std::size_t place_of(SetupKind kind)
{
    return static_cast<std::size_t>(kind);
}

SetupKind kind_behind(const LinkTable& table)
{
    return std::ranges::find(setup_lists(), QByteArrayView(table.table),
                             [](const SetupList& list) { return QByteArrayView(list.carriers.table); })
        ->kind;
}

template <class Visit>
void visit_links(const LinkTable& table, std::vector<LinkRow>& rows, const Visit& visit)
{
    const auto kind = kind_behind(table);
    for (auto& row : rows)
        visit(kind, SetupItem{.key = row.item, .text = row.text}, row.item);
}

/// Calls `visit` with the list and the item of every place of the file, and with the key that stands there.
template <class Visit>
void visit_items(FamilyFile& file, const Visit& visit)
{
    for (auto& person : file.people) {
        for (const auto& link : person_links())
            visit_links(link.table, person.*link.rows, visit);
        int title = 0; // Stored as text.
        if (!person.Title.isEmpty())
            visit(SetupKind::titles, SetupItem{.text = person.Title}, title);
    }
    for (const auto& link : family_links())
        visit_links(link.table, file.*link.rows, visit);
    for (auto* suburb : {&file.residential, &file.postal}) {
        if (!*suburb || (*suburb)->suburb.isEmpty())
            continue;
        auto& chosen = **suburb;
        visit(SetupKind::suburbs, {.key = chosen.suburb_id, .text = chosen.suburb, .postcode = chosen.postcode},
              chosen.suburb_id);
    }
}

std::vector<SetupItem> absent(const std::vector<SetupItem>& items, const std::vector<SetupRow>& rows)
{
    QSet<QString> known;
    for (const auto& row : rows)
        known.insert(sameness(row.item));
    std::vector<SetupItem> found;
    std::ranges::remove_copy_if(items, std::back_inserter(found),
                                [&](const SetupItem& item) { return known.contains(sameness(item)); });
    return found;
}

/// Adds at the list's end what it lacks; returns the whole list.
std::vector<SetupRow> complete(Session& there, const SetupList& list, const std::vector<SetupItem>& items)
{
    auto rows = read_setup_rows(there, list);
    auto added = absent(items, rows);
    std::vector<int> keys;
    // Read again once there is a key: its counter is held until the end, so that nobody adds the same text meanwhile.
    while (added.size() > keys.size()) {
        const auto more = added.size() - keys.size();
        int key = there.allocate(list.entity, static_cast<int>(more));
        for (std::size_t i = 0; i < more; ++i)
            keys.push_back(key++);
        rows = read_setup_rows(there, list);
        added = absent(items, rows);
    }
    int position = 0;
    for (const auto& row : rows)
        position = std::max(position, row.position);
    const auto known = rows.size();
    for (auto key = keys.begin(); auto& item : added) {
        item.key = *key++;
        rows.push_back({std::move(item), ++position});
    }
    if (rows.size() > known)
        insert_setup_rows(there, list, std::span(rows).subspan(known));
    return rows;
}

ItemKeys keys_in(const std::vector<SetupRow>& rows)
{
    ItemKeys keys;
    for (const auto& row : rows) {
        if (const auto text = sameness(row.item); !keys.contains(text))
            keys.insert(text, row.item.key);
    }
    return keys;
}

/// Two items of one church may be one in the other.
void drop_doubles(std::vector<LinkRow>& rows)
{
    QSet<std::pair<int, int>> seen;
    std::erase_if(rows, [&](const LinkRow& row) {
        const auto before = seen.size();
        seen.insert({row.item, row.type});
        return seen.size() == before;
    });
}

} // namespace

CarriedItems carried_items(Session& here, FamilyFile file)
{
    CarriedItems items;
    visit_items(file, [&](SetupKind kind, const SetupItem& item, int) {
        auto& of_kind = items[place_of(kind)];
        const auto same = [&](const SetupItem& other) {
            return sameness(other) == sameness(item);
        };
        if (std::ranges::none_of(of_kind, same))
            of_kind.push_back(item);
    });
    auto& groups = items[place_of(SetupKind::groups)];
    if (groups.empty())
        return items;
    const auto listed = read_setup_items(here, SetupKind::groups);
    for (auto& group : groups) {
        const auto found = std::ranges::find(listed, group.key, &SetupItem::key);
        group.not_active = found != listed.end() && found->not_active;
    }
    return items;
}

CarriedItems missing_items(Session& there, const CarriedItems& items)
{
    CarriedItems missing;
    for (const auto& list : setup_lists()) {
        const auto& carried = items[place_of(list.kind)];
        if (!carried.empty())
            missing[place_of(list.kind)] = absent(carried, read_setup_rows(there, list));
    }
    return missing;
}

ItemKeys translate_items(Session& there, const CarriedItems& items, FamilyFile& file)
{
    std::array<ItemKeys, setup_list_count> keys;
    for (const auto& list : setup_lists()) {
        const auto& carried = items[place_of(list.kind)];
        if (!carried.empty() || list.kind == SetupKind::groups)
            keys[place_of(list.kind)] = keys_in(complete(there, list, carried));
    }
    for (auto* suburb : {&file.residential, &file.postal}) {
        if (*suburb)
            (*suburb)->suburb_id *= !(*suburb)->suburb.isEmpty();
    }
    visit_items(file, [&](SetupKind kind, const SetupItem& item, int& key) {
        key = keys[place_of(kind)].value(sameness(item));
    });
    for (auto& person : file.people) {
        for (const auto& link : person_links())
            drop_doubles(person.*link.rows);
    }
    for (const auto& link : family_links())
        drop_doubles(file.*link.rows);
    return keys[place_of(SetupKind::groups)];
}

} // namespace kindrel::people
