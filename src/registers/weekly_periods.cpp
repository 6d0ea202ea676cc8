#include "registers/weekly_periods.h"

#include "core/day_refusal.h"

#include <algorithm>

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

constexpr int first_offered = 1996;
constexpr int last_offered = 2020;
constexpr int year_digits = 4;
constexpr int first_year = 1000;
constexpr int last_year = 9998; ///< The financial year after it still has four digits.

std::optional<int> read_year(const QString& typed, ReportField field, const QString& missing, ReportCheck& check)
{
    const auto text = typed.trimmed();
    if (text.isEmpty())
        return check.refuse(field, missing);
    const bool digits = std::ranges::all_of(text, [](QChar c) { return c >= u'0' && c <= u'9'; });
    const int year = digits && text.size() == year_digits ? text.toInt() : 0;
    if (year < first_year || year > last_year)
        return check.refuse(field, u"Incorrect format for the analysis year, eg. '2007'"_s);
    return year;
}

std::optional<int> read_first_year(const PeriodChoice& choice, ReportCheck& check)
{
    return read_year(choice.year, ReportField::from, u"Please enter an analysis year"_s, check);
}

std::optional<Period> date_range(const PeriodChoice& choice, core::DayOrder order, ReportCheck& check)
{
    if (!choice.from)
        return check.refuse(ReportField::from, u"Please select a date to begin the search from"_s);
    if (!choice.from->year_known())
        return check.refuse(ReportField::from, core::year_missing);
    if (!choice.to)
        return check.refuse(ReportField::to, u"Please select a date to end the search from"_s);
    if (!choice.to->year_known())
        return check.refuse(ReportField::to, core::year_missing);
    if (*choice.to < *choice.from)
        return check.refuse(ReportField::to,
                            u"The date to end the search from is before the date to begin the search from"_s);
    return Period{choice.kind, *choice.from, *choice.to,
                  u" (%1 - %2)"_s.arg(choice.from->shown(order), choice.to->shown(order))};
}

std::optional<Period> calendar_year(const PeriodChoice& choice, ReportCheck& check)
{
    const auto year = read_first_year(choice, check);
    if (!year)
        return {};
    return Period{choice.kind, {*year, 1, 1}, {*year, 12, 31}, u" Calender Year (%1)"_s.arg(*year)};
}

std::optional<Period> financial_year(const PeriodChoice& choice, ReportCheck& check)
{
    const auto year = read_first_year(choice, check);
    if (!year)
        return {};
    return Period{
        choice.kind, {*year, 7, 1}, {*year + 1, 6, 30}, u" Financial Year (%1 - %2)"_s.arg(*year).arg(*year + 1)};
}

std::optional<Period> year_span(const PeriodChoice& choice, ReportCheck& check)
{
    const auto from = read_first_year(choice, check);
    if (!from)
        return {};
    const auto to = read_year(choice.to_year, ReportField::to, u"Please enter a `To' year for analysis"_s, check);
    if (!to)
        return {};
    if (*to < *from)
        return check.refuse(ReportField::to, u"The `To' year for analysis is before the year to begin from"_s);
    if (*to - *from + 1 > most_span_years)
        return check.refuse(ReportField::to,
                            u"You can only do an analysis up to a maximum of 12 years, please decrease the gap in "
                            "the years selected for analysis"_s);
    return Period{choice.kind, {*from, 1, 1}, {*to, 12, 31}, u" (%1 - %2)"_s.arg(*from).arg(*to)};
}

int month_number(const core::Date& date)
{
    return date.year * 12 + date.month;
}

} // namespace

std::nullopt_t ReportCheck::refuse(ReportField field, const QString& why)
{
    guilty = field;
    dialogue.show({why});
    return std::nullopt;
}

int Period::month_slot(const core::Date& date) const
{
    return month_number(date) - month_number(first) + 1;
}

Period Period::from_month_before() const
{
    auto period = *this;
    const bool january = first.month == 1;
    period.first = {january ? first.year - 1 : first.year, january ? 12 : first.month - 1, 1};
    return period;
}

Period Period::only_year(int year) const
{
    auto period = *this;
    period.first = {year, 1, 1};
    period.last = {year, 12, 31};
    return period;
}

QStringList offered_years()
{
    QStringList years;
    for (int year = first_offered; year <= last_offered; ++year)
        years += QString::number(year);
    return years;
}

std::optional<Period> read_period(const PeriodChoice& choice, core::DayOrder order, ReportCheck& check)
{
    switch (choice.kind) {
    case PeriodKind::date_range:
        return date_range(choice, order, check);
    case PeriodKind::calendar_year:
        return calendar_year(choice, check);
    case PeriodKind::financial_year:
        return financial_year(choice, check);
    case PeriodKind::year_span:
        return year_span(choice, check);
    }
    return {};
}

} // namespace kindrel::registers
