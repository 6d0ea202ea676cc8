#include "pages/report.h"

#include <algorithm>

using namespace Qt::StringLiterals;

namespace kindrel::pages {

namespace {

class FlowTest : public Report
{
protected:
    /// What stands in the columns after `write`.
    std::string columns_after(int columns, const std::function<void(Flow&)>& write)
    {
        const auto setup = ten_lines(columns);
        Flow flow(spool, setup);
        write(flow);
        flow.finish();
        return columns_of(setup);
    }
};

QString words(int count)
{
    QStringList all;
    for (int i = 0; i < count; ++i)
        all.push_back(u"word%1"_s.arg(i));
    return all.join(u' ');
}

} // namespace

TEST_F(FlowTest, LinesRunDownEachColumnAcrossThePageAndOnToTheNext)
{
    const auto twenty_five = [](Flow& flow) {
        write_lines(flow, 1, 25);
    };
    EXPECT_EQ(columns_after(1, twenty_five), "1 2 3 4 5 6 7 8 9 10 || 11 12 13 14 15 16 17 18 19 20 || 21 22 23 24 25");
}

TEST_F(FlowTest, EveryNumberOfColumnsIsFilledBeforeThePageTurns)
{
    for (int columns = 1; columns <= 4; ++columns) {
        PageSpool pages;
        Flow flow(pages, ten_lines(columns));
        write_lines(flow, 1, 40);
        flow.finish();
        EXPECT_EQ(pages.page_count(), (4 + columns - 1) / columns) << columns << " columns";
    }
}

TEST_F(FlowTest, KeptLinesMoveToTheNextColumnTogether)
{
    const auto columns = columns_after(2, [](Flow& flow) {
        write_lines(flow, 1, 8);
        {
            const Keep keep(flow);
            write_lines(flow, 9, 11);
        }
        flow.line(u"after"_s);
    });
    EXPECT_EQ(columns, "1 2 3 4 5 6 7 8 | 9 10 11 after");
}

TEST_F(FlowTest, TwoKeepsInARowAreKeptApart)
{
    const auto columns = columns_after(2, [](Flow& flow) {
        for (int family = 0; family < 3; ++family) {
            const Keep keep(flow);
            write_lines(flow, family * 4 + 1, family * 4 + 4);
        }
    });
    EXPECT_EQ(columns, "1 2 3 4 5 6 7 8 | 9 10 11 12");
}

TEST_F(FlowTest, AKeepHigherThanAColumnIsDividedWhereItStands)
{
    const auto columns = columns_after(2, [](Flow& flow) {
        write_lines(flow, 1, 6);
        const Keep keep(flow);
        write_lines(flow, 7, 23);
    });
    EXPECT_EQ(columns, "1 2 3 4 5 6 7 8 9 10 | 11 12 13 14 15 16 17 18 19 20 || 21 22 23");
}

TEST_F(FlowTest, AHeadingStaysWithTheFirstLineBelowIt)
{
    const auto columns = columns_after(2, [](Flow& flow) {
        write_lines(flow, 1, 8);
        flow.heading(u"Choir"_s, 3);
        write_lines(flow, 9, 10);
    });
    EXPECT_EQ(columns, "1 2 3 4 5 6 7 8 | Choir 9 10");
}

TEST_F(FlowTest, AHeadingInsideAnOversizedKeepStillStaysWithItsLine)
{
    const auto columns = columns_after(2, [](Flow& flow) {
        const Keep keep(flow);
        write_lines(flow, 1, 8);
        flow.heading(u"Choir"_s, 3);
        write_lines(flow, 9, 14);
    });
    EXPECT_EQ(columns, "1 2 3 4 5 6 7 8 | Choir 9 10 11 12 13 14");
}

TEST_F(FlowTest, AParagraphLeavesNoSingleLineAlone)
{
    const auto lines_on_first_page = [](int lines_before) {
        PageSpool pages;
        Flow flow(pages, ten_lines(1));
        write_lines(flow, 1, lines_before);
        flow.line(words(250));
        flow.finish();
        return texts_of(pages.page(1), 1).size() - lines_before;
    };
    EXPECT_EQ(lines_on_first_page(9), 0) << "a first line alone at the foot";
    EXPECT_EQ(lines_on_first_page(8), 2);
}

TEST_F(FlowTest, SpaceIsDroppedAtTheTopOfAColumn)
{
    const auto setup = ten_lines(2);
    Flow flow(spool, setup);
    write_lines(flow, 1, 10);
    flow.space(30);
    flow.line(u"first"_s);
    flow.finish();
    const auto texts = placed();
    EXPECT_EQ(texts.back().text, u"first"_s);
    EXPECT_DOUBLE_EQ(texts.back().at.y(), texts.front().at.y());
}

TEST_F(FlowTest, ASeparatorStandsWhereTheInitialChangesAndStaysWithItsEntry)
{
    const auto columns = columns_after(3, [](Flow& flow) {
        for (const auto& name :
             {u"Abbott"_s, u"Ávila"_s, u"aSmith"_s, u"Baker"_s, u"3rd Scouts"_s, u"(none)"_s, u"Éluard"_s, u"Ede"_s}) {
            flow.separator(name);
            flow.line(name);
        }
    });
    EXPECT_EQ(columns, "A Abbott Ávila aSmith B Baker | # 3rd Scouts (none) E Éluard Ede");
}

TEST_F(FlowTest, AGroupsHeadingStandsAgainWhereTheGroupGoesOn)
{
    const auto columns = columns_after(3, [](Flow& flow) {
        {
            const Group group(flow, u"Choir"_s, 3);
            write_lines(flow, 1, 10);
        }
        write_lines(flow, 11, 17);
    });
    EXPECT_EQ(columns, "Choir 1 2 3 4 5 6 7 8 | Choir (continued) 9 10 11 12 13 14 15 16 | 17");
}

TEST_F(FlowTest, ColumnsAndPagesTurnOnRequest)
{
    const auto columns = columns_after(2, [](Flow& flow) {
        flow.line(u"a"_s);
        flow.next_column();
        flow.line(u"b"_s);
        flow.next_page();
        flow.line(u"c"_s);
        flow.next_page();
    });
    EXPECT_EQ(columns, "a | b || c");
    EXPECT_EQ(spool.page_count(), 2) << "turning the page after the last line begins no page";
}

TEST_F(FlowTest, AnEmptyReportHasOnePageWithHeaderAndFooter)
{
    Flow flow(spool, {});
    flow.set_header([](Writer& band, int) { band.line(u"Directory 1"_s); });
    flow.set_footer([](Writer& band, int number) { band.line(u"Page: %1"_s.arg(number)); });
    flow.finish();
    EXPECT_EQ(spool.page_count(), 1);
    EXPECT_EQ(texts(1), QStringList({u"Directory 1"_s, u"Page: 1"_s}));
}

TEST_F(FlowTest, EachPageBearsItsNumberAndTheTotal)
{
    Flow flow(spool, ten_lines(1));
    flow.set_footer([](Writer& band, int number) { band.line(u"Page: %1 of %2"_s.arg(number).arg(page_total_mark)); });
    write_lines(flow, 1, 18);
    flow.finish();
    ASSERT_EQ(spool.page_count(), 3);
    EXPECT_EQ(texts(3).front(), u"Page: 3 of 3"_s);
}

TEST_F(FlowTest, ColumnsKeepClearOfHeaderAndFooterHoweverHighTheyAre)
{
    PageSetup setup;
    Flow flow(spool, setup);
    flow.set_header([](Writer& band, int number) { write_lines(band, 1, number == 1 ? 8 : 2); });
    flow.set_footer([](Writer& band, int) { write_lines(band, 1, 3); });
    for (int i = 0; i < 200; ++i)
        flow.line(u"body"_s);
    flow.finish();
    const auto line = flow.metrics().line_height(flow.type().body);
    for (const auto& text : placed()) {
        if (text.text != u"body"_s)
            continue;
        EXPECT_GT(text.at.y() - line, setup.margins.top() + (text.page == 1 ? 8 : 2) * line - 1);
        EXPECT_LT(text.at.y(), setup.size().height() - setup.margins.bottom() - 3 * line);
    }
}

TEST_F(FlowTest, HeaderAndFooterThatWouldFillThePageAreCutSoThatTheReportHasRoom)
{
    struct Case
    {
        int header, footer; ///< Lines, of which a page holds fewer than 100.
        const char* what;
    };
    for (const Case& one : {Case{200, 2, "header"}, Case{2, 200, "footer"}, Case{200, 200, "both"}}) {
        PageSpool pages;
        Flow flow(pages, {});
        flow.set_header([&](Writer& band, int) { write_lines(band, 1, one.header); });
        flow.set_footer([&](Writer& band, int) { write_lines(band, 1001, 1000 + one.footer); });
        flow.line(u"body"_s);
        flow.line(u"end"_s);
        flow.finish();
        ASSERT_EQ(pages.page_count(), 1) << one.what;
        const auto all = texts_of(pages.page(1), 1);
        EXPECT_EQ(all.front(), u"1"_s) << one.what;
        EXPECT_TRUE(all.contains(QString::number(1000 + one.footer))) << one.what;
        qreal above = 0, below = 1e6, at = 0;
        for (const auto& item : pages.page(1).items) {
            const auto& text = std::get<TextItem>(item);
            const auto number = text.text.toInt();
            if (number > 1000)
                below = std::min(below, text.at.y());
            else if (number > 0)
                above = std::max(above, text.at.y());
            else
                at = text.at.y();
        }
        EXPECT_TRUE(above < at && at < below) << one.what;
    }
}

TEST_F(FlowTest, AFlowThatIsDroppedLeavesTheSpoolOpen)
{
    {
        Flow flow(spool, {});
        flow.line(u"cancelled"_s);
    }
    EXPECT_FALSE(spool.finished());
}

} // namespace kindrel::pages
