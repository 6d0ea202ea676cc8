#pragma once

#include "output/catalogue.h"
#include "people/disclosed.h"
#include "people/family_store.h"
#include "people/names.h"

#include <functional>

namespace kindrel::output {

/// A family of the working list. The household holds those of its people alone who are on the list; its primary is
/// null when the primary adult is not.
struct ListedFamily
{
    const people::DisclosedFamily& family;
    people::Household household;
};

/// Reads the working list's families in its order, a few hundred at a time, and hands each to `write`, as far as
/// `extent` goes. False when cancelled. Throws core::DatabaseError.
[[nodiscard]] bool for_each_family(const ReportInput& input, core::Progress& progress,
                                   const std::function<void(const ListedFamily&)>& write,
                                   people::Extent extent = people::Extent::whole);

} // namespace kindrel::output
