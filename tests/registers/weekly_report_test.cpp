#include "registers/weekly_reports.h"

#include "pages/find.h"

#include "weekly_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Date;
using registers::PeriodKind;
using registers::WeeklyReportRequest;
using enum registers::FigureKind;

namespace {

/// Cancels at the given step, or never; remembers what it was begun with.
class CancellingProgress : public core::SilentProgress
{
public:
    int cancel_at = 0; ///< Counted from 1; 0 is never.
    int taken = 0, announced = 0;
    QString question;

    void begin(const QString&, int steps, const QString& cancel_question) override
    {
        announced += steps;
        question = cancel_question;
    }
    [[nodiscard]] bool step(const QString&) override { return ++taken != cancel_at; }
};

class WeeklyReportTest : public testing::Test
{
protected:
    WeeklyReportTest() : desk(church), figures(church.session())
    {
        figures.add({{{2006, 12, 10}, 1, 30},
                     {{2007, 2, 4}, 1, 25},
                     {{2007, 2, 4}, 3, 40.5},
                     {{2007, 3, 4}, 1, 10},
                     {{2007, 3, 11}, 1, 20},
                     {{2007, 3, 18}, 1, 30},
                     {{2007, 3, 11}, 3, 100},
                     {{2007, 3, 18}, 3, 50}});
    }

    /// Of project 1's three categories and the year 2007, or the years 2006 and 2007.
    static WeeklyReportRequest request(const QString& report)
    {
        WeeklyReportRequest asked;
        asked.project = 1;
        asked.report = registers::find_weekly_report(report);
        asked.categories = {3, 2, 1};
        const bool several = asked.report && (asked.report->period == registers::ReportPeriod::years ||
                                              asked.report->period == registers::ReportPeriod::two_years);
        asked.period.kind = several ? PeriodKind::year_span : PeriodKind::calendar_year;
        asked.period.year = several ? u"2006"_s : u"2007"_s;
        asked.period.to_year = u"2007"_s;
        if (asked.report && asked.report->charts == registers::ReportCharts::required)
            asked.chart = pages::find_chart_style(u"2D Line");
        return asked;
    }
    bool run(const WeeklyReportRequest& asked, pages::Paper paper = pages::Paper::a4)
    {
        spool.emplace();
        registers::ReportCheck check{desk.dialogue};
        const auto plan = plan_weekly_report(desk.office, asked, check);
        guilty = check.guilty;
        return plan && write_weekly_report(desk.office, *plan, paper, progress, *spool);
    }
    /// The texts of all pages, each page's in the order of writing.
    QStringList texts()
    {
        QStringList all;
        for (int number = 1; number <= spool->page_count(); ++number)
            all += texts_of(spool->page(number), spool->page_count());
        return all;
    }
    /// The first text that reads `first` and those after it, so many in all, joined by blanks.
    QString row_of(const QString& first, int cells)
    {
        const auto all = texts();
        return all.mid(std::max<qsizetype>(0, all.indexOf(first)), cells).join(u' ');
    }
    void refused(const WeeklyReportRequest& asked, const QString& words,
                 std::optional<registers::ReportField> field = {})
    {
        desk.dialogue.expect_box(words);
        EXPECT_FALSE(run(asked)) << words.toStdString();
        desk.dialogue.verify();
        EXPECT_EQ(spool->page_count(), 0);
        EXPECT_FALSE(spool->finished());
        EXPECT_TRUE(!field || guilty == field) << words.toStdString();
    }
    /// Makes `count` categories of attendance, each with a figure in March 2007, and returns their keys.
    std::vector<int> many_categories(int count)
    {
        std::vector<int> keys;
        std::vector<GivenFigure> given;
        for (int key = 100; key < 100 + count; ++key) {
            figures.category(key, u"G%1"_s.arg(key), attendance);
            given.push_back({{2007, 3, 4}, key, double(key)});
            keys.push_back(key);
        }
        figures.add(given);
        return keys;
    }

    TestChurch church{core::EngineKind::sqlite};
    SetupOffice desk;
    WeeklyFigures figures;
    CancellingProgress progress;
    std::optional<pages::PageSpool> spool;        ///< Of the last run.
    std::optional<registers::ReportField> guilty; ///< Likewise.
};

struct ReportCase
{
    const char* report;
    QString heading, period;
    QString first;    ///< Of the row that is read back.
    QString expected; ///< The row.
};

const std::vector<ReportCase> report_cases{
    {"weekly_total_report", u"Weekly Totals"_s, u"Sunday Calender Year (2007)"_s, u"Total Amount"_s,
     u"Total Amount 85 $190.50 Average Amount 21 $63.50 Highest Amount 30 $100.00 Lowest Amount 10 $40.50"_s},
    {"weekly_total_report_landscape", u"Weekly Totals"_s, u"Sunday Calender Year (2007)"_s, u"11/03/2007"_s,
     u"11/03/2007 20 $100.00"_s},
    {"weekly_analysis_report", u"Weekly Analysis"_s, u"Sunday Calender Year (2007)"_s, u"Date"_s,
     u"Date Morning Evening Offering ($) 04/02/2007 25 $40.50 04/03/2007 10 11/03/2007 20 $100.00"_s},
    {"weekly_table_report", u"Monthly Totals"_s, u"Sunday Calender Year (2007)"_s, u"Morning"_s,
     u"Morning 25 60 85 Evening $ Amount Offering ($) $40.50 $150.00 $190.50"_s},
    {"weekly_table_average_report", u"Monthly Averages"_s, u"Sunday Calender Year (2007)"_s, u"Morning"_s,
     u"Morning 25 20 21 Evening $ Amount Offering ($) $40.50 $75.00 $63.50"_s},
    {"weekly_table_variance_report", u"Monthly Growth or Decline"_s, u"Sunday Calender Year (2007)"_s, u"Morning"_s,
     u"Morning -5 Evening $ Amount Offering ($) +$34.50"_s},
    {"Yearly_table_report", u"Yearly Totals"_s, u"Sunday (2006 - 2007)"_s, u"2006"_s,
     u"2006 2007 All Years Attendance Morning 30 85 115"_s},
    {"Yearly_average_report", u"Yearly Averages"_s, u"Sunday (2006 - 2007)"_s, u"2006"_s,
     u"2006 2007 All Years Attendance Morning 30 21 23"_s},
    {"Yearly_variance_report", u"Yearly Comparison"_s, u"Sunday (2006 - 2007)"_s, u"Morning"_s, u"Morning -9"_s},
};

class EachWeeklyReportTest : public WeeklyReportTest, public testing::WithParamInterface<ReportCase>
{
};

} // namespace

TEST_P(EachWeeklyReportTest, PrintsItsFiguresUnderItsHeadings)
{
    const auto& one = GetParam();
    ASSERT_TRUE(run(request(QString::fromUtf8(one.report))));

    EXPECT_EQ(texts().first(2), QStringList({one.heading, one.period}));
    const auto cells = int(one.expected.split(u' ').size());
    const auto found = row_of(one.first, cells);
    EXPECT_TRUE(found.startsWith(one.expected)) << found.toStdString();
    EXPECT_TRUE(spool->finished());
}

TEST_P(EachWeeklyReportTest, TakesAsManyStepsAsItAnnounced)
{
    auto asked = request(QString::fromUtf8(GetParam().report));
    for (const auto* style : {"2D Bar", "2D Pie"}) {
        asked.chart = pages::find_chart_style(QString::fromUtf8(style));
        ASSERT_TRUE(run(asked));
        EXPECT_EQ(progress.taken, progress.announced) << style;
        EXPECT_GT(progress.taken, 0);
    }
}

TEST_P(EachWeeklyReportTest, FillsTheWidthOfEitherPaper)
{
    for (const auto paper : {pages::Paper::a4, pages::Paper::letter}) {
        ASSERT_TRUE(run(request(QString::fromUtf8(GetParam().report)), paper));
        const auto page = spool->page(1);
        qreal right = 0;
        for (const auto& item : page.items) {
            if (const auto* text = std::get_if<pages::TextItem>(&item))
                right = std::max(right, text->at.x() + text->width);
        }
        EXPECT_LT(right, page.size.width() - 20);
        EXPECT_GT(right, page.size.width() - 60);
    }
}

INSTANTIATE_TEST_SUITE_P(Reports, EachWeeklyReportTest, testing::ValuesIn(report_cases),
                         [](const auto& test) { return std::string(test.param.report); });

TEST_F(WeeklyReportTest, EveryReportOfTheListCanBeRun)
{
    for (const auto& report : registers::weekly_reports())
        EXPECT_TRUE(std::ranges::any_of(report_cases, [&](const auto& one) {
            return std::string_view(one.report) == report.name;
        })) << report.name;
    EXPECT_EQ(registers::weekly_reports().size(), report_cases.size());
}

TEST_F(WeeklyReportTest, WhatIsMissingIsAskedForInOrder)
{
    using enum registers::ReportField;
    WeeklyReportRequest asked;
    refused(asked, u"Please choose a weekly project"_s, project);
    asked.project = 1;
    refused(asked, u"Please choose a report"_s, report);
    asked.report = registers::find_weekly_report(u"weekly_analysis_report");
    refused(asked, u"Please select either a financial or attendance item"_s);
    asked.categories = {4};
    refused(asked, u"Please select either a financial or attendance item"_s, categories);
    asked.categories = {1};
    refused(asked, u"Please choose a chart style"_s, chart);
    asked.chart = pages::find_chart_style(u"2D Bar");
    refused(asked, u"Please select a date to begin the search from"_s);
    asked.period.from = Date{2007, 5, 1};
    refused(asked, u"Please select a date to end the search from"_s);
    asked.period.to = Date{2007, 5, 31};
    refused(asked, u"No figures found for creating a report"_s, from);
    asked.period.from = Date{2007, 3, 18};
    EXPECT_TRUE(run(asked));
}

TEST_F(WeeklyReportTest, AReportAsksForTheKindOfPeriodThatItIsOf)
{
    auto asked = request(u"weekly_table_report"_s);
    asked.period = {};
    refused(asked, u"Please enter an analysis year"_s);
    asked = request(u"Yearly_average_report"_s);
    asked.period.to_year.clear();
    refused(asked, u"Please enter a `To' year for analysis"_s);
    asked = request(u"weekly_total_report"_s);
    asked.period.kind = PeriodKind::year_span;
    refused(asked, u"Please select a date to begin the search from"_s);
}

TEST_F(WeeklyReportTest, WithoutProjectsThereIsNothingToProceedWith)
{
    church.session().execute(u"DELETE FROM [tbl_weekly_project];"_s);
    refused({}, u"Unable to proceed as no Weekly projects have been setup"_s);
}

TEST_F(WeeklyReportTest, WithoutTheRightNothingIsShown)
{
    desk.office.rights.set(core::Area::weekly_statistics, false);
    refused(request(u"weekly_total_report"_s), u"Your password does not give access to \"Weekly Statistics\""_s);
}

struct LimitCase
{
    const char* report;
    int most;
    QString words;
};

class WeeklyLimitTest : public WeeklyReportTest, public testing::WithParamInterface<LimitCase>
{
};

TEST_P(WeeklyLimitTest, SoManyCategoriesAreAllowedAndNotOneMore)
{
    const auto& one = GetParam();
    auto asked = request(QString::fromUtf8(one.report));
    asked.categories = many_categories(one.most + 1);
    refused(asked, one.words);

    asked.categories.pop_back();
    ASSERT_TRUE(run(asked));
    EXPECT_TRUE(texts().contains(u"G%1"_s.arg(99 + one.most)));
}

INSTANTIATE_TEST_SUITE_P(
    Reports, WeeklyLimitTest,
    testing::Values(
        LimitCase{"weekly_total_report", 9,
                  u"For the records data report you are only able to select a maximum amount of 9 categories"_s},
        LimitCase{"weekly_analysis_report", 9,
                  u"For the records analysis report you are only able to select a maximum amount of 9 categories"_s},
        LimitCase{"weekly_table_report", 200,
                  u"For the records data report you are only able to select a maximum amount of 200 categories"_s},
        LimitCase{"weekly_table_average_report", 200,
                  u"For the records analysis report you are only able to select a maximum amount of 200 categories"_s}),
    [](const auto& test) { return std::string(test.param.report); });

TEST_F(WeeklyReportTest, SixGraphsAreTheMostOfAMonthlyReport)
{
    using enum registers::ReportField;
    auto asked = request(u"weekly_table_average_report"_s);
    asked.chart = pages::find_chart_style(u"3D Bar");
    asked.categories = many_categories(7);
    refused(asked, u"A maximum of six graphs can only be displayed at once for the monthly analysis Report"_s, chart);

    asked.categories.pop_back();
    ASSERT_TRUE(run(asked));
    for (const int key : asked.categories)
        EXPECT_EQ(texts().count(u"G%1"_s.arg(key)), 2) << "in the table and above its chart";
}

TEST_F(WeeklyReportTest, ATableAloneIsNeverRefusedBecauseOfCharts)
{
    const auto categories = many_categories(7);
    for (const auto& [report, style] :
         {std::pair{u"weekly_table_report"_s, "3D Bar"}, {u"weekly_analysis_report"_s, ""}}) {
        auto asked = request(report);
        asked.categories = categories;
        asked.chart = pages::find_chart_style(QString::fromLatin1(style));
        asked.parts = registers::ReportParts::table;
        registers::ReportCheck check{desk.dialogue};
        const auto plan = plan_weekly_report(desk.office, asked, check);
        ASSERT_TRUE(plan) << report.toStdString();
        EXPECT_EQ(plan->chart, nullptr);
    }
}

TEST_F(WeeklyReportTest, TheFirstMonthIsComparedWithTheOneBeforeThePeriod)
{
    figures.add({{{2007, 1, 7}, 1, 33}});
    ASSERT_TRUE(run(request(u"weekly_table_variance_report"_s)));
    EXPECT_EQ(row_of(u"Morning"_s, 4), u"Morning +3 -8 -5"_s);
}

TEST_F(WeeklyReportTest, HeadCountsAndMoneyHaveChartsOfTheirOwn)
{
    ASSERT_TRUE(run(request(u"weekly_analysis_report"_s)));
    const auto all = texts();
    EXPECT_TRUE(all.contains(u"Attendance"_s)) << "a chart of two categories, with a legend";
    EXPECT_FALSE(all.contains(u"$ Amount"_s));
    EXPECT_EQ(all.count(u"Offering ($)"_s), 2) << "above its own chart and in the table";
    EXPECT_TRUE(all.contains(u"$100.00"_s));
    EXPECT_TRUE(all.contains(u"0"_s)) << "the axis of head counts begins at zero";
}

TEST_F(WeeklyReportTest, APieOfSeveralCategoriesShowsWhatTheTableShowsForAllYears)
{
    figures.add({{{2006, 12, 10}, 2, 10}, {{2007, 2, 4}, 2, 40}, {{2007, 3, 4}, 2, 10}});
    struct Case
    {
        QString report;
        QString morning, evening;
    };
    for (const auto& [report, morning, evening] : {Case{u"Yearly_average_report"_s, u"23 (53.5%)"_s, u"20 (46.5%)"_s},
                                                   Case{u"Yearly_table_report"_s, u"115 (65.7%)"_s, u"60 (34.3%)"_s}}) {
        auto asked = request(report);
        asked.chart = pages::find_chart_style(u"2D Pie");
        ASSERT_TRUE(run(asked));
        EXPECT_TRUE(texts().contains(u"Morning: "_s + morning)) << texts().join(u'|').toStdString();
        EXPECT_TRUE(texts().contains(u"Evening: "_s + evening));
    }
}

TEST_F(WeeklyReportTest, AComparisonLooksAtItsTwoYearsAlone)
{
    figures.add({{{2007, 3, 4}, 2, 500}, {{2009, 12, 6}, 1, 34}});
    auto asked = request(u"Yearly_variance_report"_s);
    asked.period.to_year = u"2009"_s;
    ASSERT_TRUE(run(asked));
    EXPECT_EQ(row_of(u"Morning"_s, 4), u"Morning +4 +4 Evening"_s);
    asked.categories = {2};
    refused(asked, u"No figures found for creating a report"_s);
}

TEST_F(WeeklyReportTest, ATableOfChangesWithoutAChangeIsRefusedNamingTheYearWithoutFigures)
{
    figures.add({{{2009, 1, 4}, 2, 34}, {{2009, 3, 1}, 2, 34}});
    using registers::ReportField;
    struct Case
    {
        QString report, from, to, words;
        ReportField guilty = ReportField::from;
    };
    for (const auto& one :
         {Case{u"Yearly_variance_report"_s, u"2003"_s, u"2007"_s,
               u"There are no figures of 2003 to compare with those of 2007."_s},
          Case{u"Yearly_variance_report"_s, u"2007"_s, u"2011"_s,
               u"There are no figures of 2011 to compare with those of 2007."_s, ReportField::to},
          Case{u"Yearly_variance_report"_s, u"2007"_s, u"2007"_s, u"Please enter two different years to compare"_s,
               ReportField::to},
          Case{u"Yearly_variance_report"_s, u"2003"_s, u"2003"_s, u"Please enter two different years to compare"_s,
               ReportField::to},
          Case{u"Yearly_variance_report"_s, u"2007"_s, u"2009"_s,
               u"None of the chosen categories has figures of both 2007 and 2009."_s},
          Case{u"weekly_table_variance_report"_s,
               u"2009"_s,
               {},
               u"No month of the period and the month before it both have figures of the chosen categories."_s}}) {
        auto asked = request(one.report);
        asked.period.year = one.from;
        asked.period.to_year = one.to;
        refused(asked, one.words, one.guilty);
    }
}

TEST_F(WeeklyReportTest, ChartsFillThePageThatTheirTableLeaves)
{
    struct Case
    {
        QString report, last; ///< The lowest text of a chart, or of the table beneath it.
    };
    for (const auto& [report, last] :
         {Case{u"weekly_table_report"_s, u"December"_s}, Case{u"weekly_table_average_report"_s, u"December"_s},
          Case{u"weekly_analysis_report"_s, u"Lowest Amount"_s}}) {
        auto asked = request(report);
        asked.chart = pages::find_chart_style(u"2D Line");
        if (report != u"weekly_analysis_report")
            asked.categories = {1, 3};
        ASSERT_TRUE(run(asked));
        EXPECT_EQ(spool->page_count(), 1) << report.toStdString();
        const auto page = spool->page(1);
        const auto places = pages::find(page, last);
        ASSERT_FALSE(places.empty()) << report.toStdString();
        EXPECT_GT(places.back().where.bottom(), page.size.height() * 0.75) << report.toStdString();
    }
}

TEST_F(WeeklyReportTest, FiguresThatAddUpToNothingHaveADashForAnAverage)
{
    figures.add({{{2007, 3, 11}, 2, 0}});
    auto asked = request(u"weekly_total_report"_s);
    asked.categories = {2, 3};
    ASSERT_TRUE(run(asked));
    EXPECT_EQ(row_of(u"Average Amount"_s, 3), u"Average Amount – $63.50"_s);
}

TEST_F(WeeklyReportTest, TheLargestFiguresAndTheWordsOfHeadingsStandWhole)
{
    const std::array keys{100, 101, 102, 103, 104, 105, 106, 107, 108};
    for (const int key : keys) {
        figures.category(key, u"Thanksgiving %1"_s.arg(key), money);
        for (int week = 1; week < 53; ++week)
            figures.add({{Date::from(QDate(2007, 1, 1).addDays(7 * week - 7)), key, 99999}});
    }
    for (const auto& report : {u"weekly_total_report"_s, u"weekly_table_report"_s, u"Yearly_table_report"_s}) {
        auto asked = request(report);
        asked.categories.assign(keys.begin(), keys.end());
        asked.period.year = u"2007"_s;
        ASSERT_TRUE(run(asked)) << report.toStdString();
        const auto all = texts();
        EXPECT_GE(all.count(u"$5199948.00"_s), 9) << all.join(u'|').toStdString();
        EXPECT_TRUE(all.contains(u"Thanksgiving"_s) || all.contains(u"Thanksgiving 100 ($)"_s));
    }
}

TEST_F(WeeklyReportTest, AHyphenatedNameBreaksBehindItsHyphensInsteadOfShrinkingTheTable)
{
    const auto height_of_figures = [this](int key, const QString& name) {
        figures.category(key, name, attendance);
        figures.add({{{2007, 3, 4}, key, 777}});
        auto asked = request(u"weekly_total_report"_s);
        asked.categories = {1, 2, 3, key};
        EXPECT_TRUE(run(asked));
        return pages::find(spool->page(1), u"777"_s).at(0).where.height();
    };
    const auto usual = height_of_figures(100, u"Mothers and Toddlers Fellowship Afternoon"_s);
    EXPECT_EQ(height_of_figures(101, u"Mothers-and-Toddlers-Fellowship-Afternoon"_s), usual);
    EXPECT_LT(height_of_figures(102, u"MothersandToddlersFellowshipAfternoon"_s), usual);
}

TEST_F(WeeklyReportTest, OfAProjectsCategoriesOnlyTheChosenOnesPrint)
{
    auto asked = request(u"weekly_total_report"_s);
    asked.categories = {3};
    ASSERT_TRUE(run(asked));
    EXPECT_FALSE(texts().contains(u"Morning"_s));
    EXPECT_FALSE(texts().contains(u"04/03/2007"_s)) << "a date without a figure of theirs";
    EXPECT_EQ(row_of(u"Total Amount"_s, 2), u"Total Amount $190.50"_s);
}

TEST_F(WeeklyReportTest, ACancelledRunLeavesTheDocumentOpen)
{
    progress.cancel_at = 2;
    EXPECT_FALSE(run(request(u"weekly_total_report"_s)));
    EXPECT_EQ(progress.question, u"Are you sure that you wish to cancel this report?"_s);
    EXPECT_EQ(progress.taken, 2);
    EXPECT_FALSE(spool->finished());
}

} // namespace kindrel::test
