#include "people/move_arrival.h"

#include "core/removal.h"
#include "people/family_rows.h"
#include "people/family_store.h"

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::Entity;
using core::Session;
using core::to_value;

/// The PINs of the file that are in use there by others than the people of the passage.
QSet<QString> taken_pins(Session& there, const FamilyFile& file, const Passage& passage)
{
    std::vector<core::Value> pins;
    for (const auto& person : file.people) {
        if (!person.personal_pin.isEmpty())
            pins.push_back(to_value(person.personal_pin));
    }
    QSet<QString> taken;
    if (pins.empty())
        return taken;
    const auto arriving = passage.people.values();
    auto rows =
        there.select_with(u"SELECT [person_id],[personal_pin] FROM [tbl_pin] WHERE [personal_pin] IN (%1);"_s.arg(
                              places_for(static_cast<qsizetype>(pins.size()))),
                          pins);
    for (const core::Row& row : rows) {
        if (!arriving.contains(row.integer(core::Column{0})))
            taken.insert(row.text(core::Column{1}));
    }
    return taken;
}

/// The file under its new keys. Its booking state stays behind.
FamilyFile addressed(FamilyFile file, const Passage& passage, const QDate& today)
{
    auto& family = file.family;
    family.Surname_ID = passage.to;
    family.last_edit = core::Date::from(today);
    family.booked_out = family.active_in_book = false;
    family.booked_out_date.reset();
    family.booked_out_person.clear();
    for (int position = 0; auto& person : file.people) {
        person.person_id = passage.people.value(person.person_id);
        person.Surname_ID = passage.to;
        person.position = ++position;
    }
    return file;
}

/// Keys for the past groups that the other church does not have: it shows them as groups that were removed.
ItemKeys keys_of_past_groups(Session& there, const std::vector<HistoryEntry>& history, const ItemKeys& groups)
{
    ItemKeys past;
    for (const auto& entry : history) {
        if (const auto text = sameness(entry.group); !groups.contains(text))
            past.insert(text, 0);
    }
    if (past.isEmpty())
        return past;
    int key = there.allocate(Entity::group, static_cast<int>(past.size()));
    for (auto& group : past)
        group = key++;
    return past;
}

void write_history(Session& there, const std::vector<HistoryEntry>& history, const Passage& passage,
                   const ItemKeys& groups)
{
    if (history.empty())
        return;
    const auto past = keys_of_past_groups(there, history, groups);
    int key = there.allocate(Entity::history, static_cast<int>(history.size()));
    std::vector<std::vector<core::Value>> rows;
    // The latest joining comes first; keys rise with time.
    for (auto entry = history.rbegin(); entry != history.rend(); ++entry) {
        const auto text = sameness(entry->group);
        const bool removed = past.contains(text);
        rows.push_back({to_value(key++), to_value(passage.people.value(entry->person_id)),
                        to_value(removed ? past.value(text) : groups.value(text)),
                        removed ? to_value(entry->group) : core::Value{}, to_value(entry->date_in),
                        to_value(entry->date_out), to_value(entry->completed)});
    }
    there.insert(
        u"tbl_group_history"_s,
        {u"history_id"_s, u"person_id"_s, u"group_id"_s, u"group"_s, u"date_in"_s, u"date_out"_s, u"completed"_s},
        rows);
}

void remove_earlier_try(Session& there, const Passage& passage)
{
    core::remove_entities(there, Entity::surname, std::array{passage.to});
    const auto people = passage.people.values();
    core::remove_entities(there, Entity::person, std::vector<int>(people.begin(), people.end()));
}

} // namespace

std::optional<Parcel> pack(Session& here, int surname_id)
{
    auto file = load_family(here, surname_id);
    if (!file)
        return std::nullopt;
    auto items = carried_items(here, *file);
    return Parcel{std::move(*file), std::move(items), read_group_history(here, surname_id)};
}

QStringList holders_of_taken_pins(Session& there, const FamilyFile& file, const Passage& passage)
{
    const auto taken = taken_pins(there, file, passage);
    QStringList names;
    for (const auto& person : file.people) {
        if (taken.contains(person.personal_pin))
            names += person.Name;
    }
    return names;
}

void write_arrival(Session& there, const Parcel& parcel, const Passage& passage, const QDate& today)
{
    core::Transaction transaction(there);
    if (!present_families(there, {passage.to}).isEmpty() || !present_people(there, passage.people.values()).isEmpty())
        remove_earlier_try(there, passage);
    auto file = addressed(parcel.file, passage, today);
    const auto taken = taken_pins(there, file, passage);
    for (auto& person : file.people) {
        if (taken.contains(person.personal_pin))
            person.personal_pin.clear();
    }
    const auto groups = translate_items(there, parcel.items, file);
    FamilyRows rows;
    rows.add_new(file);
    rows.insert(there);
    write_history(there, parcel.history, passage, groups);
    transaction.commit();
}

} // namespace kindrel::people
