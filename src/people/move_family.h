#pragma once

#include "core/office.h"
#include "core/progress.h"
#include "people/records.h"

namespace kindrel::people {

/// A church that a family can be moved to.
struct OtherChurch
{
    int church = 0; ///< 1 to 7.
    QString name;
};

/// The churches beside the open one that have a database. None in training and booked-out mode.
[[nodiscard]] std::vector<OtherChurch> other_churches(const core::Office& office);

/// Moves a stored family with its people, photographs and notebook pages into another church's database: the items it
/// carries are found there by their text or added, keys come from that church's counters. Nullopt for `church` says
/// that none was chosen. False, after saying why, when nothing was moved. Whenever it is cut off, the family is whole
/// in at least one of the two churches, and moving it again mends what the first try left. Throws core::DatabaseError
/// and core::FileError.
[[nodiscard]] bool move_family(core::Office& office, int surname_id, std::optional<int> church,
                               core::Progress& progress);

} // namespace kindrel::people
