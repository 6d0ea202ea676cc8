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

std::optional<double> drawn(const std::optional<core::Amount>& figure)
{
    return figure ? std::optional(double(figure->ten_thousandths) / unit) : std::nullopt;
}

pages::ChartSeries series_of(const Category& category, const FigureRow& row)
{
    pages::ChartSeries series{captioned(category), {}};
    for (const auto& figure : row)
        series.values.push_back(drawn(figure));
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

/// Of the categories that share a chart.
using Places = std::vector<std::size_t>;

std::vector<Places> shared_charts(std::span<const Category> categories)
{
    std::vector<Places> charts;
    for (const auto kind : {FigureKind::attendance, FigureKind::money}) {
        bool open = false;
        for (std::size_t i = 0; i < categories.size(); ++i) {
            if (categories[i].kind != kind)
                continue;
            if (!open || charts.back().size() == most_together)
                charts.emplace_back();
            open = true;
            charts.back().push_back(i);
        }
    }
    return charts;
}

pages::ChartData chart_of(const Category& category, const QStringList& labels, const FigureRow& row)
{
    auto chart = empty_chart(captioned(category), labels, category.kind);
    chart.series.push_back(series_of(category, row));
    return chart;
}

/// One figure for each category.
pages::ChartData whole_chart(std::span<const Category> categories, const Places& places, const FigureRow& all)
{
    const auto kind = categories[places.front()].kind;
    auto chart = empty_chart(kind_name(kind), {}, kind);
    auto& series = chart.series.emplace_back(pages::ChartSeries{kind_name(kind), {}});
    for (const auto place : places) {
        chart.categories += captioned(categories[place]);
        series.values.push_back(drawn(all[place]));
    }
    return chart;
}

pages::ChartData shared_chart(std::span<const Category> categories, const Places& places, const ChartFigures& figures)
{
    const auto kind = categories[places.front()].kind;
    auto chart = empty_chart(kind_name(kind), figures.labels, kind);
    for (const auto place : places)
        chart.series.push_back(series_of(categories[place], figures.rows[place]));
    return chart;
}

} // namespace

std::vector<pages::ChartData> charts_by_category(std::span<const Category> categories, const ChartFigures& figures)
{
    std::vector<pages::ChartData> charts;
    for (std::size_t i = 0; i < categories.size(); ++i)
        charts.push_back(chart_of(categories[i], figures.labels, figures.rows[i]));
    return charts;
}

std::vector<pages::ChartData> charts_by_kind(std::span<const Category> categories, const ChartFigures& figures,
                                             pages::ChartShape shape)
{
    const bool whole = shape == pages::ChartShape::pie && !figures.all.empty();
    std::vector<pages::ChartData> charts;
    for (const auto& places : shared_charts(categories)) {
        if (places.size() == 1) // One series has no legend to name it.
            charts.push_back(chart_of(categories[places.front()], figures.labels, figures.rows[places.front()]));
        else if (whole)
            charts.push_back(whole_chart(categories, places, figures.all));
        else
            charts.push_back(shared_chart(categories, places, figures));
    }
    return charts;
}

} // namespace kindrel::registers
