#pragma once

#include "core/value.h"

namespace kindrel::registers {

/// What a figure counts, as `group_type` stores it.
enum class FigureKind { attendance = 1, money = 2 };

/// A figure as a person typed it. Neither a figure nor a refusal: nothing was typed.
struct TypedFigure
{
    std::optional<core::Amount> figure;
    QString refusal;
};

/// "Attendance" or "$ Amount", as headings name it.
[[nodiscard]] QString kind_name(FigureKind kind);

/// Attendance in whole numbers, money to the cent, both from 0 to 99999. A dollar sign before money and commas between
/// thousands may be typed. An attendance of 0 is shown as nothing and is no figure.
[[nodiscard]] TypedFigure read_figure(QStringView typed, FigureKind kind);

/// "#####": a whole number, zero as nothing. "$###0.00": to the cent, zero as "$0.00". Halves are rounded away from
/// zero.
[[nodiscard]] QString shown_figure(core::Amount figure, FigureKind kind);
/// The same with a sign before gains too, as "+$###0.00" and "+#####".
[[nodiscard]] QString shown_change(core::Amount change, FigureKind kind);
/// "$###.00": to the cent, without a zero before the point.
[[nodiscard]] QString shown_short_money(core::Amount amount);

/// A whole number as a figure.
[[nodiscard]] constexpr core::Amount whole(qint64 number)
{
    return {number * 10000};
}

} // namespace kindrel::registers
