#include "desktop/filter_panel_fixture.h"

namespace kindrel::test {

class FilterDatesTest : public FilterPanelTest
{
};

TEST_F(FilterDatesTest, AnAnniversaryIsAddedByKeysAndTakenOutAgain)
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

TEST_F(FilterDatesTest, AnAnniversaryNeedsNoYear)
{
    const QString march = u"born between 1 March and 31 March of any year"_s;
    choose_kind(u"Birth"_s);
    place.dialogue.expect_box(u"Incorrect format."_s);
    type_span(u"1/3"_s, {});
    settle();
    EXPECT_EQ(dates(), QStringList()) << "From day to day it needs one.";
    press(window(), Qt::Key_Escape);

    choose(u"date_span"_s, u"Anniversary in any year"_s);
    EXPECT_EQ(child<QLineEdit>(panel(), u"date_from"_s).placeholderText(), u"DD/MM"_s);
    type_span(u"1/3"_s, u"31/3"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(dates(), QStringList{march});

    type_span(u"24/12"_s, u"26/12/2020"_s);
    child<QComboBox>(panel(), u"date_span"_s).setFocus();
    press(window(), Qt::Key_Home);
    place.dialogue.expect_box(u"Please enter the year too."_s);
    press_button(u"add_date"_s);
    EXPECT_EQ(focus(), u"date_from"_s);
    choose_kind(u"Groups"_s);
    EXPECT_EQ(dates(), QStringList{march});
}

TEST_F(FilterDatesTest, EnterAfterWhatIsNoDateIsAnsweredOnce)
{
    choose_kind(u"Birth"_s);
    child<QLineEdit>(panel(), u"date_from"_s).setFocus();
    type(window(), u"32/1/1970"_s);
    place.dialogue.expect_box(u"Incorrect format."_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(focus(), u"date_from"_s);
    press(window(), Qt::Key_Escape);
}

TEST_F(FilterDatesTest, ASpanThatIsTypedWholeTakesPartWithoutBeingAdded)
{
    const QStringList spans{u"born from 01/01/1970 to 31/12/1970"_s};
    choose_kind(u"Birth"_s);
    type_span(u"1/1/1970"_s, u"31/12/1970"_s);
    press(window(), Qt::Key_Return, Qt::ControlModifier);
    EXPECT_EQ(dates(), spans);
    EXPECT_EQ(child<QTableView>(window(), u"people"_s).model()->rowCount(), 1);

    press(window(), Qt::Key_Escape);
    press_button(u"clear_filter"_s);
    choose_kind(u"Birth"_s);
    type_span(u"1/1/1970"_s, u"31/12/1970"_s);
    choose_kind(u"Groups"_s);
    EXPECT_EQ(dates(), spans) << "Another kind was turned to.";
    choose_kind(u"Birth"_s);
    choose_kind(u"Groups"_s);
    EXPECT_EQ(dates(), spans) << "It is taken once.";

    press_button(u"clear_filter"_s);
    choose_kind(u"Birth"_s);
    type_span(u"1/1/1970"_s, u"31/12/1970"_s);
    save_as(u"Seventies"_s);
    EXPECT_EQ(dates(), spans);
    EXPECT_EQ(kept(u"Seventies"_s), panel().filter());
}

TEST_F(FilterDatesTest, AHalfTypedSpanIsAskedForBeforeAnybodyIsListedOrTheFilterIsKept)
{
    save_as(u"Everybody"_s);
    choose_kind(u"Birth"_s);
    child<QLineEdit>(panel(), u"date_from"_s).setFocus();
    type(window(), u"1/1/1970"_s);
    for (const auto& button : {u"show_people"_s, u"save_filter"_s, u"save_filter_as"_s}) {
        choose_kind(u"Groups"_s);
        place.dialogue.expect_box(u"Please enter both dates of the range"_s);
        press_button(button);
        EXPECT_EQ(focus(), u"date_to"_s);
    }
    EXPECT_EQ(dates(), QStringList());
}

TEST_F(FilterDatesTest, ARecalledFilterIsFreeOfWhatWasTypedForTheOneBefore)
{
    save_as(u"Everybody"_s);
    choose_kind(u"Birth"_s);
    type_span(u"1/1/1970"_s, u"31/12/1970"_s);
    saved().setFocus();
    press(window(), Qt::Key_Up);
    choose_kind(u"Groups"_s);
    EXPECT_EQ(dates(), QStringList());
}

TEST_F(FilterDatesTest, AMonthOfOneKindOfFamilyDateIsAdded)
{
    place.in_database(u"INSERT INTO [tbl_family_date] ([Surname_id],[family_date_id],[family_date]) "
                      "VALUES (1,2,'1990-11-30');"_s);
    choose_kind(u"Birth"_s);
    choose(u"date_source"_s, u"Date of the family"_s);
    choose(u"date_item"_s, u"date_description 2"_s);
    choose(u"date_span"_s, u"Month of any year"_s);
    choose(u"date_month"_s, u"November"_s);
    press_button(u"add_date"_s);
    EXPECT_EQ(child<QListWidget>(panel(), u"dates"_s).item(0)->text(),
              u"of a family with the date date_description 2 in November"_s);
    EXPECT_EQ(text(u"count"_s), u"3 people are found"_s);
}

TEST_F(FilterDatesTest, WithoutTheRightToBirthDatesOrVisitsNobodyIsFoundByThem)
{
    press(window(), Qt::Key_W, Qt::ControlModifier);
    desk().office.rights.set(core::Area::birth_dates, false);
    desk().office.rights.set(core::Area::visitation_tab, false);
    open();
    EXPECT_FALSE(child<QLineEdit>(panel(), u"age_from"_s).isEnabled());
    const auto& sources = child<QComboBox>(panel(), u"date_source"_s);
    EXPECT_EQ(sources.findText(u"Birth date"_s), -1);
    EXPECT_EQ(sources.findText(u"Visit to the family"_s), -1);
    EXPECT_GE(sources.findText(u"Event of the family"_s), 0);
}

} // namespace kindrel::test
