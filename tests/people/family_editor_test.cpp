#include "people/editor_fixture.h"

#include "people/family_checks.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;
using core::Area;
using people::FamilyEditor;
using people::FamilyFile;
using people::FileAccess;
using people::Saved;

namespace {

const QString held_text = u"Unable to enter this family file another user is currently editing the family file."_s;
const QString gone_text =
    u"Unable to access this family file because another user has removed it from the database. The program is now "
    "entering the family editor in new file mode."_s;
const QString full_text = u"Unable to add any more people to this family file"_s;

class FamilyEditorTest : public EditorTest
{
};
KINDREL_ON_BOTH_ENGINES(FamilyEditorTest);

} // namespace

TEST_P(FamilyEditorTest, ANewFamilyIsTypedSavedAndHeld)
{
    FamilyEditor editor(office());
    EXPECT_EQ(editor.caption(), u"New File ");
    type_surname(editor, u"Naismith"_s);
    ASSERT_TRUE(editor.add_adult(u" Ann "_s));
    ASSERT_TRUE(editor.add_adult(u"Ben"_s));
    ASSERT_TRUE(editor.add_child(u"Cy"_s));
    EXPECT_TRUE(editor.altered());
    ASSERT_EQ(editor.save(), Saved::yes);

    EXPECT_FALSE(editor.altered());
    EXPECT_EQ(editor.caption(), u"Naismith Family File");
    const auto file = stored(editor.file().family.Surname_ID);
    EXPECT_EQ(names(file), QStringList({u"Ann"_s, u"Ben"_s, u"Cy"_s}));
    EXPECT_EQ(file.family.Primary_name, u"Ann");
    EXPECT_EQ(file.family.created, core::Date::from(office().clock.today()));
    // Two adults who are typed one after the other are married, and the child makes them parents.
    EXPECT_EQ(file.people[0].Marital, 4);
    EXPECT_EQ(file.people[1].Marital, 4);
    EXPECT_EQ(file.people[2].Marital, 6);
    EXPECT_EQ(locks(file.family.Surname_ID), 1);
    ASSERT_TRUE(editor.leave());
    EXPECT_EQ(locks(file.family.Surname_ID), 0);
}

TEST_P(FamilyEditorTest, AFamilyIsEditedByOneWorkstationAtATime)
{
    const int key = add(u"Naismith"_s, {u"Ann"_s});
    SetupOffice other(*church);
    other.workstation.machine = u"office-2"_s;
    FamilyEditor theirs(other.office);
    ASSERT_TRUE(theirs.open(key));

    FamilyEditor mine(office());
    dialogue().expect_box(
        held_text, u"To insure the integrity of your data files a user is not allowed to edit a family file "
                   "while another user is in the family file you wish to enter.\n"
                   "Family file 'Naismith, Ann' is held by the workstation 'office-2' since 10:30 on 15/05/2024."_s);
    EXPECT_FALSE(mine.open(key));
    EXPECT_TRUE(mine.is_new());
    ASSERT_TRUE(theirs.leave());
    EXPECT_TRUE(mine.open(key));
}

TEST_P(FamilyEditorTest, AFamilyThatIsGoneOpensANewFile)
{
    const int key = add(u"Naismith"_s, {u"Ann"_s});
    people::remove_family_rows(session(), key);
    FamilyEditor editor(office());
    dialogue().expect_box(gone_text);
    EXPECT_TRUE(editor.open(key));
    EXPECT_TRUE(editor.is_new());
    EXPECT_EQ(locks(key), 0);
}

TEST_P(FamilyEditorTest, NextAndPreviousStopAtTheEndsAndAtLocks)
{
    const int adams = add(u"Adams"_s, {u"Ann"_s});
    const int brown = add(u"Brown"_s, {u"Ben"_s});
    const int clark = add(u"Clark"_s, {u"Cy"_s});
    FamilyEditor editor(office());
    ASSERT_TRUE(editor.open(adams));
    dialogue().expect_box(u"Unable to move down as this is the first family file within Kindrel"_s);
    EXPECT_FALSE(editor.previous());
    ASSERT_TRUE(editor.next());
    EXPECT_EQ(editor.file().family.Surname_ID, brown);
    EXPECT_EQ(locks(adams), 0);
    EXPECT_EQ(locks(brown), 1);

    SetupOffice other(*church);
    FamilyEditor theirs(other.office);
    ASSERT_TRUE(theirs.open(clark));
    dialogue().expect_box(
        u"Unable to move to this family file as another user is presently editing that family file"_s);
    EXPECT_FALSE(editor.next());
    EXPECT_EQ(editor.file().family.Surname_ID, brown);
    EXPECT_EQ(locks(brown), 1);
    ASSERT_TRUE(theirs.leave());

    ASSERT_TRUE(editor.next());
    dialogue().expect_box(u"Unable to move up as this is the last family file within Kindrel"_s);
    EXPECT_FALSE(editor.next());
    EXPECT_EQ(editor.file().family.Surname_ID, clark);

    editor.walk({brown, adams}, u"the list"_s);
    ASSERT_TRUE(editor.open(brown));
    dialogue().expect_box(u"Unable to move down as this is the first family file within the list"_s);
    EXPECT_FALSE(editor.previous());
    EXPECT_TRUE(editor.next());
}

TEST_P(FamilyEditorTest, AStepPassesOverFamiliesThatAreGoneAndNeverWraps)
{
    const int adams = add(u"Adams"_s, {u"Ann"_s});
    const int brown = add(u"Brown"_s, {u"Ben"_s});
    const int clark = add(u"Clark"_s, {u"Cy"_s});
    FamilyEditor editor(office());
    editor.walk({adams, brown, clark}, u"the list"_s);
    ASSERT_TRUE(editor.open(adams));
    people::remove_family_rows(session(), brown);
    ASSERT_TRUE(editor.next());
    EXPECT_EQ(editor.file().family.Surname_ID, clark);

    ASSERT_TRUE(editor.open(adams));
    people::remove_family_rows(session(), clark);
    dialogue().expect_box(u"Unable to move up as this is the last family file within the list"_s);
    EXPECT_FALSE(editor.next());
    EXPECT_EQ(editor.file().family.Surname_ID, adams);
    EXPECT_EQ(locks(adams), 1);
    EXPECT_EQ(locks(clark), 0);
}

TEST_P(FamilyEditorTest, AnEmptyRegisterHasNoNextFamily)
{
    FamilyEditor editor(office());
    dialogue().expect_box(u"Unable to move to a new file as no family records exist within Kindrel"_s);
    EXPECT_FALSE(editor.next());
}

TEST_P(FamilyEditorTest, LeavingAnAlteredFileAsksAndEachAnswerHolds)
{
    const int key = add(u"Naismith"_s, {u"Ann"_s});
    FamilyEditor editor(office());
    ASSERT_TRUE(editor.open(key));
    type_phone(editor, u"5550 1111"_s);
    dialogue().expect_confirm_or_cancel(altered_question, std::nullopt);
    EXPECT_FALSE(editor.leave());
    EXPECT_EQ(editor.file().address.phone, u"5550 1111");
    dialogue().expect_confirm_or_cancel(altered_question, true);
    EXPECT_TRUE(editor.start_new());
    EXPECT_EQ(stored(key).address.phone, u"5550 1111");

    ASSERT_TRUE(editor.open(key));
    type_phone(editor, u"5550 2222"_s);
    dialogue().expect_confirm_or_cancel(altered_question, false);
    EXPECT_TRUE(editor.leave());
    EXPECT_EQ(stored(key).address.phone, u"5550 1111");
    EXPECT_EQ(locks(key), 0);
}

TEST_P(FamilyEditorTest, SaveChecksComeInTheirOrder)
{
    FamilyEditor editor(office());
    editor.change({}, [](FamilyFile& file) { file.address.res_street = u"3 Mill Lane"_s; });
    dialogue().expect_confirm(u"You need to enter a surname before attempting to save a file. Do you wish to exit the "
                              "family editor without saving the file?"_s,
                              Answer::no, Answer::no);
    EXPECT_EQ(editor.save(), Saved::no);
    EXPECT_EQ(editor.guilty(), people::SaveRefusal::Where::surname);

    type_surname(editor, u"Naismith"_s);
    dialogue().expect_box(u"Unable to save this file until you enter some people in it"_s);
    EXPECT_EQ(editor.save(), Saved::no);

    ASSERT_TRUE(editor.add_adult(u"  "_s));
    const auto unnamed = u"You need to enter at least one person's given name before attempting to save the file. Do "
                         "you wish to exit the family editor without saving the file?"_s;
    dialogue().expect_confirm(unnamed, Answer::no);
    EXPECT_EQ(editor.save(), Saved::no);

    const std::array addresses{
        std::pair{&FamilyFile::residential,
                  QStringList{u"You need to enter the address suburb before saving this file"_s,
                              u"You need to enter the address postcode before saving this file"_s}},
        std::pair{&FamilyFile::postal,
                  QStringList{u"You need to enter the postal address suburb before saving this file"_s,
                              u"You need to enter the postal postcode before saving this file"_s}}};
    editor.change({}, [](FamilyFile& file) {
        file.people.front().Name = u"Ann"_s;
        file.address.post_street = u"PO Box 3"_s;
    });
    for (const auto& [suburb, texts] : addresses) {
        dialogue().expect_box(texts[0]);
        EXPECT_EQ(editor.save(), Saved::no);
        const auto type = suburb == &FamilyFile::postal ? people::SuburbType::postal : people::SuburbType::residential;
        editor.change({},
                      [&](FamilyFile& file) { (file.*suburb).emplace().suburb_id = 2, (file.*suburb)->Type = type; });
        dialogue().expect_box(texts[1]);
        EXPECT_EQ(editor.save(), Saved::no);
        editor.change({}, [&](FamilyFile& file) { (file.*suburb)->postcode_var = u"3000"_s; });
    }
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_surname];"_s), 0);
    EXPECT_EQ(editor.save(), Saved::yes);
}

TEST_P(FamilyEditorTest, YesToLeavingWithoutSavingDropsTheFile)
{
    const int key = add(u"Naismith"_s, {u"Ann"_s});
    FamilyEditor editor(office());
    ASSERT_TRUE(editor.open(key));
    type_surname(editor, u" "_s);
    dialogue().expect_confirm(u"You need to enter a surname before attempting to save a file. Do you wish to exit the "
                              "family editor without saving the file?"_s,
                              Answer::yes);
    EXPECT_EQ(editor.save(), Saved::left);
    EXPECT_EQ(stored(key).family.surname, u"Naismith");
    EXPECT_EQ(locks(key), 0);
    EXPECT_FALSE(editor.altered());
}

TEST_P(FamilyEditorTest, AFamilyHoldsSeventeenPeople)
{
    FamilyEditor editor(office());
    type_surname(editor, u"Naismith"_s);
    for (int child = 0; child < people::most_people; ++child)
        ASSERT_TRUE(editor.add_child(u"Child %1"_s.arg(child)));
    dialogue().expect_box(full_text);
    EXPECT_FALSE(editor.add_child(u"One more"_s));
    ASSERT_EQ(editor.save(), Saved::yes);
    auto file = stored(editor.file().family.Surname_ID);
    EXPECT_EQ(file.people.size(), 17u);
    file.people.push_back(person(u"One more"_s));
    EXPECT_THROW((void)people::save_family(session(), file, office().clock.today()), std::logic_error);
}

TEST_P(FamilyEditorTest, WhatMustNeverBeStoredIsNotStored)
{
    auto nameless = family(u" "_s, {u"Ann"_s});
    auto empty = family(u"Naismith"_s, {});
    auto zero = family(u"Naismith"_s, {u"Ann"_s});
    zero.people.front().school_year = 0;
    for (const auto& file : {nameless, empty, zero})
        EXPECT_THROW((void)people::save_family(session(), file, office().clock.today()), std::logic_error);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_surname];"_s), 0);
}

TEST_P(FamilyEditorTest, ReadOnlyUsersLookAndChangeNothing)
{
    const int key = add(u"Naismith"_s, {u"Ann"_s, u"Ben"_s});
    office().rights.set(Area::read_only_family_data, true);
    FamilyEditor editor(office());
    ASSERT_TRUE(editor.open(key));
    EXPECT_EQ(editor.caption(), u"Naismith Family File (Read Only Access)");
    EXPECT_EQ(locks(key), 1);
    type_phone(editor, u"5550 1111"_s);
    EXPECT_FALSE(editor.altered());
    dialogue().expect_box(u"Unable to delete this family file as you only have read only access within family files"_s);
    EXPECT_FALSE(editor.remove_family());
    dialogue().expect_box(u"Unable to save this family file as you only have read only access within family files"_s);
    EXPECT_EQ(editor.save(), Saved::no);
    EXPECT_EQ(stored(key).people.size(), 2u);
}

TEST_P(FamilyEditorTest, FamiliesAreAddedAndOpenedWithTheRightAlone)
{
    const int key = add(u"Naismith"_s, {u"Ann"_s});
    office().rights.set(Area::add_family, false);
    FamilyEditor editor(office());
    dialogue().expect_box(u"Your password does not give access to \"Add Family\""_s);
    EXPECT_FALSE(editor.start_new());
    office().rights.set(Area::search_for_family, false);
    dialogue().expect_box(u"Your password does not give access to \"Search for Family\""_s);
    EXPECT_FALSE(editor.open(key));
}

TEST_P(FamilyEditorTest, ABookedOutFamilyIsShownAndNotChanged)
{
    const int key = add(u"Naismith"_s, {u"Ann"_s});
    session().execute(u"UPDATE [tbl_surname] SET [booked_out]=-1,[booked_out_person]='Ruth',"
                      "[booked_out_date]='2024-05-01';"_s);
    FamilyEditor editor(office());
    ASSERT_TRUE(editor.open(key));
    EXPECT_EQ(editor.access(), FileAccess::booked_out);
    EXPECT_EQ(editor.caption(),
              u"Naismith Family File (Booked out to Ruth on 01/05/2024) (Unable to Edit this Family file)");
    office().mode = core::Mode::booked_out;
    dialogue().expect_box(u"Unable to alter data while in Remote Access Mode"_s);
    EXPECT_EQ(editor.save(), Saved::no);
    session().execute(u"UPDATE [tbl_surname] SET [active_in_book]=-1;"_s);
    ASSERT_TRUE(editor.open(key));
    EXPECT_EQ(editor.access(), FileAccess::edit);
}

TEST_P(FamilyEditorTest, UndoGoesBackFieldByField)
{
    const int key = add(u"Naismith"_s, {u"Ann"_s});
    FamilyEditor editor(office());
    ASSERT_TRUE(editor.open(key));
    type_phone(editor, u"5"_s);
    type_phone(editor, u"55"_s);
    type_surname(editor, u"Smith"_s);
    ASSERT_TRUE(editor.add_adult(u"Ben"_s));
    editor.undo();
    EXPECT_EQ(names(editor.file()), QStringList({u"Ann"_s}));
    editor.undo();
    EXPECT_EQ(editor.file().family.surname, u"Naismith");
    editor.undo();
    EXPECT_TRUE(editor.file().address.phone.isEmpty());
    EXPECT_FALSE(editor.can_undo());
    EXPECT_FALSE(editor.altered());
}

} // namespace kindrel::test
