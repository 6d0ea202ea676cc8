#include "registers/figures.h"

#include <QRegularExpression>

#include <array>

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

constexpr qint64 unit = 10000;
constexpr qint64 cent = 100;
constexpr qint64 limit = 99999 * unit;
constexpr int most_digits = 9; ///< Before the point; more are over the limit anyway.

struct KindWords
{
    const char16_t* no_figure;
    const char16_t* over_limit;
};
constexpr KindWords of_attendance{u"Please enter a whole number, for example 125",
                                  u"Please enter a number under 99,000"};
constexpr KindWords of_money{u"Please enter an amount in dollars and cents, for example 125.50",
                             u"Please enter an amount under $99,000"};

/// The typed number in ten-thousandths, the digits beyond them cut off; nullopt when it is none. `exact`: what must
/// divide the number, for it to be no more precise than the figures of its kind.
std::optional<qint64> parse(QStringView text, qint64 exact)
{
    static const QRegularExpression form(u"^(\\d{1,3}(?:,\\d{3})+|\\d*)(?:\\.(\\d*))?$"_s);
    const auto match = form.match(text.toString());
    QString before = match.captured(1).remove(u',');
    const QString behind = match.captured(2);
    if (!match.hasMatch() || (before.isEmpty() && behind.isEmpty()))
        return std::nullopt;
    while (before.size() > 1 && before.startsWith(u'0'))
        before.remove(0, 1);
    if (before.size() > most_digits)
        return limit + unit;
    for (const QChar digit : behind.sliced(std::min<qsizetype>(4, behind.size()))) {
        if (digit != u'0')
            return std::nullopt;
    }
    const qint64 number = before.toLongLong() * unit + behind.left(4).leftJustified(4, u'0').toLongLong();
    return number % exact == 0 ? std::optional(number) : std::nullopt;
}

/// Halves away from zero.
qint64 rounded(core::Amount amount, qint64 step)
{
    const qint64 half = amount.ten_thousandths < 0 ? -step / 2 : step / 2;
    return (amount.ten_thousandths + half) / step;
}

QString money(core::Amount amount, bool zero_before_point)
{
    const qint64 cents = rounded(amount, cent);
    const qint64 dollars = std::abs(cents) / 100;
    const auto text = u"%1$%2.%3"_s.arg(cents < 0 ? u"-"_s : QString(),
                                        dollars == 0 && !zero_before_point ? QString() : QString::number(dollars));
    return text.arg(std::abs(cents) % 100, 2, 10, '0'_L1);
}

} // namespace

QString kind_name(FigureKind kind)
{
    return kind == FigureKind::attendance ? u"Attendance"_s : u"$ Amount"_s;
}

TypedFigure read_figure(QStringView typed, FigureKind kind)
{
    const bool counts = kind == FigureKind::attendance;
    const auto& words = counts ? of_attendance : of_money;
    auto text = typed.trimmed();
    if (text.isEmpty())
        return {};
    if (!counts && text.startsWith(u'$'))
        text = text.sliced(1).trimmed();
    const auto number = parse(text, counts ? unit : cent);
    if (!number)
        return {.figure = {}, .refusal = QString::fromUtf16(words.no_figure)};
    if (*number > limit)
        return {.figure = {}, .refusal = QString::fromUtf16(words.over_limit)};
    if (counts && *number == 0)
        return {};
    return {.figure = core::Amount{*number}, .refusal = {}};
}

QString shown_figure(core::Amount figure, FigureKind kind)
{
    if (kind == FigureKind::money)
        return money(figure, true);
    const qint64 number = rounded(figure, unit);
    return number == 0 ? QString() : QString::number(number);
}

QString shown_change(core::Amount change, FigureKind kind)
{
    const auto text = shown_figure(change, kind);
    const qint64 step = kind == FigureKind::money ? cent : unit;
    return rounded(change, step) > 0 ? u'+' + text : text;
}

QString shown_short_money(core::Amount amount)
{
    return money(amount, false);
}

} // namespace kindrel::registers
