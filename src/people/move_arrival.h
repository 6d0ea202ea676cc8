#pragma once

#include "people/group_history.h"
#include "people/move_items.h"
#include "people/move_keys.h"

#include <QStringList>

namespace kindrel::people {

/// What goes along with a family.
struct Parcel
{
    FamilyFile file;
    CarriedItems items;
    std::vector<HistoryEntry> history;
};

/// Nullopt when the family is gone.
[[nodiscard]] std::optional<Parcel> pack(core::Session& here, int surname_id);

/// The people of the file, by name, whose PIN somebody else has in the other church.
[[nodiscard]] QStringList holders_of_taken_pins(core::Session& there, const FamilyFile& file, const Passage& passage);

/// Writes the family under the keys of the passage, in one transaction, in place of what an earlier try wrote. It is
/// not booked out there; a PIN that is in use there is left out. Past groups that the other church does not have stay
/// in the history by name, as removed ones.
void write_arrival(core::Session& there, const Parcel& parcel, const Passage& passage, const QDate& today);

} // namespace kindrel::people
