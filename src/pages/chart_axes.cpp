#include "pages/chart_axes.h"

#include <algorithm>
#include <cmath>
#include <numbers>

namespace kindrel::pages {

namespace {

constexpr qreal beside_label = 4;
constexpr qreal between_labels = 5;
constexpr qreal below_axis = 3;
constexpr qreal lines_per_step = 2.4; ///< Heights of a label from one value to the next.
constexpr int most_steps = 8;
constexpr qreal least_side = 12;         ///< Of a plot in a place too small for one.
constexpr qreal most_label_share = 0.3;  ///< Of the height, for labels that rise.
constexpr qreal line_along_rising = 1.5; ///< Heights of a label from one rising label to the next.
constexpr QRgb grid_ink = 0xffd2d5d8;
constexpr QRgb wall_ink = 0xfff6f7f8;
constexpr QRgb side_ink = 0xffeceef0;
constexpr QRgb axis_ink = 0xff5a5a5a;

/// The smallest of 1, 2, 5, 10, 20 … (and their parts) that is not below `least`.
double round_step(double least)
{
    const auto power = std::pow(10, std::floor(std::log10(least)));
    for (const auto times : {1, 2, 5}) {
        if (times * power >= least * (1 - 1e-9))
            return times * power;
    }
    return 10 * power;
}

/// How the categories are written below the plot.
struct CategoryLabels
{
    bool rising = false;
    int every = 1;  ///< Only each so manieth is written.
    qreal room = 0; ///< For one label, along its line.
    qreal height = 0;
    qreal left = 0; ///< How far they reach out to the left of the plot.
};

CategoryLabels plan_labels(ChartCanvas& canvas, const ChartData& data, qreal slot, qreal height)
{
    const auto line = canvas.label_height();
    qreal widest = 0;
    for (const auto& label : data.categories)
        widest = std::max(widest, canvas.label_width(label));
    if (widest + between_labels <= slot)
        return {.room = slot, .height = line + below_axis};
    const auto room = std::min(widest, height * most_label_share * std::numbers::sqrt2);
    CategoryLabels labels{.rising = true,
                          .every = std::max(1, int(std::ceil(line * line_along_rising / slot))),
                          .room = room,
                          .height = room / std::numbers::sqrt2 + line};
    for (int i = 0; i < data.categories.size(); i += labels.every) {
        const auto run = std::min(room, canvas.label_width(data.categories[i])) / std::numbers::sqrt2;
        labels.left = std::max(labels.left, run - (i + 0.5) * slot);
    }
    return labels;
}

void draw_labels(ChartCanvas& canvas, const ChartData& data, const Plot& plot, const CategoryLabels& labels)
{
    const auto ascent = canvas.metrics().ascent(canvas.label_style());
    for (int i = 0; i < data.categories.size(); i += labels.every) {
        const QPointF middle(plot.left_of(i) + plot.slot_width() / 2, plot.front.bottom() + below_axis);
        if (labels.rising)
            canvas.rising_label(data.categories[i], middle + QPointF(ascent / 2, ascent / 2), labels.room);
        else
            canvas.text(data.categories[i], canvas.label_style(), middle + QPointF(0, ascent), Align::centre,
                        labels.room);
    }
}

void draw_walls(ChartCanvas& canvas, const Plot& plot)
{
    const auto& front = plot.front;
    const auto back = front.translated(plot.depth);
    canvas.polygon({back.topLeft(), back.topRight(), back.bottomRight(), back.bottomLeft()}, wall_ink);
    if (!plot.deep())
        return;
    canvas.polygon({front.topLeft(), back.topLeft(), back.bottomLeft(), front.bottomLeft()}, side_ink);
    canvas.polygon({front.bottomLeft(), back.bottomLeft(), back.bottomRight(), front.bottomRight()}, side_ink,
                   grid_ink);
}

void draw_grid(ChartCanvas& canvas, const ChartData& data, const Plot& plot)
{
    const auto middle = canvas.metrics().ascent(canvas.label_style()) * 0.36;
    for (int i = 0; i <= plot.scale.steps(); ++i) {
        const auto value = plot.scale.value(i);
        const QPointF left(plot.front.left(), plot.y(value));
        const auto behind = left + plot.depth;
        if (plot.deep())
            canvas.line(left, behind, 0.5, grid_ink);
        canvas.line(behind, behind + QPointF(plot.front.width(), 0), 0.5, grid_ink);
        canvas.text(shown_value(data, value), canvas.label_style(), left + QPointF(-beside_label, middle), Align::right,
                    plot.front.left());
    }
}

/// The level of zero where figures hang below it.
void draw_zero_plane(ChartCanvas& canvas, const Plot& plot)
{
    const QPointF left(plot.front.left(), plot.y(0)), right(plot.front.right(), plot.y(0));
    if (plot.deep() && plot.scale.low < 0)
        canvas.polygon({left, left + plot.depth, right + plot.depth, right}, 0x80dfe3e6, grid_ink);
}

} // namespace

double ValueScale::value(int place) const
{
    // Counted in steps so that zero is exactly zero.
    return (std::round(low / step) + place) * step;
}

ValueScale ValueScale::around(const ChartData& data, int most)
{
    double least = 0, greatest = 0;
    for (const auto& series : data.series) {
        for (const auto& value : series.values) {
            least = std::min(least, value.value_or(0));
            greatest = std::max(greatest, value.value_or(0));
        }
    }
    if (least == greatest)
        greatest = std::max(1.0, data.finest_step);
    ValueScale scale;
    scale.step = std::max(round_step((greatest - least) / std::clamp(most, 1, most_steps)), data.finest_step);
    scale.low = std::floor(least / scale.step + 1e-9) * scale.step;
    scale.high = std::ceil(greatest / scale.step - 1e-9) * scale.step;
    return scale;
}

qreal Plot::y(double value) const
{
    return front.bottom() - (value - scale.low) / (scale.high - scale.low) * front.height();
}

int slots_of(const ChartData& data)
{
    std::size_t most = std::size_t(data.categories.size());
    for (const auto& series : data.series)
        most = std::max(most, series.values.size());
    return std::max(1, int(most));
}

QString shown_value(const ChartData& data, double value)
{
    return data.shown ? data.shown(value) : QString::number(value);
}

Plot draw_axes(ChartCanvas& canvas, const ChartData& data, const QRectF& room, QPointF depth)
{
    Plot plot;
    plot.depth = depth;
    plot.slots = slots_of(data);
    const auto line = canvas.label_height();
    plot.scale = ValueScale::around(data, int(room.height() * 0.8 / (line * lines_per_step)));
    qreal left = 0;
    for (int i = 0; i <= plot.scale.steps(); ++i)
        left = std::max(left, canvas.label_width(shown_value(data, plot.scale.value(i))) + beside_label);
    const auto labels = plan_labels(canvas, data, (room.width() - left - depth.x()) / plot.slots, room.height());
    left = std::max(left, labels.left);
    plot.front = QRectF(room.left() + left, room.top() + line / 2 - depth.y(),
                        std::max(least_side, room.width() - left - depth.x()),
                        std::max(least_side, room.height() - line / 2 + depth.y() - labels.height));
    draw_walls(canvas, plot);
    draw_grid(canvas, data, plot);
    draw_labels(canvas, data, plot, labels);
    draw_zero_plane(canvas, plot);
    return plot;
}

void draw_front_lines(ChartCanvas& canvas, const Plot& plot)
{
    canvas.line({plot.front.left(), plot.y(0)}, {plot.front.right(), plot.y(0)}, 0.8, axis_ink);
    canvas.line(plot.front.topLeft(), plot.front.bottomLeft(), 0.5, axis_ink);
}

} // namespace kindrel::pages
