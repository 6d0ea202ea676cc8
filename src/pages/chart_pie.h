#pragma once

#include "pages/chart_canvas.h"

namespace kindrel::pages {

/// A round of slices with their names, values and shares around it. The smallest slices are gathered into one; values
/// below zero have no slice and are named beneath.
void draw_pie(ChartCanvas& canvas, const ChartData& data, const QRectF& room);

} // namespace kindrel::pages
