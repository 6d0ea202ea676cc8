#include "desktop/output/preview_window.h"

#include "desktop/desktop_fixture.h"
#include "desktop/output/page_view.h"
#include "desktop/output/preview_bar.h"
#include "desktop/output/run_strip.h"
#include "desktop/shell/note_bar.h"
#include "pages/flow.h"

#include <QFileInfo>
#include <QLineEdit>
#include <QPushButton>
#include <QSpinBox>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using desktop::PreviewWindow;
using desktop::Zoom;

namespace {

constexpr auto cancel_question = "Are you sure that you wish to cancel this report?";

/// Pages that say "Page 1 of the report" and so on; `at_step` is called after each with its number.
desktop::Producer pages_of(int count, std::function<void(int)> at_step = {})
{
    return [count, at_step](core::Progress& progress, pages::PageSpool& spool) {
        pages::Flow flow(spool, {});
        progress.begin(u"Report"_s, count, QString::fromLatin1(cancel_question));
        for (int page = 1; page <= count; ++page) {
            if (page > 1)
                flow.next_page();
            flow.line(u"Page %1 of the report"_s.arg(page));
            if (at_step)
                at_step(page);
            if (!progress.step())
                return false;
        }
        flow.finish();
        return true;
    };
}

class PreviewTest : public DesktopTest
{
protected:
    PreviewWindow& open(const desktop::Producer& produce)
    {
        desktop::open_preview(desk(), u"Directory 1"_s, produce);
        settle();
        return *desk().windows.all<PreviewWindow>().at(0);
    }
};

} // namespace

TEST_F(PreviewTest, KeysTurnThePagesAndStopAtTheEnds)
{
    begin();
    PreviewWindow& preview = open(pages_of(3));
    struct Step
    {
        Qt::Key key;
        int page;
    };
    for (const auto& step : {Step{Qt::Key_PageDown, 2}, Step{Qt::Key_End, 3}, Step{Qt::Key_PageDown, 3},
                             Step{Qt::Key_PageUp, 2}, Step{Qt::Key_Home, 1}, Step{Qt::Key_PageUp, 1}}) {
        press(preview, step.key);
        EXPECT_EQ(preview.view().number(), step.page) << step.key;
    }
}

TEST_F(PreviewTest, APageIsReachedByItsNumber)
{
    begin();
    PreviewWindow& preview = open(pages_of(12));
    press(preview, Qt::Key_G, Qt::ControlModifier);
    type(preview, u"11"_s);
    press(preview, Qt::Key_Return);
    EXPECT_EQ(preview.view().number(), 11);
    EXPECT_EQ(child<QSpinBox>(preview, u"page"_s).text(), u"11 of 12"_s);
}

TEST_F(PreviewTest, KeysAndWheelZoomBetweenFiftyAndFourHundredPerCent)
{
    begin();
    PreviewWindow& preview = open(pages_of(1));
    press(preview, Qt::Key_0, Qt::ControlModifier);
    EXPECT_EQ(preview.view().zoom(), (Zoom{Zoom::Fit::none, 100}));
    press(preview, Qt::Key_Plus, Qt::ControlModifier);
    EXPECT_EQ(preview.view().zoom().percent, 125);
    for (int step = 0; step < 9; ++step)
        press(preview, Qt::Key_Plus, Qt::ControlModifier);
    EXPECT_EQ(preview.view().zoom().percent, 400);
    for (int step = 0; step < 9; ++step)
        press(preview, Qt::Key_Minus, Qt::ControlModifier);
    EXPECT_EQ(preview.view().zoom().percent, 50);

    QWheelEvent wheel({50, 50}, {50, 50}, {}, {0, 120}, Qt::NoButton, Qt::ControlModifier, Qt::NoScrollPhase, false);
    QApplication::sendEvent(preview.view().viewport(), &wheel);
    EXPECT_EQ(preview.view().zoom().percent, 75);
}

TEST_F(PreviewTest, AFittedPageStaysInsideItsWindow)
{
    begin();
    PreviewWindow& preview = open(pages_of(1));
    preview.view().set_zoom({Zoom::Fit::width, 100});
    const int across = preview.view().shown_percent();
    preview.view().set_zoom({Zoom::Fit::page, 100});
    EXPECT_LT(preview.view().shown_percent(), across);
    preview.resize(1400, 700);
    settle();
    preview.view().set_zoom({Zoom::Fit::width, 100});
    EXPECT_GT(preview.view().shown_percent(), across);
}

TEST_F(PreviewTest, FindGoesRoundThroughThePagesAndTellsWhenThereIsNothing)
{
    begin();
    PreviewWindow& preview = open(pages_of(12));
    press(preview, Qt::Key_F, Qt::ControlModifier);
    type(preview, u"page 1"_s); // Pages 1 and 10 to 12.
    QList<int> pages;
    for (int hit = 0; hit < 5; ++hit) {
        press(preview, Qt::Key_Return);
        pages += preview.view().number();
    }
    EXPECT_EQ(pages, QList<int>({1, 10, 11, 12, 1}));
    press(preview, Qt::Key_Return, Qt::ShiftModifier);
    EXPECT_EQ(preview.view().number(), 12);

    type(preview, u"00"_s);
    press(preview, Qt::Key_Return);
    EXPECT_EQ(preview.note().text(), u"\u201cpage 100\u201d does not occur in this document."_s);
    EXPECT_EQ(preview.view().number(), 12);
}

TEST_F(PreviewTest, TheFirstPageCanBeReadWhileTheOthersAreBeingMade)
{
    begin();
    QList<int> shown;
    PreviewWindow& preview =
        open(pages_of(3, [&](int) { shown += desk().windows.all<PreviewWindow>().at(0)->view().number(); }));
    // A page is finished once the next one begins.
    EXPECT_EQ(shown, QList<int>({0, 1, 1}));
    EXPECT_EQ(preview.document().page_count(), 3);
}

TEST_F(PreviewTest, ClosingWhileTheReportIsMadeAsksAndCancels)
{
    begin();
    int made = 0;
    place.dialogue.expect_confirm(QString::fromLatin1(cancel_question), core::Answer::no, core::Answer::no);
    place.dialogue.expect_confirm(QString::fromLatin1(cancel_question), core::Answer::yes, core::Answer::no);
    desktop::open_preview(desk(), u"Directory 1"_s, pages_of(9, [&](int page) {
                              made = page;
                              if (page == 2 || page == 4)
                                  desk().windows.all<PreviewWindow>().at(0)->close();
                          }));
    settle();
    settle();
    EXPECT_EQ(made, 4);
    EXPECT_TRUE(desk().windows.all<PreviewWindow>().empty());
}

TEST_F(PreviewTest, OtherWindowsAreDeafWhileTheReportIsMade)
{
    begin();
    open(pages_of(2, [&](int) { QTest::keyClick(&window(), Qt::Key_2, Qt::ControlModifier); }));
    EXPECT_EQ(window().focusWidget()->objectName(), u"filter"_s);
    EXPECT_EQ(child<QLineEdit>(window(), u"filter"_s).text(), QString());
    QTest::keyClicks(&child<QLineEdit>(window(), u"filter"_s), u"n"_s);
    EXPECT_EQ(child<QLineEdit>(window(), u"filter"_s).text(), u"n"_s);
}

TEST_F(PreviewTest, TheWholeDocumentGoesToThePrinter)
{
    begin();
    PreviewWindow& preview = open(pages_of(3));
    press(preview, Qt::Key_P, Qt::ControlModifier);
    EXPECT_EQ(printing.titles, QStringList({u"Directory 1"_s}));
    EXPECT_EQ(printing.pages, 3);
    EXPECT_EQ(preview.note().text(), u"Sent to the printer."_s);
}

TEST_F(PreviewTest, TheDocumentIsSavedAsPdfOrTheReasonIsTold)
{
    begin();
    PreviewWindow& preview = open(pages_of(3));
    const QString file = place.data.drive() + u"directory.pdf"_s;
    place.dialogue.expect_file(u"Save as PDF"_s, file);
    press(preview, Qt::Key_S, Qt::ControlModifier);
    EXPECT_TRUE(DataFolder::read(file).startsWith("%PDF"));

    place.dialogue.expect_file(u"Save as PDF"_s, place.data.drive() + u"no such folder/directory.pdf"_s);
    place.dialogue.expect_box(u"The document could not be saved."_s);
    press(preview, Qt::Key_S, Qt::ControlModifier);
}

} // namespace kindrel::test
