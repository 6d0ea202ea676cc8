#pragma once

#include "pages/style.h"

#include <QFont>
#include <QFontMetricsF>
#include <QHash>

#include <array>
#include <memory>
#include <optional>
#include <vector>

namespace kindrel::pages {

/// Text is laid out and drawn at this many units to the point, unhinted, so that it comes out alike on every device.
inline constexpr int units_per_point = 16;

/// The font that lays out and draws a style, `units_per_point` times its size.
[[nodiscard]] QFont reference_font(const TextStyle& style);

/// Measures text in points and remembers what it measured.
class TextMetrics
{
public:
    TextMetrics();
    ~TextMetrics();
    TextMetrics(const TextMetrics&) = delete;
    TextMetrics& operator=(const TextMetrics&) = delete;

    [[nodiscard]] qreal ascent(const TextStyle& style);
    [[nodiscard]] qreal line_height(const TextStyle& style);
    [[nodiscard]] qreal width(const QString& text, const TextStyle& style);
    /// The sum of the letters' widths when the text surely fits on one line of `room` and needs no layout: common
    /// letters, no tabs or breaks. Nullopt says nothing.
    [[nodiscard]] std::optional<qreal> plain_width(const QString& text, const TextStyle& style, qreal room);
    /// The text, or its beginning and an ellipsis.
    [[nodiscard]] QString elided(const QString& text, const TextStyle& style, qreal room);
    [[nodiscard]] const QFont& font(const TextStyle& style);

private:
    struct Face;
    [[nodiscard]] Face& face(const TextStyle& style);

    std::vector<std::unique_ptr<Face>> m_faces;
};

} // namespace kindrel::pages
