#pragma once

#include "pages/chart.h"

namespace kindrel::pages {

enum class Hatch : quint8 { none, rising, falling, level, upright, crossed };
enum class Marker : quint8 { circle, square, triangle, diamond, wedge, ring, frame, cross, plus };

/// How a series or slice looks in every chart.
struct SeriesLook
{
    QRgb fill;
    Hatch hatch;
    Marker marker;
};

inline constexpr std::size_t look_count = 9;
/// Of the series at `place`; looks come again after the last.
[[nodiscard]] const SeriesLook& look_of(std::size_t place);

using Outline = std::vector<QPointF>;

/// The side of a body that a face shows; the light falls from above.
enum class Face : quint8 { front, top, side };

/// What the parts of one chart draw on.
class ChartCanvas
{
public:
    ChartCanvas(Drawing& drawing, const TypeScale& type, TextMetrics& metrics)
        : m_items(drawing.items), m_type(type), m_metrics(metrics)
    {
    }

    [[nodiscard]] const TypeScale& type() const { return m_type; }
    [[nodiscard]] const TextStyle& label_style() const { return m_type.small; }
    [[nodiscard]] qreal label_height() { return m_metrics.line_height(m_type.small); }
    [[nodiscard]] qreal label_width(const QString& text) { return m_metrics.width(text, m_type.small); }
    [[nodiscard]] TextMetrics& metrics() { return m_metrics; }

    void line(QPointF from, QPointF to, qreal thickness, QRgb colour);
    void polygon(Outline points, QRgb fill, QRgb outline = ink::none, qreal thickness = 0.5);
    /// A face of a body of the look, hatched where it is large enough to show it.
    void face(const Outline& points, const SeriesLook& look, Face side = Face::front);
    /// The line of a series through its corners.
    void stroke(const std::vector<QPointF>& corners, const SeriesLook& look);
    void marker(QPointF centre, const SeriesLook& look);
    /// A line of text whose left end, middle or right end stands at `at`, shortened to `room`.
    void text(const QString& words, const TextStyle& style, QPointF at, Align align, qreal room);
    /// A label that rises to `end` at 45 degrees, shortened to `room`.
    void rising_label(const QString& words, QPointF end, qreal room);

private:
    void hatch(const Outline& points, const SeriesLook& look);

    std::vector<Item>& m_items;
    const TypeScale& m_type;
    TextMetrics& m_metrics;
};

/// Thickness of the outlines of bars, slices and areas.
inline constexpr qreal outline_thickness = 0.4;
inline constexpr QRgb outline_ink = 0xff33383d;

} // namespace kindrel::pages
