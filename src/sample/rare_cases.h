#pragma once

#include "sample/household.h"

namespace kindrel::sample {

/// The first so many families of a church hold every rare case once, and so do as many of every sixteen hundred.
inline constexpr int rare_families = 160;

/// The household, and the surname, that the family of this index must have; null or empty for most.
[[nodiscard]] const HouseholdPlan* wished_plan(int index);
[[nodiscard]] QString wished_origin(int index);
/// Active for those at which people will look first.
[[nodiscard]] std::optional<people::FileStatus> wished_status(int index);
/// Changes who is in a family that has only its people yet.
void grow_rare(MadeFamily& family, const Stock& stock, Chance& chance);
/// Does to the finished family what its index asks for.
void make_rare(MadeFamily& family, const Stock& stock, Chance& chance);

} // namespace kindrel::sample
