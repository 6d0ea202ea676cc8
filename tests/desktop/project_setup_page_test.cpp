#include "core/locks.h"
#include "desktop/desktop_fixture.h"
#include "desktop/shell/page.h"
#include "desktop/shell/rail.h"

#include <QLineEdit>
#include <QTabWidget>
#include <QTableView>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

const QString leave_question = u"Do you wish to save the changes made to the projects?"_s;
const QString service_missing = u"You must enter at least one Roll service description for each Roll project"_s;

enum Tab { roll, finance, weekly };

class ProjectSetupPageTest : public DesktopTest
{
protected:
    ProjectSetupPageTest() { begin(); }
    [[nodiscard]] core::Session& session() { return *desk().office.session; }
    [[nodiscard]] QWidget& page() { return *window().page(); }
    [[nodiscard]] bool is_open() { return page().objectName() == u"setup_projects"_s; }
    [[nodiscard]] QString in_focus() { return window().focusWidget()->objectName(); }
    [[nodiscard]] QTableView& table(const QString& name) { return child<QTableView>(page(), name); }

    /// The first tab is that of the roll projects.
    void open(Tab tab = roll)
    {
        running->open_area(u"setup_projects"_s);
        settle();
        for (int turn = 0; turn < tab; ++turn)
            press(window(), Qt::Key_PageDown, Qt::ControlModifier);
    }
    void enter(const QString& text)
    {
        type(window(), text);
        press(window(), Qt::Key_Return);
    }
    void save() { press(window(), Qt::Key_S, Qt::ControlModifier); }
    void close() { press(window(), Qt::Key_W, Qt::ControlModifier); }
    void add_roll_project(const QString& name, const QString& service)
    {
        press(window(), Qt::Key_Insert);
        enter(name);
        press(window(), Qt::Key_V, Qt::AltModifier);
        enter(service);
        press(window(), Qt::Key_P, Qt::AltModifier);
    }
    /// The first column of every row.
    [[nodiscard]] QStringList stored(const QString& query)
    {
        QStringList texts;
        auto rows = session().select(query + u';');
        for (const core::Row& row : rows)
            texts += row.text(core::Column{0});
        return texts;
    }
    [[nodiscard]] QStringList roll_projects()
    {
        return stored(u"SELECT [roll_project] FROM [Qry_roll_load_project]"_s);
    }
};

} // namespace

TEST_F(ProjectSetupPageTest, AWeeklyProjectIsSetUpFromNothingByKeysAlone)
{
    open(weekly);
    enter(u"Sunday"_s);
    press(window(), Qt::Key_T, Qt::AltModifier);
    enter(u"Morning"_s);
    enter(u"Evening"_s);
    press(window(), Qt::Key_Up, Qt::AltModifier);
    press(window(), Qt::Key_F, Qt::AltModifier);
    enter(u"Offering"_s);
    EXPECT_EQ(stored(u"SELECT [weekly_project] FROM [tbl_weekly_project]"_s), QStringList());
    save();

    EXPECT_EQ(window().page()->status(), u"Saved"_s);
    EXPECT_EQ(stored(u"SELECT [weekly_project] FROM [Qry_weekly_load_project]"_s), QStringList{u"Sunday"_s});
    EXPECT_EQ(stored(u"SELECT [group] FROM [tbl_weekly_group] ORDER BY [group_type],[position]"_s),
              QStringList({u"Evening"_s, u"Morning"_s, u"Offering"_s}));
    close();
    EXPECT_FALSE(is_open());
}

TEST_F(ProjectSetupPageTest, ARollProjectGetsServicesReasonsAndTheirMarksByKeysAlone)
{
    open();
    enter(u"Sunday"_s);
    press(window(), Qt::Key_V, Qt::AltModifier);
    enter(u"Morning"_s);
    enter(u"Evening"_s);
    press(window(), Qt::Key_B, Qt::AltModifier);
    enter(u"Away"_s);
    EXPECT_EQ(in_focus(), u"include_1"_s);
    press(window(), Qt::Key_Space);
    save();
    EXPECT_EQ(stored(u"SELECT [service1] || '|' || [service2] || '|' || [absent1] || '|' || [include1] "
                     "FROM [tbl_roll_setup]"_s),
              QStringList{u"Morning|Evening|Away|-1"_s});
}

TEST_F(ProjectSetupPageTest, AnIncompleteProjectIsDroppedAndThePageLeftWithoutItsDatabase)
{
    open();
    enter(u"Youth"_s);
    place.in_database(u"DROP VIEW [Qry_roll_load_project];"_s);
    place.dialogue.expect_confirm_or_cancel(leave_question, false);
    place.dialogue.expect_box(u"Unable to read the projects"_s);
    place.dialogue.expect_confirm_or_cancel(u"Backup Kindrel files before exiting?"_s, false);
    EXPECT_TRUE(window().close());
}

TEST_F(ProjectSetupPageTest, AnEmptiedServiceWhoseMarksAreToStayInSightComesBack)
{
    open();
    add_roll_project(u"Sunday"_s, u"Morning"_s);
    save();
    place.in_database(u"INSERT INTO [tbl_roll_date] ([roll_date_id],[roll_date],[roll_project_id]) VALUES "
                      "(1,'2024-05-12',1);"_s);
    place.in_database(u"INSERT INTO [tbl_roll_attendance] ([roll_date_id],[person_id],[Attendance]) VALUES "
                      "(1,1,192);"_s);
    press(window(), Qt::Key_V, Qt::AltModifier);
    auto& service = child<QLineEdit>(page(), u"description_1"_s);
    service.selectAll();
    press(window(), Qt::Key_Delete);
    place.dialogue.expect_confirm(u"Please confirm that you wish to remove this service 'Morning'. Do you wish to "
                                  "continue?"_s,
                                  core::Answer::no, core::Answer::no);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(service.text(), u"Morning"_s);
    EXPECT_FALSE(window().page()->altered());
}

TEST_F(ProjectSetupPageTest, WhatIsTypedAndCannotBeLookedIntoIsToldAsAFailedSaveAndStaysTyped)
{
    open();
    add_roll_project(u"Sunday"_s, u"Morning"_s);
    save();
    press(window(), Qt::Key_V, Qt::AltModifier);
    auto& service = child<QLineEdit>(page(), u"description_1"_s);
    service.selectAll();
    press(window(), Qt::Key_Delete);
    place.in_database(u"DROP TABLE [tbl_roll_attendance];"_s);
    place.dialogue.expect_box(u"Unable to save the projects"_s);
    save();
    place.dialogue.verify();
    EXPECT_EQ(service.text(), QString());
    EXPECT_TRUE(window().page()->altered());
    EXPECT_EQ(roll_projects(), QStringList{u"Sunday"_s});
    service.setText(u"Morning"_s);
    service.setModified(false); // The page closes without asking.
}

TEST_F(ProjectSetupPageTest, AnIncompleteProjectIsChosenWhenThePageRefusesToBeLeft)
{
    open();
    add_roll_project(u"Sunday"_s, u"Morning"_s);
    press(window(), Qt::Key_Insert);
    enter(u"Youth"_s);
    add_roll_project(u"Children"_s, u"Morning"_s);
    press(window(), Qt::Key_PageDown, Qt::ControlModifier);
    place.dialogue.expect_confirm_or_cancel(leave_question, true);
    place.dialogue.expect_box(service_missing);
    close();
    EXPECT_TRUE(is_open());
    EXPECT_EQ(table(u"tbl_roll_project"_s).currentIndex().data().toString(), u"Youth"_s);
    EXPECT_EQ(in_focus(), u"description_1"_s);
    EXPECT_EQ(roll_projects(), QStringList());
    enter(u"Evening"_s);
    save();
    EXPECT_EQ(roll_projects(), QStringList({u"Sunday"_s, u"Youth"_s, u"Children"_s}));

    press(window(), Qt::Key_PageDown, Qt::ControlModifier);
    press(window(), Qt::Key_PageDown, Qt::ControlModifier);
    enter(u"Sunday"_s);
    place.dialogue.expect_box(u"You have set up a Weekly Project name without either adding a financial or attendance "
                              "category, please add at least one before exiting this area."_s);
    save();
    EXPECT_EQ(in_focus(), u"new_0"_s);
    EXPECT_TRUE(page().findChild<QWidget*>(u"attendance_input"_s)->isAncestorOf(window().focusWidget()));
}

TEST_F(ProjectSetupPageTest, AProjectThatIsStoredIncompleteIsMendedBeforeThePageIsLeft)
{
    place.in_database(
        u"INSERT INTO [tbl_roll_project] ([roll_project_id],[roll_project],[position]) VALUES (1,'Sunday',1);"_s);
    (void)session().allocate(core::Entity::roll_project);
    open();
    place.dialogue.expect_box(service_missing);
    close();
    EXPECT_TRUE(is_open());
    EXPECT_EQ(in_focus(), u"description_1"_s);
    enter(u"Morning"_s);
    place.dialogue.expect_confirm_or_cancel(leave_question, true);
    close();
    EXPECT_FALSE(is_open());
}

TEST_F(ProjectSetupPageTest, WhatIsRefusedStaysSelectedInItsField)
{
    open();
    add_roll_project(u"Sunday"_s, u"Morning"_s);
    auto& second = child<QLineEdit>(page(), u"description_2"_s);
    second.setFocus();
    for (const auto& way : {QKeyCombination(Qt::Key_Return), QKeyCombination(Qt::Key_Tab), Qt::CTRL | Qt::Key_S}) {
        second.clear();
        type(window(), u"morning"_s);
        place.dialogue.expect_box(u"This item already exists in the list"_s);
        press(window(), way.key(), way.keyboardModifiers());
        EXPECT_EQ(in_focus(), u"description_2"_s);
        EXPECT_EQ(second.selectedText(), u"morning"_s);
    }
    press(window(), Qt::Key_Escape);
    EXPECT_EQ(second.text(), QString());
}

TEST_F(ProjectSetupPageTest, NothingIsAddedBeforeAProjectIsChosen)
{
    open();
    press(window(), Qt::Key_V, Qt::AltModifier);
    place.dialogue.expect_box(u"You need to select a Roll project before adding any information to it"_s);
    enter(u"Morning"_s);
    EXPECT_EQ(in_focus(), u"new_0"_s);
    EXPECT_EQ(child<QLineEdit>(page(), u"description_1"_s).text(), QString());
    EXPECT_FALSE(window().page()->altered());

    press(window(), Qt::Key_PageUp, Qt::ControlModifier);
    press(window(), Qt::Key_F, Qt::AltModifier);
    place.dialogue.expect_box(u"You must choose a weekly project before attempting to add anything to it"_s);
    enter(u"Offering"_s);
    EXPECT_TRUE(page().findChild<QWidget*>(u"finance_input"_s)->isAncestorOf(window().focusWidget()));
}

TEST_F(ProjectSetupPageTest, LeavingAsksAndDoesAsItIsTold)
{
    struct Case
    {
        std::optional<bool> answer;
        bool stays;
        int stored;
    };
    for (const auto& [answer, stays, count] :
         {Case{std::nullopt, true, 0}, Case{false, false, 0}, Case{true, false, 1}}) {
        open();
        if (!window().page()->altered())
            add_roll_project(u"Sunday"_s, u"Morning"_s);
        place.dialogue.expect_confirm_or_cancel(leave_question, answer);
        close();
        EXPECT_EQ(is_open(), stays);
        EXPECT_EQ(roll_projects().size(), count);
    }
}

TEST_F(ProjectSetupPageTest, AProjectIsRemovedWithItsDatesOnceItIsSaved)
{
    open();
    add_roll_project(u"Sunday"_s, u"Morning"_s);
    save();
    place.in_database(
        u"INSERT INTO [tbl_roll_date] ([roll_date_id],[roll_date],[roll_project_id]) VALUES (7,'2024-05-05',1);"_s);
    press(window(), Qt::Key_F, Qt::ControlModifier);
    place.dialogue.expect_confirm(
        u"Please confirm that you wish to remove this Roll project 'Sunday', please note all records attached to this "
        "Roll project will be removed once you delete this project. Do you wish to continue?"_s,
        core::Answer::yes, core::Answer::no);
    press(window(), Qt::Key_Delete);
    EXPECT_EQ(roll_projects().size(), 1);
    save();
    EXPECT_EQ(roll_projects(), QStringList());
    EXPECT_EQ(stored(u"SELECT [roll_date_id] FROM [tbl_roll_date]"_s), QStringList());
}

TEST_F(ProjectSetupPageTest, ACategoryThatIsStillTypedGoesIntoTheProjectItWasTypedFor)
{
    open(weekly);
    enter(u"Sunday"_s);
    enter(u"Youth"_s);
    press(window(), Qt::Key_T, Qt::AltModifier);
    type(window(), u"Games"_s);
    auto& projects = table(u"tbl_weekly_project"_s);
    projects.setFocus();
    press(window(), Qt::Key_Up);
    EXPECT_EQ(table(u"attendance_input_list"_s).model()->rowCount(), 0);
    press(window(), Qt::Key_Down);
    EXPECT_EQ(table(u"attendance_input_list"_s).model()->index(0, 0).data().toString(), u"Games"_s);
}

TEST_F(ProjectSetupPageTest, EveryTabFitsTheSmallestWindow)
{
    open();
    window().resize(window().minimumSize());
    settle();
    EXPECT_LE(page().minimumSizeHint().width(), page().width());
    EXPECT_LE(page().minimumSizeHint().height(), page().height());
}

TEST_F(ProjectSetupPageTest, TheAreaStaysClosedWhileAProjectIsWorkedInElsewhere)
{
    desk().office.mode = core::Mode::network;
    place.in_database(u"INSERT INTO [tbl_weekly_locked] ([weekly_locked]) VALUES (1);"_s);
    place.dialogue.expect_box(u"Unable to enter the Weekly Statistics setup area as another user is currently working "
                              "in the Weekly Statistics program."_s);
    open();
    EXPECT_FALSE(is_open());
    place.in_database(u"DELETE FROM [tbl_weekly_locked];"_s);
    open();
    EXPECT_TRUE(child<desktop::RailButton>(window(), u"setup_projects"_s).marks().locked);
}

} // namespace kindrel::test
