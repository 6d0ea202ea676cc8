#include "core/day_refusal.h"
#include "registers/weekly_periods.h"

#include "support/scripted_dialogue.h"

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Date;
using registers::PeriodChoice;
using registers::PeriodKind;
using enum registers::PeriodKind;

namespace {

PeriodChoice days(std::optional<Date> from, std::optional<Date> to)
{
    PeriodChoice choice;
    choice.from = from;
    choice.to = to;
    return choice;
}

PeriodChoice years(PeriodKind kind, const QString& year, const QString& to_year = {})
{
    PeriodChoice choice;
    choice.kind = kind;
    choice.year = year;
    choice.to_year = to_year;
    return choice;
}

struct PeriodCase
{
    PeriodChoice choice;
    Date first, last;
    QString title;
};

struct RefusedCase
{
    PeriodChoice choice;
    QString words;
    registers::ReportField guilty = registers::ReportField::from;
};

const auto no_year = u"Please enter an analysis year"_s;
const auto bad_year = u"Incorrect format for the analysis year, eg. '2007'"_s;
const auto too_long = u"You can only do an analysis up to a maximum of 12 years, please decrease the gap in the years "
                      "selected for analysis"_s;

} // namespace

TEST(WeeklyPeriodsTest, APeriodRunsFromItsFirstDayToItsLast)
{
    const std::vector<PeriodCase> cases{
        {days(Date{2007, 3, 4}, Date{2007, 3, 4}), {2007, 3, 4}, {2007, 3, 4}, u" (04/03/2007 - 04/03/2007)"_s},
        {years(calendar_year, u"2007"_s), {2007, 1, 1}, {2007, 12, 31}, u" Calender Year (2007)"_s},
        {years(calendar_year, u" 1984 "_s), {1984, 1, 1}, {1984, 12, 31}, u" Calender Year (1984)"_s},
        {years(financial_year, u"2007"_s), {2007, 7, 1}, {2008, 6, 30}, u" Financial Year (2007 - 2008)"_s},
        {years(year_span, u"2000"_s, u"2011"_s), {2000, 1, 1}, {2011, 12, 31}, u" (2000 - 2011)"_s},
        {years(year_span, u"2007"_s, u"2007"_s), {2007, 1, 1}, {2007, 12, 31}, u" (2007 - 2007)"_s},
    };
    for (const auto& one : cases) {
        ScriptedDialogue dialogue;
        registers::ReportCheck check{dialogue};
        const auto period = read_period(one.choice, core::DayOrder::day_first, check);
        ASSERT_TRUE(period) << one.title.toStdString();
        EXPECT_EQ(period->title, one.title);
        EXPECT_EQ(period->first, one.first) << one.title.toStdString();
        EXPECT_EQ(period->last, one.last) << one.title.toStdString();
    }
}

TEST(WeeklyPeriodsTest, WhatMakesNoPeriodIsRefusedInWords)
{
    const std::vector<RefusedCase> cases{
        {days({}, {}), u"Please select a date to begin the search from"_s},
        {days(Date{2007, 1, 1}, {}), u"Please select a date to end the search from"_s, registers::ReportField::to},
        {days(Date{1800, 3, 5}, Date{2007, 1, 1}), u"Please enter the year too."_s},
        {days(Date{2007, 1, 1}, Date{1800, 3, 5}), u"Please enter the year too."_s, registers::ReportField::to},
        {days(Date{2007, 1, 2}, Date{2007, 1, 1}),
         u"The date to end the search from is before the date to begin the search from"_s, registers::ReportField::to},
        {years(calendar_year, u" "_s), no_year},
        {years(financial_year, {}), no_year},
        {years(calendar_year, u"07"_s), bad_year},
        {years(financial_year, u"20 7"_s), bad_year},
        {years(calendar_year, u"-200"_s), bad_year},
        {years(calendar_year, u"20071"_s), bad_year},
        {years(calendar_year, u"0000"_s), bad_year},
        {years(year_span, {}, u"2007"_s), no_year},
        {years(year_span, u"2007"_s, {}), u"Please enter a `To' year for analysis"_s, registers::ReportField::to},
        {years(year_span, u"2007"_s, u"8"_s), bad_year, registers::ReportField::to},
        {years(year_span, u"2007"_s, u"2006"_s), u"The `To' year for analysis is before the year to begin from"_s,
         registers::ReportField::to},
        {years(year_span, u"2000"_s, u"2012"_s), too_long, registers::ReportField::to},
    };
    for (const auto& one : cases) {
        ScriptedDialogue dialogue;
        dialogue.expect_box(one.words);
        registers::ReportCheck check{dialogue};
        EXPECT_FALSE(read_period(one.choice, core::DayOrder::day_first, check)) << one.words.toStdString();
        EXPECT_EQ(check.guilty, one.guilty) << one.words.toStdString();
    }
}

TEST(WeeklyPeriodsTest, ADayAndMonthAloneAreToldToLackTheirYear)
{
    using enum core::DayOrder;
    struct Case
    {
        QString typed;
        core::DayOrder order;
        bool lacks_year;
    };
    const std::vector<Case> cases{
        {u"05/03"_s, day_first, true},      {u" 5/3 "_s, day_first, true},    {u"05/03/"_s, day_first, true},
        {u"29/2"_s, day_first, true},       {u"31/12"_s, day_first, true},    {u"31/12"_s, month_first, false},
        {u"05/03/xxxx"_s, day_first, true}, {u"31/02"_s, day_first, false},   {u"05/03/24x"_s, day_first, false},
        {u"March"_s, day_first, false},     {u"31/2/24"_s, day_first, false}, {{}, day_first, false},
    };
    for (const auto& [typed, order, lacks_year] : cases) {
        const auto message = core::day_refusal(typed, order);
        EXPECT_EQ(message.text, lacks_year ? u"Please enter the year too."_s : bad_date_message(order).text)
            << typed.toStdString();
        EXPECT_EQ(message.more, lacks_year ? QString() : bad_date_message(order).more) << typed.toStdString();
    }
}

TEST(WeeklyPeriodsTest, MonthsCountFromTheFirstOfThePeriod)
{
    ScriptedDialogue dialogue;
    registers::ReportCheck check{dialogue};
    const auto calendar = *read_period(years(calendar_year, u"2008"_s), core::DayOrder::day_first, check);
    const auto financial = *read_period(years(financial_year, u"2007"_s), core::DayOrder::day_first, check);
    struct Case
    {
        registers::Period period;
        Date date;
        int slot;
    };
    const std::vector<Case> cases{
        {calendar, {2007, 12, 31}, 0},  {calendar, {2008, 1, 1}, 1},   {calendar, {2008, 2, 29}, 2},
        {calendar, {2008, 12, 31}, 12}, {financial, {2007, 6, 30}, 0}, {financial, {2007, 7, 1}, 1},
        {financial, {2007, 12, 31}, 6}, {financial, {2008, 1, 1}, 7},  {financial, {2008, 6, 30}, 12},
    };
    for (const auto& one : cases)
        EXPECT_EQ(one.period.month_slot(one.date), one.slot) << one.date.stored().toStdString();

    EXPECT_EQ(calendar.from_month_before().first, (Date{2007, 12, 1}));
    EXPECT_EQ(financial.from_month_before().first, (Date{2007, 6, 1}));
    EXPECT_EQ(financial.from_month_before().last, financial.last);
}

TEST(WeeklyPeriodsTest, TheYearsOfferedRunFrom1996To2020)
{
    const auto years = registers::offered_years();
    EXPECT_EQ(years.size(), 25);
    EXPECT_EQ(years.front(), u"1996"_s);
    EXPECT_EQ(years.back(), u"2020"_s);
}

} // namespace kindrel::test
