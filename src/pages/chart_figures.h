#pragma once

#include "pages/chart_axes.h"

namespace kindrel::pages {

/// How far the back wall lies behind the front of a chart of the style in `room`; null when flat.
[[nodiscard]] QPointF depth_of(const ChartData& data, const ChartStyle& style, const QRectF& room);

/// Draws the values of all series as the style's bars, lines, areas or steps.
void draw_figures(ChartCanvas& canvas, const ChartData& data, const ChartStyle& style, const Plot& plot);

} // namespace kindrel::pages
