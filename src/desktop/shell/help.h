#pragma once

#include "desktop/shell/windows.h"

namespace kindrel::desktop {

/// Opens the help text of a screen in its window, or brings that window forward.
void open_help(Windows& windows, const QString& name);

} // namespace kindrel::desktop
