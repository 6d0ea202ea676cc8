#include "desktop/editor_fixture.h"
#include "desktop/people/card_list_view.h"
#include "desktop/people/family_card.h"
#include "desktop/shell/rail.h"

#include <QComboBox>
#include <QTabWidget>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;
using core::Area;

namespace {

const QString leave_question = u"This file has been altered."_s;
const QString no_surname = u"You need to enter a surname before attempting to save a file. Do you wish to exit the "
                           "family editor without saving the file?"_s;

people::FamilyFile listed_full_family()
{
    auto file = full_family(false);
    file.family.Condition = people::FileStatus::active;
    return file;
}

class EditorPageTest : public EditorTest
{
protected:
    void open_naismith(people::FamilyFile file = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Kit"_s}))
    {
        begin_with({std::move(file), family(u"Nash"_s, {u"Carl"_s})});
        open(u"nais"_s);
    }
    [[nodiscard]] int tab() { return child<QTabWidget>(page(), u"editor_tabs"_s).currentIndex(); }
};

} // namespace

TEST_F(EditorPageTest, DeleteRemovesTheChosenPersonAfterAskingButNeverThePrimary)
{
    open_naismith();
    place.dialogue.expect_confirm(u"Please confirm you wish to delete Ben from the family file"_s, Answer::yes,
                                  Answer::no);
    choose(u"adults"_s, 1);
    press(window(), Qt::Key_Delete);
    EXPECT_EQ(names(u"adults"_s), QStringList(u"Ann"_s));

    choose(u"adults"_s, 0);
    place.dialogue.expect_box(u"Unable to remove the primary person in this family file, if you wish to remove this "
                              "person then move another person into the primary position then remove them."_s);
    press(window(), Qt::Key_Delete);
    EXPECT_EQ(names(u"adults"_s), QStringList(u"Ann"_s));
    EXPECT_EQ(names(u"children"_s), QStringList(u"Kit"_s));
}

TEST_F(EditorPageTest, ThePeopleAreMovedWithAltAndTheArrows)
{
    open_naismith();
    choose(u"adults"_s, 1);
    alt(Qt::Key_Up);
    EXPECT_EQ(names(u"adults"_s), QStringList({u"Ben"_s, u"Ann"_s}));
    EXPECT_EQ(child<QListWidget>(page(), u"adults"_s).currentRow(), 0);
    place.dialogue.expect_box(u"Unable to move this person any higher within the family file"_s);
    alt(Qt::Key_Up);
    control(Qt::Key_S);
    EXPECT_EQ(read(0).people.front().Name, u"Ben"_s);
}

TEST_F(EditorPageTest, OnePersonIsChosenInBothListsTogether)
{
    open_naismith();
    choose(u"children"_s, 0);
    EXPECT_TRUE(child<QListWidget>(page(), u"adults"_s).selectedItems().isEmpty());
    press(window(), Qt::Key_Return);
    EXPECT_EQ(in_focus(), u"Name"_s);
    EXPECT_EQ(line(u"Name"_s).text(), u"Kit"_s);
    choose(u"adults"_s, 1);
    EXPECT_TRUE(child<QListWidget>(page(), u"children"_s).selectedItems().isEmpty());
    EXPECT_EQ(line(u"Name"_s).text(), u"Ben"_s);
}

TEST_F(EditorPageTest, InsertLeadsToTheLineThatAddsAndEnterStaysInIt)
{
    open_naismith();
    choose(u"children"_s, 0);
    press(window(), Qt::Key_Insert);
    for (const auto& name : {u"Lea"_s, u"Max"_s}) {
        type(window(), name);
        press(window(), Qt::Key_Return);
        EXPECT_EQ(in_focus(), u"add_child"_s);
    }
    EXPECT_EQ(names(u"children"_s), QStringList({u"Kit"_s, u"Lea"_s, u"Max"_s}));
}

TEST_F(EditorPageTest, AReadOnlyPasswordShowsEverythingAndChangesNothing)
{
    begin_with({listed_full_family()});
    desk().office.rights.set(Area::read_only_family_data, true);
    open({});
    EXPECT_TRUE(page().title().endsWith(u"(Read Only Access)"_s));
    EXPECT_TRUE(child<QWidget>(page(), u"read_only_strip"_s).isVisible());
    auto& tabs = child<QTabWidget>(page(), u"editor_tabs"_s);
    for (int tab = 0; tab < 2; ++tab) {
        tabs.setCurrentIndex(tab);
        for (const QLineEdit* field : tabs.currentWidget()->findChildren<QLineEdit*>())
            EXPECT_TRUE(field->isReadOnly()) << field->objectName().toStdString();
        for (const QAbstractButton* button : tabs.currentWidget()->findChildren<QAbstractButton*>())
            EXPECT_FALSE(button->isVisible() && button->isEnabled()) << button->objectName().toStdString();
    }
    EXPECT_TRUE(line(u"surname"_s).isReadOnly());
    EXPECT_TRUE(line(u"add_adult"_s).isReadOnly());
    place.dialogue.expect_box(u"Unable to delete this family file as you only have read only access within family "
                              "files"_s);
    choose_in_menu(Qt::Key_D);
    EXPECT_FALSE(page().altered());
}

TEST_F(EditorPageTest, ARefusedSavePutsTheCursorIntoTheGuiltyField)
{
    open_naismith();
    struct Case
    {
        QString field, typed, refusal, guilty;
        int tab;
    };
    const std::vector<Case> cases{
        {u"res_street"_s, u"1 High Street"_s, u"You need to enter the address suburb before saving this file"_s,
         u"res_suburb"_s, 0},
        {u"post_street"_s, u"PO Box 7"_s, u"You need to enter the postal address suburb before saving this file"_s,
         u"post_suburb"_s, 0},
    };
    for (const auto& [field, typed, refusal, guilty, guilty_tab] : cases) {
        alt(Qt::Key_F);
        fill(field, typed);
        alt(Qt::Key_P);
        place.dialogue.expect_box(refusal);
        control(Qt::Key_S);
        EXPECT_EQ(tab(), guilty_tab);
        EXPECT_EQ(in_focus(), guilty);
        fill(guilty, u"suburb 1"_s);
    }
    fill(u"surname"_s, u" "_s);
    place.dialogue.expect_confirm(no_surname, Answer::no, Answer::no);
    control(Qt::Key_S);
    EXPECT_EQ(in_focus(), u"surname"_s);
    type(window(), u"Nye"_s);
    control(Qt::Key_S);
    EXPECT_EQ(read(0).family.surname, u"Nye"_s);
    EXPECT_EQ(read(0).address.post_street, u"PO Box 7"_s);
}

TEST_F(EditorPageTest, ExitingWithoutSavingClosesThePage)
{
    open_naismith();
    fill(u"surname"_s, u" "_s);
    place.dialogue.expect_confirm(no_surname, Answer::yes);
    control(Qt::Key_S);
    EXPECT_FALSE(is_open());
    EXPECT_EQ(read(0).family.surname, u"Naismith"_s);
}

TEST_F(EditorPageTest, UndoTakesBackFieldByFieldWhereverTheCursorIs)
{
    open_naismith();
    fill(u"phone"_s, u"5550 1234"_s);
    fill(u"family_email"_s, u"ann@example.org"_s);
    choose(u"adults"_s, 1);
    alt(Qt::Key_Up);
    control(Qt::Key_Z);
    EXPECT_EQ(names(u"adults"_s), QStringList({u"Ann"_s, u"Ben"_s}));
    line(u"family_email"_s).setFocus();
    control(Qt::Key_Z);
    EXPECT_EQ(line(u"family_email"_s).text(), QString());
    EXPECT_EQ(line(u"phone"_s).text(), u"5550 1234"_s);
    control(Qt::Key_Z);
    EXPECT_FALSE(page().altered());
}

TEST_F(EditorPageTest, APersonsDataIsTypedForThePersonWhoIsChosen)
{
    open_naismith();
    choose(u"children"_s, 0);
    press(window(), Qt::Key_Return);
    fill(u"birthdate"_s, u"12/3/XXXX"_s);
    press(window(), Qt::Key_Tab);
    EXPECT_EQ(line(u"birthdate"_s).text(), u"12/03/XXXX"_s);
    place.dialogue.expect_box(u"You are unable to enter a zero value here, if you want to represent a year before a "
                              "person reaches year one level, for example, preps, enter a negative number, for example "
                              "-1. Automatic increment skips zero: it moves people from -1 straight to 1. Kinder is "
                              "-2."_s);
    fill(u"school_year"_s, u"0"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(in_focus(), u"school_year"_s);
    fill(u"school_year"_s, u"-1"_s);
    fill(u"mobile_phone"_s, u"0400 1"_s);
    control(Qt::Key_H);
    child<QAbstractButton>(page(), u"Privacy"_s).click();
    EXPECT_EQ(names(u"children"_s), QStringList(u"Kit (Privacy)"_s));
    control(Qt::Key_S);

    const people::Person kit = read(0).people.at(2);
    EXPECT_EQ(kit.birthdate, (core::Date{core::Date::unknown_year, 3, 12}));
    EXPECT_EQ(kit.school_year, -1);
    EXPECT_EQ(kit.mobile_phone, u"0400 1"_s);
    EXPECT_TRUE(kit.mobile_hidden);
    EXPECT_TRUE(kit.Privacy);
    EXPECT_EQ(read(0).people.at(0).mobile_phone, QString());
}

TEST_F(EditorPageTest, ADateThatIsNoneIsToldAndKeepsTheFileFromBeingSaved)
{
    open_naismith();
    choose(u"adults"_s, 0);
    press(window(), Qt::Key_Return);
    fill(u"birthdate"_s, u"31/2/2000"_s);
    place.dialogue.expect_box(u"Incorrect format."_s);
    control(Qt::Key_S);
    EXPECT_EQ(in_focus(), u"birthdate"_s);
    EXPECT_NE(page().status(), u"Saved"_s);
    type(window(), u"t"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(line(u"birthdate"_s).text(), u"15/05/2024"_s);
}

TEST_F(EditorPageTest, ASuburbIsFoundByAPartOfItAndItsPostcodeMayDiffer)
{
    open_naismith();
    place.in_database(u"UPDATE [tbl_suburb_setup] SET [suburb]='Mosman',[postcode]='2088' WHERE [suburb_id]=2;"_s);
    open(u"nais"_s);
    fill(u"res_suburb"_s, u"mosm"_s);
    press(window(), Qt::Key_Tab);
    EXPECT_EQ(line(u"res_suburb"_s).text(), u"Mosman"_s);
    EXPECT_EQ(line(u"res_postcode"_s).text(), u"2088"_s);
    fill(u"res_postcode"_s, u"2089"_s);
    control(Qt::Key_S);
    ASSERT_TRUE(read(0).residential);
    EXPECT_EQ(read(0).residential->suburb_id, 2);
    EXPECT_EQ(read(0).residential->postcode_var, u"2089"_s);

    QTest::mouseClick(&child<QAbstractButton>(page(), u"copy_residential"_s), Qt::LeftButton);
    control(Qt::Key_S);
    ASSERT_TRUE(read(0).postal);
    EXPECT_EQ(read(0).postal->Type, people::SuburbType::postal);
    EXPECT_EQ(read(0).postal->shown_postcode(), u"2089"_s);
}

TEST_F(EditorPageTest, AnUnknownSuburbIsOfferedToBeAdded)
{
    open_naismith();
    fill(u"res_suburb"_s, u"Nowhere"_s);
    press(window(), Qt::Key_Tab);
    EXPECT_EQ(line(u"res_suburb"_s).text(), QString());
    EXPECT_EQ(note(), u"\u201cNowhere\u201d is none of the suburbs, or the beginning of several."_s);
    place.in_database(u"DELETE FROM [tbl_suburb_setup];"_s);
    control(Qt::Key_1);
    control(Qt::Key_2);
    place.dialogue.expect_box(u"To enter a suburb to this family file you first need to enter all the suburbs in your "
                              "area in the family file setup area of Kindrel"_s);
    line(u"res_suburb"_s).setFocus();
    press(window(), Qt::Key_Down);
}

TEST_F(EditorPageTest, AFamilyThatMayExistAlreadyIsNamedAndCanBeLookedAt)
{
    auto nash = family(u"Nash"_s, {u"Carl"_s});
    nash.address.phone = u"5550 1234"_s;
    begin_with({nash});
    control(Qt::Key_N);
    type(window(), u"Somebody"_s);
    fill(u"phone"_s, u"55501234"_s);
    press(window(), Qt::Key_Tab);
    EXPECT_EQ(note(), u"This may be the family Nash, Carl: the same phone 55501234."_s);
    take_offer();
    ASSERT_EQ(desk().windows.all<desktop::FamilyCard>().size(), 1U);
    EXPECT_EQ(desk().windows.all<desktop::FamilyCard>()[0]->surname_id(), stored[0].family.Surname_ID);
}

TEST_F(EditorPageTest, LeavingAsksAndDoesAsItIsTold)
{
    struct Case
    {
        std::optional<bool> answer;
        bool stays;
        QString stored;
    };
    begin_with({family(u"Naismith"_s, {u"Ann"_s})});
    for (const auto& [answer, stays, phone] :
         {Case{std::nullopt, true, {}}, Case{false, false, {}}, Case{true, false, u"5550 1234"_s}}) {
        open(u"nais"_s);
        fill(u"phone"_s, u"5550 1234"_s);
        place.dialogue.expect_confirm_or_cancel(leave_question, answer);
        control(Qt::Key_W);
        EXPECT_EQ(is_open(), stays);
        EXPECT_EQ(read(0).address.phone, phone);
    }
}

TEST_F(EditorPageTest, AFamilyHeldElsewhereIsToldAndNoEditorStaysOpen)
{
    begin_with({family(u"Naismith"_s, {u"Ann"_s})});
    desk().office.mode = core::Mode::network;
    place.in_database(
        u"INSERT INTO [tbl_locked_family_files] ([surname_id]) VALUES (%1);"_s.arg(stored[0].family.Surname_ID));
    place.dialogue.expect_box(u"Unable to enter this family file another user is currently editing the family file."_s);
    open(u"nais"_s);
    settle();
    EXPECT_FALSE(is_open());
    EXPECT_FALSE(window().page_of(u"editor"_s));
}

TEST_F(EditorPageTest, TheRailShowsTheLockAndTheUnsavedWork)
{
    begin_with({family(u"Naismith"_s, {u"Ann"_s})});
    desk().office.mode = core::Mode::network;
    open(u"nais"_s);
    auto& button = child<desktop::RailButton>(window(), u"editor"_s);
    EXPECT_TRUE(button.marks().locked);
    EXPECT_FALSE(button.marks().altered);
    fill(u"phone"_s, u"5"_s);
    EXPECT_TRUE(button.marks().altered);
    control(Qt::Key_Z);
    control(Qt::Key_W);
    EXPECT_FALSE(button.marks().locked);
    EXPECT_FALSE(session().select(u"SELECT [surname_id] FROM [tbl_locked_family_files];"_s).first());
}

TEST_F(EditorPageTest, WhatAPasswordDoesNotOpenIsNotThere)
{
    begin_with({listed_full_family()});
    desk().office.rights.set(Area::birth_dates, false);
    desk().office.rights.set(Area::full_financial, false);
    desk().office.rights.set(Area::pin_financial_only, false);
    open({});
    EXPECT_FALSE(page().findChild<QLineEdit*>(u"birthdate"_s));
    EXPECT_FALSE(page().findChild<QLineEdit*>(u"personal_pin"_s));
    EXPECT_TRUE(page().findChild<QLineEdit*>(u"mobile_phone"_s));
}

TEST_F(EditorPageTest, AClosedSectionSaysSoInPlaceOfItsFields)
{
    auto file = listed_full_family();
    file.access.Address = false;
    begin_with({file});
    open({});
    EXPECT_FALSE(line(u"phone"_s).isVisible());
    EXPECT_TRUE(visible_texts(page()).contains(desktop::closed_words()));
}

TEST_F(EditorPageTest, AFreePinIsLookedForAndAnotherHolderFound)
{
    auto naismith = family(u"Naismith"_s, {u"Ann"_s});
    auto nash = family(u"Nash"_s, {u"Carl"_s});
    nash.people[0].personal_pin = u"7"_s;
    begin_with({naismith, nash});
    place.in_database(u"UPDATE [tbl_startup] SET [pin_auto_number_start]=7;"_s);
    open(u"nais"_s);
    alt(Qt::Key_P);
    child<QAbstractButton>(page(), u"new_pin"_s).click();
    EXPECT_EQ(line(u"personal_pin"_s).text(), u"8"_s);
    fill(u"personal_pin"_s, u"007"_s);
    EXPECT_EQ(line(u"personal_pin"_s).text(), u"7"_s);
    place.dialogue.expect_box(u"Caution: This P.I.N. is in use by another person and cannot be used."_s);
    child<QAbstractButton>(page(), u"check_pin"_s).click();
}

} // namespace kindrel::test
