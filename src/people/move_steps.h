#pragma once

#include "people/move_family.h"

#include <functional>

namespace kindrel::people {

/// What a move has done, in this order. Each step is whole in itself, and a move that was cut off behind any of them is
/// mended by the next one to that church.
enum class MoveStep {
    keys_kept,     ///< The other church has set keys aside and noted them.
    files_copied,  ///< Photographs and notebook pages lie there under the new keys.
    arrived,       ///< The family is in both churches.
    departed,      ///< It is in the other church alone.
    files_removed, ///< Nothing of it is left here.
    note_removed
};
inline constexpr int move_steps = 6;

/// Told of each step once it is done.
using MoveWatch = std::function<void(MoveStep)>;

/// move_family(), watched: tests cut it off by throwing.
[[nodiscard]] bool move_family_watched(core::Office& office, int surname_id, std::optional<int> church,
                                       core::Progress& progress, const MoveWatch& watch);

} // namespace kindrel::people
