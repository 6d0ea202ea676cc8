#include "registers/figures.h"

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using registers::FigureKind;
using enum FigureKind;

namespace {

const QString no_count = u"Please enter a whole number, for example 125"_s;
const QString no_money = u"Please enter an amount in dollars and cents, for example 125.50"_s;
const QString count_over = u"Please enter a number under 99,000"_s;
const QString money_over = u"Please enter an amount under $99,000"_s;

} // namespace

TEST(Figures, AreReadAsTheyAreTyped)
{
    struct Case
    {
        QString typed;
        FigureKind kind;
        std::optional<qint64> figure;
        QString refusal;
    };
    const std::vector<Case> cases{
        {u"120"_s, attendance, 1200000, {}},
        {u" 1,204 "_s, attendance, 12040000, {}},
        {u"12.00"_s, attendance, 120000, {}},
        {u"0"_s, attendance, {}, {}},
        {u" "_s, attendance, {}, {}},
        {u"99999"_s, attendance, 999990000, {}},
        {u"100000"_s, attendance, {}, count_over},
        {u"99999999999999999999999"_s, attendance, {}, count_over},
        {u"12.5"_s, attendance, {}, no_count},
        {u"-3"_s, attendance, {}, no_count},
        {u"$12"_s, attendance, {}, no_count},
        {u"twelve"_s, attendance, {}, no_count},
        {u"1,20"_s, attendance, {}, no_count},
        {u"."_s, attendance, {}, no_count},
        {u"1234.5"_s, money, 12345000, {}},
        {u"$ 1,234.50"_s, money, 12345000, {}},
        {u".05"_s, money, 500, {}},
        {u"7."_s, money, 70000, {}},
        {u"0.00"_s, money, 0, {}},
        {u"0000000000012.10"_s, money, 121000, {}},
        {u"12.100000"_s, money, 121000, {}},
        {u"$"_s, money, {}, no_money},
        {u"12.005"_s, money, {}, no_money},
        {u"12.00001"_s, money, {}, no_money},
        {u"-0.01"_s, money, {}, no_money},
        {u"1.234,50"_s, money, {}, no_money},
        {u"99999.00"_s, money, 999990000, {}},
        {u"99999.01"_s, money, {}, money_over},
    };
    for (const auto& [typed, kind, figure, refusal] : cases) {
        const auto read = registers::read_figure(typed, kind);
        EXPECT_EQ(read.figure.has_value(), figure.has_value()) << typed.toStdString();
        EXPECT_EQ(read.figure.value_or(core::Amount{}).ten_thousandths, figure.value_or(0)) << typed.toStdString();
        EXPECT_EQ(read.refusal, refusal) << typed.toStdString();
    }
}

TEST(Figures, AreShownInTheirFormatsWithHalvesAwayFromZero)
{
    struct Case
    {
        qint64 figure;
        QString count, money, short_money, count_change, money_change;
    };
    const std::vector<Case> cases{
        {0, u""_s, u"$0.00"_s, u"$.00"_s, u""_s, u"$0.00"_s},
        {1200000, u"120"_s, u"$120.00"_s, u"$120.00"_s, u"+120"_s, u"+$120.00"_s},
        {5000, u"1"_s, u"$0.50"_s, u"$.50"_s, u"+1"_s, u"+$0.50"_s},
        {4999, u""_s, u"$0.50"_s, u"$.50"_s, u""_s, u"+$0.50"_s},
        {49, u""_s, u"$0.00"_s, u"$.00"_s, u""_s, u"$0.00"_s},
        {50, u""_s, u"$0.01"_s, u"$.01"_s, u""_s, u"+$0.01"_s},
        {-50000, u"-5"_s, u"-$5.00"_s, u"-$5.00"_s, u"-5"_s, u"-$5.00"_s},
        {-5050, u"-1"_s, u"-$0.51"_s, u"-$.51"_s, u"-1"_s, u"-$0.51"_s},
        {123456789999900, u"12345679000"_s, u"$12345678999.99"_s, u"$12345678999.99"_s, u"+12345679000"_s,
         u"+$12345678999.99"_s},
    };
    for (const auto& each : cases) {
        const core::Amount figure{each.figure};
        EXPECT_EQ(registers::shown_figure(figure, attendance), each.count) << each.figure;
        EXPECT_EQ(registers::shown_figure(figure, money), each.money) << each.figure;
        EXPECT_EQ(registers::shown_short_money(figure), each.short_money) << each.figure;
        EXPECT_EQ(registers::shown_change(figure, attendance), each.count_change) << each.figure;
        EXPECT_EQ(registers::shown_change(figure, money), each.money_change) << each.figure;
    }
}

} // namespace kindrel::test
