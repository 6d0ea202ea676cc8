#pragma once

#include "core/progress.h"
#include "pages/flow.h"
#include "registers/weekly_reports.h"

namespace kindrel::registers {

/// All that a report is written from.
struct WeeklyContent
{
    const WeeklyReport& report;
    const Period& period;
    std::span<const Category> categories;
    std::span<const WeeklyFigure> figures; ///< Of the period, for month_changes of the month before it too.
    const pages::ChartStyle* chart;        ///< Null: no charts.
    core::DayOrder day_order;
};

/// Each date's figure with a column for each category, then total, average, highest and lowest. False when cancelled.
[[nodiscard]] bool write_date_pages(const WeeklyContent& content, pages::Flow& flow, core::Progress& progress);
/// Months or years with a row for each category.
[[nodiscard]] bool write_slot_pages(const WeeklyContent& content, pages::Flow& flow, core::Progress& progress);

} // namespace kindrel::registers
