#include "registers/weekly_charts.h"

#include <cmath>

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

constexpr double unit = 10000; ///< Ten-thousandths in a whole.
constexpr std::size_t most_together = 9;

/// Zero reads as "0", which tables leave out.
QString shown(double value, FigureKind kind)
{
    const auto text = shown_figure({std::llround(value * unit)}, kind);
    return text.isEmpty() ? u"0"_s : text;
}

pages::ChartSeries series_of(const Category& category, const FigureRow& row)
{
    pages::ChartSeries series{captioned(category), {}};
    for (const auto& figure : row)
        series.values.push_back(figure ? std::optional(double(figure->ten_thousandths) / unit) : std::nullopt);
    return series;
}

pages::ChartData empty_chart(const QString& title, const QStringList& labels, FigureKind kind)
{
    return {.title = title,
            .categories = labels,
            .series = {},
            .shown = [kind](double value) { return shown(value, kind); },
            .finest_step = kind == FigureKind::attendance ? 1.0 : 0.01};
}

QString title_of(FigureKind kind)
{
    return kind == FigureKind::attendance ? u"Attendance"_s : u"$ Amount"_s;
}

} // namespace

std::vector<pages::ChartData> charts_by_category(std::span<const Category> categories, const ChartFigures& figures)
{
    std::vector<pages::ChartData> charts;
    for (std::size_t i = 0; i < categories.size(); ++i) {
        charts.push_back(empty_chart(captioned(categories[i]), figures.labels, categories[i].kind));
        charts.back().series.push_back(series_of(categories[i], figures.rows[i]));
    }
    return charts;
}

std::vector<pages::ChartData> charts_by_kind(std::span<const Category> categories, const ChartFigures& figures)
{
    std::vector<pages::ChartData> charts;
    for (const auto kind : {FigureKind::attendance, FigureKind::money}) {
        bool open = false;
        for (std::size_t i = 0; i < categories.size(); ++i) {
            if (categories[i].kind != kind)
                continue;
            if (!open || charts.back().series.size() == most_together)
                charts.push_back(empty_chart(title_of(kind), figures.labels, kind));
            open = true;
            charts.back().series.push_back(series_of(categories[i], figures.rows[i]));
        }
    }
    // One series has no legend to name it.
    for (auto& chart : charts) {
        if (chart.series.size() == 1)
            chart.title = chart.series.front().name;
    }
    return charts;
}

} // namespace kindrel::registers
