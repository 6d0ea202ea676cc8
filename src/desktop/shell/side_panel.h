#pragma once

class QLayout;
class QScrollArea;

namespace kindrel::desktop {

/// A column of fixed width that scrolls when the window is low.
[[nodiscard]] QScrollArea* make_side_panel(QLayout* content, int width);

} // namespace kindrel::desktop
