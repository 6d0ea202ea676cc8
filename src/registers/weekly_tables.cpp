#include "registers/weekly_tables.h"

#include <algorithm>
#include <array>

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

using RowKind = WeeklyTable::RowKind;

const QString no_average = u"–"_s; ///< Of figures that add up to nothing.

Tally tally_of(const FigureRow& column)
{
    Tally tally;
    for (const auto& figure : column) {
        if (figure)
            tally.add(*figure);
    }
    return tally;
}

QString shown(const std::optional<core::Amount>& figure, FigureKind kind)
{
    return figure ? shown_figure(*figure, kind) : QString();
}

QString total(const FigureRow& column, FigureKind kind)
{
    return shown(tally_of(column).total(), kind);
}

QString average(const FigureRow& column, FigureKind kind)
{
    const auto tally = tally_of(column);
    return tally.count > 0 && tally.sum == 0 ? no_average : shown(tally.average(kind), kind);
}

QString highest(const FigureRow& column, FigureKind kind)
{
    return shown(*std::ranges::max_element(column), kind);
}

/// Dates without a figure do not count.
QString lowest(const FigureRow& column, FigureKind kind)
{
    std::optional<core::Amount> least;
    for (const auto& figure : column) {
        if (figure && (!least || *figure < *least))
            least = figure;
    }
    return shown(least, kind);
}

struct Summary
{
    const char* caption;
    QString (*of)(const FigureRow&, FigureKind);
};
constexpr std::array summaries{Summary{"Total Amount", total}, Summary{"Average Amount", average},
                               Summary{"Highest Amount", highest}, Summary{"Lowest Amount", lowest}};

WeeklyTable table_of_dates(const WeeklyPlan& plan)
{
    const auto dates = date_table(plan.figures, plan.categories);
    WeeklyTable table{.columns = {u"Date"_s}, .plain = int(plan.categories.size()) + 1, .rows = {}};
    for (const auto& category : plan.categories)
        table.columns += captioned(category);
    for (std::size_t row = 0; row < dates.rows.size(); ++row) {
        QStringList texts{dates.dates[row].shown(plan.day_order)};
        for (std::size_t i = 0; i < plan.categories.size(); ++i)
            texts += shown(dates.rows[row][i], plan.categories[i].kind);
        table.rows.push_back({texts, RowKind::figures});
    }
    for (const auto& summary : summaries) {
        QStringList texts{QString::fromLatin1(summary.caption)};
        for (std::size_t i = 0; i < plan.categories.size(); ++i)
            texts += summary.of(dates.column(i), plan.categories[i].kind);
        table.rows.push_back({texts, RowKind::summary});
    }
    return table;
}

QString shown_slot(const std::optional<core::Amount>& figure, FigureKind kind, TableShape shape)
{
    if (!figure)
        return {};
    if (shape != TableShape::month_changes && shape != TableShape::year_changes)
        return shown_figure(*figure, kind);
    const auto text = shown_change(*figure, kind);
    return text.isEmpty() ? u"0"_s : text;
}

WeeklyTable table_of_slots(const WeeklyPlan& plan)
{
    const auto& categories = plan.categories;
    const auto slots = slot_table(*plan.report->shape, plan.period, plan.figures, categories);
    WeeklyTable table{.columns = QStringList(u"Category"_s) + slots.columns, .plain = slots.slots + 1, .rows = {}};
    const bool sections = categories.front().kind != categories.back().kind;
    for (std::size_t i = 0; i < categories.size(); ++i) {
        const auto kind = categories[i].kind;
        if (sections && (i == 0 || categories[i - 1].kind != kind))
            table.rows.push_back({{kind_name(kind)}, RowKind::section});
        QStringList texts{captioned(categories[i])};
        for (const auto& figure : slots.rows[i])
            texts += shown_slot(figure, kind, *plan.report->shape);
        table.rows.push_back({texts, RowKind::figures});
    }
    return table;
}

} // namespace

WeeklyTable weekly_table(const WeeklyPlan& plan)
{
    return plan.report->shape ? table_of_slots(plan) : table_of_dates(plan);
}

} // namespace kindrel::registers
