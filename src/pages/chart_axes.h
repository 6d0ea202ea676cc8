#pragma once

#include "pages/chart_canvas.h"

namespace kindrel::pages {

/// The values of an axis: from `low` to `high` in steps of 1, 2 or 5 times a power of ten; zero is one of them.
struct ValueScale
{
    double low = 0, high = 1, step = 1;

    [[nodiscard]] int steps() const { return qRound((high - low) / step); }
    [[nodiscard]] double value(int place) const;

    /// Around zero and all values of the data, with about `most` steps at most.
    [[nodiscard]] static ValueScale around(const ChartData& data, int most);
};

/// Where values and categories lie in the front plane, and how far the back wall lies behind it.
struct Plot
{
    QRectF front;
    QPointF depth; ///< From a point in front to the same at the back; null when flat.
    ValueScale scale;
    int slots = 1; ///< Categories.

    [[nodiscard]] qreal slot_width() const { return front.width() / slots; }
    [[nodiscard]] qreal left_of(int slot) const { return front.left() + slot * slot_width(); }
    [[nodiscard]] qreal y(double value) const;
    [[nodiscard]] bool deep() const { return !depth.isNull(); }
};

[[nodiscard]] int slots_of(const ChartData& data);
[[nodiscard]] QString shown_value(const ChartData& data, double value);

/// Divides `room` between the plot and its labels, and draws all that lies behind the figures, and the labels.
[[nodiscard]] Plot draw_axes(ChartCanvas& canvas, const ChartData& data, const QRectF& room, QPointF depth);
/// The zero line and the axis, which stand before the figures.
void draw_front_lines(ChartCanvas& canvas, const Plot& plot);

} // namespace kindrel::pages
