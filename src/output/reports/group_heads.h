#pragma once

#include "output/family_lines.h"
#include "people/group_details.h"

#include <QHash>

namespace kindrel::output {

/// How much of a group's own details stands above its members.
enum class GroupHead { leader = 1, meeting = 2, everything = 4 };

/// The details of all groups by the groups' keys, in one statement.
[[nodiscard]] QHash<int, people::GroupDetails> read_group_details(core::Session& session);

/// The lines of a head under their captions, without what a run keeps to itself.
[[nodiscard]] CaptionLines head_lines(const people::GroupDetails& details, GroupHead head,
                                      const people::Details& withheld);

} // namespace kindrel::output
