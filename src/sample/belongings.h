#pragma once

#include "sample/made_family.h"

namespace kindrel::sample {

/// File status, which may be wished, flags and the day on which the file was made.
void give_standing(MadeFamily& family, std::optional<people::FileStatus> wished, const Stock& stock, Chance& chance);
/// What the setup lists hold: statuses, groups with their history, ministries, dates, flexi fields, occupations,
/// family groups and family dates. Standing first: who is no member carries less.
void give_items(MadeFamily& family, const Stock& stock, Chance& chance);

} // namespace kindrel::sample
