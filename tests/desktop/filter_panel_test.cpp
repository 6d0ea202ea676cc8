#include "desktop/filter_panel_fixture.h"
#include "desktop/people/found_people_model.h"
#include "desktop/shell/page.h"

#include <QAction>

namespace kindrel::test {

TEST_F(FilterPanelTest, ActiveFamiliesAndTheirActivePeopleStandThereFromTheStart)
{
    EXPECT_EQ(text(u"sentence"_s), active_people);
    EXPECT_EQ(text(u"count"_s), u"3 people are found"_s);
}

TEST_F(FilterPanelTest, AnItemIsFoundByItsLettersIncludedExcludedAndLeftOutByKeys)
{
    choose_kind(u"Groups"_s);
    type(window(), u"GROUP 1"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(use(0), u"include"_s);
    EXPECT_EQ(text(u"sentence"_s), active_people + u"; in the group group 1"_s);
    EXPECT_EQ(text(u"count"_s), u"2 people are found"_s);

    press(window(), Qt::Key_Down);
    EXPECT_EQ(focus(), u"items"_s);
    press(window(), Qt::Key_Space);
    EXPECT_EQ(use(0), u"exclude"_s);
    EXPECT_EQ(text(u"sentence"_s), active_people + u"; in a group other than group 1, or in none"_s);
    EXPECT_EQ(text(u"count"_s), u"2 people are found"_s);

    press(window(), Qt::Key_Space);
    EXPECT_EQ(use(0), QString());
    EXPECT_EQ(text(u"count"_s), u"3 people are found"_s);
}

TEST_F(FilterPanelTest, PlusAndMinusTurnAnItemAtOnce)
{
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Minus);
    EXPECT_EQ(use(0), u"exclude"_s);
    press(window(), Qt::Key_Plus);
    EXPECT_EQ(use(0), u"include"_s);
    press(window(), Qt::Key_Plus);
    EXPECT_EQ(panel().filter().items, std::vector<FilterItem>());
}

TEST_F(FilterPanelTest, TheKeysOfTheListWorkInTheLineWhileNothingIsTypedThere)
{
    choose_kind(u"Groups"_s);
    ASSERT_EQ(focus(), u"wanted"_s);
    press(window(), Qt::Key_Space);
    EXPECT_EQ(use(0), u"include"_s);
    press(window(), Qt::Key_Minus);
    EXPECT_EQ(use(0), u"exclude"_s);
    press(window(), Qt::Key_Plus);
    EXPECT_EQ(use(0), u"include"_s);
    auto* part = child<QStackedWidget>(panel(), {}).currentWidget();
    EXPECT_EQ(child<QLineEdit>(*part, u"wanted"_s).text(), QString());
    type(window(), u"group 2"_s);
    EXPECT_EQ(child<QLineEdit>(*part, u"wanted"_s).text(), u"group 2"_s) << "A blank among letters is a blank.";
    EXPECT_EQ(use(0), QString());
    press(window(), Qt::Key_Return);
    EXPECT_EQ(use(0), u"include"_s);
    press(window(), Qt::Key_Enter, Qt::KeypadModifier);
    EXPECT_EQ(use(0), u"exclude"_s);
}

TEST_F(FilterPanelTest, TheKindsTellWhereSomethingIsAskedFor)
{
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(child<QListWidget>(panel(), u"kinds"_s).currentItem()->text(), u"Groups (1)"_s);
}

TEST_F(FilterPanelTest, AStateChosenBesideAMinistryIncludesItInThatState)
{
    choose_kind(u"Ministry"_s);
    auto* part = child<QStackedWidget>(panel(), {}).currentWidget();
    child<QComboBox>(*part, u"ministry_state"_s).setFocus();
    press(window(), Qt::Key_Down);
    EXPECT_EQ(use(0), u"include, active only"_s);
    EXPECT_EQ(text(u"sentence"_s), active_people + u"; in the ministry ministry 1 (active)"_s);
}

TEST_F(FilterPanelTest, AValueTypedBesideAFlexiFieldIncludesIt)
{
    choose_kind(u"Flexi"_s);
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Down);
    auto* part = child<QStackedWidget>(panel(), {}).currentWidget();
    auto& value = child<QComboBox>(*part, u"value"_s);
    EXPECT_EQ(value.itemText(value.count() - 1), u"Piano"_s);
    value.setFocus();
    press(window(), Qt::Key_End);
    value.lineEdit()->selectAll();
    type(window(), u"Piano"_s);
    EXPECT_EQ(use(1), u"include, = Piano"_s);
    EXPECT_EQ(text(u"count"_s), u"1 person is found"_s);
}

TEST_F(FilterPanelTest, SeveralValuesOfAFlexiFieldAreAlternatives)
{
    for (const auto& [person, value] : {std::pair(u"Ben"_s, u"Violin"_s), std::pair(u"Cleo"_s, u"Drums"_s)})
        place.in_database(u"INSERT INTO [tbl_flexi] ([person_id],[flexi_id],[flexi_field]) "
                          "SELECT [person_id],2,'%1' FROM [tbl_people] WHERE [Name]='%2';"_s.arg(value, person));
    choose_kind(u"Flexi"_s);
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Down);
    auto* part = child<QStackedWidget>(panel(), {}).currentWidget();
    child<QComboBox>(*part, u"value"_s).setFocus();
    child<QComboBox>(*part, u"value"_s).lineEdit()->selectAll();
    type(window(), u"Piano"_s);
    press_button(u"another_value"_s);
    EXPECT_EQ(use(1), u"include, = Piano"_s) << "Nothing more is typed yet.";
    type(window(), u"Violin"_s);
    EXPECT_EQ(use(1), u"include, = Piano or = Violin"_s);
    EXPECT_EQ(text(u"count"_s), u"2 people are found"_s);

    child<QTableView>(*part, u"items"_s).setFocus();
    press(window(), Qt::Key_Minus);
    EXPECT_EQ(use(1), u"exclude, = Piano or = Violin"_s);
    EXPECT_EQ(text(u"count"_s), u"1 person is found"_s);
    press_button(u"another_value"_s);
    child<QTableView>(*part, u"items"_s).setFocus();
    press(window(), Qt::Key_Minus);
    EXPECT_EQ(panel().filter().items, std::vector<FilterItem>());
    child<QComboBox>(*part, u"value"_s).setFocus();
    type(window(), u"Drums"_s);
    EXPECT_EQ(use(1), u"include, = Drums"_s) << "There is none any more to which it could be another.";
}

TEST_F(FilterPanelTest, TheLastOfSeveralValuesIsEmptiedAndTypedAnew)
{
    choose_kind(u"Flexi"_s);
    auto* part = child<QStackedWidget>(panel(), {}).currentWidget();
    child<QComboBox>(*part, u"value"_s).setFocus();
    child<QComboBox>(*part, u"value"_s).lineEdit()->selectAll();
    type(window(), u"A"_s);
    press_button(u"another_value"_s);
    type(window(), u"B"_s);
    press(window(), Qt::Key_Backspace);
    EXPECT_EQ(use(0), u"include, = A"_s);
    type(window(), u"C"_s);
    EXPECT_EQ(use(0), u"include, = A or = C"_s);
}

TEST_F(FilterPanelTest, AnOpenRangeGoesAsFarAsItsGreyFigures)
{
    choose_kind(u"Surnames"_s);
    child<QLineEdit>(panel(), u"year_to"_s).setFocus();
    type(window(), u"3"_s);
    EXPECT_EQ(panel().filter().school_years, (people::SchoolYears{-2, 3}));
    EXPECT_EQ(text(u"count"_s), u"1 person is found"_s);
    press(window(), Qt::Key_Backspace);
    EXPECT_FALSE(panel().filter().school_years);

    child<QLineEdit>(panel(), u"surname_from"_s).setFocus();
    type(window(), u"o"_s);
    EXPECT_EQ(text(u"count"_s), u"Nobody is found"_s);
    EXPECT_EQ(text(u"faults"_s), u"What leaves nobody: with the family's surname from o"_s);
}

TEST_F(FilterPanelTest, WithoutAFileStatusNobodyIsShownAndTheCursorGoesToIt)
{
    choose_kind(u"File Status"_s);
    press(window(), Qt::Key_Home);
    choose_kind(u"Groups"_s);
    const QString refusal =
        u"You need to apply a File Status filter before continuing, for example choose 'Active Families'"_s;
    EXPECT_EQ(text(u"sentence"_s), refusal);
    place.dialogue.expect_box(refusal);
    press(window(), Qt::Key_Return, Qt::ControlModifier);
    EXPECT_EQ(focus(), u"file_status"_s);
}

TEST_F(FilterPanelTest, ALostItemIsTold)
{
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    place.in_database(u"DELETE FROM [tbl_group_setup] WHERE [group_id]=1;"_s);
    EXPECT_TRUE(text(u"faults"_s).contains(u"The group 'group 1' no longer exists"_s));
}

TEST_F(FilterPanelTest, TheFoundPeopleAreListedWithMarkersNarrowedAndOpened)
{
    choose_kind(u"File Status"_s);
    press_button(u"contact"_s);
    press(window(), Qt::Key_Return, Qt::ControlModifier);
    const auto* list = child<QTableView>(window(), u"people"_s).model();
    const auto row = [&](int at) {
        return QStringList{list->index(at, 0).data().toString(), list->index(at, 1).data().toString(),
                           list->index(at, 2).data().toString()};
    };
    EXPECT_EQ(list->rowCount(), 4);
    EXPECT_EQ(row(0), QStringList({u"Ann"_s, u"Naismith"_s, u"suburb 1"_s}));
    EXPECT_EQ(row(3), QStringList({u"Dora (Contact)"_s, u"Okafor"_s, QString()}));
    EXPECT_EQ(window().page()->status(), u"4 people"_s);

    type(window(), u"oka dor"_s);
    EXPECT_EQ(window().page()->status(), u"1 of 4 people"_s);
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(window().page()->objectName(), u"Editor"_s);
}

TEST_F(FilterPanelTest, ThePeopleFoundAreSavedAsCommaSeparatedText)
{
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    const QString file = place.data.drive() + u"people.csv"_s;
    place.dialogue.expect_file(u"Save this list"_s, file);
    for (QAction* action : window().page()->actions())
        if (action->text() == u"Save as CSV")
            action->trigger();
    EXPECT_EQ(DataFolder::read(file), "\xEF\xBB\xBFName,Family,Suburb\r\nAnn,Naismith,suburb 1\r\n"
                                      "Ben,Naismith,suburb 1\r\n");
}

TEST_F(FilterPanelTest, PeopleAreFoundInTheListWithoutMindingAccents)
{
    desktop::FoundPeopleModel list;
    list.set_people({{.name = u"Zo\u00eb (Contact)"_s, .family = u"\u017b\u00f3\u0142\u0107"_s},
                     {.name = u"Stan"_s, .family = u"Okafor"_s, .suburb = u"Z\u00fcrich"_s}});
    for (const auto& [typed, found] : std::initializer_list<std::pair<QString, int>>{
             {u"zoe"_s, 1}, {u"z"_s, 2}, {u"CONTACT"_s, 1}, {u"oka zur"_s, 1}, {u"kafor"_s, 0}, {{}, 2}}) {
        list.narrow(typed);
        EXPECT_EQ(list.rowCount(), found) << typed.toStdString();
    }
}

TEST_F(FilterPanelTest, ACancelledReadingGivesNobody)
{
    struct Cancelling : core::SilentProgress
    {
        bool step(const QString&) override { return false; }
    } cancelling;
    desktop::Desk impatient{desk().office,  cancelling,      desk().remembered,
                            desk().windows, desk().printing, desk().navigation};
    const auto list = people::active_families(*desk().office.session);
    EXPECT_FALSE(desktop::read_people(impatient, list));
    EXPECT_EQ(desktop::read_people(desk(), list)->size(), list.members.size());
}

TEST_F(FilterPanelTest, EscapeLeadsFromThePeopleBackToTheFilter)
{
    press(window(), Qt::Key_Return, Qt::ControlModifier);
    EXPECT_EQ(focus(), u"find_person"_s);
    press(window(), Qt::Key_Escape);
    EXPECT_EQ(focus(), u"kinds"_s);
}

TEST_F(FilterPanelTest, AFusionBringsItsSwitchesAlong)
{
    place.in_database(u"INSERT INTO [Tbl_fusion_group] ([fusion_id],[fusion_group],[fusion_status],[position]) "
                      "VALUES (7,'Visitors','000010',1);"_s);
    choose_kind(u"Fusion"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(panel().filter().fusions, std::vector<int>{7});
    EXPECT_EQ(text(u"sentence"_s),
              u"Active Families; people who are contacts, or of no state; of the fusion Visitors"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(panel().filter().fusions, std::vector<int>());
}

} // namespace kindrel::test
