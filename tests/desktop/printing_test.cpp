#include "desktop/shell/printing.h"

#include "pages/find.h"
#include "pages/flow.h"
#include "support/scripted_dialogue.h"

#include <QPrinter>
#include <QTemporaryDir>
#include <poppler-qt6.h>

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using desktop::print_on;

namespace {

/// A report of four pages, on a printer that prints into a file.
class PrintingTest : public testing::Test
{
protected:
    PrintingTest()
    {
        printer.setOutputFormat(QPrinter::PdfFormat);
        printer.setOutputFileName(file);
        pages::Flow flow(spool, {});
        for (int page = 1; page <= 4; ++page) {
            if (page > 1)
                flow.next_page();
            flow.line(u"sheet %1"_s.arg(page));
        }
        flow.finish();
    }
    [[nodiscard]] desktop::PrintJob job() { return {spool, u"Directory 1"_s, 3}; }
    [[nodiscard]] std::unique_ptr<Poppler::Document> printed() { return Poppler::Document::load(file); }
    /// The numbers of the pages that were printed.
    [[nodiscard]] QString sheets()
    {
        const auto document = printed();
        QString numbers;
        for (int page = 0; document && page < document->numPages(); ++page)
            numbers += document->page(page)->text({}).trimmed().last(1);
        return numbers;
    }

    QTemporaryDir folder;
    QString file = folder.filePath(u"printed.pdf"_s);
    pages::PageSpool spool;
    QPrinter printer{QPrinter::HighResolution};
    ScriptedDialogue dialogue;
    core::SilentProgress progress;
};

} // namespace

TEST_F(PrintingTest, ThePagesThatWereChosenArePrinted)
{
    struct Case
    {
        QPrinter::PrintRange range;
        QString sheets;
    };
    printer.setFromTo(2, 3);
    for (const auto& [range, expected] : {Case{QPrinter::AllPages, u"1234"_s}, Case{QPrinter::PageRange, u"23"_s},
                                          Case{QPrinter::CurrentPage, u"3"_s}}) {
        printer.setPrintRange(range);
        EXPECT_TRUE(print_on(printer, job(), dialogue, progress));
        EXPECT_EQ(sheets(), expected);
    }
}

TEST_F(PrintingTest, TextStandsOnPaperWhereThePreviewShowsIt)
{
    ASSERT_TRUE(print_on(printer, job(), dialogue, progress));

    const auto document = printed();
    EXPECT_EQ(document->page(0)->pageSize(), QSize(595, 842));
    const auto where = pages::find(spool, u"sheet"_s).at(0).where;
    const QRectF on_paper = document->page(0)->textList().at(0)->boundingBox();
    EXPECT_NEAR(on_paper.left(), where.left(), 0.5);
    EXPECT_NEAR(on_paper.right(), where.right(), 0.5);
    EXPECT_NEAR(on_paper.center().y(), where.center().y(), 2);
    EXPECT_EQ(document->info(u"Title"_s), u"Directory 1"_s);
}

TEST_F(PrintingTest, APrinterThatDoesNotPrintIsTold)
{
    printer.setOutputFileName(folder.filePath(u"nowhere/printed.pdf"_s));
    dialogue.expect_box(u"The pages could not be written out"_s);
    EXPECT_FALSE(print_on(printer, job(), dialogue, progress));
}

} // namespace kindrel::test
