#pragma once

#include <QStyleOption>

class QPainter;

namespace kindrel::desktop {

enum class Ground { raised, flat };

void draw_button(const QStyleOption& option, QPainter& painter, Ground ground);
/// The box that is ticked, with the tick or with the dash of what is neither.
void draw_tick_box(const QStyleOption& option, QPainter& painter);
/// Around a field that is typed in.
void draw_field_edge(const QStyleOption& option, QPainter& painter);
/// Around a list or table.
void draw_frame(const QStyleOption& option, QPainter& painter);
void draw_header_section(const QStyleOptionHeader& option, QPainter& painter);
void draw_header_ground(const QStyleOption& option, QPainter& painter);
/// Only the chosen tab is marked, by a line beneath it.
void draw_tab(const QStyleOptionTab& option, QPainter& painter);
void draw_scroll_bar(const QStyleOptionSlider& option, const QRect& slider, QPainter& painter);
/// The slider's place in a scroll bar that has no arrows.
[[nodiscard]] QRect scroll_slider(const QStyleOptionSlider& option);

} // namespace kindrel::desktop
