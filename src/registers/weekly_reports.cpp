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
                 ReportData::analysis, row_each, years, by_kind, landscape, year_changes},
};

constexpr qreal text_size = 9;
constexpr qreal slot_text_size = 8;
constexpr qreal dense_text_size = 7.5; ///< With many columns for the width.
constexpr std::size_t many_columns = 6;
constexpr QMarginsF landscape_margins{28, 30, 28, 30};
constexpr qreal below_period = 6;

bool refuse(core::Office& office, const QString& why)
{
    office.dialogue.show({why});
    return false;
}

/// The project's name; nullopt, after saying why, when none is chosen.
std::optional<QString> chosen_project(core::Office& office, int key)
{
    const auto projects = read_projects(*office.session, register_kind(Kind::weekly));
    const auto found = std::ranges::find(projects, key, &Project::key);
    if (found != projects.end())
        return found->name;
    office.dialogue.show({projects.empty() ? u"Unable to proceed as no Weekly projects have been setup"_s
                                           : u"Please choose a weekly project"_s});
    return {};
}

std::vector<Category> chosen_categories(core::Office& office, const WeeklyReportRequest& request)
{
    auto categories = read_categories(*office.session, request.project);
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

/// Whether the report can be of so many categories, with the charts that are asked for.
bool can_hold(core::Office& office, const WeeklyReportRequest& request, std::size_t categories)
{
    const auto& report = *request.report;
    if (categories == 0)
        return refuse(office, u"Please select either a financial or attendance item"_s);
    if (categories > std::size_t(report.most_categories))
        return refuse(office, limit_words(report));
    if (request.chart && report.charts == by_category && categories > most_graphs)
        return refuse(office,
                      u"A maximum of six graphs can only be displayed at once for the monthly analysis Report"_s);
    if (!request.chart && report.charts == required)
        return refuse(office, u"Please choose a chart style"_s);
    return true;
}

/// What the report needs when the choice is of another kind: the first thing that is then missing is asked for.
PeriodChoice fitting(PeriodChoice choice, ReportPeriod wanted)
{
    const bool span = choice.kind == PeriodKind::year_span;
    const bool year = choice.kind == PeriodKind::calendar_year || choice.kind == PeriodKind::financial_year;
    if (wanted == years)
        choice.kind = PeriodKind::year_span;
    else if (wanted == one_year && !year)
        choice.kind = PeriodKind::calendar_year;
    else if (wanted == any_days && span)
        choice.kind = PeriodKind::date_range;
    return choice;
}

/// What a run that may begin has found.
struct Plan
{
    QString project;
    std::vector<Category> categories;
    Period period;
};

/// Everything that can be refused before a figure is read.
std::optional<Plan> plan_of(core::Office& office, const WeeklyReportRequest& request)
{
    if (!core::permitted(office, core::Area::weekly_statistics))
        return {};
    const auto project = chosen_project(office, request.project);
    if (!project)
        return {};
    if (!request.report) {
        office.dialogue.show({u"Please choose a report"_s});
        return {};
    }
    auto categories = chosen_categories(office, request);
    if (!can_hold(office, request, categories.size()))
        return {};
    const auto period =
        read_period(fitting(request.period, request.report->period), office.day_order(), office.dialogue);
    if (!period)
        return {};
    return Plan{*project, std::move(categories), *period};
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

qreal text_size_of(const WeeklyReport& report, std::size_t categories)
{
    if (report.shape)
        return slot_text_size;
    return report.orientation == portrait && categories > many_columns ? dense_text_size : text_size;
}

/// Of the days that the report looks at.
std::vector<WeeklyFigure> read_figures(core::Session& session, const WeeklyReportRequest& request, const Plan& plan)
{
    const auto& period = plan.period;
    const auto read = [&](const Period& days) {
        return read_weekly_figures(session, request.project, days, plan.categories);
    };
    if (request.report->shape == month_changes)
        return read(period.from_month_before());
    if (request.report->shape != year_changes || period.years() == 1)
        return read(period);
    auto figures = read(period.only_year(period.first.year));
    std::ranges::copy(read(period.only_year(period.last.year)), std::back_inserter(figures));
    return figures;
}

bool write_report(core::Office& office, const WeeklyContent& content, const QString& project, pages::Paper paper,
                  core::Progress& progress, pages::PageSpool& spool)
{
    const auto& report = content.report;
    pages::TextStyle body;
    body.size = text_size_of(report, content.categories.size());
    pages::Flow flow(spool, page_of(report, paper), pages::TypeScale::around(body));
    const people::WorkingList no_people;
    output::OwnBands own;
    own.header = [words = project + content.period.title,
                  how = what_is_compared(report, content.period)](pages::Writer& band, int) {
        band.line(words, band.type().headings[1]);
        if (!how.isEmpty())
            band.line(how, band.type().small);
        band.space(below_period);
    };
    output::decorate(flow, QString::fromUtf8(report.title), {office, no_people}, own);
    if (!(report.shape ? write_slot_pages(content, flow, progress) : write_date_pages(content, flow, progress)))
        return false;
    flow.finish();
    return true;
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

bool run_weekly_report(core::Office& office, const WeeklyReportRequest& request, pages::Paper paper,
                       core::Progress& progress, pages::PageSpool& spool)
{
    const auto plan = plan_of(office, request);
    if (!plan)
        return false;
    const auto& report = *request.report;
    const auto figures = read_figures(*office.session, request, *plan);
    if (figures.empty())
        return refuse(office, u"No figures found for creating a report"_s);
    const auto* chart = report.charts == ReportCharts::none ? nullptr : request.chart;
    return write_report(office, {report, plan->period, plan->categories, figures, chart, office.day_order()},
                        plan->project, paper, progress, spool);
}

} // namespace kindrel::registers
