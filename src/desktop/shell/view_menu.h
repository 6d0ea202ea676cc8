#pragma once

#include "desktop/shell/look.h"
#include "desktop/shell/remembered.h"

class QMenu;

namespace kindrel::desktop {

/// The program's palette and text size to choose from, kept for all churches of the workstation. The menu goes when it
/// is closed.
[[nodiscard]] QMenu* make_view_menu(Look& look, Remembered& remembered, QWidget* parent);

} // namespace kindrel::desktop
