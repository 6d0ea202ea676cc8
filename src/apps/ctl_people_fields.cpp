#include "apps/ctl_people_fields.h"

#include "people/field_labels.h"
#include "people/fields.h"
#include "people/names.h"

#include <QSet>

namespace kindrel::apps {

using namespace Qt::StringLiterals;
using people::DisclosedFamily;
using people::Extent;
using people::Part;
using people::Person;

namespace {

QJsonValue cell(const QString& text)
{
    return text;
}

QJsonValue cell(int number)
{
    return number;
}

QJsonValue cell(bool flag)
{
    return flag;
}

QJsonValue cell(const std::optional<int>& number)
{
    return number ? QJsonValue(*number) : QJsonValue();
}

QJsonValue cell(const std::optional<core::Date>& date)
{
    return date ? QJsonValue(date->stored()) : QJsonValue();
}

const people::Address& record(const DisclosedFamily& family, const Person&, const people::Address*)
{
    return family.address();
}

const Person& record(const DisclosedFamily&, const Person& person, const Person*)
{
    return person;
}

/// Switches say what is hidden, and notes belong to the workstation: neither is listed.
bool is_listed(const QString& name)
{
    static const QSet<QString> left_out{u"audio_note"_s, u"transfer_exists"_s, u"position"_s, u"Marital"_s, u"Name"_s};
    return !name.endsWith("hidden"_L1, Qt::CaseInsensitive) && !left_out.contains(name);
}

template <class Record>
void add_stored(std::vector<PeopleField>& to, std::span<const people::Field<Record>> fields, Extent extent)
{
    for (const auto& field : fields) {
        const auto name = QString::fromLatin1(field.name);
        if (!is_listed(name))
            continue;
        to.push_back({name, people::label_of(field.name), extent,
                      [member = field.member](const DisclosedFamily& family, const Person& person) {
                          const Record& of = record(family, person, static_cast<const Record*>(nullptr));
                          return std::visit([&](auto value) { return cell(of.*value); }, member);
                      }});
    }
}

QJsonValue age_of(const Person& person, const QDate& today)
{
    const auto& born = person.birthdate;
    const bool known = born && born->year_known() && born->year < today.year();
    return known ? QJsonValue(today.year() - born->year) : QJsonValue();
}

void add_items(std::vector<PeopleField>& to, const QString& name, const QString& heading,
               std::vector<people::LinkRow> Person::*rows, Part part)
{
    to.push_back({name, heading, part, [rows](const DisclosedFamily&, const Person& person) {
                      QStringList texts;
                      for (const auto& row : person.*rows)
                          texts += row.text;
                      return QJsonValue(texts.join(u", "_s));
                  }});
}

} // namespace

std::vector<PeopleField> people_list_fields(const QDate& today)
{
    constexpr auto names = Part::address;
    std::vector<PeopleField> fields{
        {u"person_id"_s, u"Key"_s, names,
         [](const auto&, const auto& person) {
             return person.person_id;
         }},
        {u"surname_id"_s, u"Family key"_s, names,
         [](const auto& family, const auto&) {
             return family.family().Surname_ID;
         }},
        {u"surname"_s, u"Surname"_s, names,
         [](const auto& family, const auto&) {
             return family.family().surname;
         }},
        {u"name"_s, u"Name"_s, names,
         [](const auto& family, const auto& person) {
             return family.name(person);
         }},
        {u"suburb"_s, u"Suburb"_s, names,
         [](const auto& family, const auto&) {
             return family.residential() ? family.residential()->suburb : QString();
         }},
        {u"postcode"_s, u"Postcode"_s, names,
         [](const auto& family, const auto&) {
             return family.residential() ? family.residential()->shown_postcode() : QString();
         }},
        {u"age"_s, u"Age"_s, Part::details,
         [today](const auto&, const auto& person) {
             return age_of(person, today);
         }},
    };
    add_stored(fields, people::people_fields(), names);
    add_stored(fields, people::detail_fields(), Part::details);
    add_stored(fields, people::address_fields(), names);
    add_items(fields, u"status"_s, u"Status"_s, &Person::status, Part::status);
    add_items(fields, u"groups"_s, u"Groups"_s, &Person::groups, Part::groups);
    add_items(fields, u"ministries"_s, u"Ministries"_s, &Person::ministries, Part::ministries);
    add_items(fields, u"occupations"_s, u"Occupations"_s, &Person::occupations, Part::occupations);
    return fields;
}

} // namespace kindrel::apps
