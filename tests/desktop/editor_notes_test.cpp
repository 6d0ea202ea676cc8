#include "desktop/editor_bench_fixture.h"
#include "desktop/people/editor_tabs.h"
#include "people/person_files.h"
#include "support/families.h"

#include <QPlainTextEdit>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

class EditorNotesTest : public EditorBenchTest
{
protected:
    EditorNotesTest() { open(family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s})); }
    [[nodiscard]] QPlainTextEdit& page(const QString& name) { return child<QPlainTextEdit>(*tab, name); }
    void write(const QString& name, const QString& text)
    {
        page(name).setFocus();
        type(*tab, text);
    }
    [[nodiscard]] QString family_notes()
    {
        return people::read_notebook(desk().office.paths, people::notebook_of_family(file().family.Surname_ID));
    }
    [[nodiscard]] QString notes_of(std::size_t number)
    {
        return people::read_notebook(desk().office.paths,
                                     people::notebook_of_person(stored.front().people[number].person_id));
    }
    [[nodiscard]] bool can_be_seen(const QString& name)
    {
        const auto* found = tab->findChild<QWidget*>(name);
        return found && found->isVisibleTo(tab.get());
    }
};

} // namespace

TEST_F(EditorNotesTest, NotesAreSavedByTheirButton)
{
    show(desktop::make_notes_tab);
    write(u"family_notes"_s, u"Likes the choir."_s);
    EXPECT_TRUE(visible_texts(*tab).contains(u"not saved"_s));
    EXPECT_EQ(family_notes(), QString());
    click(u"save_notes"_s);
    EXPECT_EQ(family_notes(), u"Likes the choir."_s);
    EXPECT_FALSE(visible_texts(*tab).contains(u"not saved"_s));
}

TEST_F(EditorNotesTest, NotesAreSavedWhenTheTabIsLeftAndWhenAnotherPersonIsChosen)
{
    show(desktop::make_notes_tab);
    write(u"person_notes"_s, u"About Ann"_s);
    bench->choose_person(1);
    EXPECT_EQ(page(u"person_notes"_s).toPlainText(), QString());
    EXPECT_EQ(notes_of(0), u"About Ann"_s);
    write(u"person_notes"_s, u"About Ben"_s);
    tab->hide();
    EXPECT_EQ(notes_of(1), u"About Ben"_s);
    EXPECT_EQ(notes_of(0), u"About Ann"_s);
}

TEST_F(EditorNotesTest, AnAlteredFamilyIsOfferedForSavingOnlyOnceTheNotebookIsAskedFor)
{
    bench->editor.change(u"phone"_s, [](people::FamilyFile& changed) { changed.address.phone = u"555 1234"_s; });
    show(desktop::make_notes_tab);
    EXPECT_FALSE(can_be_seen(u"family_notes"_s));
    place.dialogue.expect_confirm_or_cancel(u"This file has been altered."_s, true);
    click(u"open_notebook"_s);
    EXPECT_TRUE(can_be_seen(u"family_notes"_s));
    EXPECT_FALSE(bench->editor.altered());
}

TEST_F(EditorNotesTest, ANewFamilyHasNoNotebookYet)
{
    ASSERT_TRUE(bench->editor.start_new());
    ASSERT_TRUE(bench->editor.add_adult(u"Cleo"_s));
    show(desktop::make_notes_tab);
    place.dialogue.expect_box(u"Unable to open the family Notebook until the family file is saved"_s);
    click(u"open_notebook"_s);
    EXPECT_FALSE(can_be_seen(u"family_notes"_s));
}

TEST_F(EditorNotesTest, NotesOfADeletedFamilyDoNotComeBack)
{
    show(desktop::make_notes_tab);
    const auto key = file().family.Surname_ID;
    write(u"family_notes"_s, u"Moved away."_s);
    place.dialogue.expect_confirm(u"Are you sure that you want to delete this file?"_s, core::Answer::yes);
    ASSERT_TRUE(bench->editor.remove_family());
    bench->show_again();
    tab->hide();
    EXPECT_EQ(people::read_notebook(desk().office.paths, people::notebook_of_family(key)), QString());
}

TEST_F(EditorNotesTest, EachPageNeedsItsRight)
{
    desk().office.rights.set(core::Area::family_file_notebook, false);
    show(desktop::make_notes_tab);
    EXPECT_FALSE(can_be_seen(u"family_notes"_s));
    EXPECT_TRUE(can_be_seen(u"person_notes"_s));
    desk().office.rights.set(core::Area::personal_notes_in_notebook, false);
    show(desktop::make_notes_tab);
    EXPECT_TRUE(visible_texts(*tab).contains(u"Your password does not open the notebook"_s));
}

TEST_F(EditorNotesTest, WithReadOnlyAccessNotesAreOnlyRead)
{
    people::write_notebook(desk().office.paths, people::notebook_of_family(file().family.Surname_ID), u"Old"_s);
    desk().office.rights.set(core::Area::read_only_family_data, true);
    show(desktop::make_notes_tab);
    write(u"family_notes"_s, u"New"_s);
    EXPECT_EQ(page(u"family_notes"_s).toPlainText(), u"Old"_s);
    EXPECT_FALSE(can_be_seen(u"save_notes"_s));
}

} // namespace kindrel::test
