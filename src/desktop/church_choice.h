#pragma once

#include "desktop/shell/desk.h"

namespace kindrel::desktop {

/// Asks which of the seven churches to work with and loads it; one that was never set up is offered as new.
void load_another_church(Desk& desk);
/// Leaves the mark by which start-up counts the office's church as set up. Training and booked-out data have none.
void mark_as_set_up(const core::Office& office);

} // namespace kindrel::desktop
