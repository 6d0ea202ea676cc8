#include "people/family_json.h"

#include "people/fields.h"
#include "people/record_json.h"

namespace kindrel::people {

// Each record is described once, for the writer and the reader alike.

template <class Side, class Record>
void describe_fields(Side& side, Record& record, std::span<const Field<Record>> fields)
{
    for (const auto& field : fields)
        std::visit([&](auto member) { side.member(field.name, record.*member); }, field.member);
}

template <class Side>
void describe(Side& side, Family& family)
{
    side.member("Surname_ID", family.Surname_ID);
    side.member("Condition", family.Condition);
    describe_fields(side, family, family_fields());
    describe_fields(side, family, booking_fields());
}

template <class Side>
void describe(Side& side, Suburb& suburb)
{
    side.member("suburb_id", suburb.suburb_id);
    side.member("Type", suburb.Type);
    side.member("postcode_var", suburb.postcode_var);
    side.member("suburb", suburb.suburb);
    side.member("postcode", suburb.postcode);
}

template <class Side>
void describe(Side& side, LinkRow& row)
{
    side.member("item", row.item);
    side.member("text", row.text);
    side.member("type", row.type);
    side.member("date", row.date);
    side.member("field", row.field);
    side.member("tagged", row.tagged);
}

template <class Side>
void describe(Side& side, Person& person)
{
    side.member("person_id", person.person_id);
    side.member("Surname_ID", person.Surname_ID);
    side.member("personal_pin", person.personal_pin);
    describe_fields(side, person, people_fields());
    describe_fields(side, person, detail_fields());
    side.member("status", person.status);
    side.member("groups", person.groups);
    side.member("ministries", person.ministries);
    side.member("flexi", person.flexi);
    side.member("dates", person.dates);
    side.member("occupations", person.occupations);
}

template <class Side>
void describe(Side& side, Address& address)
{
    describe_fields(side, address, address_fields());
}

template <class Side>
void describe(Side& side, OtherContact& contact)
{
    describe_fields(side, contact, other_contact_fields());
}

template <class Side>
void describe(Side& side, Event& event)
{
    describe_fields(side, event, event_fields());
}

template <class Side>
void describe(Side& side, Visit& visit)
{
    describe_fields(side, visit, visit_fields());
}

template <class Side>
void describe(Side& side, RecordAccess& access)
{
    describe_fields(side, access, access_fields());
}

template <class Side>
void describe(Side& side, FamilyFile& file)
{
    side.member("family", file.family);
    side.member("address", file.address);
    side.member("residential", file.residential);
    side.member("postal", file.postal);
    side.member("other_contacts", file.other_contacts);
    side.member("events", file.events);
    side.member("visits", file.visits);
    side.member("family_groups", file.family_groups);
    side.member("family_dates", file.family_dates);
    side.member("access", file.access);
    side.member("people", file.people);
}

QJsonObject to_json(const FamilyFile& file)
{
    // The descriptions serve the reader too and so take what may be changed.
    auto copy = file;
    return JsonWriter::json(copy);
}

std::optional<FamilyFile> family_from_json(const QJsonObject& object)
{
    FamilyFile file;
    return JsonReader::read(object, file) ? std::optional(std::move(file)) : std::nullopt;
}

} // namespace kindrel::people
