#pragma once

#include "core/office.h"
#include "core/progress.h"
#include "pages/chart.h"
#include "pages/page_setup.h"
#include "pages/spool.h"
#include "registers/weekly_analysis.h"

namespace kindrel::registers {

/// What limits the number of categories speaks of.
enum class ReportData { records, analysis };
/// The kinds of period that a report can be of.
enum class ReportPeriod { any_days, one_year, years, two_years };
/// Whether charts belong to a report, or may be added, one for each category or several categories together.
enum class ReportCharts { none, by_category, by_kind, required };

/// A report of the output page, as its list of report types offers it.
struct WeeklyReport
{
    const char* name;
    const char* title; ///< Heads its pages, above project and period.
    const char* description;
    ReportData data;
    int most_categories;
    ReportPeriod period;
    ReportCharts charts;
    pages::Orientation orientation;
    std::optional<TableShape> shape; ///< Unset: a row for each date.
};

inline constexpr int most_graphs = 6; ///< Of those by category.

/// In the order in which they are offered.
[[nodiscard]] std::span<const WeeklyReport> weekly_reports();
/// By its name without regard to case; null when there is none.
[[nodiscard]] const WeeklyReport* find_weekly_report(QStringView name);

/// What becomes of a report: its pages, or its table alone, to which no rule about charts applies.
enum class ReportParts { pages, table };

/// What the output page asks for.
struct WeeklyReportRequest
{
    int project = 0;
    const WeeklyReport* report = nullptr;
    std::vector<int> categories = {}; ///< Keys; printed in the project's order.
    PeriodChoice period = {};
    const pages::ChartStyle* chart = nullptr; ///< Null: without charts.
    ReportParts parts = ReportParts::pages;
};

/// All that a report is written from.
struct WeeklyPlan
{
    const WeeklyReport* report = nullptr;
    Project project;
    std::vector<Category> categories = {};
    Period period = {};
    std::vector<WeeklyFigure> figures = {};   ///< Of the period, for month_changes of the month before it too.
    const pages::ChartStyle* chart = nullptr; ///< Null: no charts.
    core::DayOrder day_order = {};
};

/// Everything that can be refused before a figure is read; the plan has none yet. Nullopt when the report was refused,
/// which the person has been told. Throws core::DatabaseError.
[[nodiscard]] std::optional<WeeklyPlan> check_weekly_report(core::Office& office, const WeeklyReportRequest& request,
                                                            ReportCheck& check);
/// The plan with its figures. Nullopt when they make no report, which the person has been told. Throws
/// core::DatabaseError.
[[nodiscard]] std::optional<WeeklyPlan> with_figures(core::Session& session, WeeklyPlan plan, ReportCheck& check);
/// One after the other.
[[nodiscard]] std::optional<WeeklyPlan> plan_weekly_report(core::Office& office, const WeeklyReportRequest& request,
                                                           ReportCheck& check);
/// Writes the report into the spool and closes it. False when it was cancelled; the spool then stays open. Throws
/// core::FileError.
[[nodiscard]] bool write_weekly_report(core::Office& office, const WeeklyPlan& plan, pages::Paper paper,
                                       core::Progress& progress, pages::PageSpool& spool);

} // namespace kindrel::registers
