#include "pages/chart_figures.h"

#include <QLineF>

#include <algorithm>
#include <cmath>
#include <numeric>

namespace kindrel::pages {

namespace {

constexpr qreal group_share = 0.76;     ///< Of a category's width, that its bars take.
constexpr qreal few_bars_width = 46;    ///< No bar is broader.
constexpr qreal height_of_depth = 0.62; ///< Rise of the depth for a step to the right.
constexpr qreal lane_share = 0.7;       ///< Of a lane's depth, that its ribbon takes.
constexpr qreal between_markers = 14;
constexpr qreal lone_half = 0.3; ///< Of a category's width, to each side of a value without neighbours.

using Points = std::vector<QPointF>;

/// A stretch of values without a gap.
struct Stretch
{
    Points corners; ///< Of the line through them.
    Points values;  ///< Where the values themselves stand.
};

bool steps(ChartShape shape)
{
    return shape == ChartShape::step;
}

void add_value(Stretch& stretch, const Plot& plot, int slot, double value, ChartShape shape)
{
    const QPointF middle(plot.left_of(slot) + plot.slot_width() / 2, plot.y(value));
    stretch.values.push_back(middle);
    if (!steps(shape)) {
        stretch.corners.push_back(middle);
        return;
    }
    stretch.corners.emplace_back(plot.left_of(slot), middle.y());
    stretch.corners.emplace_back(plot.left_of(slot + 1), middle.y());
}

/// A value without neighbours gets some width, or an area through it would have none.
void widen(Stretch& stretch, const Plot& plot)
{
    if (stretch.corners.size() != 1)
        return;
    const QPointF half(plot.slot_width() * lone_half, 0);
    stretch.corners = {stretch.values.front() - half, stretch.values.front() + half};
}

std::vector<Stretch> stretches_of(const ChartSeries& series, const Plot& plot, ChartShape shape)
{
    std::vector<Stretch> stretches;
    bool open = false;
    for (std::size_t i = 0; i < series.values.size(); ++i) {
        if (series.values[i] && !open)
            stretches.emplace_back();
        open = series.values[i].has_value();
        if (open)
            add_value(stretches.back(), plot, int(i), *series.values[i], shape);
    }
    for (auto& stretch : stretches)
        widen(stretch, plot);
    return stretches;
}

/// The part of the depth in which a series lies.
struct Lane
{
    QPointF front, back;

    [[nodiscard]] QPointF depth() const { return back - front; }
};

Lane lane_of(const Plot& plot, std::size_t place, std::size_t count)
{
    const auto each = plot.depth / qreal(std::max<std::size_t>(count, 1));
    const auto front = each * (qreal(place) + (1 - lane_share) / 2);
    return {front, front + each * lane_share};
}

Points moved(Points points, QPointF by)
{
    for (auto& point : points)
        point += by;
    return points;
}

/// A line with thickness in depth. Stretches further right stand nearer and cover those before them.
void draw_ribbon(ChartCanvas& canvas, const Points& corners, const Lane& lane, const SeriesLook& look)
{
    for (std::size_t i = 0; i + 1 < corners.size(); ++i) {
        const auto from = corners[i] + lane.front, to = corners[i + 1] + lane.front;
        const auto along = to - from;
        // Steeper than the depth itself, the line shows its underside.
        const bool under = -along.y() * lane.depth().x() > -lane.depth().y() * along.x();
        canvas.face({from, to, to + lane.depth(), from + lane.depth()}, look, under ? Face::side : Face::top);
    }
}

/// Where values lie close together only some are marked, at other places for each series.
void draw_markers(ChartCanvas& canvas, const Stretch& stretch, const Plot& plot, QPointF offset, std::size_t place)
{
    const auto every = std::size_t(std::max(1.0, std::ceil(between_markers / plot.slot_width())));
    const auto first = stretch.values.size() > every ? place % every : 0;
    for (auto i = first; i < stretch.values.size(); i += every)
        canvas.marker(stretch.values[i] + offset, look_of(place));
}

void draw_line_series(ChartCanvas& canvas, const ChartSeries& series, std::size_t place, const Plot& plot,
                      const Lane& lane, ChartShape shape)
{
    for (const auto& stretch : stretches_of(series, plot, shape)) {
        if (plot.deep())
            draw_ribbon(canvas, stretch.corners, lane, look_of(place));
        if (stretch.values.size() > 1 || steps(shape))
            canvas.stroke(moved(stretch.corners, lane.front), look_of(place));
        draw_markers(canvas, stretch, plot, lane.front, place);
    }
}

void draw_area_series(ChartCanvas& canvas, const ChartSeries& series, std::size_t place, const Plot& plot,
                      const Lane& lane)
{
    auto look = look_of(place);
    const auto zero = plot.y(0);
    for (const auto& stretch : stretches_of(series, plot, ChartShape::area)) {
        auto outline = moved(stretch.corners, lane.front);
        outline.emplace_back(outline.back().x(), zero + lane.front.y());
        outline.emplace_back(outline.front().x(), zero + lane.front.y());
        if (plot.deep()) {
            draw_ribbon(canvas, stretch.corners, lane, look);
            const QPointF end = stretch.corners.back() + lane.front, foot(end.x(), zero + lane.front.y());
            canvas.face({end, foot, foot + lane.depth(), end + lane.depth()}, look, Face::side);
        } else {
            look.fill = (look.fill & 0x00ffffff) | 0xd8000000;
        }
        canvas.face(outline, look);
    }
}

double weight_of(const ChartSeries& series)
{
    return std::accumulate(series.values.begin(), series.values.end(), 0.0,
                           [](double sum, const auto& value) { return sum + std::abs(value.value_or(0)); });
}

/// The places of the series from the one in front to the one at the back: areas the largest last, lest they hide the
/// others.
std::vector<std::size_t> front_to_back(const ChartData& data, ChartShape shape)
{
    std::vector<std::size_t> order(data.series.size());
    std::iota(order.begin(), order.end(), 0);
    if (shape == ChartShape::area)
        std::ranges::stable_sort(order, {}, [&](std::size_t place) { return weight_of(data.series[place]); });
    return order;
}

void draw_lanes(ChartCanvas& canvas, const ChartData& data, ChartShape shape, const Plot& plot)
{
    const auto order = front_to_back(data, shape);
    for (std::size_t i = order.size(); i-- > 0;) {
        const auto& series = data.series[order[i]];
        const auto lane = lane_of(plot, i, order.size());
        if (shape == ChartShape::area)
            draw_area_series(canvas, series, order[i], plot, lane);
        else
            draw_line_series(canvas, series, order[i], plot, lane, shape);
    }
}

void draw_bar(ChartCanvas& canvas, const QRectF& bar, const Plot& plot, const SeriesLook& look)
{
    if (plot.deep()) {
        const auto back = bar.translated(plot.depth);
        canvas.face({bar.topRight(), back.topRight(), back.bottomRight(), bar.bottomRight()}, look, Face::side);
        canvas.face({bar.topLeft(), back.topLeft(), back.topRight(), bar.topRight()}, look, Face::top);
    }
    canvas.face({bar.topLeft(), bar.topRight(), bar.bottomRight(), bar.bottomLeft()}, look);
}

qreal bar_width(qreal slot, std::size_t series)
{
    return std::min(few_bars_width, slot * group_share / qreal(std::max<std::size_t>(series, 1)));
}

/// From left to right, so that each covers the side of the one before.
void draw_bars(ChartCanvas& canvas, const ChartData& data, const Plot& plot)
{
    const auto width = bar_width(plot.slot_width(), data.series.size());
    const auto zero = plot.y(0);
    for (int slot = 0; slot < plot.slots; ++slot) {
        auto left = plot.left_of(slot) + (plot.slot_width() - width * qreal(data.series.size())) / 2;
        for (std::size_t place = 0; place < data.series.size(); ++place, left += width) {
            const auto& values = data.series[place].values;
            if (std::size_t(slot) >= values.size() || !values[std::size_t(slot)])
                continue;
            const auto end = plot.y(*values[std::size_t(slot)]);
            draw_bar(canvas, {left, std::min(zero, end), width, std::abs(end - zero)}, plot, look_of(place));
        }
    }
}

} // namespace

QPointF depth_of(const ChartData& data, const ChartStyle& style, const QRectF& room)
{
    if (style.depth == ChartDepth::flat)
        return {};
    const auto count = qreal(data.series.size());
    const auto slot = room.width() / slots_of(data);
    const auto most = std::min(room.width(), room.height()) * 0.3;
    const auto across = style.shape == ChartShape::bar
                            ? std::clamp(bar_width(slot, data.series.size()) * 0.6, 2.0, 14.0)
                            : std::min({10 + 7 * count, 6 + 1.5 * slot * count, most});
    return {across, -across * height_of_depth};
}

void draw_figures(ChartCanvas& canvas, const ChartData& data, const ChartStyle& style, const Plot& plot)
{
    if (style.shape == ChartShape::bar)
        draw_bars(canvas, data, plot);
    else
        draw_lanes(canvas, data, style.shape, plot);
}

} // namespace kindrel::pages
