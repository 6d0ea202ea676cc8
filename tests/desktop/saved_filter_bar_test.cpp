#include "desktop/filter_panel_fixture.h"

namespace kindrel::test {

class SavedFilterBarTest : public FilterPanelTest
{
protected:
    /// "Choir" is kept for group 1 and stands on the screen; "Zion" asks for ages.
    void keep_two()
    {
        choose_kind(u"Groups"_s);
        press(window(), Qt::Key_Return);
        save_as(u"Choir"_s);
        people::Filter other = panel().filter();
        other.ages = people::Ages{18, 65};
        ASSERT_TRUE(people::save_filter(desk().office, u"Zion"_s, other));
        panel().reload();
    }
    void lose(const QString& name)
    {
        place.in_database(u"DELETE FROM [tbl_filter_memory] WHERE [filter_name]='%1';"_s.arg(name));
    }
    /// As another user does, who then keeps "Easter" under its key, the highest.
    void lose_to_easter(const QString& name)
    {
        lose(name);
        ASSERT_TRUE(people::save_filter(desk().office, u"Easter"_s, easter));
    }
    [[nodiscard]] bool naming() { return !child<QLineEdit>(panel(), u"filter_name"_s).isHidden(); }

    const people::Filter easter{.families = people::FamilyList::archive};
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

TEST_F(SavedFilterBarTest, WhatWasMadeFromAFilterFollowsItsNewName)
{
    save_as(u"Choir"_s);
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    const auto rename_to = [&](const QString& name) {
        press_button(u"rename_filter"_s);
        type(window(), name);
        press(window(), Qt::Key_Return);
    };
    rename_to(u" Band "_s);
    EXPECT_EQ(saved().currentText(), u"Band, changed"_s);
    saved().setFocus();
    press(window(), Qt::Key_Down);
    rename_to(u"Singers"_s);
    EXPECT_EQ(saved().currentText(), u"Singers"_s);
    EXPECT_EQ(saved().itemText(0), u"Singers, changed"_s);
}

TEST_F(SavedFilterBarTest, EitherSaveTakesTheNameThatIsBeingTyped)
{
    struct Case
    {
        QString asks, takes, name;
    };
    for (const auto& [asks, takes, name] : {Case{u"save_filter"_s, u"save_filter"_s, u"Choir"_s},
                                            Case{u"save_filter_as"_s, u"save_filter"_s, u"Easter"_s},
                                            Case{u"save_filter_as"_s, u"save_filter_as"_s, u"Lent"_s}}) {
        choose_kind(u"Groups"_s);
        press(window(), Qt::Key_Return);
        press_button(asks);
        type(window(), name);
        press_button(takes);
        EXPECT_EQ(saved().currentText(), name);
        EXPECT_EQ(kept(name), panel().filter());
    }
    EXPECT_NE(kept(u"Choir"_s), kept(u"Easter"_s));
}

TEST_F(SavedFilterBarTest, WhateverElseIsTurnedToEndsTheNaming)
{
    keep_two();
    const auto type_name = [this] {
        press_button(u"rename_filter"_s);
        type(window(), u"Sheep"_s);
        EXPECT_TRUE(naming());
    };
    type_name();
    place.dialogue.expect_confirm(u"Are you sure that you wish to delete the filter 'Choir'?"_s, core::Answer::no);
    press_button(u"remove_filter"_s);
    EXPECT_FALSE(naming());
    type_name();
    running->open_area(u"search"_s);
    settle();
    open();
    EXPECT_FALSE(naming());
    type_name();
    press_button(u"clear_filter"_s);
    EXPECT_FALSE(naming());
    EXPECT_EQ(saved().findText(u"Sheep"_s), -1);
}

TEST_F(SavedFilterBarTest, AFilterThatCannotBeRecalledLeavesTheOneOfTheScreenInItsPlace)
{
    keep_two();
    const auto shown = panel().filter();
    const auto fail = [&](const QString& words) {
        place.dialogue.expect_box(words);
        saved().setFocus();
        press(window(), Qt::Key_Down);
        EXPECT_EQ(saved().currentText(), u"Choir"_s) << words.toStdString();
        EXPECT_EQ(panel().filter(), shown);
    };
    desk().office.rights.set(core::Area::birth_dates, false);
    fail(u"Your password does not give access to \"Birth Dates Access\""_s);
    place.in_database(u"ALTER TABLE [tbl_filter_memory] RENAME TO [away];"_s);
    fail(u"The database could not be read or written."_s);
    place.in_database(u"ALTER TABLE [away] RENAME TO [tbl_filter_memory];"_s);
    press_button(u"save_filter"_s);
    desk().office.rights = core::Rights::all();
    EXPECT_NE(kept(u"Zion"_s), shown);
    lose(u"Zion"_s);
    fail(u"Unable to use this filter as another user has removed it"_s);
    EXPECT_EQ(saved().findText(u"Zion"_s), -1);
}

TEST_F(SavedFilterBarTest, AFilterThatAnotherUserRemovedStandsThereUnderNoName)
{
    const auto why = u"Unable to %1 this filter as another user has removed or renamed it"_s;
    const std::initializer_list<std::function<void()>> ways{
        [&] { panel().reload(); },
        [&] {
            place.dialogue.expect_box(why.arg(u"save"_s));
            press_button(u"save_filter"_s);
        },
        [&] {
            place.dialogue.expect_confirm(u"Are you sure that you wish to delete the filter 'Zion'?"_s,
                                          core::Answer::yes);
            place.dialogue.expect_box(why.arg(u"remove"_s));
            press_button(u"remove_filter"_s);
        }};
    for (const auto& notice : ways) {
        keep_two();
        saved().setFocus();
        press(window(), Qt::Key_Down);
        const auto shown = panel().filter();
        lose_to_easter(u"Zion"_s);
        notice();
        EXPECT_EQ(saved().currentText(), u"(not saved)"_s);
        EXPECT_EQ(saved().itemText(2), u"Easter"_s);
        EXPECT_EQ(kept(u"Easter"_s), easter);
        saved().setFocus();
        press(window(), Qt::Key_Down);
        EXPECT_EQ(saved().currentText(), u"Choir"_s);
        press(window(), Qt::Key_Up);
        EXPECT_EQ(panel().filter(), shown);
        lose(u"Choir"_s);
        lose(u"Easter"_s);
        press_button(u"clear_filter"_s);
    }
}

TEST_F(SavedFilterBarTest, AChangeToAFilterThatAnotherUserRemovedIsSavedUnderANewName)
{
    save_as(u"Choir"_s);
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    lose_to_easter(u"Choir"_s);
    place.dialogue.expect_box(u"Unable to save this filter as another user has removed or renamed it"_s);
    press_button(u"save_filter"_s);
    EXPECT_EQ(saved().currentText(), u"(not saved)"_s);
    press_button(u"save_filter"_s);
    type(window(), u"Singers"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(kept(u"Singers"_s), panel().filter());
    EXPECT_EQ(kept(u"Easter"_s), easter);
}

} // namespace kindrel::test
