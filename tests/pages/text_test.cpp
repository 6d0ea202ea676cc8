#include "pages/report.h"

#include <algorithm>

using namespace Qt::StringLiterals;

namespace kindrel::pages {

namespace {

class TextTest : public Report
{
protected:
    /// A flow of one narrow column.
    Flow narrow(qreal width)
    {
        PageSetup setup;
        setup.margins = {40, 40, setup.size().width() - 40 - width, 40};
        return Flow(spool, setup);
    }
    QString joined(const QString& between = {}) const
    {
        QStringList all;
        for (const auto& text : placed())
            all.push_back(text.text);
        return all.join(between);
    }
};

} // namespace

TEST_F(TextTest, NothingOfALongNameIsCutOff)
{
    const QStringList cases{
        u"Naismith-Featherstonehaugh, Bartholomew Maximilian & Wilhelmina Alexandra"_s,
        u"averylongmailboxnamewithoutanyplacetobreak@subdomain.of.some.provider.example.org"_s,
        u"שלום עולם משפחת כהן לוי מזרחי פרץ ביטון דהן אברהם פרידמן"_s,
    };
    for (const auto& text : cases) {
        PageSpool pages;
        PageSetup setup;
        setup.margins = {40, 40, setup.size().width() - 140, 40};
        Flow flow(pages, setup);
        flow.line(text);
        flow.finish();
        QString found;
        int lines = 0;
        for (const auto& item : pages.page(1).items) {
            const auto& piece = std::get<TextItem>(item);
            found += piece.text;
            EXPECT_LE(flow.metrics().width(piece.text, piece.style), 100.01) << piece.text.toStdString();
            ++lines;
        }
        EXPECT_GT(lines, 1);
        EXPECT_EQ(found.remove(u' '), QString(text).remove(u' '));
    }
}

TEST_F(TextTest, ElidedTextStaysOnOneLineInsideItsRoom)
{
    auto flow = narrow(80);
    flow.line(u"Featherstonehaugh, Bartholomew"_s, flow.type().body, Align::left, LongText::elide);
    flow.finish();
    const auto texts = placed();
    ASSERT_EQ(texts.size(), 1u);
    EXPECT_TRUE(texts[0].text.endsWith(u'…'));
    EXPECT_LE(flow.metrics().width(texts[0].text, flow.type().body), 80);
}

TEST_F(TextTest, AlignedTextEndsWhereItShould)
{
    auto flow = narrow(300);
    for (const auto align : {Align::left, Align::centre, Align::right})
        flow.line(u"AVATo Wavy"_s, flow.type().body, align);
    flow.finish();
    const auto texts = placed();
    const auto width = flow.metrics().width(u"AVATo Wavy"_s, flow.type().body);
    EXPECT_NEAR(texts[0].at.x(), 40, 0.01);
    EXPECT_NEAR(texts[1].at.x() + width / 2, 190, 0.01);
    EXPECT_NEAR(texts[2].at.x() + width, 340, 0.01);
}

TEST_F(TextTest, AJustifiedLineReachesTheRightEdgeAndTheLastDoesNot)
{
    auto flow = narrow(150);
    const pages::Run run{u"In the beginning every family wrote its own name down"_s, flow.type().body};
    flow.paragraph({run}, {.align = Align::justified});
    flow.finish();
    const auto texts = placed();
    const auto below =
        std::ranges::find_if(texts, [&](const Placed& text) { return text.at.y() > texts[0].at.y() + 1; });
    ASSERT_NE(below, texts.end());
    EXPECT_NEAR(std::prev(below)->right, 190, 0.05);
    EXPECT_LT(texts.back().right, 185);
}

TEST_F(TextTest, MixedLooksFollowEachOtherWithoutGapOrOverlap)
{
    auto flow = narrow(300);
    const auto body = flow.type().body;
    flow.paragraph(
        {{u"Family Ph: "_s, body}, {u"(02) 9555 1234"_s, body.bolder()}, {u" or "_s, body.slanted().sized(14)}});
    flow.finish();
    const auto texts = placed();
    ASSERT_EQ(texts.size(), 3u);
    EXPECT_NEAR(texts[1].at.x(), 40 + flow.metrics().width(u"Family Ph: "_s, body), 0.01);
    EXPECT_NEAR(texts[2].at.x(), texts[1].at.x() + flow.metrics().width(u"(02) 9555 1234"_s, body.bolder()), 0.01);
    EXPECT_EQ(texts[0].at.y(), texts[2].at.y()) << "one baseline";
}

TEST_F(TextTest, LineBreaksAndTabsOfANoteHold)
{
    auto flow = narrow(300);
    flow.paragraph({{u"Name\tPhone\r\nAnn\t9555"_s, flow.type().body}}, {.tabs = {120}});
    flow.finish();
    const auto texts = placed();
    ASSERT_EQ(joined(u"|"_s), u"Name|Phone|Ann|9555"_s);
    EXPECT_NEAR(texts[1].at.x(), 160, 0.01);
    EXPECT_NEAR(texts[3].at.x(), 160, 0.01);
    EXPECT_GT(texts[2].at.y(), texts[0].at.y());
}

TEST_F(TextTest, ABulletHangsOutAndItsTextStandsAtTheIndentOnEveryLine)
{
    auto flow = narrow(300);
    flow.paragraph({{u"1.\t"_s + u"Some words "_s.repeated(30), flow.type().body}},
                   {.indent = 40, .first_indent = -40, .tabs = {40}});
    flow.finish();
    const auto texts = placed();
    ASSERT_GT(texts.size(), 2u);
    EXPECT_NEAR(texts[0].at.x(), 40, 0.01);
    for (const auto& text : std::span(texts).subspan(1))
        EXPECT_NEAR(text.at.x(), 80, 0.01) << text.text.toStdString();
}

TEST_F(TextTest, AnIndentMovesWhatIsWrittenDuringItsLife)
{
    auto flow = narrow(300);
    {
        const Indent indent(flow, 25);
        flow.line(u"child"_s);
        flow.line(u"right"_s, flow.type().body, Align::right);
    }
    flow.line(u"family"_s);
    flow.finish();
    const auto texts = placed();
    EXPECT_NEAR(texts[0].at.x(), 65, 0.01);
    EXPECT_NEAR(texts[1].right, 340, 0.01);
    EXPECT_NEAR(texts[2].at.x(), 40, 0.01);
}

TEST_F(TextTest, ACaptionWithoutAValueIsLeftOut)
{
    auto flow = narrow(300);
    flow.captions({{u"Family Ph: "_s, {}}, {u"  Family Fax: "_s, u"9555"_s}, {u"  Family Mobile: "_s, {}}});
    flow.caption(u"Family Email: "_s, {});
    flow.line(u"next"_s);
    flow.finish();
    EXPECT_EQ(joined(u"|"_s), u"Family Fax: |9555|next"_s);
    EXPECT_NEAR(placed()[2].at.y() - placed()[0].at.y(), flow.metrics().line_height(flow.type().body), 0.01);
}

TEST_F(TextTest, TheTextsOfASpreadNeverMeet)
{
    const QString long_title = u"A title of a report that is far too long for the room between its neighbours"_s;
    auto flow = narrow(200);
    flow.spread(u"Hightown Parish Church of the Resurrection"_s, {}, u"Report Date - 22/11/2024"_s, flow.type().body);
    flow.spread(u"left"_s, long_title, u"right"_s, flow.type().body);
    flow.finish();
    auto texts = placed();
    std::ranges::sort(texts, {}, [](const Placed& text) { return std::pair(text.at.y(), text.at.x()); });
    for (size_t i = 0; i < texts.size(); ++i) {
        EXPECT_LE(texts[i].right, 240.01);
        if (i > 0 && texts[i].at.y() == texts[i - 1].at.y()) {
            EXPECT_LE(texts[i - 1].right, texts[i].at.x());
        }
    }
}

TEST_F(TextTest, ArialPrintsInTheFacesOfItsMeasures)
{
    EXPECT_EQ(reference_font({.family = u"Arial"_s}).family(), u"Liberation Sans"_s);
    EXPECT_EQ(reference_font({.family = u"arial narrow"_s}).family(), u"Liberation Sans Narrow"_s);
}

} // namespace kindrel::pages
