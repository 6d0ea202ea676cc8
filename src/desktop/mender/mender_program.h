#pragma once

#include "core/startup.h"

namespace kindrel::desktop {

/// The Mender with its window; returns when that is closed. Needs a display, and that there is no application object.
int run_mender(int& count, char** words, const core::StartRequest& request);

} // namespace kindrel::desktop
