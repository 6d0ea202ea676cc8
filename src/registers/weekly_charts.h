#pragma once

#include "pages/chart.h"
#include "registers/weekly_analysis.h"

namespace kindrel::registers {

/// Figures by category, a row for each, one figure for each label.
struct ChartFigures
{
    QStringList labels;
    std::vector<FigureRow> rows;
    FigureRow all = {}; ///< What stands for all labels together, by category; empty where they add up.
};

/// A chart for each category, under its name.
[[nodiscard]] std::vector<pages::ChartData> charts_by_category(std::span<const Category> categories,
                                                               const ChartFigures& figures);
/// Charts that hold several categories each, head counts and money apart, as many of them together as stay readable. A
/// pie of several shows what stands for all labels of each.
[[nodiscard]] std::vector<pages::ChartData> charts_by_kind(std::span<const Category> categories,
                                                           const ChartFigures& figures, pages::ChartShape shape);

} // namespace kindrel::registers
