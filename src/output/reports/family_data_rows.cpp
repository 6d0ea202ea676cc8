#include "output/reports/family_data_rows.h"

#include "output/family_lines.h"

#include <algorithm>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

using people::DisclosedFamily;
using people::LinkRow;
using people::Person;
using Values = std::vector<QStringList>;

void append(DataRows& rows, const QString& who, const Values& values)
{
    for (const auto& line : values) {
        const bool begins = &line == &values.front();
        rows.push_back({begins ? who : QString(), line, begins});
    }
}

/// `values_of(family, person)` gives a person's lines.
template <class ValuesOf>
DataRows by_person(const ListedFamily& listed, const ValuesOf& values_of)
{
    DataRows rows;
    for (const auto* person : listed.people())
        append(rows, listed.family.name(*person), values_of(listed.family, *person));
    return rows;
}

DataRows by_family(const ListedFamily& listed, const Values& values)
{
    DataRows rows;
    append(rows, names_of(listed.family, listed.people(), u", "), values);
    return rows;
}

/// One line, or none when all its values are empty.
Values one_line(const QStringList& values)
{
    const bool empty = std::ranges::all_of(values, &QString::isEmpty);
    return empty ? Values() : Values{values};
}

template <class Wanted>
QString items_of(const std::vector<LinkRow>& carried, const Wanted& wanted)
{
    QStringList items;
    for (const auto& row : carried) {
        if (wanted(row))
            items += row.text;
    }
    return items.join(u", "_s);
}

QString items_of(const std::vector<LinkRow>& carried)
{
    return items_of(carried, [](const LinkRow&) { return true; });
}

QString items_in(const std::vector<LinkRow>& carried, people::MinistryState state)
{
    return items_of(carried, [state](const LinkRow& row) { return row.type == static_cast<int>(state); });
}

DataRows items_by_person(const ListedFamily& listed, std::vector<LinkRow> Person::*carried)
{
    return by_person(listed, [carried](const DisclosedFamily&, const Person& person) {
        return one_line({items_of(person.*carried)});
    });
}

/// As the editor's lists show it.
QString mark_of(const LinkRow& row)
{
    return row.tagged ? u"Yes"_s : QString();
}

Values dates_of(const DisclosedFamily& family, const std::vector<LinkRow>& carried)
{
    Values lines;
    for (const auto& row : carried)
        lines.push_back({row.text, shown(family, row.date), mark_of(row)});
    return lines;
}

} // namespace

DataRows birth_date_rows(const ListedFamily& listed)
{
    return by_person(listed, [](const DisclosedFamily& family, const Person& person) {
        return one_line({shown(family, person.birthdate)});
    });
}

DataRows occupation_rows(const ListedFamily& listed)
{
    return items_by_person(listed, &Person::occupations);
}

DataRows status_rows(const ListedFamily& listed)
{
    return items_by_person(listed, &Person::status);
}

DataRows group_rows(const ListedFamily& listed)
{
    return items_by_person(listed, &Person::groups);
}

DataRows ministry_rows(const ListedFamily& listed)
{
    return by_person(listed, [](const DisclosedFamily&, const Person& person) {
        return one_line({items_in(person.ministries, people::MinistryState::active),
                         items_in(person.ministries, people::MinistryState::potential)});
    });
}

DataRows individual_date_rows(const ListedFamily& listed)
{
    return by_person(
        listed, [](const DisclosedFamily& family, const Person& person) { return dates_of(family, person.dates); });
}

DataRows flexi_rows(const ListedFamily& listed)
{
    return by_person(listed, [](const DisclosedFamily&, const Person& person) {
        Values lines;
        for (const auto& row : person.flexi)
            lines.push_back({row.text, row.field, mark_of(row)});
        return lines;
    });
}

DataRows preferred_name_rows(const ListedFamily& listed)
{
    DataRows rows;
    for (const auto* person : listed.people())
        append(rows, person->Name, one_line({person->preferred_name}));
    return rows;
}

DataRows school_year_rows(const ListedFamily& listed)
{
    return by_person(listed, [](const DisclosedFamily&, const Person& person) {
        return one_line({people::school_year_text(person.school_year)});
    });
}

DataRows email_rows(const ListedFamily& listed)
{
    const auto addresses = [](std::initializer_list<QStringList> lines) {
        Values present;
        std::ranges::copy_if(lines, std::back_inserter(present),
                             [](const QStringList& line) { return !line.front().isEmpty(); });
        return present;
    };
    DataRows rows;
    const auto& address = listed.family.address();
    const auto& owner = address.family_email_description;
    append(rows, {},
           addresses({{address.family_email, u"Family Email"_s + (owner.isEmpty() ? owner : u" (%1)"_s.arg(owner))}}));
    for (const auto* person : listed.people())
        append(rows, listed.family.name(*person),
               addresses({{person->Personal_email, u"Email"_s}, {person->business_email, u"Business Email"_s}}));
    return rows;
}

DataRows other_contact_rows(const ListedFamily& listed)
{
    Values lines;
    for (const auto& [contact, phone] : listed.family.file().other_contacts)
        lines.push_back({contact, phone});
    return by_family(listed, lines);
}

DataRows family_group_rows(const ListedFamily& listed)
{
    return by_family(listed, one_line({items_of(listed.family.file().family_groups)}));
}

DataRows event_rows(const ListedFamily& listed)
{
    Values lines;
    for (const auto& [date, event] : listed.family.file().events)
        lines.push_back({shown(listed.family, date), event});
    return by_family(listed, lines);
}

DataRows family_date_rows(const ListedFamily& listed)
{
    return by_family(listed, dates_of(listed.family, listed.family.file().family_dates));
}

DataRows visit_rows(const ListedFamily& listed)
{
    Values lines;
    for (const auto& visit : listed.family.file().visits)
        lines.push_back({shown(listed.family, visit.date), visit.visitor, visit.comments});
    return by_family(listed, lines);
}

DataRows edited_and_created_rows(const ListedFamily& listed)
{
    const auto& family = listed.family.family();
    return by_family(listed, one_line({shown(listed.family, family.created), shown(listed.family, family.last_edit)}));
}

} // namespace kindrel::output
