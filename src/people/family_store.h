#pragma once

#include "core/office.h"
#include "people/records.h"

#include <span>

namespace kindrel::people {

/// What can be read of a family beside itself and its people's names and flags, which always are.
enum class Part : quint32 {
    address = 1 << 0, ///< With the suburbs.
    details = 1 << 1, ///< Of the people.
    pins = 1 << 2,
    status = 1 << 3,
    groups = 1 << 4,
    ministries = 1 << 5,
    flexi = 1 << 6,
    dates = 1 << 7,
    occupations = 1 << 8, ///< Brings the details along, which tell whether they are hidden.
    family_groups = 1 << 9,
    family_dates = 1 << 10,
    other_contacts = 1 << 11,
    events = 1 << 12,
    visits = 1 << 13,
    access = 1 << 14,
    own_surnames = 1 << 15 ///< Of people who differ from their family; the details have them too.
};
Q_DECLARE_FLAGS(Extent, Part)
Q_DECLARE_OPERATORS_FOR_FLAGS(Extent)

inline constexpr Extent whole_family{QFlag((1 << 15) - 1)};

/// The families of these keys with everything that hangs on them, in the order of the keys; a key without a row is
/// passed over. A handful of statements, whatever their number. Throws core::DatabaseError.
[[nodiscard]] std::vector<FamilyFile> load_families(core::Session& session, std::span<const int> surname_ids,
                                                    Extent extent = whole_family);

/// Nullopt when the family is gone.
[[nodiscard]] std::optional<FamilyFile> load_family(core::Session& session, int surname_id);

/// Writes the whole set as one transaction: rows of people and items that are no longer in the file go, the others
/// are rewritten. New families and people get their keys, positions are renumbered, `Primary_name` and `last_edit`
/// are set; the file comes back as it was stored. A new file's `created` is `today`. Visits and booking state are left
/// alone on a family that exists. Throws core::DatabaseError, or std::logic_error for a family that must never be
/// stored (see require_storable()), and then nothing is written.
[[nodiscard]] FamilyFile save_family(core::Session& session, FamilyFile file, const QDate& today);

/// Deletes a family with everything that goes with it, and then its files and those of its people. What outlives them
/// stays: giving, attendance, audits. Throws core::DatabaseError, and then nothing is gone, or core::FileError.
void remove_stored_family(core::Office& office, const FamilyFile& file);
/// The halves of it: the rows, and the files.
void remove_family_rows(core::Session& session, int surname_id);
void remove_family_files(const core::Office& office, const FamilyFile& file);

/// Adds an entry to the visits, which a save leaves alone.
void add_visit(core::Session& session, int surname_id, const Visit& visit);

/// Many new families in few statements; all keys must be 0. For making and importing churches.
void add_families(core::Session& session, std::vector<FamilyFile>& files, const QDate& today);

} // namespace kindrel::people
