#pragma once

#include "core/session.h"
#include "people/records.h"

#include <span>

namespace kindrel::people {

/// How much of a family is read: a directory needs neither details nor items.
enum class Extent {
    whole,
    names_and_address ///< The family, its people's names and flags, address and suburbs.
};

/// The families of these keys with everything that hangs on them, in the order of the keys; a key without a row is
/// passed over. A handful of statements, whatever their number. Throws core::DatabaseError.
[[nodiscard]] std::vector<FamilyFile> load_families(core::Session& session, std::span<const int> surname_ids,
                                                    Extent extent = Extent::whole);

/// Nullopt when the family is gone.
[[nodiscard]] std::optional<FamilyFile> load_family(core::Session& session, int surname_id);

/// Writes the whole set as one transaction: rows of people and items that are no longer in the file go, the others
/// are rewritten. New families and people get their keys, positions are renumbered, `Primary_name` and `last_edit`
/// are set; the file comes back as it was stored. A new file's `created` is `today`. Visits and booking state are left
/// alone on a family that exists. Throws core::DatabaseError, and then nothing is written.
[[nodiscard]] FamilyFile save_family(core::Session& session, FamilyFile file, const QDate& today);

/// Many new families in few statements; all keys must be 0. For making and importing churches.
void add_families(core::Session& session, std::vector<FamilyFile>& files, const QDate& today);

} // namespace kindrel::people
