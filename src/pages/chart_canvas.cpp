#include "pages/chart_canvas.h"

#include <QLineF>
#include <QPolygonF>

#include <algorithm>
#include <array>
#include <cmath>
#include <numbers>

namespace kindrel::pages {

namespace {

/// Neighbours differ in lightness; those of like lightness are hatched differently.
constexpr std::array<SeriesLook, look_count> looks{{
    {0xff35587f, Hatch::none, Marker::circle},
    {0xffe3b04b, Hatch::none, Marker::square},
    {0xff5b9a8b, Hatch::rising, Marker::triangle},
    {0xffeee8dc, Hatch::none, Marker::diamond},
    {0xff94474a, Hatch::falling, Marker::wedge},
    {0xffb3cbe2, Hatch::rising, Marker::ring},
    {0xff77823f, Hatch::level, Marker::frame},
    {0xffd3bfdb, Hatch::crossed, Marker::cross},
    {0xff4a4a4f, Hatch::upright, Marker::plus},
}};

constexpr qreal marker_radius = 2.4;
constexpr qreal marker_stroke = 1;
constexpr qreal hatch_spacing = 3.2;
constexpr qreal hatch_thickness = 0.45;
constexpr qreal least_hatched = 3;    ///< Narrower faces are left plain.
constexpr qreal least_outlined = 2.5; ///< Narrower faces would be outline alone.
constexpr qreal least_stroke = 0.2;
constexpr qreal stroke_thickness = 1.4;
constexpr int middling_grey = 140;

QRgb lit(QRgb colour, Face side)
{
    const auto shown = QColor::fromRgba(colour);
    return side == Face::front ? colour : (side == Face::top ? shown.lighter(118) : shown.darker(128)).rgba();
}

/// The points turned by the angle around the origin.
Outline turned(const Outline& points, qreal cosine, qreal sine)
{
    Outline result;
    for (const auto& point : points)
        result.emplace_back(point.x() * cosine - point.y() * sine, point.x() * sine + point.y() * cosine);
    return result;
}

/// Where the height `y` enters and leaves the outline, from left to right.
std::vector<qreal> crossings(const Outline& points, qreal y)
{
    std::vector<qreal> found;
    for (std::size_t i = 0; i < points.size(); ++i) {
        const auto& from = points[i];
        const auto& to = points[(i + 1) % points.size()];
        if ((from.y() <= y) != (to.y() <= y))
            found.push_back(from.x() + (y - from.y()) / (to.y() - from.y()) * (to.x() - from.x()));
    }
    std::ranges::sort(found);
    return found;
}

/// Level strokes through the outline, at the same heights whatever the outline.
std::vector<QLineF> level_strokes(const Outline& points)
{
    const auto [top, bottom] = std::ranges::minmax(points, {}, &QPointF::y);
    std::vector<QLineF> strokes;
    for (auto y = std::ceil(top.y() / hatch_spacing) * hatch_spacing; y < bottom.y(); y += hatch_spacing) {
        const auto ends = crossings(points, y);
        for (std::size_t i = 0; i + 1 < ends.size(); i += 2) {
            if (ends[i + 1] - ends[i] > least_stroke)
                strokes.emplace_back(ends[i], y, ends[i + 1], y);
        }
    }
    return strokes;
}

std::vector<qreal> angles_of(Hatch hatch)
{
    constexpr auto quarter = std::numbers::pi / 4;
    switch (hatch) {
    case Hatch::none:
        return {};
    case Hatch::level:
        return {0};
    case Hatch::rising:
        return {-quarter};
    case Hatch::falling:
        return {quarter};
    case Hatch::upright:
        return {2 * quarter};
    case Hatch::crossed:
        return {-quarter, quarter};
    }
    return {};
}

/// Corners of a regular figure, the first at the given angle clockwise from the right.
Outline regular(QPointF centre, int corners, qreal radius, qreal first)
{
    Outline points;
    for (int i = 0; i < corners; ++i) {
        const auto angle = first + 2 * std::numbers::pi * i / corners;
        points.push_back(centre + radius * QPointF(std::cos(angle), std::sin(angle)));
    }
    return points;
}

struct MarkerFigure
{
    int corners;
    qreal first; ///< In eighths of a turn.
    qreal times; ///< The radius, so that all look equally large.
    bool filled;
};

/// In the order of Marker; the last two are strokes.
constexpr std::array<MarkerFigure, 7> figures{{{16, 0, 1, true},
                                               {4, 1, 1.2, true},
                                               {3, -2, 1.35, true},
                                               {4, 0, 1.3, true},
                                               {3, 2, 1.35, true},
                                               {16, 0, 1, false},
                                               {4, 1, 1.2, false}}};

} // namespace

const SeriesLook& look_of(std::size_t place)
{
    return looks[place % looks.size()];
}

void ChartCanvas::line(QPointF from, QPointF to, qreal thickness, QRgb colour)
{
    m_items.push_back(LineItem{from, to, thickness, colour});
}

void ChartCanvas::polygon(Outline points, QRgb fill, QRgb outline, qreal thickness)
{
    m_items.push_back(PolygonItem{std::move(points), fill, outline, thickness});
}

void ChartCanvas::face(const Outline& points, const SeriesLook& look, Face side)
{
    const auto bounds = QPolygonF(QList<QPointF>(points.begin(), points.end())).boundingRect();
    const auto narrowest = std::min(bounds.width(), bounds.height());
    polygon(points, lit(look.fill, side), narrowest < least_outlined ? ink::none : outline_ink, outline_thickness);
    if (side == Face::front && narrowest >= least_hatched)
        hatch(points, look);
}

void ChartCanvas::stroke(const std::vector<QPointF>& corners, const SeriesLook& look)
{
    constexpr int palest = 190;
    const auto colour = qGray(look.fill) > palest ? QColor::fromRgba(look.fill).darker(150).rgba() : look.fill;
    for (std::size_t i = 0; i + 1 < corners.size(); ++i)
        line(corners[i], corners[i + 1], stroke_thickness, colour);
}

void ChartCanvas::hatch(const Outline& points, const SeriesLook& look)
{
    const QRgb colour = qGray(look.fill) < middling_grey ? 0xc0ffffff : 0xb0404040;
    for (const auto angle : angles_of(look.hatch)) {
        const auto cosine = std::cos(angle), sine = std::sin(angle);
        for (const auto& one : level_strokes(turned(points, cosine, -sine))) {
            const auto back = turned({one.p1(), one.p2()}, cosine, sine);
            line(back[0], back[1], hatch_thickness, colour);
        }
    }
}

void ChartCanvas::marker(QPointF centre, const SeriesLook& look)
{
    constexpr auto eighth = std::numbers::pi / 4;
    const auto place = std::size_t(look.marker);
    const auto ink = lit(look.fill, Face::side);
    if (place < figures.size()) {
        const auto& figure = figures[place];
        polygon(regular(centre, figure.corners, marker_radius * figure.times, figure.first * eighth),
                figure.filled ? look.fill : 0xffffffff, figure.filled ? outline_ink : ink,
                figure.filled ? outline_thickness : marker_stroke);
        return;
    }
    const auto ends = regular(centre, 4, marker_radius * 1.3, look.marker == Marker::cross ? eighth : 0);
    line(ends[0], ends[2], marker_stroke * 1.3, ink);
    line(ends[1], ends[3], marker_stroke * 1.3, ink);
}

void ChartCanvas::text(const QString& words, const TextStyle& style, QPointF at, Align align, qreal room)
{
    const auto shown = m_metrics.width(words, style) <= room ? words : m_metrics.elided(words, style, room);
    const auto width = m_metrics.width(shown, style);
    const auto before = align == Align::right ? width : align == Align::centre ? width / 2 : 0;
    m_items.push_back(TextItem{.at = at - QPointF(before, 0),
                               .width = width,
                               .right_to_left = shown.isRightToLeft(),
                               .style = style,
                               .text = shown});
}

void ChartCanvas::rising_label(const QString& words, QPointF end, qreal room)
{
    const auto& style = label_style();
    const auto shown = label_width(words) <= room ? words : m_metrics.elided(words, style, room);
    const auto width = label_width(shown);
    const auto run = width / std::numbers::sqrt2;
    m_items.push_back(TextItem{.at = end + QPointF(-run, run),
                               .width = width,
                               .right_to_left = shown.isRightToLeft(),
                               .angle = -45,
                               .style = style,
                               .text = shown});
}

} // namespace kindrel::pages
