#include "desktop/people/card_text.h"

#include "people/names.h"

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::FamilyFile;
using people::LinkRow;
using people::Person;
using people::RecordAccess;

namespace {

QString shown(const std::optional<core::Date>& date, const CardReader& reader)
{
    return date ? date->shown(reader.disclosure.day_order) : QString();
}

QString tagged(const LinkRow& row)
{
    return row.tagged ? u"Yes"_s : QString();
}

QString with_state(const LinkRow& ministry)
{
    const bool potential = ministry.type == int(people::MinistryState::potential);
    return (potential ? u"(Potential) "_s : u"(Active) "_s) + ministry.text;
}

CardRows rows_from(const std::vector<LinkRow>& links, auto row_of)
{
    CardRows rows;
    for (const LinkRow& link : links)
        rows.push_back(row_of(link));
    return rows;
}

/// The items' own texts.
template <auto Links, class Of>
CardRows item_rows(const Of& of, const CardReader&)
{
    return rows_from(of.*Links, [](const LinkRow& row) { return QStringList{row.text}; });
}

template <auto Links, class Of>
CardRows dated_rows(const Of& of, const CardReader& reader)
{
    return rows_from(of.*Links, [&](const LinkRow& row) {
        return QStringList{row.text, shown(row.date, reader), tagged(row)};
    });
}

CardRows ministry_rows(const Person& person, const CardReader&)
{
    return rows_from(person.ministries, [](const LinkRow& row) { return QStringList{with_state(row)}; });
}

CardRows flexi_rows(const Person& person, const CardReader&)
{
    return rows_from(person.flexi, [](const LinkRow& row) { return QStringList{row.text, row.field, tagged(row)}; });
}

CardRows history_rows(const Person& person, const CardReader& reader)
{
    CardRows rows;
    for (const auto& entry : reader.history) {
        if (entry.person_id == person.person_id)
            rows.push_back({entry.group, shown(entry.date_in, reader), shown(entry.date_out, reader),
                            entry.completed ? u"Yes"_s : QString()});
    }
    return rows;
}

CardRows event_rows(const FamilyFile& file, const CardReader& reader)
{
    CardRows rows;
    for (const auto& event : file.events)
        rows.push_back({shown(event.event_date, reader), event.event});
    return rows;
}

CardRows contact_rows(const FamilyFile& file, const CardReader&)
{
    CardRows rows;
    for (const auto& contact : file.other_contacts)
        rows.push_back({contact.contact, contact.phone});
    return rows;
}

CardRows visit_rows(const FamilyFile& file, const CardReader& reader)
{
    CardRows rows;
    for (const auto& visit : file.visits)
        rows.push_back({shown(visit.date, reader), visit.visitor, visit.comments});
    return rows;
}

struct Section
{
    const char* name;
    bool RecordAccess::*open;
};

constexpr std::array sections{
    Section{"Address", &RecordAccess::Address},
    Section{"Details", &RecordAccess::Details},
    Section{"Status", &RecordAccess::status},
    Section{"Groups", &RecordAccess::groups},
    Section{"Ministries", &RecordAccess::ministry},
    Section{"Dates", &RecordAccess::date},
    Section{"Flexi fields", &RecordAccess::flexi},
    Section{"Other contacts", &RecordAccess::contact},
    Section{"Visitation", &RecordAccess::visitation},
    Section{"Family groups", &RecordAccess::family_group},
    Section{"Family dates", &RecordAccess::family_date},
    Section{"Occupations", &RecordAccess::occupation},
    Section{"Family events", &RecordAccess::events},
    Section{"PIN", &RecordAccess::pin},
};

CardRows access_rows(const FamilyFile& file, const CardReader&)
{
    CardRows rows;
    for (const Section& section : sections)
        rows.push_back({QString::fromLatin1(section.name), file.access.*section.open ? u"Open"_s : u"Closed"_s});
    return rows;
}

} // namespace

const std::vector<PersonCardList>& group_lists()
{
    static const std::vector<PersonCardList> lists{
        {"Status", {}, item_rows<&Person::status, Person>, &RecordAccess::status},
        {"Groups", {}, item_rows<&Person::groups, Person>, &RecordAccess::groups},
        {"Group history", {"Group", "In", "Out", "Completed:"}, history_rows, &RecordAccess::groups},
        {"Ministries", {}, ministry_rows, &RecordAccess::ministry},
        {"Occupations", {}, item_rows<&Person::occupations, Person>, &RecordAccess::occupation},
    };
    return lists;
}

const std::vector<PersonCardList>& date_lists()
{
    static const std::vector<PersonCardList> lists{
        {"Dates", {"Date of", "Date", "Tagged"}, dated_rows<&Person::dates, Person>, &RecordAccess::date},
        {"Flexi fields", {"Field", "Value", "Tagged"}, flexi_rows, &RecordAccess::flexi},
    };
    return lists;
}

const std::vector<FamilyCardList>& event_lists()
{
    static const std::vector<FamilyCardList> lists{
        {"Family events", {"Date", "Event"}, event_rows, &RecordAccess::events},
        {"Family dates",
         {"Date of", "Date", "Tagged"},
         dated_rows<&FamilyFile::family_dates, FamilyFile>,
         &RecordAccess::family_date},
        {"Family groups", {}, item_rows<&FamilyFile::family_groups, FamilyFile>, &RecordAccess::family_group},
    };
    return lists;
}

const FamilyCardList& other_contact_list()
{
    static const FamilyCardList list{"Other contacts", {"Contact", "Phone"}, contact_rows, &RecordAccess::contact};
    return list;
}

const FamilyCardList& visit_list()
{
    static const FamilyCardList list{"Visits", {"Date", "Visitor", "Comments"}, visit_rows, &RecordAccess::visitation};
    return list;
}

const FamilyCardList& access_list()
{
    static const FamilyCardList list{"Record access", {"Section", "Access"}, access_rows, nullptr};
    return list;
}

QString card_caption(const people::Family& family, core::DayOrder order)
{
    return family.surname + u" Family File"_s + people::booked_out_note(family, order);
}

QString file_dates(const people::Family& family, core::DayOrder order)
{
    QStringList words;
    if (family.created)
        words << u"File Created "_s + family.created->shown(order);
    if (family.last_edit)
        words << u"Last Edit "_s + family.last_edit->shown(order);
    return words.join(u"   "_s);
}

} // namespace kindrel::desktop
