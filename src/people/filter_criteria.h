#pragma once

#include "people/filter_condition.h"
#include "people/filter_search.h"
#include "people/fusion.h"

namespace kindrel::people {

/// One criterion over `qry_filter1_all`, in the engine's words and in the reader's.
struct Criterion
{
    Condition where;
    QString words;
};

/// In the order of the screen. `fusions` are those of the filter that still exist.
[[nodiscard]] std::vector<Criterion> criteria_of(const Filter& filter, std::span<const Fusion> fusions,
                                                 const FilterDay& day);

} // namespace kindrel::people
