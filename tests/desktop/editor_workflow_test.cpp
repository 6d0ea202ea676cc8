#include "desktop/editor_fixture.h"
#include "people/drafts.h"

#include <QComboBox>
#include <QDialog>
#include <QTabWidget>
#include <QTableView>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;

namespace {

constexpr int acts_for_a_visiting_family = 20;

class EditorWorkflowTest : public EditorTest
{
protected:
    /// A key that is not text.
    void act(Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        press(on ? *on : window(), key, modifiers);
        ++acts;
    }
    void write(const QString& text)
    {
        type(on ? *on : window(), text);
        settle();
    }

    QWidget* on = nullptr; ///< A dialog in front of the window.
    int acts = 0;
};

std::vector<people::FamilyFile> some_families()
{
    return {family(u"Adder"_s, {u"Una"_s}), family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Kit"_s}),
            family(u"Nash"_s, {u"Carl"_s})};
}

QStringList people_of(const people::FamilyFile& file)
{
    QStringList names;
    for (const auto& person : file.people)
        names += person.Name;
    return names;
}

} // namespace

TEST_F(EditorWorkflowTest, AVisitingFamilyOfFourIsTypedInTwentyActsWithoutTheMouse)
{
    begin_with({});
    act(Qt::Key_N, Qt::ControlModifier);
    write(u"Naismith"_s);
    act(Qt::Key_Tab);
    write(u"Ann"_s);
    act(Qt::Key_Return);
    write(u"Ben"_s);
    act(Qt::Key_Tab);
    write(u"Kit"_s);
    act(Qt::Key_Return);
    write(u"Lea"_s);
    act(Qt::Key_Tab);
    write(u"1 High Street"_s);
    act(Qt::Key_Tab);
    act(Qt::Key_Tab);
    write(u"suburb 2"_s);
    act(Qt::Key_H, Qt::AltModifier);
    write(u"5550 1234"_s);
    act(Qt::Key_Tab);
    write(u"ann@example.org"_s);
    act(Qt::Key_A, Qt::AltModifier);
    for (const auto letter : {Qt::Key_P, Qt::Key_R, Qt::Key_O}) // "Prospect" in the list of file statuses.
        act(letter);
    act(Qt::Key_G, Qt::AltModifier);
    act(Qt::Key_Insert);
    on = &child<QDialog>(page(), u"item_picker"_s);
    write(u"status 3"_s);
    act(Qt::Key_Return);
    on = nullptr;
    window().activateWindow(); // As every desktop does when the dialog is gone.
    settle();
    act(Qt::Key_S, Qt::ControlModifier);

    EXPECT_LE(acts, acts_for_a_visiting_family);
    EXPECT_EQ(page().status(), u"Saved"_s);
    const auto saved = people::load_family(session(), 1);
    ASSERT_TRUE(saved);
    EXPECT_EQ(saved->family.surname, u"Naismith"_s);
    EXPECT_EQ(saved->family.Condition, people::FileStatus::prospect);
    EXPECT_EQ(people_of(*saved), QStringList({u"Ann"_s, u"Ben"_s, u"Kit"_s, u"Lea"_s}));
    EXPECT_EQ(saved->people[1].Marital, 4);
    EXPECT_EQ(saved->address.res_street, u"1 High Street"_s);
    ASSERT_TRUE(saved->residential);
    EXPECT_EQ(saved->residential->suburb, u"suburb 2"_s);
    EXPECT_EQ(saved->address.phone, u"5550 1234"_s);
    EXPECT_EQ(saved->address.family_email, u"ann@example.org"_s);
    const auto carries_status = [](const people::Person& person) {
        return person.status.size() == 1 && person.status[0].item == 3;
    };
    EXPECT_EQ(std::ranges::count_if(saved->people, carries_status), 1);
}

TEST_F(EditorWorkflowTest, AFamilyIsFoundAgainChangedAndSaved)
{
    begin_with(some_families());
    open(u"nais"_s);
    EXPECT_EQ(page().title(), u"Naismith Family File"_s);
    alt(Qt::Key_H);
    type(window(), u"5550 4321"_s);
    EXPECT_TRUE(page().altered());
    control(Qt::Key_S);

    EXPECT_FALSE(page().altered());
    EXPECT_EQ(read(1).address.phone, u"5550 4321"_s);
    EXPECT_EQ(people_of(read(1)), QStringList({u"Ann"_s, u"Ben"_s, u"Kit"_s}));
}

TEST_F(EditorWorkflowTest, AChildGetsAFamilyFileOfItsOwnFromTheMenu)
{
    begin_with(some_families());
    open(u"nais"_s);
    choose(u"children"_s, 0);
    place.dialogue.expect_box(u"Kit has now been transferred to a new family file."_s);
    choose_in_menu(Qt::Key_N);

    EXPECT_EQ(names(u"children"_s), QStringList());
    EXPECT_EQ(note(), u"Kit has a family file of their own now."_s);
    EXPECT_EQ(people_of(read(1)), QStringList({u"Ann"_s, u"Ben"_s}));
    const auto founded = people::load_family(session(), 4);
    ASSERT_TRUE(founded);
    EXPECT_EQ(people_of(*founded), QStringList(u"Kit"_s));
}

TEST_F(EditorWorkflowTest, AFamilyIsDeletedAfterAsking)
{
    begin_with(some_families());
    open(u"nais"_s);
    place.dialogue.expect_confirm(u"Are you sure that you want to delete this file?"_s, Answer::no, Answer::no);
    choose_in_menu(Qt::Key_D);
    EXPECT_EQ(people_of(read(1)).size(), 3);

    place.dialogue.expect_confirm(u"Are you sure that you want to delete this file?"_s, Answer::yes);
    choose_in_menu(Qt::Key_D);
    EXPECT_EQ(people_of(read(1)).size(), 0);
    EXPECT_EQ(page().title(), u"New File"_s);
    EXPECT_EQ(note(), u"The Naismith family was deleted."_s);
    control(Qt::Key_1);
    line(u"filter"_s).clear();
    EXPECT_EQ(child<QTableView>(window(), u"families"_s).model()->rowCount(), 2);
}

TEST_F(EditorWorkflowTest, WorkThatWasNotSavedIsOfferedAtTheNextStart)
{
    begin_with(some_families());
    people::Draft draft{.stored = read(1), .typed = read(1), .kept = place.clock.now()};
    draft.typed.address.phone = u"5550 4321"_s;
    people::Drafts(desk().office).keep(draft);
    begin_again();
    EXPECT_EQ(note(), u"Work on the Naismith family was not saved; it was kept on 15/05/2024 at 10:30."_s);
    take_offer();

    ASSERT_TRUE(is_open());
    EXPECT_EQ(line(u"phone"_s).text(), u"5550 4321"_s);
    EXPECT_TRUE(page().altered());
    control(Qt::Key_S);
    EXPECT_EQ(read(1).address.phone, u"5550 4321"_s);
    begin_again();
    EXPECT_EQ(note(), QString());
}

TEST_F(EditorWorkflowTest, PreviousAndNextTurnThroughTheListOneCameFrom)
{
    begin_with(some_families());
    open(u"na"_s);
    EXPECT_EQ(page().title(), u"Naismith Family File"_s);
    control(Qt::Key_PageDown);
    EXPECT_EQ(page().title(), u"Nash Family File"_s);
    place.dialogue.expect_box(u"Unable to move up as this is the last family file within Active Families"_s);
    control(Qt::Key_PageDown);
    control(Qt::Key_PageUp);
    place.dialogue.expect_box(u"Unable to move down as this is the first family file within Active Families"_s);
    control(Qt::Key_PageUp);
    EXPECT_EQ(page().title(), u"Naismith Family File"_s);
}

} // namespace kindrel::test
