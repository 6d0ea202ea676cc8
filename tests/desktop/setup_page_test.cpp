#include "desktop/desktop_fixture.h"
#include "desktop/people/group_details_dialog.h"
#include "desktop/people/quick_add_dialogs.h"
#include "desktop/shell/idle_watch.h"
#include "desktop/shell/page.h"
#include "desktop/shell/rail.h"
#include "people/setup_lists.h"

#include <QLineEdit>
#include <QTabWidget>
#include <QTableView>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using people::SetupKind;

namespace {

const QString cancel_question = u"Do you wish to drop every change since the lists were saved?"_s;
const QString leave_question = u"Do you wish to save the changes made to the setup lists?"_s;

class SetupPageTest : public DesktopTest
{
protected:
    SetupPageTest()
    {
        begin();
        for (const auto& list : people::setup_lists())
            (void)session().allocate(list.entity, 3);
    }
    [[nodiscard]] core::Session& session() { return *desk().office.session; }
    [[nodiscard]] desktop::RailButton& button() { return child<desktop::RailButton>(window(), u"setup"_s); }
    [[nodiscard]] bool is_open() { return window().page()->objectName() == u"setup_family"_s; }
    [[nodiscard]] QString in_focus() { return window().focusWidget()->objectName(); }

    void open(SetupKind kind)
    {
        running->open_area(u"setup"_s);
        settle();
        child<QTabWidget>(window(), u"lists"_s).setCurrentIndex(int(kind));
        settle();
    }
    void add(const QString& text)
    {
        press(window(), Qt::Key_Insert);
        type(window(), text);
        press(window(), Qt::Key_Return);
    }
    void add_suburb(const QString& suburb, const QString& postcode)
    {
        add(suburb);
        type(window(), postcode);
        press(window(), Qt::Key_Return);
    }
    void press_button(const QString& name)
    {
        child<QAbstractButton>(tab(), name).setFocus();
        press(window(), Qt::Key_Space);
    }
    void cancel()
    {
        for (QAction* action : window().page()->actions())
            if (action->text() == u"Cancel")
                action->trigger();
    }
    [[nodiscard]] QWidget& tab() { return *child<QTabWidget>(window(), u"lists"_s).currentWidget(); }
    [[nodiscard]] QTableView& table() { return *tab().findChild<QTableView*>(); }
    [[nodiscard]] QStringList stored(SetupKind kind)
    {
        QStringList texts;
        for (const auto& item : people::read_setup_items(session(), kind))
            texts += (item.text + u' ' + item.postcode).trimmed();
        return texts;
    }
    void remove_all_suburbs() { place.in_database(u"DELETE FROM [tbl_suburb_setup];"_s); }
    void add_a_title_that_cannot_be_saved()
    {
        open(SetupKind::titles);
        add(u"Deacon"_s);
        place.in_database(u"DROP TABLE [tbl_title];"_s);
        place.dialogue.expect_box(u"Unable to save the setup lists"_s);
        press(window(), Qt::Key_S, Qt::ControlModifier);
    }
};

} // namespace

TEST_F(SetupPageTest, ASuburbListIsBuiltSortedImportedAndSavedByKeyboardAlone)
{
    remove_all_suburbs();
    const QString file = place.data.drive() + u"suburbs.txt"_s;
    DataFolder::write(file, "Ashfield,2131\nMosman,2088\n");
    running->open_area(u"setup"_s);
    settle();
    press(window(), Qt::Key_PageUp, Qt::ControlModifier);
    add_suburb(u"Mosman"_s, u"2088"_s);
    add_suburb(u"Balmain"_s, u"2041"_s);
    place.dialogue.expect_confirm(u"Please confirm that you wish to sort this group into an alphabetical order."_s,
                                  core::Answer::yes);
    press_button(u"sort"_s);
    place.dialogue.expect_file(u"Import Suburbs"_s, file);
    press_button(u"import"_s);
    EXPECT_TRUE(visible_texts(window()).contains(u"1 item was added, 1 exists already."_s));
    EXPECT_EQ(stored(SetupKind::suburbs), QStringList());

    press(window(), Qt::Key_S, Qt::ControlModifier);

    EXPECT_EQ(stored(SetupKind::suburbs), QStringList({u"Balmain 2041"_s, u"Mosman 2088"_s, u"Ashfield 2131"_s}));
    EXPECT_EQ(window().page()->status(), u"Saved"_s);
}

TEST_F(SetupPageTest, ARefusedSuburbPutsTheCursorIntoTheGuiltyField)
{
    open(SetupKind::suburbs);
    add(u"Mosman"_s);
    EXPECT_EQ(in_focus(), u"new_1"_s);
    place.dialogue.expect_box(u"Please enter a suburb postcode before attempting to add a new suburb to the list"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(in_focus(), u"new_1"_s);

    tab().findChild<QLineEdit*>(u"new_0"_s)->clear();
    type(window(), u"2088"_s);
    place.dialogue.expect_box(u"Please enter a suburb before attempting to add a new suburb to the list"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(in_focus(), u"new_0"_s);

    tab().findChild<QLineEdit*>(u"new_0"_s)->setText(QString(255, u'x'));
    tab().findChild<QLineEdit*>(u"new_1"_s)->setText(QString(256, u'1'));
    for (const auto keys : {QKeyCombination(Qt::Key_Return), Qt::CTRL | Qt::Key_S}) {
        place.dialogue.expect_box(u"Please enter no more than 255 characters"_s);
        press(window(), keys.key(), keys.keyboardModifiers());
        EXPECT_EQ(in_focus(), u"new_1"_s);
    }
}

TEST_F(SetupPageTest, ARefusedNameIsToldOnceAndStaysInItsCell)
{
    open(SetupKind::titles);
    press(window(), Qt::Key_Return);
    type(window(), u" "_s);
    place.dialogue.expect_box(u"Please enter an item"_s);
    press(window(), Qt::Key_S, Qt::ControlModifier);
    EXPECT_EQ(in_focus(), u"cell"_s);
    EXPECT_TRUE(window().page()->altered());
}

TEST_F(SetupPageTest, AnItemStopsAtTheEndsOfItsList)
{
    open(SetupKind::status);
    place.dialogue.expect_box(u"This is the highest position this item can be moved to"_s);
    press(window(), Qt::Key_Up, Qt::AltModifier);
    press(window(), Qt::Key_End, Qt::ControlModifier);
    place.dialogue.expect_box(u"This is the lowest position this item can be moved to"_s);
    press(window(), Qt::Key_Down, Qt::AltModifier);
    EXPECT_EQ(table().currentIndex().row(), 2);
    EXPECT_FALSE(window().page()->altered());
}

TEST_F(SetupPageTest, CancelDropsEveryListAfterAsking)
{
    open(SetupKind::titles);
    add(u"Deacon"_s);
    EXPECT_TRUE(button().marks().altered);
    place.dialogue.expect_confirm(cancel_question, core::Answer::yes, core::Answer::no);
    cancel();
    EXPECT_EQ(table().model()->rowCount(), 3);
    EXPECT_FALSE(button().marks().altered);
}

TEST_F(SetupPageTest, ChangesAreDroppedAlsoWhereTheListsCannotBeReadAgain)
{
    add_a_title_that_cannot_be_saved();
    place.dialogue.expect_confirm(cancel_question, core::Answer::yes);
    place.dialogue.expect_box(u"Unable to read the setup lists"_s);
    cancel();
    EXPECT_EQ(table().model()->rowCount(), 3);
    EXPECT_FALSE(window().page()->altered());
}

TEST_F(SetupPageTest, LeavingAsksAndDoesAsItIsTold)
{
    struct Case
    {
        std::optional<bool> answer;
        bool stays;
        int stored;
    };
    for (const auto& [answer, stays, count] :
         {Case{std::nullopt, true, 3}, Case{false, false, 3}, Case{true, false, 4}}) {
        open(SetupKind::titles);
        if (!window().page()->altered())
            add(u"Deacon"_s);
        place.dialogue.expect_confirm_or_cancel(leave_question, answer);
        press(window(), Qt::Key_W, Qt::ControlModifier);
        EXPECT_EQ(is_open(), stays);
        EXPECT_EQ(stored(SetupKind::titles).size(), count);
    }
}

TEST_F(SetupPageTest, WhatIsTypedButNotEnteredIsSavedToo)
{
    open(SetupKind::titles);
    press(window(), Qt::Key_Insert);
    type(window(), u"Deacon"_s);
    press(window(), Qt::Key_S, Qt::ControlModifier);
    EXPECT_EQ(stored(SetupKind::titles).last(), u"Deacon"_s);
}

TEST_F(SetupPageTest, AFailedSaveIsToldAndLosesNothing)
{
    add_a_title_that_cannot_be_saved();
    EXPECT_TRUE(is_open());
    EXPECT_TRUE(window().page()->altered());
    EXPECT_EQ(table().model()->rowCount(), 4);
}

TEST_F(SetupPageTest, TheAreaStaysClosedWhileSomebodyElseIsInIt)
{
    desk().office.mode = core::Mode::network;
    place.in_database(u"INSERT INTO [tbl_locked_area] ([locked_area]) VALUES (2);"_s);
    place.dialogue.expect_box(u"Unable to enter the setup area as another user is presently in the setup area."_s);
    QTest::mouseClick(&button(), Qt::LeftButton);
    EXPECT_EQ(window().page()->objectName(), u"main_menu"_s);
    EXPECT_TRUE(child<desktop::RailButton>(window(), u"main_menu"_s).isChecked());
}

TEST_F(SetupPageTest, TheRailShowsTheLockAndRemindsOfItUntilThePageIsClosed)
{
    desk().office.mode = core::Mode::network;
    open(SetupKind::status);
    EXPECT_TRUE(button().marks().locked);
    auto* watch = window().findChild<desktop::IdleWatch*>();
    Q_EMIT watch->idle();
    EXPECT_TRUE(button().toolTip().contains(u"still locked for others"_s));
    Q_EMIT watch->returned();
    EXPECT_FALSE(button().marks().idle);
    press(window(), Qt::Key_W, Qt::ControlModifier);
    EXPECT_FALSE(button().marks().locked);
    EXPECT_FALSE(session().select(u"SELECT [locked_area] FROM [tbl_locked_area];"_s).first());
}

TEST_F(SetupPageTest, MembersOfARemovedGroupLeaveItIntoTheirHistory)
{
    place.in_database(u"INSERT INTO [tbl_group] ([person_id],[group_id]) VALUES (1,1);"_s);
    place.in_database(u"INSERT INTO [tbl_group_history] ([history_id],[person_id],[group_id],[date_in]) "
                      "VALUES (1,1,1,'2020-03-01');"_s);
    open(SetupKind::groups);
    place.dialogue.expect_confirm(u"Please confirm that you wish to remove this item 'group 1'"_s, core::Answer::yes);
    place.dialogue.expect_confirm(u"Do you wish to remove everybody attached to this group?"_s, core::Answer::yes);
    press(window(), Qt::Key_Delete);
    EXPECT_EQ(table().model()->rowCount(), 2);

    press(window(), Qt::Key_S, Qt::ControlModifier);

    EXPECT_FALSE(session().select(u"SELECT [person_id] FROM [tbl_group];"_s).first());
    auto history = session().select(u"SELECT [date_out],[completed] FROM [tbl_group_history];"_s);
    const auto* row = history.first();
    ASSERT_TRUE(row);
    EXPECT_EQ(row->text(core::Column{0}), place.clock.today().toString(Qt::ISODate));
    EXPECT_TRUE(row->flag(core::Column{1}));
}

TEST_F(SetupPageTest, DetailsOfANewGroupOpenOnceItIsSaved)
{
    open(SetupKind::groups);
    add(u"Choir"_s);
    place.dialogue.expect_confirm(
        u"Unable to access this groups details as this is a new group and needs to be created "
        "and saved first. Save this group now and then access this groups details?"_s,
        core::Answer::yes);
    QTest::mouseClick(&child<QAbstractButton>(tab(), u"details"_s), Qt::LeftButton);
    settle();
    auto& details = child<desktop::GroupDetailsDialog>(window(), u"group_details"_s);
    QTest::keyClicks(details.focusWidget(), u"Tuesday"_s);
    QTest::keyClick(&details, Qt::Key_Return);
    settle();
    EXPECT_EQ(people::load_group_details(session(), 4).Day, u"Tuesday"_s);
}

TEST_F(SetupPageTest, AQuickAddedSuburbIsThereAtOnce)
{
    desktop::QuickAddDialog dialog(desk().office, SetupKind::suburbs, {u"Mosman"_s});
    dialog.show();
    settle();
    EXPECT_EQ(dialog.focusWidget()->objectName(), u"new_1"_s);
    place.dialogue.expect_box(u"Please enter a postcode"_s);
    press(dialog, Qt::Key_Return);
    type(dialog, u"2088"_s);
    press(dialog, Qt::Key_Return);
    EXPECT_EQ(dialog.key(), 4);
    EXPECT_EQ(stored(SetupKind::suburbs).last(), u"Mosman 2088"_s);
}

} // namespace kindrel::test
