#pragma once

#include "core/session.h"
#include "people/records.h"

namespace kindrel::people {

/// A stored family that may be the one in the editor.
struct Likeness
{
    int surname_id = 0;
    QString family; ///< "Naismith, Ann".
    QString reason; ///< In words: "Ann Naismith is in it", "the same phone 5550 1234", "the same e-mail ann@…".

    friend bool operator==(const Likeness&, const Likeness&) = default;
};

/// The stored families, other than the file's own, that share a surname with a given name, a phone or an e-mail with
/// it; each once, with its first reason, at most five. Case, accents and the spacing of numbers make no difference.
/// A handful of statements.
[[nodiscard]] std::vector<Likeness> likely_duplicates(core::Session& session, const FamilyFile& file);

} // namespace kindrel::people
