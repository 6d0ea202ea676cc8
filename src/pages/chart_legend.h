#pragma once

#include "pages/chart_canvas.h"

namespace kindrel::pages {

/// Names the series in rows along the foot of `room` and returns the height taken; series that have no place in a
/// third of the room are counted.
[[nodiscard]] qreal draw_legend(ChartCanvas& canvas, const ChartData& data, ChartShape shape, const QRectF& room);

} // namespace kindrel::pages
