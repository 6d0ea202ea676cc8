#pragma once

#include "core/progress.h"
#include "pages/flow.h"
#include "registers/weekly_reports.h"

namespace kindrel::registers {

/// What the charts of a report have to fill, in points.
struct ChartRoom
{
    qreal page = 0;          ///< Of an empty page.
    qreal table = 0;         ///< Taken by the table.
    qreal beneath_table = 0; ///< On the page on which the table ends.
};

/// Found by writing the table into a document that nobody sees, `trial`, whose pages go to `written`.
[[nodiscard]] ChartRoom measure_room(const WeeklyPlan& plan, pages::Flow& trial, const pages::PageSpool& written);

/// The report's table with its charts: those of dates above it, those of months and years beneath. False when
/// cancelled.
[[nodiscard]] bool write_weekly_pages(const WeeklyPlan& plan, const ChartRoom& room, pages::Flow& flow,
                                      core::Progress& progress);

} // namespace kindrel::registers
