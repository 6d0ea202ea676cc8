#include "desktop/shell/note_bar.h"
#include "desktop/weekly_fixture.h"
#include "pages/find.h"

#include <QTableView>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

const QString leave_question = u"You have un-saved Weekly Statistics information, do you wish to save this data before "
                               "exiting the weekly program?"_s;
const QString held = u"Unable to enter this Weekly Project as another user is editing this Weekly Project."_s;

class WeeklyPageTest : public WeeklyScreenTest
{
protected:
    [[nodiscard]] QTableView& grid() { return child<QTableView>(page(), u"figures"_s); }
    [[nodiscard]] QString shown(int row, int column) { return grid().model()->index(row, column).data().toString(); }
    [[nodiscard]] QString totals() { return child<QLabel>(page(), u"totals"_s).text(); }
    void add_date(const QString& date)
    {
        act(Qt::Key_Insert);
        enter(date);
    }
    /// The key of a button, which is pressed for a moment before it acts.
    void press_button(Qt::Key key)
    {
        const auto shown = place.dialogue.seen().size();
        act(key, Qt::AltModifier);
        EXPECT_TRUE(QTest::qWaitFor([&] { return place.dialogue.seen().size() > shown; }));
        settle();
    }
};

} // namespace

TEST_F(WeeklyPageTest, ASundayOfTwelveCategoriesIsEnteredSavedAndReportedInTheKeysItMayTake)
{
    start(8, 4);
    open_page();
    add_date(u"12/05/2024"_s);
    for (int category = 1; category <= 12; ++category)
        enter(QString::number(category));
    save();
    EXPECT_EQ(window().page()->status(), u"Saved"_s);
    act(Qt::Key_PageDown, Qt::ControlModifier);
    act(Qt::Key_Return);

    EXPECT_EQ(stored(u"2024-05-12"_s), u"1:1 2:2 3:3 4:4 5:5 6:6 7:7 8:8 9:9 10:10 11:11 12:12"_s);
    ASSERT_EQ(previews().size(), 1);
    EXPECT_FALSE(pages::find(previews().front()->document().page(1), u"Category 12"_s).empty());
    EXPECT_LE(acts, 12 * 2 + 8);
}

TEST_F(WeeklyPageTest, FiguresStandBesideThoseOfTheLastDateAndAreTotalled)
{
    start();
    open_page();
    add_date(u"12/05/2024"_s);
    EXPECT_EQ(grid().model()->headerData(3, Qt::Horizontal).toString(), u"05/05/2024"_s);
    EXPECT_EQ(shown(0, 3), u"120"_s);
    enter(u"1,100"_s);
    act(Qt::Key_Return);
    enter(u"45.5"_s);
    EXPECT_EQ(shown(0, 2), u"1100"_s);
    EXPECT_EQ(shown(1, 2), QString());
    EXPECT_EQ(shown(2, 1), u"$45.50"_s);
    EXPECT_EQ(totals(), u"Attendance: 1100     $ Amount: $45.50"_s);
}

TEST_F(WeeklyPageTest, ARefusedFigureStaysSelectedInItsCellWhicheverWayItIsLeft)
{
    const QString number = u"Please enter a number under 99,000"_s;
    const QString amount = u"Please enter an amount under $99,000"_s;
    struct Case
    {
        int row;
        QString refusal;
        QKeyCombination way;
    };
    start();
    open_newest();
    for (const auto& [row, refusal, way] :
         {Case{0, number, Qt::Key_Return}, Case{1, number, Qt::Key_Up}, Case{2, amount, Qt::Key_Down},
          Case{2, amount, Qt::Key_Tab}, Case{2, amount, Qt::CTRL | Qt::Key_S}}) {
        while (grid().currentIndex().row() < row)
            act(Qt::Key_Down);
        write(u"100000"_s);
        place.dialogue.expect_box(refusal);
        act(way.key(), way.keyboardModifiers());
        const auto field = refusal == amount ? u"fin_in"_s : u"att_in"_s;
        ASSERT_EQ(in_focus(), field) << row;
        EXPECT_EQ(grid().currentIndex().row(), row);
        EXPECT_EQ(child<QLineEdit>(grid(), field).selectedText(), u"100000"_s);
        EXPECT_TRUE(window().page()->altered());
        act(Qt::Key_Escape);
        EXPECT_FALSE(window().page()->altered());
    }
    enter(u"99999"_s);
    EXPECT_EQ(shown(2, 1), u"$99999.00"_s);
}

TEST_F(WeeklyPageTest, AFigureIsClearedAndWhatIsStillBeingTypedIsSaved)
{
    start();
    open_newest();
    act(Qt::Key_Delete);
    act(Qt::Key_Down);
    write(u"80"_s);
    EXPECT_TRUE(marks().altered);
    save();
    EXPECT_EQ(stored(u"2024-05-05"_s), u"2:80"_s);
    EXPECT_FALSE(marks().altered);
}

TEST_F(WeeklyPageTest, WhatIsStillBeingTypedGoesAlongWithWhateverIsDoneToTheDate)
{
    start();
    open_newest();
    write(u"130"_s);
    place.dialogue.expect_text(u"New date in place of 05/05/2024"_s, u"06/05/2024"_s);
    press_button(Qt::Key_C);
    EXPECT_EQ(shown(0, 2), u"130"_s);

    act(Qt::Key_Down);
    write(u"80"_s);
    place.dialogue.expect_confirm(u"Please confirm that you wish to remove this record"_s, core::Answer::no);
    press_button(Qt::Key_L);
    save();
    EXPECT_EQ(stored(u"2024-05-06"_s), u"1:130 2:80"_s);
}

TEST_F(WeeklyPageTest, ARefusedFigureKeepsItsDateFromBeingChangedOrDeleted)
{
    start();
    open_newest();
    write(u"100000"_s);
    for (const auto key : {Qt::Key_C, Qt::Key_L}) {
        place.dialogue.expect_box(u"Please enter a number under 99,000"_s);
        press_button(key);
        EXPECT_EQ(in_focus(), u"att_in"_s);
        EXPECT_EQ(child<QLineEdit>(grid(), u"att_in"_s).text(), u"100000"_s);
    }
}

TEST_F(WeeklyPageTest, LeavingAsksAndDoesAsItIsTold)
{
    struct Case
    {
        std::optional<bool> answer;
        bool stays;
        QString stored;
    };
    start();
    for (const auto& [answer, stays, in_store] :
         {Case{std::nullopt, true, u"1:120"_s}, Case{false, false, u"1:120"_s}, Case{true, false, u"1:130"_s}}) {
        if (!window().page()->altered()) {
            open_newest();
            enter(u"130"_s);
        }
        place.dialogue.expect_confirm_or_cancel(leave_question, answer);
        close();
        EXPECT_EQ(page().objectName() == u"weekly"_s, stays);
        EXPECT_EQ(stored(u"2024-05-05"_s), in_store);
        EXPECT_EQ(marks().locked, stays);
    }
}

TEST_F(WeeklyPageTest, FiguresThatCannotBeStoredStayAndLeavingWithoutThemNeedsNoDatabase)
{
    start();
    open_newest();
    enter(u"130"_s);
    place.in_database(u"ALTER TABLE [tbl_weekly_amount] RENAME TO [gone];"_s);
    place.dialogue.expect_confirm_or_cancel(leave_question, true);
    place.dialogue.expect_box(u"Unable to save the figures of this date"_s);
    EXPECT_FALSE(window().close());
    EXPECT_TRUE(window().isVisible());
    EXPECT_EQ(shown(0, 2), u"130"_s);
    EXPECT_TRUE(marks().altered);
    place.dialogue.expect_confirm_or_cancel(leave_question, false);
    place.dialogue.expect_confirm_or_cancel(u"Backup Kindrel files before exiting?"_s, false);
    EXPECT_TRUE(window().close());
}

TEST_F(WeeklyPageTest, TheProjectSetupHasTheParkedPageSettledFirst)
{
    start();
    open_newest();
    enter(u"130"_s);
    place.dialogue.expect_confirm_or_cancel(leave_question, true);
    running->open_area(u"setup_projects"_s);
    settle();
    EXPECT_EQ(page().objectName(), u"setup_projects"_s);
    EXPECT_EQ(stored(u"2024-05-05"_s), u"1:130"_s);
    EXPECT_FALSE(marks().locked);
}

TEST_F(WeeklyPageTest, AnotherDateIsOpenedOnceTheUnsavedOneIsSettled)
{
    start();
    open_newest();
    enter(u"130"_s);
    act(Qt::Key_F, Qt::ControlModifier);
    act(Qt::Key_Down);
    place.dialogue.expect_confirm_or_cancel(leave_question, std::nullopt);
    act(Qt::Key_Return);
    EXPECT_EQ(dates(), QStringList({u"05/05/2024  open"_s, u"28/04/2024"_s}));
    act(Qt::Key_F, Qt::ControlModifier);
    act(Qt::Key_Down);
    place.dialogue.expect_confirm_or_cancel(leave_question, true);
    act(Qt::Key_Return);
    EXPECT_EQ(dates(), QStringList({u"05/05/2024"_s, u"28/04/2024  open"_s}));
    EXPECT_EQ(shown(0, 3), QString());
    EXPECT_EQ(stored(u"2024-05-05"_s), u"1:130"_s);
}

TEST_F(WeeklyPageTest, AProjectThatIsLockedElsewhereIsNeitherOpenedNorLosesADate)
{
    start();
    place.in_database(u"INSERT INTO [tbl_weekly_locked] ([weekly_locked]) VALUES (1);"_s);
    open_page();
    place.dialogue.expect_box(held);
    act(Qt::Key_Return);
    EXPECT_FALSE(marks().locked);
    EXPECT_EQ(in_focus(), u"dates"_s);
    place.dialogue.expect_confirm(u"Please confirm that you wish to remove this record"_s, core::Answer::yes,
                                  core::Answer::no);
    place.dialogue.expect_box(u"Unable to delete this date as another user is editing this Weekly Project."_s);
    act(Qt::Key_Delete);
    EXPECT_EQ(dates().size(), 2);
    place.dialogue.expect_box(held);
    add_date(u"12/05/2024"_s);
    EXPECT_EQ(in_focus(), u"new_date"_s);
    EXPECT_EQ(dates().size(), 2);
}

TEST_F(WeeklyPageTest, ARefusedDateStaysSelectedInItsField)
{
    start();
    open_page();
    auto& field = child<QLineEdit>(page(), u"new_date"_s);
    for (const auto& [typed, refusal] :
         {std::pair{u"5/5/24"_s, u"This date has already been used. Please enter another date."_s},
          std::pair{u"05/03/XXXX"_s, u"Please enter the year too."_s},
          std::pair{u"05/03"_s, u"Please enter the year too."_s},
          std::pair{u"31/2/24"_s, core::bad_date_message(core::DayOrder::day_first).text}}) {
        field.clear();
        place.dialogue.expect_box(refusal);
        add_date(typed);
        EXPECT_EQ(in_focus(), u"new_date"_s);
        EXPECT_EQ(field.selectedText(), field.text());
        EXPECT_FALSE(field.text().isEmpty());
    }
    EXPECT_FALSE(field.toolTip().contains(u"XXXX"_s));
}

TEST_F(WeeklyPageTest, AnOddDateIsRemarkedOnInTheNoteBarAndAddedAllTheSame)
{
    start();
    open_page();
    add_date(u"21/04/2024"_s);
    EXPECT_EQ(window().page()->note().text(), QString());
    add_date(u"22/05/2024"_s);
    EXPECT_EQ(window().page()->note().text(), u"22/05/2024 is a Wednesday, but most dates of this project are Sundays. "
                                              "22/05/2024 lies in the future."_s);
    EXPECT_EQ(dates().front(), u"22/05/2024  open"_s);
    EXPECT_EQ(in_focus(), u"figures"_s);
}

TEST_F(WeeklyPageTest, AnotherDayForADateIsAskedForUntilItCanBeTaken)
{
    start();
    open_page();
    auto& button = child<QAbstractButton>(page(), u"btn_edit"_s);
    button.setFocus();
    for (const auto& without_year : {u"05/03/XXXX"_s, u"5/3"_s}) {
        place.dialogue.expect_text(u"New date in place of 05/05/2024"_s, without_year);
        place.dialogue.expect_box(u"Please enter the year too."_s);
    }
    place.dialogue.expect_text(u"New date in place of 05/05/2024"_s, u"31/2/24"_s);
    place.dialogue.expect_box(core::bad_date_message(core::DayOrder::day_first).text);
    place.dialogue.expect_text(u"New date in place of 05/05/2024"_s, u"28/04/2024"_s);
    place.dialogue.expect_box(
        u"Unable to change to this date as it already exists, please choose a date which has not been used yet."_s);
    place.dialogue.expect_text(u"New date in place of 05/05/2024"_s, std::nullopt);
    act(Qt::Key_Space);
    EXPECT_EQ(place.dialogue.seen().back().more, u"You typed \"28/04/2024\"."_s);
    EXPECT_EQ(dates().front(), u"05/05/2024  open"_s);
    button.setFocus();
    place.dialogue.expect_text(u"New date in place of 05/05/2024"_s, u"06/05/2024"_s);
    act(Qt::Key_Space);
    EXPECT_EQ(dates(), QStringList({u"06/05/2024  open"_s, u"28/04/2024"_s}));
    EXPECT_EQ(stored(u"2024-05-06"_s), u"1:120"_s);
}

TEST_F(WeeklyPageTest, BothTabsFitTheSmallestWindow)
{
    start(8, 4);
    open_newest();
    window().resize(window().minimumSize());
    settle();
    EXPECT_LE(page().minimumSizeHint().width(), page().width());
    EXPECT_LE(page().minimumSizeHint().height(), page().height());
}

TEST_F(WeeklyPageTest, TheFiguresOfADateAreKeptAsText)
{
    start(1, 1);
    open_newest();
    act(Qt::Key_Down);
    enter(u"7.5"_s);
    const QString file = place.data.drive() + u"figures.csv"_s;
    place.dialogue.expect_file(u"Save this list"_s, file);
    for (QAction* action : window().page()->actions())
        if (action->text() == u"Save as CSV")
            action->trigger();
    EXPECT_EQ(DataFolder::read(file), "\xEF\xBB\xBF"
                                      "Category,$ Amount,Attendance,28/04/2024\r\n"
                                      "Category 1,,120,\r\nCategory 2,$7.50,,\r\n");
}

TEST_F(WeeklyPageTest, WithoutAProjectTheNextStepIsItsSetup)
{
    begin();
    place.dialogue.expect_box(u"Unable to enter a Weekly project, as no Weekly projects have been setup. Please go to "
                              "the weekly setup area, which is accessed from the main menu setup tab to enter a new "
                              "weekly project."_s);
    open_page();
    EXPECT_EQ(in_focus(), u"open_setup"_s);
    act(Qt::Key_Space);
    EXPECT_EQ(page().objectName(), u"setup_projects"_s);
}

TEST_F(WeeklyPageTest, ProjectsThatCannotBeReadAreNotCalledMissingAndAreReadOnceTheyCanBe)
{
    start();
    const QString church = place.data.paths().database();
    place.in_database(u"DROP VIEW [Qry_weekly_load_project];"_s);
    place.dialogue.expect_box(u"Unable to read the weekly projects"_s);
    open_page();
    EXPECT_EQ(in_focus(), u"try_again"_s);
    place.in_database(u"CREATE VIEW [Qry_weekly_load_project] AS SELECT * FROM [tbl_weekly_project];"_s);
    desk().office.mode = core::Mode::network;
    ASSERT_TRUE(QFile::rename(church, church + u".away"_s));
    place.dialogue.expect_box(u"Unable to access your network files."_s);
    act(Qt::Key_Space);
    EXPECT_EQ(in_focus(), u"try_again"_s);
    ASSERT_TRUE(QFile::rename(church + u".away"_s, church));
    act(Qt::Key_Space);
    EXPECT_EQ(in_focus(), u"dates"_s);
    EXPECT_EQ(dates().size(), 2);
}

TEST_F(WeeklyPageTest, TheAreaStaysClosedWhileSomebodyIsInTheProjectSetup)
{
    start();
    desk().office.mode = core::Mode::network;
    place.in_database(u"INSERT INTO [tbl_locked_area] ([locked_area]) VALUES (%1);"_s.arg(
        static_cast<int>(core::AreaCode::project_setup)));
    place.dialogue.expect_box(
        u"Unable to enter the Weekly Statistics program as another user is in the setup area of Kindrel"_s);
    act(Qt::Key_7, Qt::ControlModifier);
    EXPECT_EQ(page().objectName(), u"main_menu"_s);
}

} // namespace kindrel::test
