#include "pages/chart_legend.h"

#include <algorithm>

using namespace Qt::StringLiterals;

namespace kindrel::pages {

namespace {

constexpr QSizeF swatch(10, 7);
constexpr qreal beside_swatch = 4;
constexpr qreal between_entries = 14;
constexpr qreal above_rows = 6;
constexpr qreal row_spacing = 1.35;
constexpr qreal most_share = 0.33; ///< Of the room's height.

struct Entry
{
    std::size_t place = 0;
    QString name;
    int row = 0;
    qreal left = 0;
    bool rest = false; ///< Stands for all the series that have no place.
};

qreal width_of(ChartCanvas& canvas, const QString& name, qreal room)
{
    return std::min(room, swatch.width() + beside_swatch + canvas.label_width(name));
}

/// The entries in their rows; those beyond `most_rows` become one that counts them.
std::vector<Entry> arranged(ChartCanvas& canvas, const ChartData& data, qreal room, int most_rows)
{
    std::vector<Entry> entries;
    qreal left = 0;
    int row = 0;
    for (std::size_t place = 0; place < data.series.size(); ++place) {
        const auto& name = data.series[place].name;
        const auto width = width_of(canvas, name, room);
        if (left > 0 && left + width > room) {
            left = 0;
            ++row;
        }
        if (row == most_rows) {
            const auto rest = data.series.size() - place + 1;
            entries.back().name = u"and %1 more"_s.arg(rest);
            entries.back().rest = true;
            break;
        }
        entries.push_back({place, name, row, left});
        left += width + between_entries;
    }
    return entries;
}

void draw_swatch(ChartCanvas& canvas, QPointF at, std::size_t place, ChartShape shape)
{
    const auto& look = look_of(place);
    const QRectF box(at, swatch);
    if (shape != ChartShape::line && shape != ChartShape::step) {
        canvas.face({box.topLeft(), box.topRight(), box.bottomRight(), box.bottomLeft()}, look);
        return;
    }
    canvas.stroke({{box.left(), box.center().y()}, {box.right(), box.center().y()}}, look);
    canvas.marker(box.center(), look);
}

} // namespace

qreal draw_legend(ChartCanvas& canvas, const ChartData& data, ChartShape shape, const QRectF& room)
{
    const auto line = canvas.label_height() * row_spacing;
    const auto entries = arranged(canvas, data, room.width(), std::max(1, int(room.height() * most_share / line)));
    const auto height = (entries.back().row + 1) * line;
    const auto ascent = canvas.metrics().ascent(canvas.label_style());
    for (const auto& entry : entries) {
        const QPointF at(room.left() + entry.left, room.bottom() - height + entry.row * line);
        const auto indent = entry.rest ? 0 : swatch.width() + beside_swatch;
        if (!entry.rest)
            draw_swatch(canvas, at + QPointF(0, ascent * 0.64 - swatch.height() / 2), entry.place, shape);
        canvas.text(entry.name, canvas.label_style(), at + QPointF(indent, ascent), Align::left,
                    room.width() - entry.left - indent);
    }
    return height + above_rows;
}

} // namespace kindrel::pages
