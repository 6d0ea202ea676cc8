#pragma once

#include <QStyleOption>

class QPainter;

namespace kindrel::desktop {

enum class Ground { raised, flat };

void draw_button(const QStyleOption& option, QPainter& painter, Ground ground);
void draw_header_section(const QStyleOption& option, QPainter& painter);
/// Only the chosen tab is marked, by a line beneath it.
void draw_tab(const QStyleOptionTab& option, QPainter& painter);
void draw_scroll_bar(const QStyleOptionSlider& option, const QRect& slider, QPainter& painter);
/// The slider's place in a scroll bar that has no arrows.
[[nodiscard]] QRect scroll_slider(const QStyleOptionSlider& option);

} // namespace kindrel::desktop
