#pragma once

#include "people/records.h"

#include <QStringList>

namespace kindrel::people {

/// What others changed between two readings of a family, one line each, in the words of the screens: "Phone", "Ann:
/// birth date", "Ben was added". What a save leaves alone (visits, booking state) and the texts of setup items, which
/// follow their lists, make no difference.
[[nodiscard]] QStringList changes_between(const FamilyFile& before, const FamilyFile& after);

/// Both kinds of changes to `base` together: field by field and list by list, `mine` where both changed the same.
[[nodiscard]] FamilyFile merged(const FamilyFile& base, const FamilyFile& mine, const FamilyFile& theirs);

} // namespace kindrel::people
