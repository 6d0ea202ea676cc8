#pragma once

#include "people/address_book.h"
#include "people/setup_lists.h"

#include <array>
#include <optional>
#include <span>
#include <vector>

namespace kindrel::people {

/// What people and families carry, in the order of the filters screen.
enum class FilterKind { status, groups, family_groups, ministry, dates, family_dates, flexi, occupation, suburb };
inline constexpr int filter_kind_count = 9;

/// Which rows of a ministry count.
enum class MinistryChoice { any, active, potential, not_active, not_potential };
/// Which rows of a date or a flexi field count.
enum class Marks { any, marked, unmarked };

/// One kind: the setup list of its items, the fields of its link table beyond the item's key (null where it has none),
/// and its words.
struct FilterKindRow
{
    FilterKind kind;
    SetupKind list;
    const char* state;  ///< `ministry_type`.
    const char* value;  ///< `flexi_field`.
    const char* tagged; ///< The mark.
    const char* rows;   ///< Which rows of the table count; null: all.
    QStringView caption;
    QStringView preposition; ///< "in" the group Choir, "with" the status Elder.
    QStringView article;
    QStringView noun;

    [[nodiscard]] bool has_states() const { return state != nullptr; }
    [[nodiscard]] bool has_marks() const { return tagged != nullptr; }
    [[nodiscard]] bool has_value() const { return value != nullptr; }
    [[nodiscard]] const Carriers& carriers() const { return setup_list(list).carriers; }
};
[[nodiscard]] std::span<const FilterKindRow> filter_kinds();
[[nodiscard]] const FilterKindRow& filter_kind(FilterKind kind);

/// One item of a kind. What it asks beyond its key belongs to some kinds alone.
struct FilterItem
{
    FilterKind kind = FilterKind::status;
    int item = 0;
    QString text = {};
    bool exclude = false;
    MinistryChoice ministry = MinistryChoice::any;
    Marks marks = Marks::any;
    std::optional<QString> value = {}; ///< Of a flexi field, compared letter by letter.

    friend bool operator==(const FilterItem&, const FilterItem&) = default;
};

/// The switches of the states that a person can be in. People without any state are always taken.
struct PersonStates
{
    bool active = true, privacy = false, prospect = false, archived = false, contact = false, deceased = false;

    friend bool operator==(const PersonStates&, const PersonStates&) = default;
};
struct PersonStateRow
{
    bool PersonStates::*on;
    const char* column;
    QStringView caption;
    QStringView words;
};
/// In the order of the screen and of a fusion's `fusion_status`.
[[nodiscard]] std::span<const PersonStateRow> person_states();

/// From the first letter to the last, both included; accents and case make no difference.
struct SurnameRange
{
    QString first = {}, last = {};
    bool own_surname = false; ///< By the surname under which the person sorts, not that of the family.

    friend bool operator==(const SurnameRange&, const SurnameRange&) = default;
};

/// Both ends included. 0 is never found.
struct SchoolYears
{
    int first = 1, last = 1;

    friend bool operator==(const SchoolYears&, const SchoolYears&) = default;
};

/// Both ends included. An age counts the calendar years between birth and `on`; who was born in that year, later or in
/// an unknown year has none.
struct Ages
{
    int youngest = 1, oldest = 1;
    std::optional<core::Date> on = {}; ///< Unset: today.

    friend bool operator==(const Ages&, const Ages&) = default;
};

enum class DateSource { birth_date, personal_date, family_date, events, visits };
enum class DateSpan {
    days,          ///< From one day to another.
    anniversaries, ///< Day and month of any year; from later to earlier goes past the end of the year.
    month
};

/// A date that lies in a span, be it of the person or the family.
struct DateCriterion
{
    DateSource source = DateSource::birth_date;
    int item = 0; ///< Personal and family dates: the kind of date; 0 takes all.
    QString text = {};
    DateSpan span = DateSpan::days;
    core::Date from = {}, to = {};
    int month = 1;

    friend bool operator==(const DateCriterion&, const DateCriterion&) = default;
};

enum class FamilyType {
    all_people,
    single_adult,
    single_parent,
    married_no_child,
    married_with_child,
    widower_no_child,
    widower_with_child,
    deceased_child
};
struct FamilyTypeRow
{
    FamilyType type;
    QStringView label;
    std::span<const int> codes; ///< Of `Marital`; none takes all people.
};
[[nodiscard]] std::span<const FamilyTypeRow> family_types();
[[nodiscard]] const FamilyTypeRow& family_type(FamilyType type);

/// Chooses people. All of it must hold; items of one kind are alternatives.
struct Filter
{
    std::optional<FamilyList> families = {}; ///< Without it nobody is found.
    PersonStates states = {};
    std::vector<FilterItem> items = {};
    std::optional<SurnameRange> surnames = {};
    std::optional<SchoolYears> school_years = {};
    std::optional<Ages> ages = {};
    std::vector<DateCriterion> dates = {};
    bool suburb_known = false; ///< The residential one.
    bool own_postcode = false; ///< A residential postcode that differs from the suburb's.
    FamilyType family_type = FamilyType::all_people;
    std::vector<int> fusions = {}; ///< Keys.

    friend bool operator==(const Filter&, const Filter&) = default;
};

/// Whether it could tell a birth date to somebody who may not see one: by age or by the date itself.
[[nodiscard]] bool asks_for_birth_dates(const Filter& filter);
/// Whether it could tell a visit to somebody who may not see one.
[[nodiscard]] bool asks_for_visits(const Filter& filter);

/// What is said of a filter without a family list.
inline constexpr QStringView no_families_chosen =
    u"You need to apply a File Status filter before continuing, for example choose 'Active Families'";

} // namespace kindrel::people
