#include "pages/chart_pie.h"

#include "pages/chart_axes.h"

#include <algorithm>
#include <cmath>
#include <numbers>
#include <numeric>

using namespace Qt::StringLiterals;

namespace kindrel::pages {

namespace {

constexpr double least_share = 0.02; ///< Smaller slices are gathered when there are several.
constexpr int most_slices = 14;
constexpr qreal label_share = 0.3; ///< Of the width, for the labels of a side.
constexpr qreal least_radius = 8;
constexpr qreal leader = 9; ///< From the rim to where a label's line turns level.
constexpr qreal beside_leader = 4;
constexpr qreal label_slack = 0.5; ///< What name and figure may be wider together than one by one.
constexpr qreal line_spacing = 1.25;
constexpr int points_in_round = 180;
constexpr QRgb leader_ink = 0xff8a8f94;

struct Slice
{
    QString name;
    double value = 0;
};

struct Slices
{
    std::vector<Slice> shown;
    QStringList below_zero;

    [[nodiscard]] double total() const
    {
        return std::accumulate(shown.begin(), shown.end(), 0.0,
                               [](double sum, const Slice& slice) { return sum + slice.value; });
    }
};

std::vector<Slice> values_of(const ChartData& data)
{
    std::vector<Slice> values;
    if (data.series.size() == 1) {
        const auto& series = data.series.front().values;
        for (std::size_t i = 0; i < series.size(); ++i)
            values.push_back({data.categories.value(qsizetype(i)), series[i].value_or(0)});
        return values;
    }
    for (const auto& series : data.series) {
        values.push_back({series.name, 0});
        for (const auto& value : series.values)
            values.back().value += value.value_or(0);
    }
    return values;
}

/// Leaves at most `most` slices, the smallest in one at the end; a single small one stays.
void gather_small(std::vector<Slice>& slices, double total, std::size_t most)
{
    auto order = slices;
    std::ranges::stable_sort(order, std::ranges::greater(), &Slice::value);
    const auto large = std::size_t(
        std::ranges::count_if(order, [&](const Slice& slice) { return slice.value >= total * least_share; }));
    const auto kept = std::min(large, most - 1);
    if (slices.size() <= std::max<std::size_t>(kept + 1, 2))
        return;
    const auto limit = kept > 0 ? order[kept - 1].value : total;
    std::vector<Slice> result;
    Slice other{u"Other"_s};
    for (auto& slice : slices) {
        if (slice.value >= limit && result.size() < kept)
            result.push_back(std::move(slice));
        else
            other.value += slice.value;
    }
    result.push_back(other);
    slices = std::move(result);
}

Slices slices_of(const ChartData& data, std::size_t most)
{
    Slices slices;
    for (auto& slice : values_of(data)) {
        if (slice.value > 0)
            slices.shown.push_back(std::move(slice));
        else if (slice.value < 0)
            slices.below_zero += slice.name;
    }
    gather_small(slices.shown, slices.total(), most);
    return slices;
}

struct Round
{
    QPointF centre;
    qreal radius = 0;

    /// `part` of the whole turn, clockwise from the top.
    [[nodiscard]] QPointF rim(double part, qreal beyond = 0) const
    {
        const auto angle = 2 * std::numbers::pi * part;
        return centre + (radius + beyond) * QPointF(std::sin(angle), -std::cos(angle));
    }
};

Outline sector(const Round& round, double from, double to)
{
    Outline points;
    if (to - from < 1)
        points.push_back(round.centre);
    const auto count = std::max(2, int(std::ceil((to - from) * points_in_round)));
    for (int i = 0; i <= count; ++i)
        points.push_back(round.rim(from + (to - from) * i / count));
    return points;
}

struct Label
{
    QString name, figure; ///< One behind the other; where there is no room for both the name is shortened.
    double middle = 0;    ///< Of the slice, as a part of the turn.
    qreal y = 0;
};

/// Moves labels, from top to bottom, apart to lines of their own within the height.
void spread(std::vector<Label>& labels, qreal line, const QRectF& room)
{
    std::ranges::sort(labels, {}, &Label::y);
    auto free = room.top() + line / 2;
    for (auto& label : labels) {
        label.y = std::max(label.y, free);
        free = label.y + line;
    }
    auto last = room.bottom() - line / 2;
    for (auto label = labels.rbegin(); label != labels.rend(); ++label) {
        label->y = std::min(label->y, last);
        last = label->y - line;
    }
}

void draw_label(ChartCanvas& canvas, const Label& label, const Round& round, const QRectF& room)
{
    const bool right = label.middle < 0.5;
    const auto rim = round.rim(label.middle);
    const auto turn_x = round.centre.x() + (right ? 1 : -1) * (round.radius + leader);
    const QPointF turn(turn_x, label.y);
    canvas.line(rim, turn, 0.5, leader_ink);
    const auto start = turn + QPointF(right ? beside_leader : -beside_leader, 0);
    canvas.line(turn, start, 0.5, leader_ink);
    const auto middle = canvas.metrics().ascent(canvas.label_style()) * 0.36;
    const auto text_at = start + QPointF(right ? 2 : -2, middle);
    const auto wide = right ? room.right() - text_at.x() : text_at.x() - room.left();
    const auto name = canvas.metrics().elided(label.name, canvas.label_style(),
                                              wide - canvas.label_width(label.figure) - label_slack);
    canvas.text(name + label.figure, canvas.label_style(), text_at, right ? Align::left : Align::right, wide);
}

/// As it stands behind the slice's name.
QString figure_of(const ChartData& data, const Slice& slice, double total)
{
    return u": %1 (%2%)"_s.arg(shown_value(data, slice.value), QString::number(slice.value / total * 100, 'f', 1));
}

/// The last slice lies beside the first and must not look like it.
const SeriesLook& slice_look(std::size_t place, std::size_t count)
{
    const bool like_first = place > 0 && place + 1 == count && place % look_count == 0;
    return look_of(like_first ? place + look_count / 2 : place);
}

void draw_slices(ChartCanvas& canvas, const ChartData& data, const Slices& slices, const Round& round,
                 const QRectF& room)
{
    const auto total = slices.total();
    std::vector<Label> left, right;
    double from = 0;
    for (std::size_t i = 0; i < slices.shown.size(); ++i) {
        const auto& slice = slices.shown[i];
        const auto to = i + 1 == slices.shown.size() ? 1.0 : from + slice.value / total;
        canvas.face(sector(round, from, to), slice_look(i, slices.shown.size()));
        const auto middle = slices.shown.size() == 1 ? 0.25 : (from + to) / 2;
        (middle < 0.5 ? right : left)
            .push_back({slice.name, figure_of(data, slice, total), middle, round.rim(middle, leader).y()});
        from = to;
    }
    for (auto* labels : {&left, &right}) {
        spread(*labels, canvas.label_height() * line_spacing, room);
        for (const auto& label : *labels)
            draw_label(canvas, label, round, room);
    }
}

} // namespace

void draw_pie(ChartCanvas& canvas, const ChartData& data, const QRectF& room)
{
    const auto line = canvas.label_height() * line_spacing;
    const auto lines = std::max(2, int(room.height() / line) - 1);
    const auto slices = slices_of(data, std::size_t(std::min(lines, most_slices)));
    auto round_room = room;
    if (!slices.below_zero.empty()) {
        round_room.setBottom(room.bottom() - line);
        canvas.text(u"Below zero and not shown: "_s + slices.below_zero.join(u", "_s), canvas.label_style(),
                    {room.left(), room.bottom() - line * 0.2}, Align::left, room.width());
    }
    const auto radius = std::min(round_room.height() / 2 - line * 0.4, room.width() * (0.5 - label_share));
    draw_slices(canvas, data, slices, {round_room.center(), std::max(least_radius, radius)}, round_room);
}

} // namespace kindrel::pages
