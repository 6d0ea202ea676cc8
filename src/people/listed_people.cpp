#include "people/listed_people.h"

#include "people/names.h"

#include <array>

namespace kindrel::people {

using namespace Qt::StringLiterals;
using core::Column;

namespace {

constexpr auto columns =
    u"p.[person_id],p.[Surname_ID],p.[Name],p.[preferred_name],p.[Preferred_Name_hidden],p.[Decease],p.[archive],"
    "p.[Privacy],p.[Prospect],p.[contact],f.[surname],f.[sort_key],f.[booked_out],p.[sort_key],d.[other_surname],"
    "d.[surname_hidden],p.[Active]";
constexpr auto around_person = u" JOIN [tbl_surname] f ON f.[Surname_ID]=p.[Surname_ID] "
                               "LEFT JOIN [tbl_personal_details] d ON d.[person_id]=p.[person_id] ";

Person person_of(const core::Row& row)
{
    Person person;
    person.Name = row.text(Column{2});
    person.preferred_name = row.text(Column{3});
    person.Preferred_Name_hidden = row.flag(Column{4});
    person.Decease = row.flag(Column{5});
    person.archive = row.flag(Column{6});
    person.Privacy = row.flag(Column{7});
    person.Prospect = row.flag(Column{8});
    person.contact = row.flag(Column{9});
    person.other_surname = row.text(Column{14});
    person.surname_hidden = row.flag(Column{15});
    person.Active = row.flag(Column{16});
    return person;
}

std::vector<ListedPerson> read(core::Rows rows, bool use_preferred_names)
{
    std::vector<ListedPerson> found;
    for (const core::Row& row : rows) {
        const Person person = person_of(row);
        found.push_back({.member = {row.integer(Column{0}), row.integer(Column{1})},
                         .name = listed_name(person, row.text(Column{10}), use_preferred_names),
                         .surname = row.text(Column{10}),
                         .sort_key = row.text(Column{11}),
                         .own_sort_key = row.text(Column{13}),
                         .states = states_of(person),
                         .booked_out = row.flag(Column{12})});
    }
    return found;
}

/// A place where what is needed can stand, and the switch that hides it.
struct Source
{
    bool Needs::*need;
    const char16_t* value;
    const char16_t* hidden;
};

constexpr std::array sources{
    Source{&Needs::address, u"a.[res_street]", u"a.[res_hidden]"},
    Source{&Needs::address, u"a.[res_street2]", u"a.[res_hidden]"},
    Source{&Needs::phone, u"a.[phone]", u"a.[phone_hidden]"},
    Source{&Needs::phone, u"a.[family_mobile]", u"a.[family_mobile_hidden]"},
    Source{&Needs::phone, u"d.[mobile_phone]", u"d.[mobile_hidden]"},
    Source{&Needs::email, u"a.[family_email]", u"a.[family_email_hidden]"},
    Source{&Needs::email, u"d.[Personal_email]", u"d.[email_hidden]"},
    Source{&Needs::birth_date, u"d.[birthdate]", u"d.[birthdate_hidden]"},
};

struct NeedRow
{
    bool Needs::*need;
    QStringView words;
};

constexpr std::array need_rows{
    NeedRow{&Needs::address, u"an address"},
    NeedRow{&Needs::phone, u"a phone number"},
    NeedRow{&Needs::email, u"an e-mail address"},
    NeedRow{&Needs::birth_date, u"a birth date"},
};

QString condition(bool Needs::*need)
{
    QStringList alternatives;
    for (const auto& source : sources) {
        if (source.need != need)
            continue;
        alternatives += u"(%1 IS NOT NULL AND %2=0)"_s.arg(QStringView(source.value), QStringView(source.hidden));
    }
    return u'(' + alternatives.join(u" OR "_s) + u')';
}

} // namespace

PersonStates states_of(const Person& person)
{
    return {.active = person.Active,
            .privacy = person.Privacy,
            .prospect = person.Prospect,
            .archived = person.archive,
            .contact = person.contact,
            .deceased = person.Decease};
}

QString listed_name(const Person& person, const QString& surname, bool use_preferred_names)
{
    QString name = display_name(person, use_preferred_names);
    if (!person.surname_hidden && !person.other_surname.isEmpty() && person.other_surname != surname)
        name += u' ' + person.other_surname;
    return name + markers(person, Markers::full);
}

std::vector<ListedPerson> listed_people(core::Session& session, const WorkingList& list, bool use_preferred_names)
{
    lend(session, list);
    return read(session.select(u"SELECT %1 FROM [work_people] w JOIN [tbl_people] p ON p.[person_id]=w.[person_id]%2"
                               "ORDER BY w.[place];"_s.arg(QStringView(columns), QStringView(around_person))),
                use_preferred_names);
}

std::vector<ListedPerson> everybody(core::Session& session, bool use_preferred_names)
{
    return read(session.select(u"SELECT %1 FROM [tbl_people] p%2ORDER BY f.[sort_key],f.[Primary_name],f.[Surname_ID],"
                               "p.[position],p.[person_id];"_s.arg(QStringView(columns), QStringView(around_person))),
                use_preferred_names);
}

WorkingList having(core::Session& session, const WorkingList& list, const Needs& needs)
{
    if (!needs.any())
        return list;
    QStringList conditions;
    for (const auto& row : need_rows) {
        if (needs.*row.need)
            conditions += condition(row.need);
    }
    lend(session, list);
    auto rows = session.select(u"SELECT w.[person_id],w.[surname_id] FROM [work_people] w "
                               "JOIN [tbl_people] p ON p.[person_id]=w.[person_id] "
                               "LEFT JOIN [tbl_personal_details] d ON d.[person_id]=p.[person_id] "
                               "LEFT JOIN [tbl_address] a ON a.[surname_id]=p.[Surname_ID] "
                               "WHERE %1 ORDER BY w.[place];"_s.arg(conditions.join(u" AND "_s)));
    WorkingList found{{}, list.criteria};
    for (const core::Row& row : rows)
        found.members.push_back({row.integer(Column{0}), row.integer(Column{1})});
    return found;
}

QString needs_words(const Needs& needs)
{
    QStringList words;
    for (const auto& row : need_rows) {
        if (needs.*row.need)
            words += row.words.toString();
    }
    return words.isEmpty() ? QString() : u"with "_s + words.join(u" and "_s);
}

} // namespace kindrel::people
