#include "registers/project_rows.h"

#include "core/locks.h"
#include "core/removal.h"

#include <QHash>

#include <algorithm>

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

using core::Column;
using core::Session;
using core::to_value;
using core::Value;
using Items = std::vector<ProjectItem>;

/// The fields of `tbl_roll_setup` that setup writes: services, absences and include flags, in this order.
QStringList setup_fields()
{
    QStringList fields;
    for (int service = 1; service <= service_count; ++service)
        fields += u"service%1"_s.arg(service);
    for (int absence = 1; absence <= absence_count; ++absence)
        fields += u"absent%1"_s.arg(absence);
    for (int absence = 1; absence <= absence_count; ++absence)
        fields += u"include%1"_s.arg(absence);
    return fields;
}

std::vector<Value> setup_values(const ProjectItem& item)
{
    std::vector<Value> values;
    for (const auto& service : item.services)
        values.push_back(to_value(service));
    for (const auto& absence : item.absences)
        values.push_back(to_value(absence));
    for (const bool include : item.include)
        values.push_back(to_value(include));
    return values;
}

Items read_names(Session& session, const RegisterKind& kind)
{
    auto rows = session.select(u"SELECT %1,%2 FROM %3 ORDER BY [position],%1;"_s.arg(
        named(kind.project_key), named(kind.project_name), named(kind.projects_query)));
    Items items;
    for (const core::Row& row : rows) {
        auto& item = items.emplace_back();
        item.key = row.integer(Column{0});
        item.name = row.text(Column{1});
    }
    return items;
}

QHash<int, ProjectItem*> by_key(Items& items)
{
    QHash<int, ProjectItem*> places;
    for (auto& item : items)
        places.insert(item.key, &item);
    return places;
}

void read_roll_setup(Session& session, Items& items)
{
    const auto places = by_key(items);
    auto rows =
        session.select(u"SELECT [roll_project_id],[%1] FROM [tbl_roll_setup];"_s.arg(setup_fields().join(u"],["_s)));
    for (const core::Row& row : rows) {
        auto* item = places.value(row.integer(Column{0}));
        if (!item)
            continue;
        int column = 0;
        for (auto& service : item->services)
            service = row.text(Column{++column});
        for (auto& absence : item->absences)
            absence = row.text(Column{++column});
        for (auto& include : item->include)
            include = row.flag(Column{++column});
    }
}

void read_weekly_categories(Session& session, Items& items)
{
    const auto places = by_key(items);
    auto rows = session.select(u"SELECT [weekly_project_id],[group_id],[group],[group_type] FROM [qry_weekly_load] "
                               "ORDER BY [weekly_project_id],[group_type],[position],[group_id];"_s);
    for (const core::Row& row : rows) {
        if (auto* item = places.value(row.integer(Column{0})))
            item->categories(static_cast<FigureKind>(row.integer(Column{3})))
                .push_back({row.integer(Column{1}), row.text(Column{2})});
    }
}

/// Keys of items that are among `before` and not among `after`.
template <class List>
std::vector<int> gone(const List& before, const List& after)
{
    std::vector<int> keys;
    for (const auto& item : before) {
        if (std::ranges::find(after, item.key, &List::value_type::key) == after.end())
            keys.push_back(item.key);
    }
    return keys;
}

std::vector<CategoryItem> all_categories(const Items& items)
{
    std::vector<CategoryItem> all;
    for (const auto& item : items) {
        std::ranges::copy(item.attendance, std::back_inserter(all));
        std::ranges::copy(item.finance, std::back_inserter(all));
    }
    return all;
}

void remove_projects(core::Office& office, const RegisterKind& kind, const std::vector<int>& keys)
{
    Session& session = *office.session;
    core::remove_entities(session, kind.project_entity, keys);
    for (const int key : keys) {
        core::Locks(office).unlock(kind.lock, key);
        for (const auto* field : {kind.entry_position, kind.output_position})
            session.execute(u"UPDATE [tbl_project_position] SET %1=? WHERE %1=?;"_s.arg(named(field)), Value{}, key);
    }
}

void write_names(Session& session, const RegisterKind& kind, const Items& items)
{
    std::vector<std::vector<Value>> rows;
    for (const auto& item : items)
        rows.push_back({to_value(item.key), to_value(item.name), to_value(rows.size() + 1)});
    const auto table = QString::fromUtf16(kind.project_table);
    session.execute(u"DELETE FROM [%1];"_s.arg(table));
    session.insert(table, {QString::fromUtf16(kind.project_key), QString::fromUtf16(kind.project_name), u"position"_s},
                   rows);
}

/// Row by row, for the presets of a project stand in the same row.
void write_roll_setup(Session& session, const Items& items)
{
    const auto fields = setup_fields();
    const auto update = u"UPDATE [tbl_roll_setup] SET [%1]=? WHERE [roll_project_id]=?;"_s.arg(fields.join(u"]=?,["_s));
    for (const auto& item : items) {
        auto values = setup_values(item);
        values.push_back(to_value(item.key));
        if (session.execute_with(update, values) == 0)
            session.insert(u"tbl_roll_setup"_s, fields + QStringList{u"roll_project_id"_s}, std::array{values});
    }
}

void add_category_rows(std::vector<std::vector<Value>>& rows, const ProjectItem& project, FigureKind kind,
                       const std::vector<CategoryItem>& categories)
{
    for (int position = 0; const auto& category : categories)
        rows.push_back({to_value(category.key), to_value(category.name), to_value(++position), to_value(kind),
                        to_value(project.key)});
}

void write_categories(Session& session, const Items& stored, const Items& items)
{
    core::remove_entities(session, core::Entity::weekly_group, gone(all_categories(stored), all_categories(items)));
    std::vector<std::vector<Value>> rows;
    for (const auto& item : items) {
        add_category_rows(rows, item, FigureKind::attendance, item.attendance);
        add_category_rows(rows, item, FigureKind::money, item.finance);
    }
    session.execute(u"DELETE FROM [tbl_weekly_group];"_s);
    session.insert(u"tbl_weekly_group"_s,
                   {u"group_id"_s, u"group"_s, u"position"_s, u"group_type"_s, u"weekly_project_id"_s}, rows);
}

} // namespace

std::vector<ProjectItem> read_project_items(Session& session, Kind kind)
{
    auto items = read_names(session, register_kind(kind));
    if (kind == Kind::roll)
        read_roll_setup(session, items);
    if (kind == Kind::weekly)
        read_weekly_categories(session, items);
    return items;
}

void give_keys(Session& session, Kind kind, std::vector<ProjectItem>& items)
{
    std::vector<int*> projects, categories;
    for (auto& item : items) {
        if (item.key == 0)
            projects.push_back(&item.key);
        for (auto* list : {&item.attendance, &item.finance}) {
            for (auto& category : *list) {
                if (category.key == 0)
                    categories.push_back(&category.key);
            }
        }
    }
    const auto give = [&](core::Entity entity, const std::vector<int*>& keys) {
        int next = keys.empty() ? 0 : session.allocate(entity, static_cast<int>(keys.size()));
        for (int* key : keys)
            *key = next++;
    };
    give(register_kind(kind).project_entity, projects);
    give(core::Entity::weekly_group, categories);
}

void write_project_items(core::Office& office, Kind kind, const std::vector<ProjectItem>& stored,
                         const std::vector<ProjectItem>& items)
{
    const auto& names = register_kind(kind);
    Session& session = *office.session;
    remove_projects(office, names, gone(stored, items));
    write_names(session, names, items);
    if (kind == Kind::roll)
        write_roll_setup(session, items);
    if (kind == Kind::weekly)
        write_categories(session, stored, items);
}

} // namespace kindrel::registers
