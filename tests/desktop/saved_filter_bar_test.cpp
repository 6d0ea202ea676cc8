#include "desktop/filter_panel_fixture.h"
#include "people/saved_filters.h"

namespace kindrel::test {

class SavedFilterBarTest : public FilterPanelTest
{
};

TEST_F(SavedFilterBarTest, ARecalledFilterStandsInItsFields)
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

TEST_F(SavedFilterBarTest, ClearStartsAgainAndTheListsShowIt)
{
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    press_button(u"clear_filter"_s);
    EXPECT_EQ(use(0), QString());
    EXPECT_EQ(text(u"sentence"_s), active_people);
}

TEST_F(SavedFilterBarTest, ASavedFilterIsRecalledAfterTheNextStart)
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

TEST_F(SavedFilterBarTest, WhatIsNotSavedWaitsWhileASavedFilterIsLookedAt)
{
    save_as(u"Everybody"_s);
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    const auto built = panel().filter();
    EXPECT_EQ(saved().currentText(), u"Everybody, changed"_s);
    saved().setFocus();
    press(window(), Qt::Key_Down);
    EXPECT_NE(panel().filter(), built);
    press(window(), Qt::Key_Up);
    EXPECT_EQ(panel().filter(), built);
}

TEST_F(SavedFilterBarTest, AChangedFilterIsSavedUnderTheNameItCameFrom)
{
    save_as(u"Newsletter families"_s);
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    const auto built = panel().filter();
    press_button(u"save_filter"_s);
    EXPECT_EQ(saved().currentText(), u"Newsletter families"_s);
    EXPECT_EQ(saved().itemText(0), u"(not saved)"_s);

    press_button(u"clear_filter"_s);
    EXPECT_EQ(saved().currentText(), u"(not saved)"_s);
    saved().setFocus();
    press(window(), Qt::Key_Down);
    EXPECT_EQ(panel().filter(), built);
}

TEST_F(SavedFilterBarTest, ANameStandsThereToBeChangedAndEscapeLeavesIt)
{
    press_button(u"save_filter"_s);
    EXPECT_EQ(focus(), u"filter_name"_s) << "What has no name yet is asked for one.";
    type(window(), u"Choir"_s);
    press(window(), Qt::Key_Return);

    const auto edit = [&](const QString& button, Qt::Key end) {
        press_button(button);
        press(window(), Qt::Key_End);
        type(window(), u" 2"_s);
        press(window(), end);
    };
    edit(u"rename_filter"_s, Qt::Key_Escape);
    EXPECT_EQ(saved().currentText(), u"Choir"_s);
    edit(u"rename_filter"_s, Qt::Key_Return);
    EXPECT_EQ(saved().currentText(), u"Choir 2"_s);
    edit(u"save_filter_as"_s, Qt::Key_Return);
    EXPECT_EQ(saved().currentText(), u"Choir 2 2"_s);
    EXPECT_EQ(saved().count(), 3);
}

TEST_F(SavedFilterBarTest, ASavedFilterIsRenamedAndRemoved)
{
    for (const auto& button : {u"rename_filter"_s, u"remove_filter"_s}) {
        place.dialogue.expect_box(u"Please choose a saved filter first"_s);
        press_button(button);
    }
    save_as(u"Everybody"_s);
    press_button(u"rename_filter"_s);
    type(window(), u"All"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(saved().currentText(), u"All"_s);
    place.dialogue.expect_confirm(u"Are you sure that you wish to delete the filter 'All'?"_s, core::Answer::yes);
    press_button(u"remove_filter"_s);
    EXPECT_EQ(saved().count(), 1);
}

} // namespace kindrel::test
