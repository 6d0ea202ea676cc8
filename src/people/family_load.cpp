#include "people/family_store.h"

#include "people/fields.h"
#include "people/link_tables.h"

#include <QHash>

#include <utility>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::Row;
using core::Rows;
using core::Session;

/// Which families are read: one by its key, or those lent in `work_families`.
class Scope
{
public:
    explicit Scope(std::span<const int> keys) : m_key(keys.size() == 1 ? keys.front() : 0) {}

    /// `rest`, a further condition or the order, is appended as it stands.
    [[nodiscard]] Rows families(Session& session, const char* from, const char* rest = "") const
    {
        return run(session, from, m_key ? u"[surname_id]=?"_s : u"[surname_id] IN (%1)"_s.arg(lent), rest);
    }
    [[nodiscard]] Rows people(Session& session, const char* from, const char* rest = "") const
    {
        const auto whose = m_key ? u"=?"_s : u" IN (%1)"_s.arg(lent);
        return run(session, from,
                   u"[person_id] IN (SELECT [person_id] FROM [tbl_people] WHERE [Surname_ID]%1)"_s.arg(whose), rest);
    }

private:
    static constexpr QStringView lent = u"SELECT [surname_id] FROM [work_families]";

    Rows run(Session& session, const char* from, const QString& where, const char* rest) const
    {
        const auto text =
            u"SELECT * FROM [%1] WHERE %2%3;"_s.arg(QString::fromLatin1(from), where, QString::fromLatin1(rest));
        return m_key ? session.select(text, m_key) : session.select(text);
    }
    int m_key;
};

using FamilyMap = QHash<int, FamilyFile*>;
using PersonMap = QHash<int, Person*>;

void lend_families(Session& session, std::span<const int> keys)
{
    std::vector<std::vector<core::Value>> rows;
    QHash<int, bool> lent;
    for (const int key : keys) {
        if (!std::exchange(lent[key], true))
            rows.push_back({core::to_value(key)});
    }
    session.fill_temporary(u"work_families"_s, {u"surname_id"_s}, rows);
}

FamilyMap load_family_rows(Session& session, const Scope& scope, std::span<const int> keys,
                           std::vector<FamilyFile>& files)
{
    auto rows = scope.families(session, "tbl_surname");
    const auto key = rows.column(u"Surname_ID");
    const auto condition = rows.column(u"Condition");
    const FieldReader reader(rows, family_fields());
    const FieldReader booking(rows, booking_fields());
    QHash<int, FamilyFile> found;
    for (const Row& row : rows) {
        auto& family = found[row.integer(key)].family;
        family.Surname_ID = row.integer(key);
        family.Condition = static_cast<FileStatus>(row.integer(condition));
        reader.read(row, family);
        booking.read(row, family);
    }
    files.reserve(keys.size());
    FamilyMap by_key;
    for (const int wanted : keys) {
        const auto file = found.find(wanted);
        if (file == found.end() || by_key.contains(wanted))
            continue;
        files.push_back(std::move(*file));
        by_key.insert(wanted, &files.back());
    }
    return by_key;
}

/// Reads a table of the family: each row goes to the family it names through `place`, which returns the record to fill.
template <class Record, class Place>
void load_of_families(Rows rows, const FamilyMap& families, std::span<const Field<Record>> fields, Place place)
{
    const auto key = rows.column(u"surname_id");
    const FieldReader reader(rows, fields);
    for (const Row& row : rows) {
        if (auto* file = families.value(row.integer(key)))
            reader.read(row, place(*file));
    }
}

void load_suburbs(Session& session, const Scope& scope, const FamilyMap& families)
{
    auto rows = scope.families(session, "Qry_suburb_load");
    const auto key = rows.column(u"surname_id");
    const auto type = rows.column(u"Type");
    const auto item = rows.column(u"suburb_id");
    const auto variant = rows.column(u"postcode_var");
    const auto suburb = rows.column(u"suburb");
    const auto postcode = rows.column(u"postcode");
    for (const Row& row : rows) {
        auto* file = families.value(row.integer(key));
        if (!file)
            continue;
        const auto kind = static_cast<SuburbType>(row.integer(type));
        (kind == SuburbType::postal ? file->postal : file->residential) =
            Suburb{row.integer(item), kind, row.text(variant), row.text(suburb), row.text(postcode)};
    }
}

std::optional<core::Column> column_of(const Rows& rows, const char* name)
{
    return name ? std::optional(rows.column(QString::fromLatin1(name))) : std::nullopt;
}

template <class Owner>
void load_links(Rows rows, const LinkTable& table, std::vector<LinkRow> Owner::*list, const QHash<int, Owner*>& owners)
{
    const auto owner = rows.column(QString::fromLatin1(table.owner));
    const auto item = rows.column(QString::fromLatin1(table.item));
    const auto text = rows.column(QString::fromLatin1(table.text));
    const auto type = column_of(rows, table.type);
    const auto date = column_of(rows, table.date);
    const auto field = column_of(rows, table.field);
    const auto tagged = column_of(rows, table.tagged);
    for (const Row& row : rows) {
        auto* carrier = owners.value(row.integer(owner));
        if (!carrier)
            continue;
        (carrier->*list)
            .push_back({row.integer(item), row.text(text), type ? row.integer(*type) : 0,
                        date ? row.date(*date) : std::nullopt, field ? row.text(*field) : QString(),
                        tagged && row.flag(*tagged)});
    }
}

/// Kinds without a place of their own come in the order of their setup list.
QByteArray order_of(const LinkTable& table)
{
    return QByteArray(" ORDER BY [") + (table.position ? table.position : "position") + "],[" + table.item + "]";
}

void load_people_rows(Session& session, const Scope& scope, const FamilyMap& families)
{
    auto rows = scope.families(session, "tbl_people", " ORDER BY [Surname_ID],[Position]");
    const auto key = rows.column(u"person_id");
    const auto family = rows.column(u"Surname_ID");
    const FieldReader reader(rows, people_fields());
    for (const Row& row : rows) {
        auto* file = families.value(row.integer(family));
        if (!file)
            continue;
        auto& person = file->people.emplace_back();
        person.person_id = row.integer(key);
        person.Surname_ID = row.integer(family);
        reader.read(row, person);
    }
}

void load_details(Session& session, const Scope& scope, const PersonMap& people)
{
    auto details = scope.people(session, "tbl_personal_details");
    const auto key = details.column(u"person_id");
    const FieldReader reader(details, detail_fields());
    for (const Row& row : details) {
        if (auto* person = people.value(row.integer(key)))
            reader.read(row, *person);
    }
}

/// Of the few who have one: a list of names needs no more of the details.
void load_own_surnames(Session& session, const Scope& scope, const PersonMap& people)
{
    auto details = scope.people(session, "tbl_personal_details", " AND [other_surname] IS NOT NULL");
    const auto key = details.column(u"person_id");
    const auto surname = details.column(u"other_surname");
    const auto hidden = details.column(u"surname_hidden");
    for (const Row& row : details) {
        auto* person = people.value(row.integer(key));
        if (!person)
            continue;
        person->other_surname = row.text(surname);
        person->surname_hidden = row.flag(hidden);
    }
}

void load_pins(Session& session, const Scope& scope, const PersonMap& people)
{
    auto pins = scope.people(session, "tbl_pin");
    const auto holder = pins.column(u"person_id");
    const auto pin = pins.column(u"personal_pin");
    for (const Row& row : pins) {
        if (auto* person = people.value(row.integer(holder)))
            person->personal_pin = row.text(pin);
    }
}

/// What hangs on the people.
void load_person_rows(Session& session, const Scope& scope, std::vector<FamilyFile>& files, Extent extent)
{
    PersonMap people;
    for (auto& file : files) {
        for (auto& person : file.people)
            people.insert(person.person_id, &person);
    }
    if (extent & (Part::details | Part::occupations))
        load_details(session, scope, people);
    else if (extent & Part::own_surnames)
        load_own_surnames(session, scope, people);
    if (extent & Part::pins)
        load_pins(session, scope, people);
    for (const auto& [table, list] : person_links()) {
        if (extent & table.part)
            load_links(scope.people(session, table.load_query, order_of(table)), table, list, people);
    }
}

/// What hangs on the families themselves.
void load_belongings(Session& session, const Scope& scope, const FamilyMap& families, Extent extent)
{
    if (extent & Part::access)
        load_of_families<RecordAccess>(scope.families(session, "tbl_record_access"), families, access_fields(),
                                       [](FamilyFile& file) -> RecordAccess& { return file.access; });
    if (extent & Part::other_contacts)
        load_of_families<OtherContact>(
            scope.families(session, "tbl_other_contact", " ORDER BY [position]"), families, other_contact_fields(),
            [](FamilyFile& file) -> OtherContact& { return file.other_contacts.emplace_back(); });
    if (extent & Part::events)
        load_of_families<Event>(scope.families(session, "Qry_events_load", " ORDER BY [e_position]"), families,
                                event_fields(), [](FamilyFile& file) -> Event& { return file.events.emplace_back(); });
    if (extent & Part::visits)
        load_of_families<Visit>(scope.families(session, "tbl_visitation", " ORDER BY [date]"), families, visit_fields(),
                                [](FamilyFile& file) -> Visit& { return file.visits.emplace_back(); });
    for (const auto& [table, list] : family_links()) {
        if (extent & table.part)
            load_links(scope.families(session, table.load_query, order_of(table)), table, list, families);
    }
}

void load_address(Session& session, const Scope& scope, const FamilyMap& families)
{
    load_of_families<Address>(scope.families(session, "tbl_address"), families, address_fields(),
                              [](FamilyFile& file) -> Address& { return file.address; });
    load_suburbs(session, scope, families);
}

} // namespace

std::vector<FamilyFile> load_families(Session& session, std::span<const int> surname_ids, Extent extent)
{
    std::vector<FamilyFile> files;
    if (surname_ids.empty())
        return files;
    const Scope scope(surname_ids);
    if (surname_ids.size() > 1)
        lend_families(session, surname_ids);
    const auto families = load_family_rows(session, scope, surname_ids, files);
    load_people_rows(session, scope, families);
    if (extent & Part::address)
        load_address(session, scope, families);
    load_belongings(session, scope, families, extent);
    load_person_rows(session, scope, files, extent);
    return files;
}

std::optional<FamilyFile> load_family(Session& session, int surname_id)
{
    auto files = load_families(session, {&surname_id, 1});
    return files.empty() ? std::nullopt : std::optional(std::move(files.front()));
}

} // namespace kindrel::people
