#pragma once

#include <QColor>
#include <QPalette>
#include <QString>

namespace kindrel::desktop {

enum class Shade { light, dark };

/// What a record can be in; always shown with its word as well as its colour.
enum class State { plain, deceased, archive, prospect, privacy, contact, booked_out, altered, error };

/// Every role of every group, so that nothing of the desktop's own palette shows through.
[[nodiscard]] QPalette palette_of(Shade shade);
[[nodiscard]] Shade shade_of(const QPalette& palette);

/// Reads at 5:1 and better on every background of its shade.
[[nodiscard]] QColor state_colour(State state, Shade shade);
/// Captions and what stands back: quieter than text, still readable.
[[nodiscard]] QColor quiet_colour(Shade shade);
/// Lines between areas of a page.
[[nodiscard]] QColor line_colour(Shade shade);
/// Around what is filled in or ticked: 3:1 and better against every background of its shade.
[[nodiscard]] QColor edge_colour(Shade shade);
/// Behind what the mouse is over.
[[nodiscard]] QColor hover_colour(Shade shade);

} // namespace kindrel::desktop
