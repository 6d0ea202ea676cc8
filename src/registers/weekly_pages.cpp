#include "registers/weekly_pages.h"

#include "core/progress_run.h"
#include "pages/table.h"
#include "pages/text_layout.h"
#include "registers/weekly_charts.h"
#include "registers/weekly_tables.h"

#include <algorithm>
#include <cmath>
#include <functional>

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

using RowKind = WeeklyTable::RowKind;

// Points.
constexpr qreal date_in_ems = 9; ///< Width of the dates, in text sizes.
constexpr qreal name_width = 118;
constexpr qreal usual_chart = 250;
constexpr qreal least_chart = 190;
constexpr qreal least_small_chart = 150;
constexpr qreal highest_of_width = 0.7; ///< A chart that is higher than that looks lost in its width.
constexpr qreal between_charts = 14;
constexpr qreal cell_padding = 2;
constexpr qreal least_text = 5; ///< Holds the largest figures that years of Sundays can add up to.
constexpr QRgb stripe = 0xfff7f7f7;
constexpr QRgb summary_shade = pages::ink::shade;

core::ProgressRun begin(core::Progress& progress, std::size_t steps)
{
    return {progress, u"Creating report"_s, int(steps), u"Are you sure that you wish to cancel this report?"_s};
}

// Charts

/// Shares the room out among charts beneath each other: as many on a page as it holds at their least height, which then
/// fill it.
class ChartHeights
{
public:
    ChartHeights(const ChartRoom& room, qreal beneath, std::size_t charts, qreal least, qreal most)
        : m_page(room.page), m_left(beneath), m_charts(int(charts)), m_least(least + between_charts), m_most(most)
    {
    }

    [[nodiscard]] qreal next()
    {
        if (m_left < m_least)
            m_left = m_page;
        const int here = std::clamp(int(m_left / m_least), 1, std::max(m_charts--, 1));
        const auto height = std::min(m_left / here - between_charts, m_most);
        m_left -= height + between_charts;
        return height;
    }

private:
    qreal m_page, m_left;
    int m_charts;
    qreal m_least, m_most;
};

/// Charts above a table that fills the rest of the page; one that runs on beyond it leaves them their usual height.
qreal height_above_table(const ChartRoom& room, std::size_t charts, qreal most)
{
    const auto height = (room.page - room.table) / qreal(charts) - between_charts;
    return height < least_chart ? usual_chart : std::min(height, most);
}

bool write_charts(const WeeklyPlan& plan, std::span<const pages::ChartData> charts,
                  const std::function<qreal()>& next_height, pages::Flow& flow, core::Progress& progress)
{
    for (const auto& data : charts) {
        flow.drawing(pages::chart(data, *plan.chart, {flow.width(), next_height()}, flow.type(), flow.metrics()));
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

/// Whether charts stand two beside each other.
bool of_small_charts(const WeeklyPlan& plan)
{
    return plan.report->charts == ReportCharts::by_category && plan.categories.size() > 1;
}

bool write_small_charts(const WeeklyPlan& plan, std::span<const pages::ChartData> charts,
                        const std::function<qreal()>& next_height, pages::Flow& flow, core::Progress& progress)
{
    pages::TableStyle style;
    style.lines = pages::TableLines::none;
    style.padding = style.vertical_padding = between_charts / 2;
    pages::Table table(flow, {{.share = 1}, {.share = 1}}, style);
    const auto cell_of = [&](std::size_t place, qreal height) {
        return pages::Cell::of([&, place, height](pages::Writer& cell) {
            if (place < charts.size())
                cell.drawing(
                    pages::chart(charts[place], *plan.chart, {cell.width(), height}, cell.type(), cell.metrics()));
        });
    };
    for (std::size_t i = 0; i < charts.size(); i += 2) {
        const auto height = next_height();
        table.row({cell_of(i, height), cell_of(i + 1, height)});
        if (!progress.step())
            return false;
    }
    return true;
}

ChartFigures date_figures(const WeeklyPlan& plan)
{
    const auto dates = date_table(plan.figures, plan.categories);
    ChartFigures figures;
    for (const auto& date : dates.dates)
        figures.labels += date.shown(plan.day_order);
    for (std::size_t i = 0; i < plan.categories.size(); ++i)
        figures.rows.push_back(dates.column(i));
    return figures;
}

/// The months or years, and apart from them what stands for all of them.
ChartFigures slot_figures(const WeeklyPlan& plan)
{
    const auto slots = slot_table(*plan.report->shape, plan.period, plan.figures, plan.categories);
    ChartFigures figures{slots.columns.first(slots.slots), slots.rows};
    for (auto& row : figures.rows) {
        if (row.size() > std::size_t(slots.slots))
            figures.all.push_back(row.back());
        row.resize(std::size_t(slots.slots));
    }
    return figures;
}

std::vector<pages::ChartData> charts_of(const WeeklyPlan& plan)
{
    if (!plan.chart)
        return {};
    const auto figures = plan.report->shape ? slot_figures(plan) : date_figures(plan);
    if (plan.report->charts == ReportCharts::by_category)
        return charts_by_category(plan.categories, figures);
    return charts_by_kind(plan.categories, figures, plan.chart->shape);
}

// The table

/// The widest of a column's figures and of the words that head it, which stand in bold.
qreal widest(const WeeklyTable& table, qsizetype column, const pages::TextStyle& style, pages::TextMetrics& metrics)
{
    auto wide = pages::widest_word(table.columns[column], style.bolder(), metrics);
    for (const auto& row : table.rows) {
        const bool bold = row.kind == RowKind::summary || column >= table.plain;
        wide = std::max(wide, metrics.width(row.texts.value(column), style.bolder(bold)));
    }
    return wide;
}

/// The body text, or a smaller one in which no figure and no word of a heading is divided.
pages::TextStyle fitting_text(const WeeklyTable& table, qreal first_width, pages::Flow& flow)
{
    const auto& body = flow.type().body;
    const auto figures = table.columns.size() - 1;
    const auto room = (flow.width() - first_width) / qreal(figures) - 2 * cell_padding;
    qreal wide = room;
    for (qsizetype column = 1; column <= figures; ++column)
        wide = std::max(wide, widest(table, column, body, flow.metrics()));
    // Sizes go by sixteenths.
    const auto size = std::floor(body.size * room / wide * pages::units_per_point) / pages::units_per_point;
    return body.sized(std::max(std::min(size, body.size), least_text));
}

std::vector<pages::TableColumn> columns_of(const WeeklyTable& table, qreal first_width)
{
    std::vector<pages::TableColumn> columns{{.width = first_width, .heading = table.columns.front()}};
    for (const auto& name : table.columns.sliced(1))
        columns.push_back({.heading = name, .align = pages::Align::right});
    return columns;
}

std::vector<pages::Cell> cells_of(const WeeklyTable& table, const WeeklyTable::Row& row, const pages::TextStyle& text)
{
    std::vector<pages::Cell> cells;
    for (qsizetype column = 0; column < row.texts.size(); ++column) {
        const bool all = row.kind != RowKind::figures || column >= table.plain;
        auto& cell = cells.emplace_back(row.texts[column], text.bolder(all));
        if (row.kind == RowKind::summary)
            cell.shade = summary_shade;
        if (row.kind == RowKind::section)
            cell.columns = int(table.columns.size());
    }
    return cells;
}

bool write_table(const WeeklyTable& table, qreal first_width, pages::Flow& flow, core::Progress& progress)
{
    const auto text = fitting_text(table, first_width, flow);
    pages::TableStyle style{.padding = cell_padding, .vertical_padding = 2.5};
    style.heading_shade = pages::ink::shade;
    style.heading_style = text.bolder();
    style.stripe = stripe;
    pages::Table written(flow, columns_of(table, first_width), style);
    std::optional<pages::Keep> together; ///< The summaries.
    for (const auto& row : table.rows) {
        if (row.kind == RowKind::summary && !together)
            together.emplace(flow);
        written.row(cells_of(table, row, text));
        if (!progress.step())
            return false;
    }
    return true;
}

qreal first_width(const WeeklyPlan& plan, const pages::Flow& flow)
{
    return plan.report->shape ? name_width : flow.type().body.size * date_in_ems;
}

/// Fills the page with blocks of a point until the next one begins, and returns how many it took.
int fill_page(pages::Flow& trial, const pages::PageSpool& written)
{
    int blocks = 0;
    for (const int before = written.page_count(); written.page_count() == before; ++blocks)
        trial.write({.height = 1});
    return blocks;
}

bool write_charts_beneath(const WeeklyPlan& plan, std::span<const pages::ChartData> charts, const ChartRoom& room,
                          pages::Flow& flow, core::Progress& progress)
{
    if (charts.empty())
        return true;
    const bool small = of_small_charts(plan);
    const auto width = small ? flow.width() / 2 : flow.width();
    ChartHeights heights(room, room.beneath_table - between_charts, small ? pairs(charts.size()) : charts.size(),
                         small ? least_small_chart : least_chart, width * highest_of_width);
    flow.space(between_charts);
    return (small ? write_small_charts : write_charts)(
        plan, charts, [&] { return heights.next(); }, flow, progress);
}

} // namespace

ChartRoom measure_room(const WeeklyPlan& plan, pages::Flow& trial, const pages::PageSpool& written)
{
    core::SilentProgress nobody;
    (void)write_table(weekly_table(plan), first_width(plan, trial), trial, nobody);
    // A block is placed once the next one comes: two without height bring the table's end to its place.
    for (int i = 0; i < 2; ++i)
        trial.write({});
    const int full_pages = written.page_count();
    const auto beneath = fill_page(trial, written) - 2;
    const auto page = fill_page(trial, written);
    return {qreal(page), qreal((full_pages + 1) * page - beneath), qreal(beneath)};
}

bool write_weekly_pages(const WeeklyPlan& plan, const ChartRoom& room, pages::Flow& flow, core::Progress& progress)
{
    const auto table = weekly_table(plan);
    const auto charts = charts_of(plan);
    const bool small = of_small_charts(plan);
    const auto run = begin(progress, table.rows.size() + (small ? pairs(charts.size()) : charts.size()));
    const auto write_rows = [&] {
        return write_table(table, first_width(plan, flow), flow, progress);
    };
    if (plan.report->shape)
        return write_rows() && write_charts_beneath(plan, charts, room, flow, progress);
    const auto height = [&] {
        return height_above_table(room, charts.size(), flow.width() * highest_of_width);
    };
    return write_charts(plan, charts, height, flow, progress) && write_rows();
}

} // namespace kindrel::registers
