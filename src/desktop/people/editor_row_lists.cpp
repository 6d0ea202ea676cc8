#include "desktop/people/editor_row_lists.h"

#include <algorithm>
#include <array>
#include <utility>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::FamilyFile;
using people::LinkRow;
using people::MinistryState;
using people::Person;
using people::RecordAccess;
using people::RowList;
using people::RowPlace;
using people::SetupKind;

namespace {

/// Where the link rows of the first eight lists lie.
struct LinkRows
{
    std::vector<LinkRow> Person::*of_person = nullptr;
    std::vector<LinkRow> FamilyFile::*of_family = nullptr;
};

constexpr std::array link_lists{LinkRows{&Person::status},
                                LinkRows{&Person::groups},
                                LinkRows{&Person::ministries},
                                LinkRows{&Person::flexi},
                                LinkRows{&Person::dates},
                                LinkRows{&Person::occupations},
                                LinkRows{nullptr, &FamilyFile::family_groups},
                                LinkRows{nullptr, &FamilyFile::family_dates}};

/// The rows of a list that picks its items; the person must be there.
template <class File>
auto& links(File& file, const RowPlace& place)
{
    const LinkRows& rows = link_lists.at(std::size_t(place.list));
    using Rows = std::remove_reference_t<decltype((file.family_groups))>;
    return rows.of_family ? static_cast<Rows&>(file.*rows.of_family)
                          : static_cast<Rows&>(file.people.at(std::size_t(place.person)).*rows.of_person);
}

template <class File>
auto& link(File& file, const RowPlace& place)
{
    return links(file, place).at(std::size_t(place.row));
}

template <class File>
auto& date(File& file, const RowPlace& place)
{
    return place.list == RowList::events ? file.events.at(std::size_t(place.row)).event_date : link(file, place).date;
}

template <class File>
auto& words(File& file, const RowPlace& place, Cell cell)
{
    const auto row = std::size_t(place.row);
    switch (cell) {
    case Cell::contact:
        return file.other_contacts.at(row).contact;
    case Cell::phone:
        return file.other_contacts.at(row).phone;
    case Cell::event:
        return file.events.at(row).event;
    default:
        return link(file, place).field;
    }
}

int other_state(int state)
{
    return int(state == int(MinistryState::potential) ? MinistryState::active : MinistryState::potential);
}

std::vector<RowColumn> dated()
{
    return {{"Date of", Cell::item, 55}, {"Date", Cell::date, 27}, {"Tagged", Cell::tagged, 18}};
}

const std::array looks{
    RowListLook{RowList::status,
                "status",
                "Status",
                "status",
                {{"Status", Cell::item}},
                &RecordAccess::status,
                SetupKind::status},
    RowListLook{RowList::groups,
                "groups",
                "Groups",
                "group",
                {{"Group", Cell::item}},
                &RecordAccess::groups,
                SetupKind::groups},
    RowListLook{RowList::ministries,
                "ministries",
                "Ministries",
                "ministry",
                {{"Ministry", Cell::ministry}},
                &RecordAccess::ministry,
                SetupKind::ministries},
    RowListLook{RowList::flexi,
                "flexi",
                "Flexi fields",
                "flexi field",
                {{"Field", Cell::item, 32}, {"Value", Cell::field, 50}, {"Tagged", Cell::tagged, 18}},
                &RecordAccess::flexi,
                SetupKind::flexi_fields},
    RowListLook{RowList::dates, "dates", "Personal dates", "personal date", dated(), &RecordAccess::date,
                SetupKind::personal_dates},
    RowListLook{RowList::occupations,
                "occupations",
                "Occupations",
                "occupation",
                {{"Occupation", Cell::item}},
                &RecordAccess::occupation,
                SetupKind::occupations},
    RowListLook{RowList::family_groups,
                "family_groups",
                "Family groups",
                "family group",
                {{"Family group", Cell::item}},
                &RecordAccess::family_group,
                SetupKind::family_groups},
    RowListLook{RowList::family_dates, "family_dates", "Family dates", "family date", dated(),
                &RecordAccess::family_date, SetupKind::family_dates},
    RowListLook{RowList::other_contacts,
                "other_contacts",
                "Other contacts",
                "contact",
                {{"Contact", Cell::contact, 60}, {"Phone", Cell::phone, 40}},
                &RecordAccess::contact,
                {},
                {Cell::contact, Cell::phone}},
    RowListLook{RowList::events,
                "events",
                "Family events",
                "event",
                {{"Date", Cell::date, 24}, {"Event", Cell::event, 76}},
                &RecordAccess::events,
                {},
                {Cell::event, Cell::date}},
};

} // namespace

const RowListLook& row_list_look(RowList list)
{
    return looks.at(std::size_t(list));
}

QString RowListLook::caption_of(Cell cell) const
{
    return QString::fromLatin1(std::ranges::find(columns, cell, &RowColumn::cell)->caption);
}

QString ministry_words(const QString& ministry, int state)
{
    return (state == int(MinistryState::potential) ? u"(Potential) "_s : u"(Active) "_s) + ministry;
}

int row_count(const FamilyFile& file, RowPlace place)
{
    if (place.list == RowList::other_contacts)
        return int(file.other_contacts.size());
    if (place.list == RowList::events)
        return int(file.events.size());
    const bool nobody = is_of_person(place.list) && (place.person < 0 || place.person >= std::ssize(file.people));
    return nobody ? 0 : int(links(file, place).size());
}

QString cell_text(const FamilyFile& file, RowPlace place, Cell cell, core::DayOrder order)
{
    switch (cell) {
    case Cell::item:
        return link(file, place).text;
    case Cell::ministry:
        return ministry_words(link(file, place).text, link(file, place).type);
    case Cell::tagged:
        return link(file, place).tagged ? u"Yes"_s : QString();
    case Cell::date:
        return date(file, place) ? date(file, place)->shown(order) : QString();
    default:
        return words(file, place, cell);
    }
}

bool carries(const FamilyFile& file, RowPlace place, int item, int type)
{
    return row_count(file, place) > 0 && std::ranges::any_of(links(file, place), [&](const LinkRow& row) {
               return row.item == item && row.type == type;
           });
}

void set_words(FamilyFile& file, RowPlace place, Cell cell, const QString& typed)
{
    words(file, place, cell) = typed;
}

void set_date(FamilyFile& file, RowPlace place, std::optional<core::Date> typed)
{
    date(file, place) = typed;
}

bool can_switch(const FamilyFile& file, RowPlace place, Cell cell)
{
    const LinkRow& row = link(file, place);
    return cell != Cell::ministry || !carries(file, place, row.item, other_state(row.type));
}

void switch_over(FamilyFile& file, RowPlace place, Cell cell)
{
    LinkRow& row = link(file, place);
    if (cell == Cell::ministry)
        row.type = other_state(row.type);
    else
        row.tagged = !row.tagged;
}

} // namespace kindrel::desktop
