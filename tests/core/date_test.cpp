#include "core/date.h"
#include "core/dialogue.h"

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

const QDate today(2026, 11, 22);

struct Typed
{
    QString text;
    QString stored; ///< Empty when it is refused.
    QString shown;
};

} // namespace

TEST(DateTest, TypedDatesAreReadStoredAndShownAgain)
{
    const std::vector<Typed> cases{
        {u"12/03/1966"_s, u"1966-03-12"_s, u"12/03/1966"_s},
        {u"1/2/07"_s, u"2007-02-01"_s, u"01/02/2007"_s},
        {u"12/05/XXXX"_s, u"1800-05-12"_s, u"12/05/XXXX"_s},
        {u" 12/05/xxxx "_s, u"1800-05-12"_s, u"12/05/XXXX"_s},
        {u"29/02/XXXX"_s, u"1800-02-29"_s, u"29/02/XXXX"_s},
        {u"29/02/2024"_s, u"2024-02-29"_s, u"29/02/2024"_s},
        {u"29/02/2023"_s, {}, {}},
        {u"30/02/XXXX"_s, {}, {}},
        {u"31/04/2020"_s, {}, {}},
        {u"12-05-2020"_s, {}, {}},
        {u"12/13/2020"_s, {}, {}},
        {u"12/05"_s, {}, {}},
        {u"12/05/202"_s, {}, {}},
        {u"12/05/20200"_s, {}, {}},
        {u"12/05/XX"_s, {}, {}},
        {u"٣/٥/٢٠٢٠"_s, {}, {}},
        {u"0/05/2020"_s, {}, {}},
        {{}, {}, {}},
    };
    for (const auto& [text, stored, shown] : cases) {
        const auto date = parse_date(text, DayOrder::day_first, today);
        EXPECT_EQ(date ? date->stored() : QString(), stored) << text.toStdString();
        EXPECT_EQ(date ? date->shown() : QString(), shown) << text.toStdString();
        EXPECT_EQ(Date::from_stored(stored), date) << text.toStdString();
    }
}

TEST(DateTest, TheMonthComesFirstWhereTheChurchWritesItSo)
{
    const auto date = parse_date(u"12/25/XXXX"_s, DayOrder::month_first, today);

    ASSERT_TRUE(date);
    EXPECT_EQ(date->stored(), u"1800-12-25"_s);
    EXPECT_EQ(date->shown(DayOrder::month_first), u"12/25/XXXX"_s);
    EXPECT_FALSE(parse_date(u"25/12/2020"_s, DayOrder::month_first, today));
    EXPECT_EQ(bad_date_message(DayOrder::month_first).more.section(u'\n', 0, 0),
              u"Correct format = MM/DD/YY Or MM/DD/YYYY"_s);
}

TEST(DateTest, TwoDigitsOfAYearMeanOneNotFarAhead)
{
    EXPECT_EQ(parse_date(u"1/1/36"_s, DayOrder::day_first, today)->year, 2036);
    EXPECT_EQ(parse_date(u"1/1/37"_s, DayOrder::day_first, today)->year, 1937);
    EXPECT_EQ(parse_date(u"1/1/00"_s, DayOrder::day_first, today)->year, 2000);
}

TEST(DateTest, WhatIsNoStoredDateReadsAsNone)
{
    for (const auto* text : {u"", u"2020-1-1", u"2020-13-01", u"2020/01/01", u"0000-01-01", u"2020-01-01T00"})
        EXPECT_FALSE(Date::from_stored(QStringView(text))) << QString::fromUtf16(text).toStdString();
}

} // namespace kindrel::test
