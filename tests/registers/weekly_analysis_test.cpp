#include "registers/weekly_analysis.h"

#include "weekly_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Date;
using registers::Category;
using registers::FigureKind;
using registers::Period;
using registers::PeriodKind;
using registers::TableShape;
using registers::Tally;
using registers::WeeklyFigure;
using enum registers::TableShape;

namespace {

const std::vector<Category> both_kinds{{1, u"Morning"_s, FigureKind::attendance},
                                       {3, u"Offering"_s, FigureKind::money}};
const Period year_2007{PeriodKind::calendar_year, {2007, 1, 1}, {2007, 12, 31}, {}};
const Period financial_2007{PeriodKind::financial_year, {2007, 7, 1}, {2008, 6, 30}, {}};
const Period from_2006_to_2008{PeriodKind::year_span, {2006, 1, 1}, {2008, 12, 31}, {}};

std::vector<WeeklyFigure> figures_of(const std::vector<GivenFigure>& given)
{
    std::vector<WeeklyFigure> figures;
    for (const auto& one : given)
        figures.push_back({one.date, one.category, {qRound64(one.figure * 10000)}});
    return figures;
}

/// The row's figures as they are shown, "." for none.
QString shown(const registers::FigureRow& row, FigureKind kind = FigureKind::attendance)
{
    QStringList texts;
    for (const auto& figure : row)
        texts += figure ? shown_change(*figure, kind).replace(u'+', QString()) : u"."_s;
    return texts.join(u' ');
}

Tally tally(std::initializer_list<qint64> ten_thousandths)
{
    Tally all;
    for (const auto figure : ten_thousandths)
        all.add({figure});
    return all;
}

struct TableCase
{
    const char* name;
    TableShape shape;
    Period period;
    std::vector<GivenFigure> figures;
    QString morning, offering;
};

const std::vector<TableCase> table_cases{
    {"march_total",
     month_totals,
     year_2007,
     {{{2007, 3, 4}, 1, 10}, {{2007, 3, 11}, 1, 20}, {{2007, 3, 18}, 1, 30}},
     u". . 60 . . . . . . . . . 60"_s,
     u". . . . . . . . . . . . ."_s},
    {"march_average",
     month_averages,
     year_2007,
     {{{2007, 3, 4}, 1, 10}, {{2007, 3, 11}, 1, 20}, {{2007, 3, 18}, 1, 30}},
     u". . 20 . . . . . . . . . 20"_s,
     u". . . . . . . . . . . . ."_s},
    {"the_year_is_averaged_over_all_figures",
     month_averages,
     year_2007,
     {{{2007, 1, 7}, 3, 10}, {{2007, 2, 4}, 3, 20}, {{2007, 2, 11}, 3, 30.01}},
     u". . . . . . . . . . . . ."_s,
     u"$10.00 $25.01 . . . . . . . . . . $20.00"_s},
    {"first_and_last_day",
     month_totals,
     year_2007,
     {{{2006, 12, 31}, 1, 1}, {{2007, 1, 1}, 1, 2}, {{2007, 12, 31}, 1, 4}, {{2008, 1, 1}, 1, 8}},
     u"2 . . . . . . . . . . 4 6"_s,
     u". . . . . . . . . . . . ."_s},
    {"financial_months_begin_in_july",
     month_totals,
     financial_2007,
     {{{2007, 7, 1}, 1, 2}, {{2007, 12, 30}, 1, 3}, {{2008, 2, 29}, 1, 5}, {{2008, 6, 30}, 1, 7}},
     u"2 . . . . 3 . 5 . . . 7 17"_s,
     u". . . . . . . . . . . . ."_s},
    {"march_fell_by_five",
     month_changes,
     year_2007,
     {{{2007, 2, 4}, 1, 25}, {{2007, 3, 4}, 1, 10}, {{2007, 3, 11}, 1, 30}},
     u". . -5 . . . . . . . . ."_s,
     u". . . . . . . . . . . ."_s},
    {"an_empty_february_leaves_march_without",
     month_changes,
     year_2007,
     {{{2007, 1, 7}, 1, 25}, {{2007, 3, 4}, 1, 20}, {{2007, 4, 1}, 1, 22}},
     u". . . 2 . . . . . . . ."_s,
     u". . . . . . . . . . . ."_s},
    {"the_month_before_the_period_counts",
     month_changes,
     year_2007,
     {{{2006, 12, 31}, 3, 10.5}, {{2007, 1, 7}, 3, 12}, {{2007, 2, 4}, 3, 12}},
     u". . . . . . . . . . . ."_s,
     u"$1.50 $0.00 . . . . . . . . . ."_s},
    {"years",
     year_totals,
     from_2006_to_2008,
     {{{2006, 1, 1}, 1, 2}, {{2006, 12, 31}, 1, 3}, {{2008, 2, 29}, 1, 5}},
     u"5 . 5 10"_s,
     u". . . ."_s},
    {"yearly_averages",
     year_averages,
     from_2006_to_2008,
     {{{2006, 1, 1}, 3, 2}, {{2006, 12, 31}, 3, 3}, {{2008, 2, 29}, 3, 10}},
     u". . . ."_s,
     u"$2.50 . $10.00 $5.00"_s},
    {"the_last_year_against_the_first",
     year_changes,
     from_2006_to_2008,
     {{{2006, 3, 5}, 1, 40},
      {{2006, 5, 7}, 1, 9},
      {{2007, 3, 4}, 1, 999},
      {{2008, 3, 2}, 1, 30},
      {{2008, 3, 9}, 1, 40}},
     u". . -5 . . . . . . . . . 11"_s,
     u". . . . . . . . . . . . ."_s},
};

class WeeklyTableTest : public testing::TestWithParam<TableCase>
{
};

} // namespace

TEST_P(WeeklyTableTest, HasTheFiguresWorkedOutByHand)
{
    const auto& one = GetParam();
    const auto table = slot_table(one.shape, one.period, figures_of(one.figures), both_kinds);
    ASSERT_EQ(table.rows.size(), 2);
    EXPECT_EQ(shown(table.rows[0]), one.morning) << shown(table.rows[0]).toStdString();
    EXPECT_EQ(shown(table.rows[1], FigureKind::money), one.offering)
        << shown(table.rows[1], FigureKind::money).toStdString();
    EXPECT_EQ(std::size_t(table.columns.size()), table.rows[0].size());
}

INSTANTIATE_TEST_SUITE_P(Cases, WeeklyTableTest, testing::ValuesIn(table_cases),
                         [](const auto& test) { return std::string(test.param.name); });

TEST(WeeklyAnalysisTest, TheColumnsAreNamedAfterTheirMonthsAndYears)
{
    const auto columns = [](TableShape shape, const Period& period) {
        return slot_table(shape, period, {}, both_kinds).columns;
    };
    EXPECT_EQ(columns(month_averages, year_2007).front(), u"January"_s);
    EXPECT_EQ(columns(month_averages, year_2007).back(), u"Year"_s);
    EXPECT_EQ(columns(month_changes, financial_2007).front(), u"July"_s);
    EXPECT_EQ(columns(month_changes, financial_2007).back(), u"June"_s);
    EXPECT_EQ(columns(year_averages, from_2006_to_2008),
              QStringList({u"2006"_s, u"2007"_s, u"2008"_s, u"All Years"_s}));
}

TEST(WeeklyAnalysisTest, AveragesAreRoundedHalfAwayFromZeroToWhatIsShown)
{
    struct Case
    {
        Tally tally;
        FigureKind kind;
        std::optional<qint64> average;
    };
    const std::vector<Case> cases{
        {tally({10'0000, 15'0000}), FigureKind::attendance, 13'0000},
        {tally({12'0000, 12'0000, 13'0000}), FigureKind::attendance, 12'0000},
        {tally({1'0000, 1'0100}), FigureKind::money, 1'0100},
        {tally({1'0000, 1'0000, 1'0100}), FigureKind::money, 1'0000},
        {tally({0, 0}), FigureKind::attendance, {}},
        {tally({-5'0000}), FigureKind::money, {}},
        {tally({}), FigureKind::money, {}},
    };
    for (const auto& one : cases) {
        const auto average = one.tally.average(one.kind);
        EXPECT_EQ(average ? std::optional(average->ten_thousandths) : std::nullopt, one.average) << one.tally.sum;
    }
}

TEST(WeeklyAnalysisTest, ChangesAreTakenBetweenTheExactAverages)
{
    struct Case
    {
        Tally before, after;
        std::optional<qint64> change;
    };
    // 12.5 and 12.4 are shown as 13 and 12 and yet differ by less than a half.
    const std::vector<Case> cases{
        {tally({12'0000, 12'0000, 12'0000, 12'0000, 14'0000}), tally({12'0000, 13'0000}), 0},
        {tally({10'0000}), tally({10'0000, 11'0000}), 1'0000},
        {tally({10'0000, 11'0000}), tally({10'0000}), -1'0000},
        {tally({}), tally({20'0000}), {}},
        {tally({20'0000}), tally({}), {}},
        {tally({0}), tally({20'0000}), 20'0000},
        {tally({99999'0000, 99999'0000}), tally({1'0000}), -99998'0000},
    };
    for (const auto& one : cases) {
        const auto change = registers::change(one.before, one.after, FigureKind::attendance);
        EXPECT_EQ(change ? std::optional(change->ten_thousandths) : std::nullopt, one.change) << one.after.sum;
    }
}

TEST(WeeklyAnalysisTest, EachDateHasOneRowWithAFigureForEachCategory)
{
    const auto table = date_table(
        figures_of({{{2007, 3, 4}, 1, 10}, {{2007, 3, 4}, 3, 2.5}, {{2007, 3, 11}, 3, 4}, {{2007, 3, 18}, 9, 7}}),
        both_kinds);

    EXPECT_EQ(table.dates, (std::vector{Date{2007, 3, 4}, Date{2007, 3, 11}}));
    EXPECT_EQ(shown(table.column(0)), u"10 ."_s);
    EXPECT_EQ(shown(table.column(1), FigureKind::money), u"$2.50 $4.00"_s);
}

using WeeklyFiguresTest = EngineTest;
KINDREL_ON_BOTH_ENGINES(WeeklyFiguresTest);

TEST_P(WeeklyFiguresTest, TheStatementFindsTheChosenCategoriesOfTheProjectInThePeriod)
{
    WeeklyFigures stored(session());
    stored.add({{{2008, 1, 6}, 1, 99},
                {{2007, 12, 31}, 1, 12},
                {{2007, 12, 31}, 2, 13},
                {{2007, 12, 31}, 3, 45.5},
                {{2007, 1, 1}, 1, 10},
                {{2006, 12, 31}, 1, 98}});
    stored.add({{{2007, 6, 3}, 4, 50}}, 2);

    EXPECT_EQ(read_weekly_figures(session(), 1, year_2007, both_kinds),
              figures_of({{{2007, 1, 1}, 1, 10}, {{2007, 12, 31}, 1, 12}, {{2007, 12, 31}, 3, 45.5}}));
    EXPECT_TRUE(read_weekly_figures(session(), 2, year_2007, both_kinds).empty());
    EXPECT_TRUE(read_weekly_figures(session(), 1, year_2007, {}).empty());
}

TEST_P(WeeklyFiguresTest, TwoHundredCategoriesAreReadAtOnce)
{
    WeeklyFigures stored(session());
    std::vector<Category> chosen;
    std::vector<GivenFigure> given;
    for (int key = 100; key < 300; ++key) {
        stored.category(key, u"Group %1"_s.arg(key), FigureKind::attendance);
        chosen.push_back({key, {}, FigureKind::attendance});
        given.push_back({{2007, 5, 6}, key, double(key)});
    }
    stored.add(given);

    EXPECT_EQ(read_weekly_figures(session(), 1, year_2007, chosen).size(), 200);
}

} // namespace kindrel::test
