#pragma once

#include "core/dialogue.h"
#include "people/records.h"

namespace kindrel::people {

/// What keeps a family from being written. A `question` asks whether to leave without saving; the others are told.
struct SaveRefusal
{
    /// Where the cursor belongs afterwards.
    enum class Where {
        surname,
        people,
        given_name,
        residential_suburb,
        residential_postcode,
        postal_suburb,
        postal_postcode
    };
    Where where;
    QString text;
    bool question = false;
};

/// The first that applies, in the order of the fields on the screen; nullopt for a family that may be written.
[[nodiscard]] std::optional<SaveRefusal> save_refusal(const FamilyFile& file);

/// Throws std::logic_error for a family that must never be stored: without surname, people or a given name, with more
/// than 17 people or with a school year of zero.
void require_storable(const FamilyFile& file);

/// The refusal of an 18th person, and that of a school year of zero.
[[nodiscard]] core::Message family_is_full();
[[nodiscard]] core::Message no_school_year_zero();

} // namespace kindrel::people
