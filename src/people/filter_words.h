#pragma once

#include "people/filter_search.h"

namespace kindrel::people {

/// "a", "a or b", "a, b or c".
[[nodiscard]] QString alternatives(const QStringList& words);

[[nodiscard]] QString words_of(const PersonStates& states);
[[nodiscard]] QString words_of(const SurnameRange& range);
[[nodiscard]] QString words_of(const SchoolYears& years);
[[nodiscard]] QString words_of(const Ages& ages, const FilterDay& day);
[[nodiscard]] QString words_of(const DateCriterion& criterion, core::DayOrder order);

} // namespace kindrel::people
