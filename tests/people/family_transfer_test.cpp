#include "people/editor_fixture.h"

#include "core/locks.h"
#include "people/person_files.h"
#include "support/processes.h"

#include <QFile>

#include <random>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;
using people::FamilyEditor;
using people::RowList;
using people::Saved;

namespace {

const QString needs_adult =
    u"Unable to move this person, as you must always have at least one person as the primary adult in the family."_s;

/// What a room above would ask, as a test sets it.
class FakeGuard : public core::PersonGuard
{
public:
    bool allows(core::Office&, core::PersonAct act, std::span<const int> people) const override
    {
        asked.push_back({act, {people.begin(), people.end()}});
        return answer;
    }
    mutable std::vector<std::pair<core::PersonAct, std::vector<int>>> asked;
    bool answer = false;
};

class FamilyTransferTest : public EditorTest
{
protected:
    void SetUp() override
    {
        EditorTest::SetUp();
        if (!church)
            return;
        key = add(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cy"_s, u"Di"_s}, 2);
        editor.emplace(office());
        ASSERT_TRUE(editor->open(key));
    }

    int key = 0;
    std::optional<FamilyEditor> editor;
};
KINDREL_ON_BOTH_ENGINES(FamilyTransferTest);

} // namespace

TEST_P(FamilyTransferTest, AChildFoundsAFamilyAtTheOldAddress)
{
    editor->change({}, [](people::FamilyFile& file) {
        file.address.res_street = u"3 Mill Lane"_s;
        file.residential = people::Suburb{2, people::SuburbType::residential, u"3001"_s, {}, {}};
        file.people[2].groups = {{1, {}, 0, {}, {}, false}};
        file.people[2].personal_pin = u"77"_s;
    });
    ASSERT_EQ(editor->save(), Saved::yes);
    const int cy = editor->file().people[2].person_id;
    dialogue().expect_box(u"Cy has now been transferred to a new family file."_s);
    ASSERT_TRUE(editor->transfer_to_new(2));

    EXPECT_EQ(names(stored(key)), QStringList({u"Ann"_s, u"Ben"_s, u"Di"_s}));
    EXPECT_EQ(stored(key).people[2].position, 3);
    const auto founded =
        stored(int(number_of(session(), u"SELECT [Surname_ID] FROM [tbl_people] WHERE [person_id]=%1;"_s.arg(cy))));
    EXPECT_NE(founded.family.Surname_ID, key);
    EXPECT_EQ(founded.family.surname, u"Naismith");
    EXPECT_EQ(founded.family.Primary_name, u"Cy");
    EXPECT_EQ(founded.people.front().Marital, 1);
    EXPECT_EQ(founded.people.front().groups.size(), 1u);
    EXPECT_EQ(founded.people.front().personal_pin, u"77");
    EXPECT_EQ(founded.address.res_street, u"3 Mill Lane");
    EXPECT_EQ(founded.residential->postcode_var, u"3001");
    EXPECT_EQ(founded.events.front().event, u"Cy came from the Naismith family file");
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_group_history] WHERE [completed]=0;"_s), 1);
}

TEST_P(FamilyTransferTest, AnExistingFamilyTakesThePersonInLast)
{
    const int other = add(u"Smith"_s, {u"Eve"_s});
    dialogue().expect_box(
        u"Di has now been transferred to the Smith family file as a child. If you need to position Di to a different "
        "position in the Smith family then enter the family file and use the positioning arrows under the names list "
        "box on the individual tab to move the person to a different position."_s);
    ASSERT_TRUE(editor->transfer_to(3, other));
    EXPECT_EQ(names(stored(key)), QStringList({u"Ann"_s, u"Ben"_s, u"Cy"_s}));
    EXPECT_EQ(names(stored(other)), QStringList({u"Eve"_s, u"Di"_s}));
    EXPECT_EQ(stored(other).people.back().other_surname, u"Naismith");
    EXPECT_EQ(locks(other), 0);
    EXPECT_EQ(editor->file(), stored(key));
}

TEST_P(FamilyTransferTest, ATransferIsRefusedBeforeAnythingIsWritten)
{
    const int other = add(u"Smith"_s, {u"Eve"_s, u"Fay"_s}, 1);
    FamilyEditor fresh(office());
    type_surname(fresh, u"Brown"_s);
    ASSERT_TRUE(fresh.add_adult(u"Gus"_s));
    dialogue().expect_box(u"Unable to transfer this person until the family file is saved"_s);
    EXPECT_FALSE(fresh.transfer_to_new(0));

    type_surname(*editor, u""_s);
    dialogue().expect_box(u"Unable to do a transfer as a surname does not exist on this family file"_s);
    EXPECT_FALSE(editor->transfer_to(2, other));
    editor->undo();

    type_phone(*editor, u"1"_s);
    dialogue().expect_confirm_or_cancel(altered_question, std::nullopt);
    EXPECT_FALSE(editor->transfer_to_new(2));
    editor->undo();

    FamilyEditor theirs(office());
    ASSERT_TRUE(theirs.open(other));
    dialogue().expect_box(
        u"Unable to move to this family file as another user is presently editing that family file"_s);
    EXPECT_FALSE(editor->transfer_to(2, other));
    dialogue().expect_box(needs_adult);
    EXPECT_FALSE(theirs.transfer_to_new(0));
    EXPECT_EQ(names(stored(key)).size(), 4);
    EXPECT_EQ(names(stored(other)).size(), 2);
}

TEST_P(FamilyTransferTest, TheLastPersonTakesTheFileAlong)
{
    const int other = add(u"Smith"_s, {u"Eve"_s});
    FamilyEditor single(office());
    ASSERT_TRUE(single.open(other));
    ASSERT_TRUE(editor->leave());
    const auto photo = office().paths.file(core::Folder::portrait, u"F%1.jpg"_s.arg(other));
    DataFolder::write(photo, "picture");
    const auto question =
        u"Eve is the only person in this family file. Do you wish to transfer Eve and delete this file?"_s;
    dialogue().expect_confirm(question, Answer::no, Answer::no);
    EXPECT_FALSE(single.transfer_to(0, key));
    dialogue().expect_confirm(question, Answer::yes);
    dialogue().expect_box(
        u"Eve has now been transferred to the Naismith family file as a further adult. If you need to position Eve to a "
        "different position in the Naismith family then enter the family file and use the positioning arrows under the "
        "names list box on the individual tab to move the person to a different position."_s);
    ASSERT_TRUE(single.transfer_to(0, key));
    EXPECT_TRUE(single.is_new());
    EXPECT_EQ(names(stored(key)).size(), 5);
    EXPECT_FALSE(people::load_family(session(), other).has_value());
    EXPECT_EQ(locks(other), 0);
    EXPECT_FALSE(QFile::exists(photo));
}

TEST_P(FamilyTransferTest, DeletingTakesFilesAlongAndLeavesTotals)
{
    const int ann = editor->file().people.front().person_id;
    session().execute(u"INSERT INTO [tbl_finance_data] ([finance_date_id],[person_id],[Data]) VALUES (1,?,50000);"_s,
                      ann);
    const auto photo = office().paths.file(core::Folder::portrait, u"%1.jpg"_s.arg(ann));
    const auto page = office().paths.file(core::Folder::notebook, u"F%1.fll"_s.arg(key));
    DataFolder::write(photo, "picture");
    DataFolder::write(page, "page");

    core::Locks locks_of(office());
    ASSERT_TRUE(locks_of.take(core::LockKind::roll_area, core::Locks::own_place()));
    dialogue().expect_box(
        u"Unable to delete people as currently another user has an area of the program active in which "
        "they are working with peoples files."_s);
    EXPECT_FALSE(editor->remove_family());
    locks_of.release(core::LockKind::roll_area, core::Locks::own_place());

    const auto question = u"Are you sure that you want to delete this file?"_s;
    dialogue().expect_confirm(question, Answer::no, Answer::no);
    EXPECT_FALSE(editor->remove_family());
    EXPECT_TRUE(QFile::exists(photo));
    dialogue().expect_confirm(question, Answer::yes);
    ASSERT_TRUE(editor->remove_family());
    EXPECT_TRUE(editor->is_new());
    EXPECT_EQ(locks(key), 0);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_people];"_s), 0);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_finance_data];"_s), 1);
    EXPECT_FALSE(QFile::exists(photo));
    EXPECT_FALSE(QFile::exists(page));
}

TEST_P(FamilyTransferTest, AGuardIsAskedBeforePeopleAreTouched)
{
    FakeGuard guard;
    office().person_guards = {&guard};
    const int other = add(u"Smith"_s, {u"Eve"_s});
    const int ben = editor->file().people[1].person_id;
    EXPECT_FALSE(editor->remove_person(1));
    EXPECT_FALSE(editor->transfer_to(1, other));
    EXPECT_FALSE(editor->remove_family());
    editor->change({}, [](people::FamilyFile& file) { file.people[1].middle_name = u"Zed"_s; });
    EXPECT_EQ(editor->save(), Saved::no);
    ASSERT_EQ(guard.asked.size(), 4u);
    using enum core::PersonAct;
    EXPECT_EQ(guard.asked[0], std::pair(remove, std::vector{ben}));
    EXPECT_EQ(guard.asked[1], std::pair(move, std::vector{ben}));
    EXPECT_EQ(guard.asked[2].first, remove_family);
    EXPECT_EQ(guard.asked[2].second.size(), 4u);
    EXPECT_EQ(guard.asked[3], std::pair(change, std::vector{ben}));
    guard.answer = true;
    EXPECT_EQ(editor->save(), Saved::yes);
}

TEST_P(FamilyTransferTest, AnAlteredFamilyIsSavedBeforeItMovesToAnotherChurch)
{
    core::SilentProgress progress;
    type_phone(*editor, u"5550 1111"_s);
    dialogue().expect_box(u"This file has been altered and needs to be saved before moving to another church."_s);
    EXPECT_FALSE(editor->move_to_church(2, progress));
    ASSERT_EQ(editor->save(), Saved::yes);
    dialogue().expect_box(u"Please select a church to move the family too first"_s);
    EXPECT_FALSE(editor->move_to_church(std::nullopt, progress));
    EXPECT_EQ(locks(key), 1);
}

TEST_P(FamilyTransferTest, NotebookPhotographsAndVisitsNeedAStoredPerson)
{
    FamilyEditor fresh(office());
    dialogue().expect_box(u"Unable to access the notebook until a person has been entered in the family file first."_s);
    EXPECT_FALSE(fresh.may_open_notebook());
    dialogue().expect_box(
        u"Unable to access the Portrait program until a person has been entered in the family file first."_s);
    EXPECT_FALSE(fresh.may_open_portrait());
    dialogue().expect_box(
        u"Unable to add to visitation list until a person has been entered in the family file first."_s);
    EXPECT_FALSE(fresh.add_to_visitation());
    type_surname(fresh, u"Brown"_s);
    ASSERT_TRUE(fresh.add_adult(u"Gus"_s));
    dialogue().expect_box(u"Unable to open the family Notebook until the family file is saved"_s);
    EXPECT_FALSE(fresh.may_open_notebook());
    dialogue().expect_box(u"Unable to open the Portrait program until the family file is saved"_s);
    EXPECT_FALSE(fresh.may_open_portrait());

    EXPECT_TRUE(editor->may_open_notebook());
    ASSERT_TRUE(editor->add_to_visitation());
    EXPECT_FALSE(editor->altered());
    EXPECT_TRUE(stored(key).visits.front().comments.startsWith(u"Ann & Ben Naismith\r\nChildren: Cy, Di"));
}

TEST_P(FamilyTransferTest, ATransferOrDeletionKilledAtAnyMomentIsWholeOrUndone)
{
    const int other = add(u"Smith"_s, {u"Eve"_s});
    const int doomed = add(u"Brown"_s, {u"Gus"_s, u"Hal"_s});
    const int di = editor->file().people[3].person_id;
    editor.reset();
    desk.reset();
    church->close();
    std::mt19937 random(7);
    for (int round = 0; round < 12; ++round) {
        run_and_kill(
            [&](const Ready& ready) {
                WorkingOffice working(*church);
                core::Office& office = working.office;
                ready();
                for (int from = key, to = other;; std::swap(from, to)) {
                    (void)core::Locks(office).unlock(core::LockKind::family, from);
                    (void)core::Locks(office).unlock(core::LockKind::family, to);
                    FamilyEditor mover(office);
                    if (mover.open(from) && !mover.is_new())
                        (void)mover.transfer_to(static_cast<int>(mover.file().people.size()) - 1, to);
                    if (mover.open(doomed) && !mover.is_new())
                        (void)mover.remove_family();
                }
            },
            std::chrono::microseconds(random() % 60000));
        church->reopen();
        const auto count = [&](const QString& what) {
            return number_of(session(), u"SELECT COUNT(*) FROM "_s + what);
        };
        EXPECT_EQ(count(u"[tbl_people] WHERE [person_id]=%1;"_s.arg(di)), 1);
        const auto gone = count(u"[tbl_surname] WHERE [Surname_ID]=%1;"_s.arg(doomed)) == 0;
        EXPECT_EQ(count(u"[tbl_people];"_s), gone ? 5 : 7);
        EXPECT_EQ(count(u"[tbl_personal_details];"_s), gone ? 5 : 7);
        for (const int family : {key, other}) {
            EXPECT_EQ(
                count(u"[tbl_people] WHERE [Surname_ID]=%1;"_s.arg(family)),
                number_of(session(), u"SELECT MAX([position]) FROM [tbl_people] WHERE [Surname_ID]=%1;"_s.arg(family)));
        }
        church->close();
    }
    church->reopen();
}

} // namespace kindrel::test
