#include "pages/barcode.h"
#include "pages/find.h"
#include "pages/painter.h"
#include "pages/pdf.h"
#include "pages/report.h"

#include "core/files.h"

#include <QPainter>
#include <QTemporaryDir>
#include <malloc.h>
#include <poppler-qt6.h>
#include <zbar.h>

#include <csignal>
#include <sys/resource.h>

using namespace Qt::StringLiterals;

namespace kindrel::pages {

namespace {

using Document = std::unique_ptr<Poppler::Document>;

class OutputTest : public Report
{
protected:
    QString file(const QString& name) const { return folder.filePath(name); }
    Document written(const PageSpool& pages)
    {
        EXPECT_TRUE(write_pdf(pages, file(u"report.pdf"_s), {u"Directory 1"_s, u"Kindrel"_s}));
        return Poppler::Document::load(file(u"report.pdf"_s));
    }
    QByteArray content(const QString& name) const { return core::read_file(file(name)).value_or(QByteArray()); }

    QTemporaryDir folder;
};

/// A page as a screen of `dots` to the point shows it.
QImage shown(const Page& page, qreal dots)
{
    QImage image((page.size * dots).toSize(), QImage::Format_Grayscale8);
    image.fill(Qt::white);
    QPainter painter(&image);
    painter.scale(dots, dots);
    PagePainter().paint(painter, page, 1);
    return image;
}

QString decoded(const QImage& image)
{
    zbar::ImageScanner scanner;
    zbar::Image picture(uint(image.bytesPerLine()), uint(image.height()), "Y800", image.constBits(),
                        ulong(image.sizeInBytes()));
    if (scanner.scan(picture) != 1)
        return {};
    return QString::fromStdString(picture.symbol_begin()->get_data());
}

/// Cancels after so many steps.
class ImpatientProgress : public core::SilentProgress
{
public:
    explicit ImpatientProgress(int steps) : m_steps(steps) {}
    bool step(const QString& = {}) override { return --m_steps > 0; }

private:
    int m_steps;
};

/// Makes every write beyond `bytes` of a file fail, as a full disk does.
class FullDisk
{
public:
    explicit FullDisk(rlim_t bytes)
    {
        std::signal(SIGXFSZ, SIG_IGN);
        getrlimit(RLIMIT_FSIZE, &m_before);
        const rlimit small{bytes, m_before.rlim_max};
        setrlimit(RLIMIT_FSIZE, &small);
    }
    ~FullDisk() { setrlimit(RLIMIT_FSIZE, &m_before); }
    FullDisk(const FullDisk&) = delete;
    FullDisk& operator=(const FullDisk&) = delete;

private:
    rlimit m_before{};
};

} // namespace

TEST_F(OutputTest, PagesComeBackFromTheSpoolAsTheyWentIn)
{
    QImage image(30, 40, QImage::Format_RGB32);
    image.fill(Qt::red);
    const TextStyle body, bold = body.bolder().coloured(0xff102030);
    const Page first{
        1,
        {595, 842},
        {TextItem{
             .at = {10, 20.25}, .width = 33.3, .align = Align::right, .angle = 90, .style = bold, .text = u"Ävila"_s},
         TextItem{
             .at = {1, 2}, .right_to_left = true, .style = body, .text = u"שלום ab"_s, .spans = {{5, body}, {2, bold}}},
         LineItem{{1, 2}, {3, 4}, 0.75, ink::grey}, RectsItem{{{1, 2, 3, 4}, {5, 6, 7, 8}}, ink::shade, ink::black, 2},
         PolygonItem{{{1, 1}, {2, 3}, {0, 9}}, ink::grey}, PictureItem{{5, 5, 30, 40}, Picture::from_image(image)},
         PictureItem{{9, 9, 3, 4}, {}}}};
    const Page second{2, {842, 595}, {}};
    spool.append(first);
    spool.append(second);
    EXPECT_EQ(spool.page(2), second);
    EXPECT_EQ(spool.page(1), first);
    EXPECT_EQ(std::get<PictureItem>(spool.page(1).items[5]).picture.decoded().size(), image.size());
}

TEST_F(OutputTest, TheFirstPageCanBeReadWhileLaterOnesAreWritten)
{
    QStringList seen;
    spool.on_page([&](int number) { seen.push_back(texts(number).front()); });
    Flow flow(spool, ten_lines(1));
    write_lines(flow, 1, 12);
    EXPECT_EQ(seen, QStringList{u"1"_s});
    write_lines(flow, 13, 21);
    flow.finish();
    EXPECT_EQ(seen, QStringList({u"1"_s, u"11"_s, u"21"_s}));
}

TEST_F(OutputTest, MemoryStaysFlatHoweverLongTheReport)
{
    Flow flow(spool, {.columns = 2});
    const auto in_use_after = [&](int lines) {
        for (int i = 0; i < lines; ++i)
            flow.caption(u"Family Ph: "_s, QString::number(i));
        return qint64(mallinfo2().uordblks);
    };
    const auto before = in_use_after(20'000);
    EXPECT_LT(in_use_after(100'000) - before, 400'000);
    EXPECT_GT(spool.page_count(), 700);
}

TEST_F(OutputTest, PaperAndOrientationReachThePdf)
{
    struct Case
    {
        Paper paper;
        Orientation orientation;
        QSize points;
    };
    for (const auto& [paper, orientation, points] :
         {Case{Paper::a4, Orientation::portrait, {595, 842}}, Case{Paper::a4, Orientation::landscape, {842, 595}},
          Case{Paper::letter, Orientation::portrait, {612, 792}},
          Case{Paper::letter, Orientation::landscape, {792, 612}}}) {
        PageSpool pages;
        Flow(pages, {.paper = paper, .orientation = orientation}).finish();
        const auto document = written(pages);
        EXPECT_EQ(document->numPages(), 1);
        EXPECT_EQ(document->page(0)->pageSize(), points);
    }
}

TEST_F(OutputTest, TextOfThePdfCanBeReadInItsOrder)
{
    Flow flow(spool, {.columns = 2});
    flow.set_footer([](Writer& band, int number) { band.line(u"Page: %1 of %2"_s.arg(number).arg(page_total_mark)); });
    for (const auto& text : {u"Ávila & Žižka"_s, u"Łódź office fi ffl"_s, u"שלום עולם"_s, u"محمد بن"_s, u"Nguyễn"_s})
        flow.line(text);
    flow.next_column();
    flow.line(u"second column"_s);
    flow.next_page();
    flow.line(u"next page"_s);
    flow.finish();
    const auto document = written(spool);
    ASSERT_EQ(document->numPages(), 2);
    const auto text = document->page(0)->text({}).normalized(QString::NormalizationForm_KC);
    qsizetype from = 0;
    for (const auto& part : {u"Ávila & Žižka"_s, u"Łódź office fi ffl"_s, u"שלום עולם"_s, u"محمد بن"_s, u"Nguyễn"_s}) {
        const auto at = text.indexOf(part.normalized(QString::NormalizationForm_KC));
        EXPECT_GE(at, from) << part.toStdString() << " in\n" << text.toStdString();
        from = at;
    }
    EXPECT_TRUE(text.contains(u"second column"_s));
    EXPECT_TRUE(text.contains(u"Page: 1 of 2"_s));
    EXPECT_TRUE(document->page(1)->text({}).contains(u"next page"_s));
    EXPECT_EQ(document->info(u"Title"_s), u"Directory 1"_s);
}

TEST_F(OutputTest, APictureOnEveryPageIsEmbeddedOnce)
{
    QImage logo(200, 200, QImage::Format_RGB32);
    for (int i = 0; i < 200 * 200; ++i)
        logo.setPixel(i % 200, i / 200, QRgb(i) * 2654435761u);
    const auto picture = Picture::from_image(logo);
    const auto size_with = [&](int count) {
        PageSpool pages;
        Flow flow(pages, {});
        flow.set_header([&](Writer& band, int) { band.picture(picture, {72, 72}); });
        for (int i = 0; i < count; ++i) {
            flow.line(u"text"_s);
            flow.next_page();
        }
        flow.finish();
        (void)written(pages);
        return content(u"report.pdf"_s).size();
    };
    EXPECT_LT(size_with(20), size_with(1) * 2);
}

TEST_F(OutputTest, ScreenAndPdfShowTextAtTheSamePlace)
{
    Flow flow(spool, {});
    flow.line(u"Featherstonehaugh, Bartholomew & Wilhelmina (continued) AVATo"_s, flow.type().body.sized(8.5),
              Align::right);
    flow.finish();
    const auto where = find(spool, u"AVATo"_s).at(0).where;
    const auto document = written(spool);
    QRectF in_pdf;
    for (const auto& word : document->page(0)->textList()) {
        if (word->text() == u"AVATo"_s)
            in_pdf = word->boundingBox();
    }
    EXPECT_NEAR(in_pdf.left(), where.left(), 0.1);
    EXPECT_NEAR(in_pdf.right(), where.right(), 0.1);

    const auto image = shown(spool.page(1), 4);
    const auto darkest_in = [&](QRectF area) {
        int darkest = 255;
        const QRect pixels = QRectF(area.topLeft() * 4, area.size() * 4).toAlignedRect();
        for (int y = pixels.top(); y <= pixels.bottom(); ++y)
            for (int x = pixels.left(); x <= pixels.right(); ++x)
                darkest = std::min(darkest, qGray(image.pixel(x, y)));
        return darkest;
    };
    EXPECT_LT(darkest_in({where.right() - 2, where.top(), 2, where.height()}), 100) << "the last letter";
    EXPECT_GT(darkest_in({where.right() + 0.5, where.top(), 20, where.height()}), 250) << "nothing beyond it";
}

TEST_F(OutputTest, FindingIgnoresCaseAndReadsCaptionAndValueAsOne)
{
    Flow flow(spool, {.columns = 2});
    flow.caption(u"Family Ph: "_s, u"9555 1234"_s);
    flow.next_column();
    flow.line(u"The Family Ph: 9555 1235"_s);
    flow.next_page();
    flow.line(u"none here"_s);
    flow.finish();
    const auto found = find(spool, u"ph: 9555"_s);
    ASSERT_EQ(found.size(), 2u);
    EXPECT_EQ(found[1].page, 1);
    EXPECT_NEAR(found[0].where.left() - 42, flow.metrics().width(u"Family "_s, flow.type().caption), 0.1);
    EXPECT_NEAR(found[0].where.width(), found[1].where.width(), 0.05);
    EXPECT_TRUE(find(spool, {}).empty());
}

TEST_F(OutputTest, ARunThatFailsOrIsCancelledLeavesTheOldFile)
{
    Flow flow(spool, {});
    for (int i = 0; i < 3000; ++i)
        flow.line(u"line %1 of a report that takes some room"_s.arg(i));
    flow.finish();
    core::write_file(file(u"old.pdf"_s), "old");

    ImpatientProgress progress(3);
    EXPECT_FALSE(write_pdf(spool, file(u"old.pdf"_s), {}, &progress));
    EXPECT_EQ(content(u"old.pdf"_s), "old");
    {
        const FullDisk full(20'000);
        EXPECT_THROW((void)write_pdf(spool, file(u"old.pdf"_s)), core::FileError);
    }
    EXPECT_EQ(content(u"old.pdf"_s), "old");
    EXPECT_EQ(QDir(folder.path()).entryList(QDir::Files), QStringList{u"old.pdf"_s}) << "nothing else is left behind";
    EXPECT_THROW((void)write_pdf(spool, file(u"no folder/report.pdf"_s)), core::FileError);
}

TEST_F(OutputTest, ASpoolThatCannotGrowSaysSo)
{
    const FullDisk full(50'000);
    Flow flow(spool, {});
    EXPECT_THROW(
        {
            for (int i = 0; i < 20'000; ++i)
                flow.line(u"line %1"_s.arg(i));
        },
        core::FileError);
}

TEST_F(OutputTest, ABarcodeReadsBackWhatWasEncoded)
{
    for (const auto& content : {u"1$"_s, u"1234$"_s, u"987654321$"_s}) {
        PageSpool pages;
        Flow flow(pages, {});
        flow.barcode(content, {150, 36});
        flow.finish();
        EXPECT_EQ(decoded(shown(pages.page(1), 300 / 72.0)), content);
    }
}

TEST_F(OutputTest, ABarcodeKeepsItsQuietZonesInsideItsWidth)
{
    const auto modules = code128(u"1234$"_s);
    const auto drawing = barcode(u"1234$"_s, {150, 36});
    const auto& bars = std::get<RectsItem>(drawing.items.front()).rects;
    const auto quiet = 150.0 / qreal(modules.size() + 20) * 10;
    EXPECT_NEAR(bars.front().left(), quiet, 1e-9);
    EXPECT_NEAR(bars.back().right(), 150 - quiet, 1e-9);
    EXPECT_THROW((void)code128({}), std::invalid_argument);
}

} // namespace kindrel::pages
