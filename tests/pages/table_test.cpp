#include "pages/table.h"

#include "pages/report.h"

using namespace Qt::StringLiterals;

namespace kindrel::pages {

namespace {

class TableTest : public Report
{
protected:
    /// Everything drawn that is not text: (left, top, right, bottom) of each rectangle.
    std::vector<QRectF> rectangles(int page) const
    {
        std::vector<QRectF> all;
        for (const auto& item : spool.page(page).items) {
            if (const auto* rects = std::get_if<RectsItem>(&item))
                all.insert(all.end(), rects->rects.begin(), rects->rects.end());
        }
        return all;
    }
};

const TableStyle bare{.lines = TableLines::none, .padding = 0, .vertical_padding = 0};

} // namespace

TEST_F(TableTest, HeadingsStandAgainAtTheTopOfEachColumn)
{
    const auto setup = ten_lines(2);
    Flow flow(spool, setup);
    {
        Table table(flow, {{.heading = u"Name"_s}}, bare);
        for (int i = 1; i <= 21; ++i)
            table.row(QStringList{QString::number(i)});
    }
    flow.line(u"after"_s);
    flow.finish();
    EXPECT_EQ(columns_of(setup), "Name 1 2 3 4 5 6 7 8 9 | Name 10 11 12 13 14 15 16 17 18 || Name 19 20 21 after");
}

TEST_F(TableTest, HeadingsNeverStandAloneAtTheFoot)
{
    const auto setup = ten_lines(2);
    Flow flow(spool, setup);
    write_lines(flow, 1, 9);
    Table table(flow, {{.heading = u"Name"_s}}, bare);
    table.row(QStringList{u"first"_s});
    flow.finish();
    EXPECT_EQ(columns_of(setup), "1 2 3 4 5 6 7 8 9 | Name first");
}

TEST_F(TableTest, ARowHigherThanAColumnIsDividedWithoutLoss)
{
    const auto setup = ten_lines(2);
    QStringList lines;
    for (int i = 1; i <= 25; ++i)
        lines.push_back(QString::number(i));
    Flow flow(spool, setup);
    {
        Table table(flow, {{.heading = u"Notes"_s}}, bare);
        table.row(QStringList{lines.join(u'\n')});
        table.row(QStringList{u"next"_s});
    }
    flow.finish();
    EXPECT_EQ(columns_of(setup),
              "Notes 1 2 3 4 5 6 7 8 9 | Notes 10 11 12 13 14 15 16 17 18 || Notes 19 20 21 22 23 24 25 next");
}

TEST_F(TableTest, FixedColumnsShrinkToTheRoomThereIs)
{
    Flow flow(spool, {});
    const auto right_edge = flow.setup().margins.left() + flow.setup().column_width();
    Table table(flow, {{.width = 400}, {.width = 400}, {}}, {.lines = TableLines::grid});
    table.row({u"a"_s, u"b"_s, u"some words that wrap in the little room left"_s});
    flow.finish();
    for (const auto& rect : rectangles(1))
        EXPECT_LE(rect.right(), right_edge + 0.5);
    for (const auto& text : placed())
        EXPECT_LE(text.at.x() + flow.metrics().width(text.text, flow.type().body), right_edge);
}

TEST_F(TableTest, CellsStandWhereTheirColumnSays)
{
    Flow flow(spool, {.margins = {40, 40, 40, 40}});
    Table table(flow, {{.width = 100}, {.width = 100, .align = Align::right}, {}}, bare);
    table.row(QStringList{u"name"_s, u"$12.00"_s, u"note"_s});
    Cell wide(u"total"_s);
    wide.columns = 2;
    wide.align = Align::right;
    table.row({wide, Cell(u"end"_s)});
    flow.finish();
    const auto texts = placed();
    EXPECT_NEAR(texts[1].right, 240, 0.01);
    EXPECT_NEAR(texts[2].at.x(), 240, 0.01);
    EXPECT_NEAR(texts[3].right, 240, 0.01) << "right edge of the two columns it spans";
    EXPECT_NEAR(texts[4].at.x(), 240, 0.01);
}

TEST_F(TableTest, ExactRowsKeepTheirPlaceOnTheSheetAndShrinkTheirContent)
{
    Flow flow(spool, {.margins = {40, 40, 40, 40}});
    auto labels = bare;
    labels.row_height = 60;
    labels.height_rule = RowHeight::exact;
    Table table(flow, {{}}, labels);
    const auto address = [](int lines) {
        return Cell::of([lines](Writer& writer) { write_lines(writer, 1, lines); });
    };
    for (const int lines : {2, 12, 2})
        table.row({address(lines)});
    flow.finish();
    const auto texts = placed();
    ASSERT_EQ(texts.size(), 16u);
    EXPECT_NEAR(texts[14].at.y() - texts[0].at.y(), 120, 0.01) << "the third label begins two labels below the first";
    EXPECT_LE(texts[13].at.y(), 40 + 120) << "the twelfth line stays on its label";
}

TEST_F(TableTest, AMissingPhotographLeavesAnEmptyFrameOfItsSize)
{
    Flow flow(spool, {.margins = {40, 40, 40, 40}});
    flow.picture(Picture::from_file(u"no such portrait.jpg"_s, {80, 100}), {80, 100});
    flow.picture(Picture::from_bytes("not a picture", {80, 100}), {80, 100});
    flow.finish();
    for (const auto& item : spool.page(1).items) {
        EXPECT_TRUE(std::get<PictureItem>(item).picture.empty());
        EXPECT_EQ(std::get<PictureItem>(item).where.size(), QSizeF(80, 100));
    }
}

TEST_F(TableTest, APictureKeepsItsShapeAndFitsTheColumn)
{
    QImage image(300, 600, QImage::Format_RGB32);
    image.fill(Qt::blue);
    Flow flow(spool, ten_lines(4));
    flow.picture(Picture::from_image(image), {1000, 1000});
    flow.finish();
    const auto where = std::get<PictureItem>(spool.page(1).items.front()).where;
    EXPECT_NEAR(where.height() / where.width(), 2, 0.01);
    EXPECT_LE(where.height(), 10.3 * flow.metrics().line_height(flow.type().body));
    EXPECT_EQ(spool.page_count(), 1);
}

TEST_F(TableTest, ALargePhotographIsKeptAtPrintingResolution)
{
    QImage image(3000, 2000, QImage::Format_RGB32);
    image.fill(Qt::blue);
    const auto picture = Picture::from_bytes(Picture::from_image(image).encoded(), {72, 72});
    EXPECT_EQ(picture.pixels(), QSize(300, 200));
}

} // namespace kindrel::pages
