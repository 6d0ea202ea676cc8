#include "desktop/desktop_fixture.h"
#include "desktop/people/filter_panel.h"
#include "desktop/people/found_people_model.h"
#include "desktop/shell/page.h"
#include "people/saved_filters.h"
#include "support/families.h"

#include <QAbstractButton>
#include <QAction>
#include <QComboBox>
#include <QLineEdit>
#include <QListWidget>
#include <QStackedWidget>
#include <QTableView>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using people::FilterItem;

namespace {

const QString active_people = u"Active Families; people who are active, or of no state"_s;

people::LinkRow carried(int item, const QString& field = {})
{
    people::LinkRow row;
    row.item = item;
    row.field = field;
    return row;
}

/// Ann is in group 1 and plays piano, Ben is in groups 1 and 2, Cleo in none; Dora of another family is a contact.
std::vector<people::FamilyFile> congregation()
{
    auto naismith = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cleo"_s});
    naismith.people[0].groups = {carried(1)};
    naismith.people[0].flexi = {carried(2, u"Piano"_s)};
    naismith.people[1].groups = {carried(1), carried(2)};
    naismith.people[1].birthdate = core::Date{1970, 3, 31};
    naismith.people[2].school_year = -1;
    naismith.residential = people::Suburb{1, people::SuburbType::residential, {}, u"suburb 1"_s, u"3000"_s};
    auto okafor = family(u"Okafor"_s, {u"Dora"_s});
    okafor.people[0].contact = true;
    okafor.people[0].birthdate = core::Date{core::Date::unknown_year, 3, 1};
    return {naismith, okafor};
}

class FilterPanelTest : public DesktopTest
{
protected:
    FilterPanelTest()
    {
        begin(congregation());
        open();
    }

    void open()
    {
        running->open_area(u"filters"_s);
        settle();
    }
    [[nodiscard]] desktop::FilterPanel& panel() { return child<desktop::FilterPanel>(window(), u"filter_panel"_s); }
    /// What is to be read after a pause in typing.
    [[nodiscard]] QString text(const QString& name)
    {
        panel().count_now();
        return child<QLabel>(panel(), name).text();
    }
    /// From the kinds at the left into what the kind offers, by the first letters of its caption.
    void choose_kind(const QString& caption)
    {
        auto& kinds = child<QListWidget>(panel(), u"kinds"_s);
        kinds.setFocus();
        while (!kinds.currentItem()->text().startsWith(caption) && kinds.currentRow() + 1 < kinds.count())
            press(window(), Qt::Key_Down);
        press(window(), Qt::Key_Return);
    }
    [[nodiscard]] QString focus() { return window().focusWidget()->objectName(); }
    /// What stands behind an item of the kind in front.
    [[nodiscard]] QString use(int row)
    {
        auto* part = child<QStackedWidget>(panel(), {}).currentWidget();
        const auto* model = child<QTableView>(*part, u"items"_s).model();
        return model->index(row, 1).data().toString();
    }
    void press_button(const QString& name)
    {
        child<QAbstractButton>(window(), name).setFocus();
        press(window(), Qt::Key_Space);
    }
    void save_as(const QString& name)
    {
        place.dialogue.expect_text(u"Please enter a name for this filter"_s, name);
        press_button(u"save_filter"_s);
    }
    [[nodiscard]] QComboBox& saved() { return child<QComboBox>(panel(), u"saved_filters"_s); }
};

} // namespace

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

TEST_F(FilterPanelTest, AnAnniversaryIsAddedByKeysAndTakenOutAgain)
{
    choose_kind(u"File Status"_s);
    press_button(u"contact"_s);
    choose_kind(u"Birth"_s);
    EXPECT_EQ(focus(), u"date_source"_s);
    child<QComboBox>(panel(), u"date_span"_s).setFocus();
    press(window(), Qt::Key_Down);
    child<QLineEdit>(panel(), u"date_from"_s).setFocus();
    type(window(), u"01/03/2000"_s);
    place.dialogue.expect_box(u"Please enter both dates of the range"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(focus(), u"date_to"_s);
    type(window(), u"31/03/2000"_s);
    press(window(), Qt::Key_Return);

    auto& dates = child<QListWidget>(panel(), u"dates"_s);
    EXPECT_EQ(dates.item(0)->text(), u"born between 1 March and 31 March of any year"_s);
    EXPECT_EQ(text(u"count"_s), u"2 people are found"_s);
    dates.setFocus();
    press(window(), Qt::Key_Delete);
    EXPECT_EQ(text(u"count"_s), u"4 people are found"_s);
}

TEST_F(FilterPanelTest, AMonthOfOneKindOfFamilyDateIsAdded)
{
    place.in_database(u"INSERT INTO [tbl_family_date] ([Surname_id],[family_date_id],[family_date]) "
                      "VALUES (1,2,'1990-11-30');"_s);
    choose_kind(u"Birth"_s);
    const auto choose = [&](const QString& box, const QString& wanted) {
        auto& choices = child<QComboBox>(panel(), box);
        choices.setFocus();
        while (choices.currentText() != wanted && choices.currentIndex() + 1 < choices.count())
            press(window(), Qt::Key_Down);
    };
    choose(u"date_source"_s, u"Date of the family"_s);
    choose(u"date_item"_s, u"date_description 2"_s);
    choose(u"date_span"_s, u"Month of any year"_s);
    choose(u"date_month"_s, u"November"_s);
    press_button(u"add_date"_s);
    EXPECT_EQ(child<QListWidget>(panel(), u"dates"_s).item(0)->text(),
              u"of a family with the date date_description 2 in November"_s);
    EXPECT_EQ(text(u"count"_s), u"3 people are found"_s);
}

TEST_F(FilterPanelTest, ARecalledFilterStandsInItsFields)
{
    people::Filter kept = panel().filter();
    kept.families = people::FamilyList::prospect;
    kept.states = {.active = false, .deceased = true};
    kept.surnames = people::SurnameRange{u"B"_s, u"K"_s, true};
    kept.ages = people::Ages{18, 65, core::Date{2020, 2, 29}};
    kept.family_type = people::FamilyType::single_parent;
    kept.suburb_known = true;
    ASSERT_TRUE(people::save_filter(desk().office, u"Kept"_s, kept));
    panel().reload();
    saved().setFocus();
    press(window(), Qt::Key_Down);
    for (const auto& kind : {u"File Status"_s, u"Surnames"_s, u"Family Type"_s})
        choose_kind(kind);

    EXPECT_EQ(child<QComboBox>(panel(), u"file_status"_s).currentText(), u"Prospect Families"_s);
    EXPECT_FALSE(child<QAbstractButton>(panel(), u"active"_s).isChecked());
    EXPECT_TRUE(child<QAbstractButton>(panel(), u"decease"_s).isChecked());
    for (const auto& [field, shown] :
         std::initializer_list<std::pair<QString, QString>>{{u"surname_from"_s, u"B"_s},
                                                            {u"surname_to"_s, u"K"_s},
                                                            {u"year_from"_s, {}},
                                                            {u"age_from"_s, u"18"_s},
                                                            {u"age_to"_s, u"65"_s},
                                                            {u"age_on"_s, u"29/02/2020"_s}})
        EXPECT_EQ(child<QLineEdit>(panel(), field).text(), shown);
    EXPECT_TRUE(child<QAbstractButton>(panel(), u"own_surname"_s).isChecked());
    EXPECT_EQ(child<QComboBox>(panel(), u"family_type"_s).currentText(), u"Single Parent"_s);
    EXPECT_TRUE(child<QAbstractButton>(panel(), u"suburb_known"_s).isChecked());
    EXPECT_EQ(panel().filter(), kept);
}

TEST_F(FilterPanelTest, ClearStartsAgainAndTheListsShowIt)
{
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    press_button(u"clear_filter"_s);
    EXPECT_EQ(use(0), QString());
    EXPECT_EQ(text(u"sentence"_s), active_people);
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

TEST_F(FilterPanelTest, ASavedFilterIsRecalledAfterTheNextStart)
{
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    save_as(u" Choir "_s);
    EXPECT_EQ(saved().currentText(), u"Choir"_s);
    const auto kept = panel().filter();

    begin_again();
    open();
    EXPECT_EQ(saved().currentText(), u"(not saved)"_s);
    saved().setFocus();
    press(window(), Qt::Key_Down);
    EXPECT_EQ(panel().filter(), kept);
    EXPECT_EQ(text(u"count"_s), u"2 people are found"_s);
}

TEST_F(FilterPanelTest, WhatIsNotSavedWaitsWhileASavedFilterIsLookedAt)
{
    save_as(u"Everybody"_s);
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    const auto built = panel().filter();
    EXPECT_EQ(saved().currentText(), u"(not saved)"_s);
    saved().setFocus();
    press(window(), Qt::Key_Down);
    EXPECT_NE(panel().filter(), built);
    press(window(), Qt::Key_Up);
    EXPECT_EQ(panel().filter(), built);
}

TEST_F(FilterPanelTest, ASavedFilterIsRenamedAndRemoved)
{
    for (const auto& button : {u"rename_filter"_s, u"remove_filter"_s}) {
        place.dialogue.expect_box(u"Please choose a saved filter first"_s);
        press_button(button);
    }
    save_as(u"Everybody"_s);
    place.dialogue.expect_text(u"Please enter another name for this filter"_s, u"All"_s);
    press_button(u"rename_filter"_s);
    EXPECT_EQ(saved().currentText(), u"All"_s);
    place.dialogue.expect_confirm(u"Are you sure that you wish to delete the filter 'All'?"_s, core::Answer::yes);
    press_button(u"remove_filter"_s);
    EXPECT_EQ(saved().count(), 1);
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

TEST_F(FilterPanelTest, WithoutTheRightToBirthDatesNobodyIsFoundByThem)
{
    press(window(), Qt::Key_W, Qt::ControlModifier);
    desk().office.rights.set(core::Area::birth_dates, false);
    open();
    EXPECT_FALSE(child<QLineEdit>(panel(), u"age_from"_s).isEnabled());
    EXPECT_EQ(child<QComboBox>(panel(), u"date_source"_s).findText(u"Birth date"_s), -1);
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
