#include "people/family_editor.h"

#include "core/entry.h"
#include "people/family_roles.h"
#include "people/names.h"
#include "people/pins.h"

#include <algorithm>
#include <array>

// What is changed in memory: the people of the family and the rows they carry.
namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

/// What is particular about a list of rows; beside the RowLists.
struct ListRule
{
    RowList list;
    bool own_order;
    const char16_t* removal;
    std::vector<LinkRow> Person::*of_person = nullptr;
    std::vector<LinkRow> FamilyFile::*of_family = nullptr;
};

constexpr auto remove_plain = u"Please confirm that you wish to remove this row";
constexpr auto remove_flexi = u"Please confirm that you wish to remove this flexi from this person";
constexpr auto remove_personal_date = u"Please confirm that you wish to remove this date from this person";
constexpr auto remove_family_date = u"Please confirm that you wish to remove this date from this family";

constexpr std::array list_rules{
    ListRule{RowList::status, true, remove_plain, &Person::status},
    ListRule{RowList::groups, true, remove_plain, &Person::groups},
    ListRule{RowList::ministries, true, remove_plain, &Person::ministries},
    ListRule{RowList::flexi, false, remove_flexi, &Person::flexi},
    ListRule{RowList::dates, false, remove_personal_date, &Person::dates},
    ListRule{RowList::occupations, false, remove_plain, &Person::occupations},
    ListRule{RowList::family_groups, true, remove_plain, nullptr, &FamilyFile::family_groups},
    ListRule{RowList::family_dates, false, remove_family_date, nullptr, &FamilyFile::family_dates},
    ListRule{RowList::other_contacts, true, remove_plain},
    ListRule{RowList::events, true, remove_plain},
};
static_assert(std::ranges::is_sorted(list_rules, {}, &ListRule::list));

const ListRule& rule_of(RowList list)
{
    return list_rules[static_cast<std::size_t>(list)];
}

bool has_person(const FamilyFile& file, int person)
{
    return person >= 0 && person < std::ssize(file.people);
}

/// The link rows at the place; null for the lists of another kind and where there is no such person.
template <class File>
auto* link_rows(File& file, const RowPlace& place)
{
    using Rows = std::remove_reference_t<decltype((file.family_groups))>;
    const ListRule& rule = rule_of(place.list);
    if (rule.of_family)
        return static_cast<Rows*>(&(file.*rule.of_family));
    const bool there = rule.of_person && has_person(file, place.person);
    return there ? static_cast<Rows*>(&(file.people[static_cast<std::size_t>(place.person)].*rule.of_person)) : nullptr;
}

/// Calls `work` with the rows of the place, of whatever type they are; `otherwise` where there are none.
template <class Result, class File, class Work>
Result with_rows(File& file, const RowPlace& place, Result otherwise, const Work& work)
{
    if (place.list == RowList::other_contacts)
        return work(file.other_contacts);
    if (place.list == RowList::events)
        return work(file.events);
    auto* rows = link_rows(file, place);
    return rows ? work(*rows) : otherwise;
}

int row_count(const FamilyFile& file, const RowPlace& place)
{
    return with_rows<int>(file, place, 0, [](const auto& rows) { return static_cast<int>(rows.size()); });
}

bool holds(const FamilyFile& file, const RowPlace& place)
{
    return place.row >= 0 && place.row < row_count(file, place);
}

/// The date of a row of events, family dates or personal dates; null elsewhere.
template <class File>
auto* date_at(File& file, const RowPlace& place)
{
    const auto row = static_cast<std::size_t>(place.row);
    if (place.list == RowList::events)
        return &file.events[row].event_date;
    return &(*link_rows(file, place))[row].date;
}

bool has_dates(RowList list)
{
    return list == RowList::events || list == RowList::family_dates || list == RowList::dates;
}

/// The place of the nearest person above (-1) or below (1) who is a child or an adult as this one is; -1 at the end.
int neighbour(const std::vector<Person>& people, int index, int by)
{
    // Whoever is first is the primary adult, whatever the code says.
    const auto grown = [&](int place) {
        return place == 0 || !is_child(people[static_cast<std::size_t>(place)]);
    };
    for (int place = index + by; place >= 0 && place < std::ssize(people); place += by) {
        if (grown(place) == grown(index))
            return place;
    }
    return -1;
}

QString field_of(const char* name, const RowPlace& place)
{
    return u"%1 %2 %3"_s.arg(QString::fromLatin1(name)).arg(static_cast<int>(place.list)).arg(place.row);
}

} // namespace

bool has_own_order(RowList list)
{
    return rule_of(list).own_order;
}

bool FamilyEditor::add_person(const QString& name, int marital)
{
    if (!may_edit())
        return refuse_reading(u"change"_s);
    if (std::ssize(m_file.people) >= most_people) {
        m_office.dialogue.show(family_is_full());
        return false;
    }
    change({}, [&](FamilyFile& file) {
        Person& person = file.people.emplace_back();
        person.Name = name.trimmed();
        person.Marital = marital;
        person.Active = true;
    });
    return true;
}

bool FamilyEditor::add_adult(const QString& name)
{
    const int adults = static_cast<int>(household_of(m_file.people).adults.size());
    if (!add_person(name, marital::single_adult))
        return false;
    // The second adult of a new file is taken for the spouse of the first.
    if (is_new() && adults == 1) {
        auto& people = m_file.people;
        people.front().Marital = people.back().Marital = with_spouse(people.front().Marital);
    }
    return true;
}

bool FamilyEditor::add_child(const QString& name)
{
    if (m_file.people.empty())
        return add_adult(name);
    const int spouse = [&] {
        const auto household = household_of(m_file.people);
        return household.spouse ? static_cast<int>(household.spouse - m_file.people.data()) : -1;
    }();
    if (!add_person(name, marital::at_school))
        return false;
    auto& people = m_file.people;
    people.front().Marital = with_child(people.front().Marital);
    if (spouse > 0)
        people[static_cast<std::size_t>(spouse)].Marital = with_child(people[static_cast<std::size_t>(spouse)].Marital);
    return true;
}

bool FamilyEditor::remove_person(int index)
{
    if (!may_edit())
        return refuse_reading(u"change"_s);
    if (!has_person(m_file, index))
        return refuse(u"Unable to remove a persons name until you have chosen one to delete"_s);
    if (index == 0) {
        return refuse(u"Unable to remove the primary person in this family file, if you wish to remove this person "
                      "then move another person into the primary position then remove them."_s);
    }
    const Person& person = m_file.people[static_cast<std::size_t>(index)];
    if (person.person_id != 0 && (!core::may_delete_people(m_office) ||
                                  !core::guards_allow(m_office, core::PersonAct::remove, std::array{person.person_id})))
        return false;
    if (!m_office.dialogue.confirm(
            {.text = u"Please confirm you wish to delete %1 from the family file"_s.arg(person.Name),
             .icon = core::Icon::question},
            core::Answer::no))
        return false;
    change({}, [&](FamilyFile& file) { file.people.erase(file.people.begin() + index); });
    return true;
}

bool FamilyEditor::move_person(int index, int by)
{
    if (!may_edit())
        return refuse_reading(u"change"_s);
    if (!has_person(m_file, index))
        return false;
    const int other = neighbour(m_file.people, index, by);
    if (other < 0) {
        const bool primary_would_be_child = (index == 0 && by > 0 && m_file.people.size() > 1) || index + by == 0;
        if (primary_would_be_child)
            return refuse(u"Unable to move this person, as you must always have at least one person as the primary "
                          "adult in the family."_s);
        return refuse(by < 0 ? u"Unable to move this person any higher within the family file"_s
                             : u"Unable to move this person any lower in the family file"_s);
    }
    change({}, [&](FamilyFile& file) { std::swap(file.people[std::size_t(index)], file.people[std::size_t(other)]); });
    return true;
}

bool FamilyEditor::set_school_year(int index, std::optional<int> year)
{
    if (!may_edit() || !has_person(m_file, index))
        return false;
    if (year == 0) {
        m_office.dialogue.show(no_school_year_zero());
        return false;
    }
    change(u"school_year %1"_s.arg(index),
           [&](FamilyFile& file) { file.people[static_cast<std::size_t>(index)].school_year = year; });
    return true;
}

bool FamilyEditor::set_new_pin(int index)
{
    if (!may_edit() || !has_person(m_file, index))
        return false;
    const auto pin = allocate_pin(m_office, m_file, index);
    if (pin)
        change({}, [&](FamilyFile& file) { file.people[static_cast<std::size_t>(index)].personal_pin = *pin; });
    return pin.has_value();
}

bool FamilyEditor::add_item(RowPlace place, int item, const QString& text, int type)
{
    const auto* rows = link_rows(std::as_const(m_file), place);
    if (!rows || !may_edit())
        return false;
    const auto carried = [&](const LinkRow& row) {
        return row.item == item && row.type == type;
    };
    if (std::ranges::any_of(*rows, carried))
        return false;
    change({}, [&](FamilyFile& file) {
        LinkRow& row = link_rows(file, place)->emplace_back();
        row.item = item;
        row.text = text;
        row.type = type;
    });
    return true;
}

bool FamilyEditor::remove_row(RowPlace place)
{
    if (!may_edit() || !holds(m_file, place))
        return false;
    const auto question = QString::fromUtf16(rule_of(place.list).removal);
    if (!m_office.dialogue.confirm({.text = question, .icon = core::Icon::question}, core::Answer::no))
        return false;
    change({}, [&](FamilyFile& file) {
        (void)with_rows<bool>(file, place, false, [&](auto& rows) {
            rows.erase(rows.begin() + place.row);
            return true;
        });
    });
    return true;
}

bool FamilyEditor::move_row(RowPlace place, int by)
{
    if (!may_edit() || !holds(m_file, place) || !has_own_order(place.list))
        return false;
    const int other = place.row + by;
    if (other < 0)
        return refuse(u"Unable to move this row up as it is at the top of the list"_s);
    if (other >= row_count(m_file, place))
        return refuse(u"Unable to move this row down as it is at the bottom of the list"_s);
    change({}, [&](FamilyFile& file) {
        (void)with_rows<bool>(file, place, false, [&](auto& rows) {
            std::swap(rows[static_cast<std::size_t>(place.row)], rows[static_cast<std::size_t>(other)]);
            return true;
        });
    });
    return true;
}

bool FamilyEditor::set_today(RowPlace place)
{
    if (!may_edit() || !has_dates(place.list) || !holds(m_file, place))
        return false;
    const auto today = core::Date::from(m_office.clock.today());
    const auto& present = *date_at(std::as_const(m_file), place);
    if (present == today)
        return true;
    if (present && !m_office.dialogue.confirm({.text = u"A date has already been entered, do you wish to change this "
                                                       "date to today's date"_s,
                                               .icon = core::Icon::question},
                                              core::Answer::no))
        return false;
    change(field_of("today", place), [&](FamilyFile& file) { *date_at(file, place) = today; });
    return true;
}

} // namespace kindrel::people
