#pragma once

#include "pages/page.h"
#include "pages/text_metrics.h"

#include <QStringList>

#include <functional>
#include <optional>
#include <span>
#include <vector>

namespace kindrel::pages {

enum class ChartShape : quint8 { bar, line, area, step, pie };
enum class ChartDepth : quint8 { flat, deep };

struct ChartStyle
{
    const char* name; ///< As it is offered, "3D Bar" for example.
    ChartShape shape;
    ChartDepth depth;
};

/// In the order in which they are offered.
[[nodiscard]] std::span<const ChartStyle> chart_styles();
/// Without regard to case; null when there is none.
[[nodiscard]] const ChartStyle* find_chart_style(QStringView name);

struct ChartSeries
{
    QString name;
    std::vector<std::optional<double>> values; ///< One for each category; what is unset or not there is not drawn.
};

struct ChartData
{
    QString title; ///< Empty: none.
    QStringList categories;
    std::vector<ChartSeries> series;
    std::function<QString(double)> shown = {}; ///< How values read; unset: as plain numbers.
    double finest_step = 0;                    ///< Between two values of the axis; 1 where only whole numbers are.
};

/// The chart of the data in exactly `size`. Series differ by shade, hatching and marker as well as colour, so that it
/// can be read in black and white. A pie shows the categories of one series, or the totals of several.
[[nodiscard]] Drawing chart(const ChartData& data, const ChartStyle& style, QSizeF size, const TypeScale& type,
                            TextMetrics& metrics);

} // namespace kindrel::pages
