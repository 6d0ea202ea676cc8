#pragma once

#include "people/records.h"

#include <QStringList>

#include <span>

namespace kindrel::people {

enum class Markers { none, shortened, full };

/// The flags' markers in their order, each with its leading blank where full: " (Privacy) (Deceased)".
[[nodiscard]] QString markers(const Person& person, Markers kind);
/// The name under which a person is listed: the preferred one where the church's option is on and it is not hidden.
[[nodiscard]] QString display_name(const Person& person, bool use_preferred_names);

/// Who is who in a family: the primary adult first, then the spouse, then the children in family order.
struct Household
{
    const Person* primary = nullptr; ///< Null only for a family without people.
    const Person* spouse = nullptr;
    std::vector<const Person*> children;
    std::vector<const Person*> adults; ///< Primary and spouse first, then any further adults in family order.
};

/// The pointers live as long as `people`.
[[nodiscard]] Household household_of(std::span<const Person> people);
/// The household of the living, to whom post goes. Where the primary adult has died, the next adult stands there alone.
[[nodiscard]] Household living_household(std::span<const Person> people);
[[nodiscard]] bool is_child(const Person& person);

/// The year after `year`: zero is skipped, so -1 is followed by 1.
[[nodiscard]] int next_school_year(int year);
/// "3", "-1", "Kinder"; empty for who is not at school.
[[nodiscard]] QString school_year_text(const std::optional<int>& year);

/// The family in the lines of the visitation list, joined by CR LF.
[[nodiscard]] QString family_summary(const FamilyFile& file, bool use_preferred_names);

/// "(Booked out to … on …)" with the note whether it may be edited; empty when the family is not booked out.
[[nodiscard]] QString booked_out_note(const Family& family, core::DayOrder order);

} // namespace kindrel::people
