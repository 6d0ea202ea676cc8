#include "registers/weekly_pages.h"

#include "core/progress_run.h"
#include "pages/table.h"
#include "registers/weekly_charts.h"

#include <algorithm>

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

// Points.
constexpr qreal date_in_ems = 9; ///< Width of the dates, in text sizes.
constexpr qreal name_width = 118;
constexpr qreal chart_height = 250;
constexpr qreal small_chart_height = 172;
constexpr qreal between_charts = 14;
constexpr qreal cell_padding = 2;
constexpr QRgb stripe = 0xfff7f7f7;
constexpr QRgb summary_shade = pages::ink::shade;

pages::TableStyle table_style(const pages::Flow& flow)
{
    pages::TableStyle style;
    style.heading_shade = pages::ink::shade;
    style.heading_style = flow.type().body.bolder();
    style.stripe = stripe;
    style.padding = cell_padding;
    style.vertical_padding = 2.5;
    return style;
}

pages::TableColumn figure_column(const QString& heading)
{
    return {.heading = heading, .align = pages::Align::right};
}

core::ProgressRun begin(core::Progress& progress, std::size_t steps)
{
    return {progress, u"Creating report"_s, int(steps), u"Are you sure that you wish to cancel this report?"_s};
}

// Charts

bool write_charts(const WeeklyContent& content, std::span<const pages::ChartData> charts, pages::Flow& flow,
                  core::Progress& progress)
{
    for (const auto& data : charts) {
        flow.drawing(pages::chart(data, *content.chart, {flow.width(), chart_height}, flow.type(), flow.metrics()));
        flow.space(between_charts);
        if (!progress.step())
            return false;
    }
    return true;
}

std::size_t pairs(std::size_t charts)
{
    return (charts + 1) / 2;
}

/// Two beside each other.
bool write_small_charts(const WeeklyContent& content, std::span<const pages::ChartData> charts, pages::Flow& flow,
                        core::Progress& progress)
{
    pages::TableStyle style;
    style.lines = pages::TableLines::none;
    style.padding = style.vertical_padding = between_charts / 2;
    pages::Table table(flow, {{.share = 1}, {.share = 1}}, style);
    const auto cell_of = [&](std::size_t place) {
        return pages::Cell::of([&, place](pages::Writer& cell) {
            if (place < charts.size())
                cell.drawing(pages::chart(charts[place], *content.chart, {cell.width(), small_chart_height},
                                          cell.type(), cell.metrics()));
        });
    };
    for (std::size_t i = 0; i < charts.size(); i += 2) {
        table.row({cell_of(i), cell_of(i + 1)});
        if (!progress.step())
            return false;
    }
    return true;
}

// A row for each date

struct Summary
{
    const char* caption;
    std::optional<core::Amount> (*of)(const FigureRow&, FigureKind);
};

Tally tally_of(const FigureRow& column)
{
    Tally tally;
    for (const auto& figure : column) {
        if (figure)
            tally.add(*figure);
    }
    return tally;
}

std::optional<core::Amount> highest(const FigureRow& column, FigureKind)
{
    return *std::ranges::max_element(column);
}

/// Dates without a figure do not count.
std::optional<core::Amount> lowest(const FigureRow& column, FigureKind)
{
    std::optional<core::Amount> least;
    for (const auto& figure : column) {
        if (figure && (!least || *figure < *least))
            least = figure;
    }
    return least;
}

constexpr std::array summaries{
    Summary{"Total Amount",
            [](const FigureRow& column, FigureKind) {
                return tally_of(column).total();
            }},
    Summary{"Average Amount",
            [](const FigureRow& column, FigureKind kind) {
                return tally_of(column).average(kind);
            }},
    Summary{"Highest Amount", highest},
    Summary{"Lowest Amount", lowest},
};

QString shown(const std::optional<core::Amount>& figure, FigureKind kind)
{
    return figure ? shown_figure(*figure, kind) : QString();
}

std::vector<pages::TableColumn> date_columns(std::span<const Category> categories, qreal date_width)
{
    std::vector<pages::TableColumn> columns{{.width = date_width, .heading = u"Date"_s}};
    for (const auto& category : categories)
        columns.push_back(figure_column(captioned(category)));
    return columns;
}

void write_summaries(const WeeklyContent& content, const DateTable& dates, pages::Table& table,
                     const pages::TextStyle& style)
{
    for (const auto& summary : summaries) {
        pages::Cell caption(QString::fromUtf8(summary.caption), style);
        caption.shade = summary_shade;
        std::vector<pages::Cell> cells{caption};
        for (std::size_t i = 0; i < content.categories.size(); ++i) {
            const auto kind = content.categories[i].kind;
            cells.emplace_back(shown(summary.of(dates.column(i), kind), kind), style);
            cells.back().shade = summary_shade;
        }
        table.row(cells);
    }
}

bool write_date_rows(const WeeklyContent& content, const DateTable& dates, pages::Flow& flow, core::Progress& progress)
{
    const auto date_width = flow.type().body.size * date_in_ems;
    pages::Table table(flow, date_columns(content.categories, date_width), table_style(flow));
    for (std::size_t row = 0; row < dates.rows.size(); ++row) {
        QStringList texts{dates.dates[row].shown(content.day_order)};
        for (std::size_t i = 0; i < content.categories.size(); ++i)
            texts += shown(dates.rows[row][i], content.categories[i].kind);
        table.row(texts);
        if (!progress.step())
            return false;
    }
    const pages::Keep together(flow);
    write_summaries(content, dates, table, flow.type().body.bolder());
    return true;
}

ChartFigures chart_figures(const DateTable& dates, std::size_t categories, core::DayOrder order)
{
    ChartFigures figures;
    for (const auto& date : dates.dates)
        figures.labels += date.shown(order);
    for (std::size_t i = 0; i < categories; ++i)
        figures.rows.push_back(dates.column(i));
    return figures;
}

// A row for each category

QString shown_slot(const std::optional<core::Amount>& figure, FigureKind kind, TableShape shape)
{
    if (!figure)
        return {};
    if (shape != TableShape::month_changes && shape != TableShape::year_changes)
        return shown_figure(*figure, kind);
    const auto text = shown_change(*figure, kind);
    return text.isEmpty() ? u"0"_s : text;
}

void write_section(pages::Table& table, FigureKind kind, int columns, const pages::TextStyle& style)
{
    pages::Cell cell(kind_name(kind), style);
    cell.columns = columns;
    table.row({cell});
}

bool write_slot_rows(const WeeklyContent& content, const SlotTable& slots, pages::Flow& flow, core::Progress& progress)
{
    std::vector<pages::TableColumn> columns{{.width = name_width, .heading = u"Category"_s}};
    for (const auto& name : slots.columns)
        columns.push_back(figure_column(name));
    pages::Table table(flow, columns, table_style(flow));
    const bool sections = content.categories.front().kind != content.categories.back().kind;
    for (std::size_t i = 0; i < content.categories.size(); ++i) {
        const auto& category = content.categories[i];
        if (sections && (i == 0 || content.categories[i - 1].kind != category.kind))
            write_section(table, category.kind, int(columns.size()), flow.type().body.bolder());
        std::vector<pages::Cell> cells{captioned(category)};
        for (std::size_t slot = 0; slot < slots.rows[i].size(); ++slot) {
            const bool all = slot >= std::size_t(slots.slots);
            cells.emplace_back(shown_slot(slots.rows[i][slot], category.kind, *content.report.shape),
                               flow.type().body.bolder(all));
        }
        table.row(cells);
        if (!progress.step())
            return false;
    }
    return true;
}

/// The months or years, and apart from them what stands for all of them.
ChartFigures chart_figures(const SlotTable& slots)
{
    ChartFigures figures{slots.columns.first(slots.slots), slots.rows};
    for (auto& row : figures.rows) {
        if (row.size() > std::size_t(slots.slots))
            figures.all.push_back(row.back());
        row.resize(std::size_t(slots.slots));
    }
    return figures;
}

} // namespace

bool write_date_pages(const WeeklyContent& content, pages::Flow& flow, core::Progress& progress)
{
    const auto dates = date_table(content.figures, content.categories);
    std::vector<pages::ChartData> charts;
    if (content.chart)
        charts = charts_by_kind(content.categories, chart_figures(dates, content.categories.size(), content.day_order),
                                content.chart->shape);
    const auto run = begin(progress, dates.dates.size() + charts.size());
    return write_charts(content, charts, flow, progress) && write_date_rows(content, dates, flow, progress);
}

bool write_slot_pages(const WeeklyContent& content, pages::Flow& flow, core::Progress& progress)
{
    const auto slots = slot_table(*content.report.shape, content.period, content.figures, content.categories);
    const bool small = content.report.charts == ReportCharts::by_category;
    std::vector<pages::ChartData> charts;
    if (content.chart) {
        const auto figures = chart_figures(slots);
        charts = small ? charts_by_category(content.categories, figures)
                       : charts_by_kind(content.categories, figures, content.chart->shape);
    }
    const auto run = begin(progress, content.categories.size() + (small ? pairs(charts.size()) : charts.size()));
    if (!write_slot_rows(content, slots, flow, progress))
        return false;
    if (charts.empty())
        return true;
    flow.space(between_charts);
    return small ? write_small_charts(content, charts, flow, progress) : write_charts(content, charts, flow, progress);
}

} // namespace kindrel::registers
