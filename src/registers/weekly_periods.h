#pragma once

#include "core/date.h"
#include "core/dialogue.h"

namespace kindrel::registers {

enum class PeriodKind { date_range, calendar_year, financial_year, year_span };

/// A period as a person chose and typed it; what its kind does not need is not read.
struct PeriodChoice
{
    PeriodKind kind = PeriodKind::date_range;
    std::optional<core::Date> from = {}, to = {}; ///< Of a date range.
    QString year = {};                            ///< "YYYY"; the first year of a financial year and of a span.
    QString to_year = {};                         ///< The last year of a span.
};

/// The days of a report, the first and the last among them.
struct Period
{
    PeriodKind kind = PeriodKind::date_range;
    core::Date first, last;
    QString title; ///< Stands after the project's name; begins with a blank.

    /// Months from that of the first day, which is 1; 0 for the month before.
    [[nodiscard]] int month_slot(const core::Date& date) const;
    /// Years from that of the first day, which is 1.
    [[nodiscard]] int year_slot(const core::Date& date) const { return date.year - first.year + 1; }
    [[nodiscard]] int years() const { return year_slot(last); }
    /// The same period and the month before it.
    [[nodiscard]] Period from_month_before() const;
    /// One year of a span.
    [[nodiscard]] Period only_year(int year) const;
};

/// A choice that a report is made of. A period has one that it begins with and, where it ends elsewhere, one more.
enum class ReportField { project, report, categories, chart, from, to };

/// Says why a report cannot be made, and remembers the choice that is in the way.
struct ReportCheck
{
    core::Dialogue& dialogue;
    std::optional<ReportField> guilty = {}; ///< Unset when nothing was refused, or no other choice would help.

    std::nullopt_t refuse(ReportField field, const QString& why);
};

/// The years that choosers list; any other can be typed.
[[nodiscard]] QStringList offered_years();
inline constexpr int most_span_years = 12;

/// Nullopt, after saying why, when no period can be made of the choice.
[[nodiscard]] std::optional<Period> read_period(const PeriodChoice& choice, core::DayOrder order, ReportCheck& check);

} // namespace kindrel::registers
