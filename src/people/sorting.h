#pragma once

#include "core/dialogue.h"
#include "core/rights.h"
#include "people/filter.h"
#include "people/working_list.h"

#include <optional>
#include <utility>

namespace kindrel::people {

/// The orders that the sort screen offers, in its order.
enum class SortBy {
    family,
    individual,
    suburb,
    postcode,
    birth_date,
    visitation,
    family_events,
    personal_date, ///< Of one kind: `item`.
    family_date    ///< Of one kind: `item`.
};

/// How a date order narrows the list besides.
enum class DateSearch { none, month, ages, dates };

struct SortOrder
{
    SortBy by = SortBy::family;
    int item = 0;
    QString item_text = {};
    DateSearch search = DateSearch::none;
    std::optional<int> month = {};
    std::optional<std::pair<int, int>> ages = {}; ///< In calendar years, from and to.
    std::optional<std::pair<core::Date, core::Date>> dates = {};
    FamilyType type = FamilyType::all_people;

    friend bool operator==(const SortOrder&, const SortOrder&) = default;
};

[[nodiscard]] QString sort_label(SortBy by);
[[nodiscard]] bool is_by_date(SortBy by);
/// What the order shows, in itself and in who answers to a search, may ask for a right; nullopt where it does not.
[[nodiscard]] std::optional<core::Area> right_for(SortBy by);

/// What is missing for the search that was chosen; nullopt when the order can be carried out.
[[nodiscard]] std::optional<core::Message> sort_refusal(const SortOrder& order);

/// The people of the list in the order asked for. Those of another family type go, and under a date search those
/// without a date that fits. Without a search a date orders by month and day, and people without one come last; under a
/// search for ages or dates the year counts too. People who are alike keep the order of families. One statement.
[[nodiscard]] WorkingList sorted(core::Session& session, const WorkingList& list, const SortOrder& order,
                                 const QDate& today);

/// "by birth date in March, married with children only"; empty for the order of families.
[[nodiscard]] QString sort_sentence(const SortOrder& order, core::DayOrder day_order);

} // namespace kindrel::people
