#include "pages/chart.h"

#include "pages/chart_figures.h"
#include "pages/chart_legend.h"
#include "pages/chart_pie.h"

#include <algorithm>
#include <array>

using namespace Qt::StringLiterals;

namespace kindrel::pages {

namespace {

using enum ChartShape;
using enum ChartDepth;

constexpr std::array<ChartStyle, 9> styles{{{"3D Bar", bar, deep},
                                            {"2D Bar", bar, flat},
                                            {"3D Line", line, deep},
                                            {"2D Line", line, flat},
                                            {"3D Area", area, deep},
                                            {"2D Area", area, flat},
                                            {"3D Step", step, deep},
                                            {"2D Step", step, flat},
                                            {"2D Pie", pie, flat}}};

constexpr qreal below_title = 4;

bool has_figure(const ChartData& data, ChartShape shape)
{
    const auto counts = [&](const std::optional<double>& value) {
        return value && (shape != pie || *value != 0);
    };
    return std::ranges::any_of(data.series,
                               [&](const auto& series) { return std::ranges::any_of(series.values, counts); });
}

qreal draw_title(ChartCanvas& canvas, const QString& title, const QRectF& room)
{
    if (title.isEmpty())
        return 0;
    const auto& style = canvas.type().headings[2];
    canvas.text(title, style, room.topLeft() + QPointF(0, canvas.metrics().ascent(style)), Align::left, room.width());
    return canvas.metrics().line_height(style) + below_title;
}

void say_empty(ChartCanvas& canvas, const QRectF& room)
{
    canvas.text(u"No figures"_s, canvas.type().caption, room.center(), Align::centre, room.width());
}

} // namespace

std::span<const ChartStyle> chart_styles()
{
    return styles;
}

const ChartStyle* find_chart_style(QStringView name)
{
    const auto found = std::ranges::find_if(styles, [&](const ChartStyle& style) {
        return name.compare(QLatin1StringView(style.name), Qt::CaseInsensitive) == 0;
    });
    return found == styles.end() ? nullptr : &*found;
}

Drawing chart(const ChartData& data, const ChartStyle& style, QSizeF size, const TypeScale& type, TextMetrics& metrics)
{
    Drawing drawing{size};
    ChartCanvas canvas(drawing, type, metrics);
    QRectF room({}, size);
    room.setTop(draw_title(canvas, data.title, room));
    if (style.shape != pie && data.series.size() > 1)
        room.setBottom(room.bottom() - draw_legend(canvas, data, style.shape, room));
    if (style.shape == pie) {
        if (has_figure(data, pie))
            draw_pie(canvas, data, room);
        else
            say_empty(canvas, room);
        return drawing;
    }
    const auto plot = draw_axes(canvas, data, room, depth_of(data, style, room));
    draw_figures(canvas, data, style, plot);
    draw_front_lines(canvas, plot);
    if (!has_figure(data, style.shape))
        say_empty(canvas, plot.front.translated(plot.depth / 2));
    return drawing;
}

} // namespace kindrel::pages
