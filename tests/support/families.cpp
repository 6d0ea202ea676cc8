#include "support/families.h"

#include "people/fields.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using core::Date;

namespace {

struct SetupList
{
    const char* table;
    const char* key;
    const char* text;
};

constexpr std::array setup_lists{
    SetupList{"tbl_status_setup", "status_id", "status"},
    SetupList{"tbl_group_setup", "group_id", "group"},
    SetupList{"tbl_ministry_setup", "ministry_id", "ministry"},
    SetupList{"tbl_individual_date_setup", "in_date_id", "date_description"},
    SetupList{"tbl_flexi_setup", "flexi_id", "flexi"},
    SetupList{"tbl_family_group_setup", "family_group_id", "family_group"},
    SetupList{"tbl_family_date_setup", "fam_date_id", "date_description"},
    SetupList{"tbl_title", "title_id", "Title"},
    SetupList{"tbl_occupation_setup", "occupation_id", "occupation"},
    SetupList{"tbl_suburb_setup", "suburb_id", "suburb"},
};

LinkRow carried(const char* list, int item)
{
    return {item, u"%1 %2"_s.arg(QString::fromLatin1(list)).arg(item), 0, {}, {}, false};
}

/// Every text gets a word of its own, every switch the wanted state, every date a day.
template <class Record>
void fill(Record& record, std::span<const Field<Record>> fields, const QString& prefix, bool switches)
{
    for (const auto& field : fields) {
        const auto word = prefix + QString::fromLatin1(field.name).remove(u'_');
        std::visit(
            [&](auto member) {
                using Value = std::remove_reference_t<decltype(record.*member)>;
                if constexpr (std::is_same_v<Value, QString>)
                    record.*member = word;
                else if constexpr (std::is_same_v<Value, bool>)
                    record.*member = switches;
                else if constexpr (std::is_same_v<Value, std::optional<Date>>)
                    record.*member = Date{1977, 7, 17};
            },
            field.member);
    }
}

Person full_person(const QString& name, int marital, bool hidden)
{
    Person full = person(name, marital);
    fill(full, detail_fields(), name, hidden);
    full.preferred_name = name + u"preferred"_s;
    full.Preferred_Name_hidden = hidden;
    full.school_year = -2;
    full.personal_pin = QString::number(name.size() * 100 + marital);
    full.status = {carried("status", 2), carried("status", 1)};
    full.groups = {carried("group", 3), carried("group", 1)};
    full.ministries = {carried("ministry", 1), carried("ministry", 1)};
    full.ministries[0].type = static_cast<int>(MinistryState::active);
    full.ministries[1].type = static_cast<int>(MinistryState::potential);
    full.flexi = {carried("flexi", 1)};
    full.flexi[0].field = name + u"flexi"_s;
    full.flexi[0].tagged = true;
    full.dates = {carried("date_description", 1), carried("date_description", 3)};
    full.dates[0].date = Date{Date::unknown_year, 2, 29};
    full.dates[1].date = Date{2001, 1, 1};
    full.occupations = {carried("occupation", 2)};
    return full;
}

} // namespace

void add_setup_items(core::Session& session)
{
    for (const auto& [table, key, text] : setup_lists) {
        std::vector<std::vector<core::Value>> rows;
        for (qint64 item = 1; item <= 3; ++item)
            rows.push_back({item, core::to_value(carried(text, static_cast<int>(item)).text), item});
        session.insert(QString::fromLatin1(table), {QString::fromLatin1(key), QString::fromLatin1(text), u"position"_s},
                       rows);
    }
    session.execute(u"UPDATE [tbl_suburb_setup] SET [postcode]='3000';"_s);
}

Person person(const QString& name, int marital)
{
    Person made;
    made.Name = name;
    made.Marital = marital;
    return made;
}

FamilyFile family(const QString& surname, std::initializer_list<QString> names)
{
    FamilyFile made;
    made.family.surname = surname;
    for (const auto& name : names)
        made.people.push_back(person(name, made.people.size() < 2 ? 4 : 5));
    if (made.people.size() == 1)
        made.people.front().Marital = 1;
    return made;
}

FamilyFile full_family(bool hidden)
{
    FamilyFile full;
    full.family.surname = u"Żółć-O’Brien"_s;
    full.family.Condition = FileStatus::prospect;
    full.family.created = Date{1999, 12, 31};
    fill(full.address, address_fields(), u"address"_s, hidden);
    full.residential = Suburb{1, SuburbType::residential, u"3999"_s, u"suburb 1"_s, u"3000"_s};
    full.postal = Suburb{2, SuburbType::postal, {}, u"suburb 2"_s, u"3000"_s};
    full.other_contacts = {{u"Neighbour"_s, u"555 1"_s}, {u"Aunt"_s, u"555 2"_s}};
    full.events = {{Date{2011, 5, 6}, u"Moved here"_s}, {Date{Date::unknown_year, 1, 2}, u"An older one"_s}};
    full.visits = {{Date{2020, 2, 3}, u"A visitor"_s, u"All well.\nCome again."_s}};
    full.family_groups = {carried("family_group", 2), carried("family_group", 1)};
    full.family_dates = {carried("date_description", 2)};
    full.family_dates[0].date = Date{1988, 8, 8};
    full.family_dates[0].tagged = true;
    full.access.visitation = false;
    full.people = {full_person(u"Zoë"_s, 4, hidden), full_person(u"Stanisław"_s, 4, hidden),
                   full_person(u"Kid"_s, 5, hidden)};
    full.people[1].Decease = full.people[1].Privacy = full.people[1].contact = true;
    return full;
}

} // namespace kindrel::test
