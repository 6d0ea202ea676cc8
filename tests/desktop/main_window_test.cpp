#include "desktop/areas.h"
#include "desktop/desktop_fixture.h"
#include "desktop/output/page_view.h"
#include "desktop/output/preview_window.h"
#include "desktop/shell/page.h"
#include "desktop/shell/rail.h"
#include "support/families.h"

#include <QTextBrowser>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

using MainWindowTest = DesktopTest;

} // namespace

TEST_F(MainWindowTest, AreasAreReachedByTheirNumberAndClosedToHome)
{
    begin();
    EXPECT_EQ(window().page()->objectName(), u"main_menu"_s);
    press(window(), Qt::Key_2, Qt::ControlModifier);
    EXPECT_EQ(window().page()->objectName(), u"reports"_s);
    press(window(), Qt::Key_W, Qt::ControlModifier);
    EXPECT_EQ(window().page()->objectName(), u"main_menu"_s);
    press(window(), Qt::Key_W, Qt::ControlModifier);
    EXPECT_EQ(window().page()->objectName(), u"main_menu"_s);
}

TEST_F(MainWindowTest, AnAreaThatIsNotGrantedIsGreyAndDoesNotOpen)
{
    begin();
    desk().office.rights.set(core::Area::report_outputs, false);
    desktop::MainWindow other(desk(), desktop::all_areas(), look);
    other.show();
    EXPECT_FALSE(child<desktop::RailButton>(other, u"reports"_s).isEnabled());
    press(other, Qt::Key_2, Qt::ControlModifier);
    EXPECT_EQ(other.page()->objectName(), u"main_menu"_s);
}

TEST_F(MainWindowTest, TheRailShowsIconsAloneWhenTheWindowIsNarrow)
{
    begin();
    auto* rail = window().findChild<desktop::Rail*>();
    window().resize(1024, 690);
    settle();
    EXPECT_EQ(rail->width(), desktop::Rail::wide);
    window().resize(800, 600);
    settle();
    EXPECT_EQ(rail->width(), desktop::Rail::narrow);
}

TEST_F(MainWindowTest, HelpTellsOfThePageInFront)
{
    begin();
    press(window(), Qt::Key_F1);
    const auto help = desk().windows.all<QTextBrowser>();
    ASSERT_EQ(help.size(), 1U);
    EXPECT_TRUE(help[0]->toPlainText().startsWith(u"Main Menu"_s));
}

TEST_F(MainWindowTest, AReportOpensFromTheCatalogueByEnter)
{
    people::FamilyFile file = family(u"Naismith"_s, {u"Ann"_s});
    file.address.phone = u"555 1234"_s;
    begin({file});
    press(window(), Qt::Key_2, Qt::ControlModifier);
    press(window(), Qt::Key_Return);

    const auto previews = desk().windows.all<desktop::PreviewWindow>();
    ASSERT_EQ(previews.size(), 1U);
    EXPECT_TRUE(pages::texts_of(previews[0]->document().page(1), 1).join(u'\n').contains(u"555 1234"_s));
}

TEST_F(MainWindowTest, WithoutAChosenReportItSaysSo)
{
    begin();
    press(window(), Qt::Key_2, Qt::ControlModifier);
    press(window(), Qt::Key_Up); // To the family of reports, which is none itself.
    place.dialogue.expect_box(u"Please choose a report"_s);
    press(window(), Qt::Key_Return);
}

TEST_F(MainWindowTest, WhatTheScreensLookLikeIsRememberedWithoutAnyName)
{
    begin({family(u"Naismith"_s, {u"Ann"_s})});
    window().resize(1100, 720);
    press(window(), Qt::Key_P, Qt::ControlModifier);
    desk().windows.all<desktop::PreviewWindow>().at(0)->view().set_zoom({desktop::Zoom::Fit::none, 150});
    begin_again();
    EXPECT_EQ(window().size(), QSize(1100, 720));
    press(window(), Qt::Key_P, Qt::ControlModifier);
    EXPECT_EQ(desk().windows.all<desktop::PreviewWindow>().at(0)->view().zoom().percent, 150);
    running.reset();
    const QByteArray kept =
        DataFolder::read(place.data.paths().folder(core::Folder::local_settings) + u"desktop.ini"_s);
    EXPECT_FALSE(kept.contains("Naismith"));
}

TEST_F(MainWindowTest, ClosingTheWindowEndsTheProgram)
{
    begin();
    window().close();
    EXPECT_EQ(ended, 1);
}

} // namespace kindrel::test
