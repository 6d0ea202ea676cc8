#include "registers/weekly_analysis.h"

#include <QHash>
#include <QLocale>

#include <algorithm>
#include <array>

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

using core::to_value;

constexpr int months = 12;

/// What is shown of a figure, in ten-thousandths.
constexpr qint64 finest(FigureKind kind)
{
    return kind == FigureKind::money ? 100 : 10000;
}

/// The fraction as the nearest multiple of `step`, halves away from zero.
core::Amount rounded(qint64 numerator, qint64 denominator, qint64 step)
{
    const auto width = denominator * step;
    const auto steps = (2 * std::abs(numerator) + width) / (2 * width);
    return {(numerator < 0 ? -steps : steps) * step};
}

using CategoryPlaces = QHash<int, std::size_t>;

CategoryPlaces places_of(std::span<const Category> categories)
{
    CategoryPlaces places;
    for (std::size_t i = 0; i < categories.size(); ++i)
        places.insert(categories[i].key, i);
    return places;
}

/// Tallies of each category by slot, from slot 0.
using Slots = std::vector<std::vector<Tally>>;

template <class SlotOf>
Slots tallied(std::span<const WeeklyFigure> figures, std::span<const Category> categories, int count,
              const SlotOf& slot_of)
{
    const auto places = places_of(categories);
    Slots slots(categories.size(), std::vector<Tally>(std::size_t(count) + 1));
    for (const auto& figure : figures) {
        const int slot = slot_of(figure.date);
        const auto place = places.constFind(figure.category);
        if (slot >= 0 && slot <= count && place != places.cend())
            slots[*place][std::size_t(slot)].add(figure.amount);
    }
    return slots;
}

Tally all_of(const std::vector<Tally>& slots)
{
    Tally all;
    for (std::size_t i = 1; i < slots.size(); ++i) {
        all.sum += slots[i].sum;
        all.count += slots[i].count;
    }
    return all;
}

QStringList month_names(const Period& period)
{
    QStringList names;
    for (int i = 0; i < months; ++i)
        names += QLocale::c().standaloneMonthName((period.first.month - 1 + i) % months + 1);
    return names;
}

QStringList year_names(const Period& period)
{
    QStringList names;
    for (int year = period.first.year; year <= period.last.year; ++year)
        names += QString::number(year);
    return names;
}

/// Totals or averages of the slots, then of all of them.
FigureRow summed_row(const std::vector<Tally>& slots, FigureKind kind, bool averages)
{
    const auto shown = [&](const Tally& tally) {
        return averages ? tally.average(kind) : tally.total();
    };
    FigureRow row;
    for (std::size_t i = 1; i < slots.size(); ++i)
        row.push_back(shown(slots[i]));
    row.push_back(shown(all_of(slots)));
    return row;
}

SlotTable summed_table(const Slots& slots, std::span<const Category> categories, QStringList names, bool averages,
                       const QString& all)
{
    SlotTable table{names + QStringList(all), int(names.size()), {}};
    for (std::size_t i = 0; i < categories.size(); ++i)
        table.rows.push_back(summed_row(slots[i], categories[i].kind, averages));
    return table;
}

SlotTable month_change_table(const Slots& slots, std::span<const Category> categories, const Period& period)
{
    SlotTable table{month_names(period), months, {}};
    for (std::size_t i = 0; i < categories.size(); ++i) {
        FigureRow row;
        for (std::size_t month = 1; month <= months; ++month)
            row.push_back(change(slots[i][month - 1], slots[i][month], categories[i].kind));
        table.rows.push_back(std::move(row));
    }
    return table;
}

/// Of the months of one year.
Slots year_slots(std::span<const WeeklyFigure> figures, std::span<const Category> categories, int year)
{
    return tallied(figures, categories, months,
                   [year](const core::Date& date) { return date.year == year ? date.month : -1; });
}

SlotTable year_change_table(std::span<const WeeklyFigure> figures, std::span<const Category> categories,
                            const Period& period)
{
    const auto before = year_slots(figures, categories, period.first.year);
    const auto after = year_slots(figures, categories, period.last.year);
    SlotTable table{month_names(period) + QStringList(u"Year"_s), months, {}};
    for (std::size_t i = 0; i < categories.size(); ++i) {
        const auto kind = categories[i].kind;
        FigureRow row;
        for (std::size_t month = 1; month <= months; ++month)
            row.push_back(change(before[i][month], after[i][month], kind));
        row.push_back(change(all_of(before[i]), all_of(after[i]), kind));
        table.rows.push_back(std::move(row));
    }
    return table;
}

} // namespace

std::vector<WeeklyFigure> read_weekly_figures(core::Session& session, int project, const Period& period,
                                              std::span<const Category> categories)
{
    std::vector<core::Value> values{to_value(project), to_value(period.first), to_value(period.last)};
    QStringList chosen;
    for (const auto& category : categories) {
        values.push_back(to_value(category.key));
        chosen += u"?"_s;
    }
    if (chosen.isEmpty())
        return {};
    // The sum keeps the engine from walking an index once for each category; it walks the dates instead.
    auto rows = session.select_with(
        u"SELECT * FROM [Qry_weekly_output_anlaysis] WHERE ([weekly_project_id]=?) AND "
        "([weekly_date]>=? AND [weekly_date]<=?) AND ([group_id]+0 IN (%1)) ORDER BY [weekly_date];"_s.arg(
            chosen.join(u',')),
        values);
    const auto date = rows.column(u"weekly_date"), category = rows.column(u"group_id"), amount = rows.column(u"amount");
    std::vector<WeeklyFigure> figures;
    for (const core::Row& row : rows) {
        if (const auto day = row.date(date))
            figures.push_back({*day, row.integer(category), row.amount(amount)});
    }
    return figures;
}

void Tally::add(core::Amount amount)
{
    sum += amount.ten_thousandths;
    ++count;
}

std::optional<core::Amount> Tally::total() const
{
    return count > 0 ? std::optional(core::Amount{sum}) : std::nullopt;
}

std::optional<core::Amount> Tally::average(FigureKind kind) const
{
    return sum > 0 ? std::optional(rounded(sum, count, finest(kind))) : std::nullopt;
}

std::optional<core::Amount> change(const Tally& before, const Tally& after, FigureKind kind)
{
    if (before.count == 0 || after.count == 0)
        return {};
    // As the averages themselves: without a sum above zero there is none to subtract.
    const auto from = std::max<qint64>(before.sum, 0), to = std::max<qint64>(after.sum, 0);
    return rounded(to * before.count - from * after.count, before.count * after.count, finest(kind));
}

FigureRow DateTable::column(std::size_t category) const
{
    FigureRow figures;
    for (const auto& row : rows)
        figures.push_back(row[category]);
    return figures;
}

DateTable date_table(std::span<const WeeklyFigure> figures, std::span<const Category> categories)
{
    const auto places = places_of(categories);
    DateTable table;
    for (const auto& figure : figures) {
        const auto place = places.constFind(figure.category);
        if (place == places.cend())
            continue;
        if (table.dates.empty() || table.dates.back() != figure.date) {
            table.dates.push_back(figure.date);
            table.rows.emplace_back(categories.size());
        }
        table.rows.back()[*place] = figure.amount;
    }
    return table;
}

SlotTable slot_table(TableShape shape, const Period& period, std::span<const WeeklyFigure> figures,
                     std::span<const Category> categories)
{
    const auto by_month = [&] {
        return tallied(figures, categories, months, [&](const core::Date& date) { return period.month_slot(date); });
    };
    const auto by_year = [&] {
        return tallied(figures, categories, period.years(),
                       [&](const core::Date& date) { return period.year_slot(date); });
    };
    using enum TableShape;
    switch (shape) {
    case month_totals:
        return summed_table(by_month(), categories, month_names(period), false, u"Year"_s);
    case month_averages:
        return summed_table(by_month(), categories, month_names(period), true, u"Year"_s);
    case month_changes:
        return month_change_table(by_month(), categories, period);
    case year_totals:
        return summed_table(by_year(), categories, year_names(period), false, u"All Years"_s);
    case year_averages:
        return summed_table(by_year(), categories, year_names(period), true, u"All Years"_s);
    case year_changes:
        return year_change_table(figures, categories, period);
    }
    return {};
}

QString captioned(const Category& category)
{
    return category.kind == FigureKind::money ? category.name + u" ($)"_s : category.name;
}

} // namespace kindrel::registers
