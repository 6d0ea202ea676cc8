#pragma once

#include "registers/weekly_periods.h"
#include "registers/weekly_register.h"

#include <span>

namespace kindrel::registers {

/// A stored figure of a category on a date.
struct WeeklyFigure
{
    core::Date date;
    int category = 0;
    core::Amount amount;

    friend bool operator==(const WeeklyFigure&, const WeeklyFigure&) = default;
};

/// The figures of the categories in the period, earliest date first; one statement. Throws core::DatabaseError.
[[nodiscard]] std::vector<WeeklyFigure> read_weekly_figures(core::Session& session, int project, const Period& period,
                                                            std::span<const Category> categories);

/// Figures that fall together, summed exactly.
struct Tally
{
    qint64 sum = 0; ///< In ten-thousandths.
    qint64 count = 0;

    void add(core::Amount amount);
    /// Unset without figures.
    [[nodiscard]] std::optional<core::Amount> total() const;
    /// Unset unless the sum is greater than zero. Rounded to what is shown of the kind, halves away from zero.
    [[nodiscard]] std::optional<core::Amount> average(FigureKind kind) const;
};

/// How far the average of `after` lies above that of `before`, worked out from the exact averages; unset when either
/// has no figures.
[[nodiscard]] std::optional<core::Amount> change(const Tally& before, const Tally& after, FigureKind kind);

using FigureRow = std::vector<std::optional<core::Amount>>;

/// Figures with a row for each date.
struct DateTable
{
    std::vector<core::Date> dates; ///< Those that have a figure.
    std::vector<FigureRow> rows;   ///< A figure for each category.

    [[nodiscard]] FigureRow column(std::size_t category) const;
};
[[nodiscard]] DateTable date_table(std::span<const WeeklyFigure> figures, std::span<const Category> categories);

enum class TableShape { month_totals, month_averages, month_changes, year_totals, year_averages, year_changes };

/// Figures with a row for each category.
struct SlotTable
{
    QStringList columns; ///< The months or years, and what stands for all of them together if anything does.
    int slots = 0;       ///< How many of the columns are months or years.
    std::vector<FigureRow> rows;
};

/// `period` is that of the report; month_changes needs the figures of the month before it too. Changes by year compare
/// the period's last year with its first.
[[nodiscard]] SlotTable slot_table(TableShape shape, const Period& period, std::span<const WeeklyFigure> figures,
                                   std::span<const Category> categories);

/// The category's name as tables and charts show it: that of money with " ($)".
[[nodiscard]] QString captioned(const Category& category);

} // namespace kindrel::registers
