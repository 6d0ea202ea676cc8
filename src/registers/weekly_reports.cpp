#include "registers/weekly_reports.h"

#include "output/decoration.h"
#include "registers/projects.h"
#include "registers/weekly_pages.h"

#include <algorithm>
#include <array>

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

using enum ReportPeriod;
using enum ReportCharts;
using enum TableShape;
using enum pages::Orientation;

constexpr int column_each = 9; ///< Categories of a report that prints a column for each.
constexpr int row_each = 200;

constexpr std::array reports{
    WeeklyReport{"weekly_total_report",
                 "Weekly Totals",
                 "Lists the figures of each date, with the total, the average, the highest and the lowest of each "
                 "category",
                 ReportData::records,
                 column_each,
                 any_days,
                 ReportCharts::none,
                 portrait,
                 {}},
    WeeklyReport{"weekly_total_report_landscape",
                 "Weekly Totals",
                 "Lists the figures of each date across the page, with the total, the average, the highest and the "
                 "lowest of each category",
                 ReportData::records,
                 column_each,
                 any_days,
                 ReportCharts::none,
                 landscape,
                 {}},
    WeeklyReport{"weekly_analysis_report",
                 "Weekly Analysis",
                 "Draws the figures of the period as a chart and lists them beneath it",
                 ReportData::analysis,
                 column_each,
                 any_days,
                 required,
                 portrait,
                 {}},
    WeeklyReport{"weekly_table_report", "Monthly Totals", "Adds up the figures of each month of the year",
                 ReportData::records, row_each, one_year, by_category, landscape, month_totals},
    WeeklyReport{"weekly_table_average_report", "Monthly Averages",
                 "Works out the average figure of each month and of the whole year", ReportData::analysis, row_each,
                 one_year, by_category, landscape, month_averages},
    WeeklyReport{"weekly_table_variance_report", "Monthly Growth or Decline",
                 "Produce a report of either the growth or decline when comparing the average value found for the "
                 "month subtracted from the average value of the month before it",
                 ReportData::analysis, row_each, one_year, by_category, landscape, month_changes},
    WeeklyReport{"Yearly_table_report", "Yearly Totals", "Adds up the figures of each year over several years",
                 ReportData::records, row_each, years, by_kind, landscape, year_totals},
    WeeklyReport{"Yearly_average_report", "Yearly Averages",
                 "Works out the average figure of each year and of all years together", ReportData::analysis, row_each,
                 years, by_kind, landscape, year_averages},
    WeeklyReport{"Yearly_variance_report", "Yearly Comparison",
                 "Compares the monthly averages of one year with the monthly averages of another year and reports the "
                 "differences",
                 ReportData::analysis, row_each, two_years, by_kind, landscape, year_changes},
};

constexpr qreal text_size = 9;
constexpr qreal slot_text_size = 8;
constexpr qreal dense_text_size = 7.5; ///< With many columns for the width.
constexpr std::size_t many_columns = 6;
constexpr QMarginsF landscape_margins{28, 30, 28, 30};
constexpr qreal below_period = 6;

/// A choice that is in the way of a report, and what is said of it.
using Fault = std::pair<ReportField, QString>;

/// Nullopt, after saying why, when none is chosen.
std::optional<Project> chosen_project(core::Session& session, int key, ReportCheck& check)
{
    const auto projects = read_projects(session, register_kind(Kind::weekly));
    const auto found = std::ranges::find(projects, key, &Project::key);
    if (found != projects.end())
        return *found;
    return check.refuse(ReportField::project, projects.empty()
                                                  ? u"Unable to proceed as no Weekly projects have been setup"_s
                                                  : u"Please choose a weekly project"_s);
}

std::vector<Category> chosen_categories(core::Session& session, const WeeklyReportRequest& request)
{
    auto categories = read_categories(session, request.project);
    std::erase_if(categories, [&](const Category& category) {
        return std::ranges::find(request.categories, category.key) == request.categories.end();
    });
    return categories;
}

QString limit_words(const WeeklyReport& report)
{
    const auto data = report.data == ReportData::records ? u"data"_s : u"analysis"_s;
    return u"For the records %1 report you are only able to select a maximum amount of %2 categories"_s.arg(data).arg(
        report.most_categories);
}

/// What keeps the report from being of so many categories, with the charts that are asked for.
std::optional<Fault> too_much(const WeeklyReportRequest& request, std::size_t categories)
{
    const auto& report = *request.report;
    if (categories == 0)
        return {{ReportField::categories, u"Please select either a financial or attendance item"_s}};
    if (categories > std::size_t(report.most_categories))
        return {{ReportField::categories, limit_words(report)}};
    if (request.parts == ReportParts::table)
        return {};
    if (request.chart && report.charts == by_category && categories > most_graphs)
        return {{ReportField::chart,
                 u"A maximum of six graphs can only be displayed at once for the monthly analysis Report"_s}};
    if (!request.chart && report.charts == required)
        return {{ReportField::chart, u"Please choose a chart style"_s}};
    return {};
}

/// What the report needs when the choice is of another kind: the first thing that is then missing is asked for.
PeriodChoice fitting(PeriodChoice choice, ReportPeriod wanted)
{
    const bool span = choice.kind == PeriodKind::year_span;
    const bool year = choice.kind == PeriodKind::calendar_year || choice.kind == PeriodKind::financial_year;
    if (wanted == years || wanted == two_years)
        choice.kind = PeriodKind::year_span;
    else if (wanted == one_year && !year)
        choice.kind = PeriodKind::calendar_year;
    else if (wanted == any_days && span)
        choice.kind = PeriodKind::date_range;
    return choice;
}

/// Nullopt, after saying why, when the report cannot be of the period that is asked for.
std::optional<Period> chosen_period(const WeeklyReportRequest& request, core::DayOrder order, ReportCheck& check)
{
    const auto wanted = request.report->period;
    auto period = read_period(fitting(request.period, wanted), order, check);
    if (period && wanted == two_years && period->years() == 1)
        return check.refuse(ReportField::to, u"Please enter two different years to compare"_s);
    return period;
}

/// Why a report of changes would stand empty; nullopt when it has one to show.
std::optional<Fault> no_change(const WeeklyPlan& plan)
{
    const auto table = slot_table(*plan.report->shape, plan.period, plan.figures, plan.categories);
    const auto shows = [](const FigureRow& row) {
        return std::ranges::any_of(row, [](const auto& figure) { return figure.has_value(); });
    };
    if (std::ranges::any_of(table.rows, shows))
        return {};
    if (plan.report->shape == month_changes)
        return {{ReportField::from,
                 u"No month of the period and the month before it both have figures of the chosen categories."_s}};
    const int first = plan.period.first.year, last = plan.period.last.year;
    const auto without = u"There are no figures of %1 to compare with those of %2."_s;
    const auto none_of = [&](int year) {
        return std::ranges::none_of(plan.figures, [&](const auto& figure) { return figure.date.year == year; });
    };
    if (none_of(first))
        return {{ReportField::from, without.arg(first).arg(last)}};
    if (none_of(last))
        return {{ReportField::to, without.arg(last).arg(first)}};
    return {
        {ReportField::from, u"None of the chosen categories has figures of both %1 and %2."_s.arg(first).arg(last)}};
}

pages::PageSetup page_of(const WeeklyReport& report, pages::Paper paper)
{
    pages::PageSetup setup{.paper = paper, .orientation = report.orientation};
    if (report.orientation == landscape)
        setup.margins = landscape_margins;
    return setup;
}

/// What is taken from what; empty for a report without changes.
QString what_is_compared(const WeeklyReport& report, const Period& period)
{
    if (report.shape == month_changes)
        return u"The average of each month less that of the month before it"_s;
    if (report.shape == year_changes)
        return u"The monthly averages of %1 less those of %2"_s.arg(period.last.year).arg(period.first.year);
    return {};
}

pages::TypeScale type_of(const WeeklyPlan& plan)
{
    const bool dense = plan.report->orientation == portrait && plan.categories.size() > many_columns;
    pages::TextStyle body;
    body.size = plan.report->shape ? slot_text_size : dense ? dense_text_size : text_size;
    return pages::TypeScale::around(body);
}

/// Header and footer.
void decorate(core::Office& office, const WeeklyPlan& plan, pages::Flow& flow)
{
    const people::WorkingList no_people;
    output::OwnBands own;
    own.header = [words = plan.project.name + plan.period.title,
                  how = what_is_compared(*plan.report, plan.period)](pages::Writer& band, int) {
        band.line(words, band.type().headings[1]);
        if (!how.isEmpty())
            band.line(how, band.type().small);
        band.space(below_period);
    };
    output::decorate(flow, QString::fromUtf8(plan.report->title), {office, no_people}, own);
}

/// Of the days that the report looks at.
std::vector<WeeklyFigure> read_figures(core::Session& session, const WeeklyPlan& plan)
{
    const auto& period = plan.period;
    const auto read = [&](const Period& days) {
        return read_weekly_figures(session, plan.project.key, days, plan.categories);
    };
    if (plan.report->shape == month_changes)
        return read(period.from_month_before());
    if (plan.report->shape != year_changes)
        return read(period);
    auto figures = read(period.only_year(period.first.year));
    std::ranges::copy(read(period.only_year(period.last.year)), std::back_inserter(figures));
    return figures;
}

} // namespace

std::span<const WeeklyReport> weekly_reports()
{
    return reports;
}

const WeeklyReport* find_weekly_report(QStringView name)
{
    const auto found = std::ranges::find_if(reports, [&](const WeeklyReport& report) {
        return name.compare(QLatin1StringView(report.name), Qt::CaseInsensitive) == 0;
    });
    return found == reports.end() ? nullptr : &*found;
}

std::optional<WeeklyPlan> check_weekly_report(core::Office& office, const WeeklyReportRequest& request,
                                              ReportCheck& check)
{
    if (!core::permitted(office, core::Area::weekly_statistics))
        return {};
    auto& session = *office.session;
    const auto project = chosen_project(session, request.project, check);
    if (!project)
        return {};
    if (!request.report)
        return check.refuse(ReportField::report, u"Please choose a report"_s);
    auto categories = chosen_categories(session, request);
    if (const auto fault = too_much(request, categories.size()))
        return check.refuse(fault->first, fault->second);
    const auto period = chosen_period(request, office.day_order(), check);
    if (!period)
        return {};
    const bool charts = request.parts == ReportParts::pages && request.report->charts != ReportCharts::none;
    return WeeklyPlan{.report = request.report,
                      .project = *project,
                      .categories = std::move(categories),
                      .period = *period,
                      .chart = charts ? request.chart : nullptr,
                      .day_order = office.day_order()};
}

std::optional<WeeklyPlan> with_figures(core::Session& session, WeeklyPlan plan, ReportCheck& check)
{
    plan.figures = read_figures(session, plan);
    if (plan.figures.empty())
        return check.refuse(ReportField::from, u"No figures found for creating a report"_s);
    const bool changes = plan.report->shape == month_changes || plan.report->shape == year_changes;
    if (const auto fault = changes ? no_change(plan) : std::nullopt)
        return check.refuse(fault->first, fault->second);
    return plan;
}

std::optional<WeeklyPlan> plan_weekly_report(core::Office& office, const WeeklyReportRequest& request,
                                             ReportCheck& check)
{
    auto plan = check_weekly_report(office, request, check);
    return plan ? with_figures(*office.session, std::move(*plan), check) : std::nullopt;
}

bool write_weekly_report(core::Office& office, const WeeklyPlan& plan, pages::Paper paper, core::Progress& progress,
                         pages::PageSpool& spool)
{
    const auto setup = page_of(*plan.report, paper);
    const auto type = type_of(plan);
    ChartRoom room;
    if (plan.chart) {
        pages::PageSpool unseen;
        pages::Flow trial(unseen, setup, type);
        decorate(office, plan, trial);
        room = measure_room(plan, trial, unseen);
    }
    pages::Flow flow(spool, setup, type);
    decorate(office, plan, flow);
    if (!write_weekly_pages(plan, room, flow, progress))
        return false;
    flow.finish();
    return true;
}

} // namespace kindrel::registers
