#pragma once

#include "core/office.h"

namespace kindrel::core {

/// Compacts the church's database under the busy marker, with the old content kept in `compact`. Returns false when it
/// was left out: with too little free space, which is told, or while somebody else holds the marker. Throws
/// DatabaseError or FileError with the database unharmed.
bool compact_church(Office& office);

/// The same for a caller who holds the busy marker already and has seen that there is room.
void compact_held_church(Office& office);

} // namespace kindrel::core
