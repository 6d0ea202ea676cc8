#include "desktop/areas.h"
#include "desktop/desktop_fixture.h"
#include "desktop/output/page_view.h"
#include "desktop/output/preview_window.h"
#include "desktop/shell/page.h"
#include "desktop/shell/rail.h"
#include "support/families.h"

#include <QTextBrowser>

#include <algorithm>
#include <functional>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

class MainWindowTest : public DesktopTest
{
protected:
    void press_number_of(QWidget& in, const QString& key)
    {
        const auto is_meant = [&key](const auto& area) {
            return key == QLatin1StringView(area.key);
        };
        const auto areas = desktop::all_areas();
        const auto place_in_rail = std::ranges::find_if(areas, is_meant) - areas.begin();
        if (place_in_rail < 9)
            press(in, Qt::Key(Qt::Key_1 + place_in_rail), Qt::ControlModifier);
        else
            QTest::mouseClick(&child<desktop::RailButton>(in, key), Qt::LeftButton);
    }
    [[nodiscard]] QStringList locked_areas()
    {
        QStringList areas;
        auto rows = desk().office.session->select(u"SELECT [locked_area] FROM [tbl_locked_area];"_s);
        for (const core::Row& row : rows)
            areas += row.text(core::Column{0});
        return areas;
    }
    void leave_a_title_unsaved()
    {
        press_number_of(window(), u"setup"_s);
        press(window(), Qt::Key_Insert);
        type(window(), u"Deacon"_s);
    }
};

} // namespace

TEST_F(MainWindowTest, AreasAreReachedByTheirNumberAndClosedToHome)
{
    begin();
    EXPECT_EQ(window().page()->objectName(), u"main_menu"_s);
    press_number_of(window(), u"reports"_s);
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
    press_number_of(other, u"reports"_s);
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
    press_number_of(window(), u"reports"_s);
    press(window(), Qt::Key_Return);

    const auto previews = desk().windows.all<desktop::PreviewWindow>();
    ASSERT_EQ(previews.size(), 1U);
    EXPECT_TRUE(pages::texts_of(previews[0]->document().page(1), 1).join(u'\n').contains(u"555 1234"_s));
}

TEST_F(MainWindowTest, WithoutAChosenReportItSaysSo)
{
    begin();
    press_number_of(window(), u"reports"_s);
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

TEST_F(MainWindowTest, AParkedPageLeavesBeforeASetupAreaIsEntered)
{
    begin();
    desk().office.mode = core::Mode::network;
    press_number_of(window(), u"setup"_s);
    EXPECT_EQ(locked_areas(), QStringList{u"2"_s});
    press_number_of(window(), u"main_menu"_s);
    press_number_of(window(), u"security"_s);

    EXPECT_EQ(window().page()->objectName(), u"security"_s);
    EXPECT_EQ(window().findChild<QWidget*>(u"setup_family"_s), nullptr);
    EXPECT_FALSE(child<desktop::RailButton>(window(), u"setup"_s).marks().locked);
    EXPECT_EQ(locked_areas(), QStringList{u"24"_s});
}

TEST_F(MainWindowTest, AParkedSetupPageMakesWayForTheEditorThatItWouldLockOut)
{
    begin();
    desk().office.mode = core::Mode::network;
    press_number_of(window(), u"setup"_s);
    press_number_of(window(), u"editor"_s);

    EXPECT_EQ(locked_areas(), QStringList());
    EXPECT_EQ(window().findChild<QWidget*>(u"setup_family"_s), nullptr);
    EXPECT_TRUE(child<desktop::RailButton>(window(), u"editor"_s).isChecked());
}

TEST_F(MainWindowTest, AParkedPageThatStaysComesForward)
{
    struct Case
    {
        const char* way;
        std::function<void()> go;
    };
    begin();
    leave_a_title_unsaved();
    for (const auto& [way, go] : {Case{"entering a setup area",
                                       [this] {
                                           press_number_of(window(), u"security"_s);
                                       }},
                                  Case{"closing the window",
                                       [this] {
                                           window().close();
                                       }},
                                  Case{"switching church", [this] {
                                           desk().navigation.load_church(core::training_church);
                                           settle();
                                       }}}) {
        press_number_of(window(), u"main_menu"_s);
        place.dialogue.expect_confirm_or_cancel(u"Do you wish to save the changes made to the setup lists?"_s, {});
        go();
        EXPECT_EQ(window().page()->objectName(), u"setup_family"_s) << way;
        EXPECT_TRUE(child<desktop::RailButton>(window(), u"setup"_s).isChecked()) << way;
        EXPECT_TRUE(window().page()->altered()) << way;
    }
    EXPECT_EQ(ended, 0);
}

TEST_F(MainWindowTest, AnAreaThatLetsNobodyInLeavesThePageInFront)
{
    begin();
    leave_a_title_unsaved();
    press_number_of(window(), u"reports"_s);
    desk().office.mode = core::Mode::network;
    place.in_database(u"INSERT INTO [tbl_locked_area] ([locked_area]) VALUES (24);"_s);
    place.dialogue.expect_confirm_or_cancel(u"Do you wish to save the changes made to the setup lists?"_s, false);
    place.dialogue.expect_box(
        u"Unable to enter the Security area as another user is presently in the Security area."_s);

    press_number_of(window(), u"security"_s);

    EXPECT_EQ(window().page()->objectName(), u"reports"_s);
    EXPECT_TRUE(child<desktop::RailButton>(window(), u"reports"_s).isChecked());
}

TEST_F(MainWindowTest, ClosingTheWindowEndsTheProgram)
{
    begin();
    place.dialogue.expect_confirm_or_cancel(u"Backup Kindrel files before exiting?"_s, false);
    window().close();
    EXPECT_EQ(ended, 1);
}

} // namespace kindrel::test
