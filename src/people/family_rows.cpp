#include "people/family_rows.h"

#include "people/fields.h"
#include "people/link_tables.h"
#include "people/sort_key.h"

#include <array>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::to_value;
using core::Value;

/// The rows of a family, and of its people, that a save writes anew.
constexpr std::array family_tables{"tbl_address", "tbl_suburb", "tbl_other_contact", "tbl_events", "tbl_record_access"};
constexpr std::array person_tables{"tbl_personal_details", "tbl_pin"};

template <class Record>
QStringList names_behind(QStringList keys, std::span<const Field<Record>> fields)
{
    append_names(keys, fields);
    return keys;
}

/// Name and value side by side: what a link table stores of a row.
struct LinkValue
{
    const char* name;
    Value value;
};

std::array<LinkValue, 5> stored_values(const LinkTable& table, const LinkRow& row, int position)
{
    return {{{table.position, to_value(position)},
             {table.type, to_value(row.type)},
             {table.date, to_value(row.date)},
             {table.field, to_value(row.field)},
             {table.tagged, to_value(row.tagged)}}};
}

QStringList link_fields(const LinkTable& table)
{
    QStringList fields{QString::fromLatin1(table.owner), QString::fromLatin1(table.item)};
    for (const auto& [name, value] : stored_values(table, {}, 0)) {
        if (name)
            fields += QString::fromLatin1(name);
    }
    return fields;
}

void append_link(std::vector<Value>& values, const LinkTable& table, int owner, const LinkRow& row, int position)
{
    values = {to_value(owner), to_value(row.item)};
    for (auto& [name, value] : stored_values(table, row, position)) {
        if (name)
            values.push_back(std::move(value));
    }
}

/// The name by which a person sorts: the family's, unless the person's own surname differs and is not hidden.
QString person_sort_key(const Person& person, const QString& surname)
{
    return sort_key(person.surname_hidden || person.other_surname.isEmpty() ? surname : person.other_surname);
}

} // namespace

std::vector<Value>& FamilyRows::row_of(const QString& name, const QStringList& fields)
{
    auto found = std::ranges::find(m_tables, name, &Table::name);
    if (found == m_tables.end())
        found = m_tables.insert(m_tables.end(), {name, fields, {}});
    return found->rows.emplace_back();
}

template <class Record>
void FamilyRows::add_record(const QString& table, const QString& owner, int key, const Record& record,
                            std::span<const Field<Record>> fields)
{
    auto& row = row_of(table, names_behind({owner}, fields));
    row = {to_value(key)};
    append_values(row, record, fields);
}

template <class Record>
void FamilyRows::add_list(const QString& table, const QString& place, int key, const std::vector<Record>& records,
                          std::span<const Field<Record>> fields)
{
    for (int position = 0; const auto& record : records) {
        auto& row = row_of(table, names_behind({u"surname_id"_s, place}, fields));
        row = {to_value(key), to_value(++position)};
        append_values(row, record, fields);
    }
}

void FamilyRows::add_links(const LinkTable& table, int owner, const std::vector<LinkRow>& links)
{
    for (int position = 0; const auto& link : links)
        append_link(row_of(QString::fromLatin1(table.table), link_fields(table)), table, owner, link, ++position);
}

void FamilyRows::add_suburbs(const FamilyFile& file)
{
    static const QStringList names{u"surname_id"_s, u"suburb_id"_s, u"Type"_s, u"postcode_var"_s};
    for (const auto* suburb : {&file.residential, &file.postal}) {
        if (!*suburb)
            continue;
        const auto item = (*suburb)->suburb_id ? to_value((*suburb)->suburb_id) : Value{};
        row_of(u"tbl_suburb"_s, names) = {to_value(file.family.Surname_ID), item, to_value((*suburb)->Type),
                                          to_value((*suburb)->postcode_var)};
    }
}

void FamilyRows::add_new(const FamilyFile& file)
{
    const auto& family = file.family;
    static const auto fields =
        names_behind(names_behind({u"Surname_ID"_s, u"Condition"_s, u"sort_key"_s}, family_fields()), booking_fields());
    auto& row = row_of(u"tbl_surname"_s, fields);
    row = {to_value(family.Surname_ID), to_value(family.Condition), to_value(sort_key(family.surname))};
    append_values(row, family, family_fields());
    append_values(row, family, booking_fields());
    for (const auto& visit : file.visits)
        add_record(u"tbl_visitation"_s, u"surname_id"_s, family.Surname_ID, visit, visit_fields());
    add(file);
}

void FamilyRows::add(const FamilyFile& file)
{
    const int key = file.family.Surname_ID;
    add_record(u"tbl_address"_s, u"surname_id"_s, key, file.address, address_fields());
    add_record(u"tbl_record_access"_s, u"surname_id"_s, key, file.access, access_fields());
    add_list(u"tbl_other_contact"_s, u"position"_s, key, file.other_contacts, other_contact_fields());
    add_list(u"tbl_events"_s, u"e_position"_s, key, file.events, event_fields());
    add_suburbs(file);
    for (const auto& [table, rows] : family_links())
        add_links(table, key, file.*rows);
    static const auto person_names = names_behind({u"person_id"_s, u"Surname_ID"_s, u"sort_key"_s}, people_fields());
    for (const auto& person : file.people) {
        auto& row = row_of(u"tbl_people"_s, person_names);
        row = {to_value(person.person_id), to_value(key), to_value(person_sort_key(person, file.family.surname))};
        append_values(row, person, people_fields());
        add_person(person);
    }
}

void FamilyRows::add_person(const Person& person)
{
    const int key = person.person_id;
    add_record(u"tbl_personal_details"_s, u"person_id"_s, key, person, detail_fields());
    if (!person.personal_pin.isEmpty())
        row_of(u"tbl_pin"_s, {u"person_id"_s, u"personal_pin"_s}) = {to_value(key), to_value(person.personal_pin)};
    for (const auto& [table, rows] : person_links())
        add_links(table, key, person.*rows);
}

void FamilyRows::insert(core::Session& session) const
{
    for (const auto& table : m_tables)
        session.insert(table.name, table.fields, table.rows);
}

void clear_family_rows(core::Session& session, int surname_id)
{
    const auto of_people = u"DELETE FROM [%1] WHERE [person_id] IN "
                           "(SELECT [person_id] FROM [tbl_people] WHERE [Surname_ID]=?);"_s;
    const auto of_family = u"DELETE FROM [%1] WHERE [surname_id]=?;"_s;
    for (const auto* table : person_tables)
        session.execute(of_people.arg(QString::fromLatin1(table)), surname_id);
    for (const auto& link : person_links())
        session.execute(of_people.arg(QString::fromLatin1(link.table.table)), surname_id);
    for (const auto& link : family_links())
        session.execute(of_family.arg(QString::fromLatin1(link.table.table)), surname_id);
    for (const auto* table : family_tables)
        session.execute(of_family.arg(QString::fromLatin1(table)), surname_id);
    session.execute(of_family.arg(u"tbl_people"_s), surname_id);
}

bool update_family_row(core::Session& session, const Family& family)
{
    QStringList names{u"Condition"_s, u"sort_key"_s};
    append_names(names, family_fields());
    std::vector<Value> values{to_value(family.Condition), to_value(sort_key(family.surname))};
    append_values(values, family, family_fields());
    values.push_back(to_value(family.Surname_ID));
    const auto text = u"UPDATE [tbl_surname] SET [%1]=? WHERE [Surname_ID]=?;"_s.arg(names.join(u"]=?,["_s));
    return session.execute_with(text, values) == 1;
}

} // namespace kindrel::people
