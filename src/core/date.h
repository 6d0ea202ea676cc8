#pragma once

#include <QDate>
#include <QString>

#include <compare>
#include <optional>

namespace kindrel::core {

/// The order in which a person writes day and month; `month_first` when `American_date` is set.
enum class DayOrder { day_first, month_first };

/// A stored day. Year 1800 stands for an unknown year, so 29 February 1800 is valid here, which QDate denies.
struct Date
{
    static constexpr int unknown_year = 1800;

    int year = 0;
    int month = 0;
    int day = 0;

    [[nodiscard]] bool valid() const;
    [[nodiscard]] bool year_known() const { return year != unknown_year; }
    /// "YYYY-MM-DD", the form in which every date lies in the database; empty when not valid.
    [[nodiscard]] QString stored() const;
    /// "DD/MM/YYYY" or "MM/DD/YYYY", an unknown year as "XXXX"; empty when not valid.
    [[nodiscard]] QString shown(DayOrder order = DayOrder::day_first) const;
    /// Null for an unknown year or an invalid day.
    [[nodiscard]] QDate qdate() const;

    [[nodiscard]] static std::optional<Date> from_stored(QStringView text);
    [[nodiscard]] static Date from(const QDate& date) { return {date.year(), date.month(), date.day()}; }

    auto operator<=>(const Date&) const = default;
};

/// Reads what a person types: "DD/MM/YY", "DD/MM/YYYY" or "DD/MM/XXXX" (month first where so ordered). Two digits
/// of the year mean the latest such year that is not after `today`'s year. Nullopt for anything else.
[[nodiscard]] std::optional<Date> parse_date(QStringView typed, DayOrder order, const QDate& today);

struct Message;
/// The box that answers a date which could not be read.
[[nodiscard]] Message bad_date_message(DayOrder order);

} // namespace kindrel::core
