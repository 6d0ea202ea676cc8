#include "people/family_store.h"

#include "core/removal.h"
#include "people/family_checks.h"
#include "people/family_rows.h"
#include "people/fields.h"
#include "people/group_history.h"
#include "people/person_files.h"

#include <algorithm>
#include <array>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::Entity;
using core::Session;
using core::to_value;

void number_positions(FamilyFile& file)
{
    for (int position = 0; auto& person : file.people) {
        person.position = ++position;
        person.Surname_ID = file.family.Surname_ID;
    }
    file.family.Primary_name = file.people.empty() ? QString() : file.people.front().Name;
}

/// Gives the new people of the files keys that follow each other, in one allocation.
void allocate_people(Session& session, std::span<FamilyFile> files)
{
    std::vector<Person*> added;
    for (auto& file : files) {
        for (auto& person : file.people) {
            if (person.person_id == 0)
                added.push_back(&person);
        }
    }
    if (added.empty())
        return;
    int key = session.allocate(Entity::person, static_cast<int>(added.size()));
    for (auto* person : added)
        person->person_id = key++;
}

std::vector<Membership> memberships_of(const FamilyFile& file)
{
    std::vector<Membership> found;
    for (const auto& person : file.people) {
        for (const auto& group : person.groups)
            found.push_back({person.person_id, group.item});
    }
    std::ranges::sort(found);
    return found;
}

std::vector<Membership> stored_memberships(Session& session, int surname_id)
{
    auto rows = session.select(u"SELECT [person_id],[group_id] FROM [tbl_group] WHERE [person_id] IN "
                               "(SELECT [person_id] FROM [tbl_people] WHERE [Surname_ID]=?);"_s,
                               surname_id);
    std::vector<Membership> found;
    for (const core::Row& row : rows)
        found.push_back({row.integer(core::Column{0}), row.integer(core::Column{1})});
    std::ranges::sort(found);
    return found;
}

void write_joined_and_left(Session& session, const FamilyFile& file, const QDate& today)
{
    const auto before = stored_memberships(session, file.family.Surname_ID);
    const auto after = memberships_of(file);
    std::vector<Membership> joined;
    std::vector<Membership> left;
    std::ranges::set_difference(after, before, std::back_inserter(joined));
    std::ranges::set_difference(before, after, std::back_inserter(left));
    write_group_history(session, joined, left, today);
}

/// The stored people of the family that the file no longer holds.
std::vector<int> removed_people(Session& session, const FamilyFile& file)
{
    auto rows = session.select(u"SELECT [person_id] FROM [tbl_people] WHERE [Surname_ID]=?;"_s, file.family.Surname_ID);
    std::vector<int> removed;
    for (const core::Row& row : rows) {
        const int key = row.integer(core::Column{0});
        if (std::ranges::find(file.people, key, &Person::person_id) == file.people.end())
            removed.push_back(key);
    }
    return removed;
}

void rewrite_family(Session& session, const FamilyFile& file, const QDate& today)
{
    if (!update_family_row(session, file.family))
        throw core::DatabaseError(u"Family %1 is no longer in the database."_s.arg(file.family.Surname_ID));
    write_joined_and_left(session, file, today);
    core::remove_entities(session, Entity::person, removed_people(session, file));
    clear_family_rows(session, file.family.Surname_ID);
    FamilyRows rows;
    rows.add(file);
    rows.insert(session);
}

} // namespace

FamilyFile save_family(Session& session, FamilyFile file, const QDate& today)
{
    if (file.family.Surname_ID == 0) {
        std::vector<FamilyFile> files{std::move(file)};
        add_families(session, files, today);
        return std::move(files.front());
    }
    require_storable(file);
    allocate_people(session, {&file, 1});
    number_positions(file);
    file.family.last_edit = core::Date::from(today);
    core::Transaction transaction(session);
    rewrite_family(session, file, today);
    transaction.commit();
    return file;
}

void remove_family_rows(Session& session, int surname_id)
{
    core::Transaction transaction(session);
    core::remove_entities(session, Entity::surname, std::array{surname_id});
    transaction.commit();
}

void remove_family_files(const core::Office& office, const FamilyFile& file)
{
    auto files = files_of_family(file.family.Surname_ID);
    for (const auto& person : file.people)
        std::ranges::move(files_of_person(person.person_id), std::back_inserter(files));
    remove_files(office.paths, files);
}

void remove_stored_family(core::Office& office, const FamilyFile& file)
{
    remove_family_rows(*office.session, file.family.Surname_ID);
    remove_family_files(office, file);
}

void add_visit(Session& session, int surname_id, const Visit& visit)
{
    QStringList fields{u"surname_id"_s};
    append_names(fields, visit_fields());
    std::vector<std::vector<core::Value>> rows{{to_value(surname_id)}};
    append_values(rows.front(), visit, visit_fields());
    session.insert(u"tbl_visitation"_s, fields, rows);
}

void add_families(Session& session, std::vector<FamilyFile>& files, const QDate& today)
{
    if (files.empty())
        return;
    std::ranges::for_each(files, require_storable);
    int key = session.allocate(Entity::surname, static_cast<int>(files.size()));
    allocate_people(session, files);
    FamilyRows rows;
    std::vector<Membership> joined;
    for (auto& file : files) {
        file.family.Surname_ID = key++;
        file.family.created = file.family.created.value_or(core::Date::from(today));
        file.family.last_edit = core::Date::from(today);
        number_positions(file);
        rows.add_new(file);
        std::ranges::copy(memberships_of(file), std::back_inserter(joined));
    }
    core::Transaction transaction(session);
    rows.insert(session);
    write_group_history(session, joined, {}, today);
    transaction.commit();
}

} // namespace kindrel::people
