#include "people/editor_fixture.h"

#include "people/family_changes.h"
#include "support/processes.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using people::FamilyEditor;
using people::FamilyFile;
using people::Saved;

namespace {

const QString changed_text = u"This family file was changed elsewhere while it was open here."_s;

/// A family that is changed behind the editor's back, as two workstations do that were let in at the same instant.
class FamilyRaceTest : public EditorTest
{
protected:
    void SetUp() override
    {
        EditorTest::SetUp();
        if (!church)
            return;
        key = add(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cy"_s}, 1);
        editor.emplace(office());
        ASSERT_TRUE(editor->open(key));
    }
    void change_elsewhere(const std::function<void(FamilyFile&)>& make)
    {
        auto file = stored(key);
        make(file);
        (void)people::save_family(session(), file, office().clock.today());
    }

    int key = 0;
    std::optional<FamilyEditor> editor;
};
KINDREL_ON_BOTH_ENGINES(FamilyRaceTest);

} // namespace

TEST_P(FamilyRaceTest, ASaveTellsWhatChangedAndKeepsBothWhenAsked)
{
    change_elsewhere([](FamilyFile& file) {
        file.address.phone = u"5550 1234"_s;
        file.address.res_map = u"12"_s;
        file.people.push_back(person(u"Di"_s, 6));
        file.people.front().groups = {{2, {}, 0, {}, {}, false}};
    });
    type_phone(*editor, u"5550 9999"_s);
    ASSERT_TRUE(editor->add_item({people::RowList::status, 1}, 3, u"status 3"_s));
    dialogue().expect_choice(changed_text, 0);
    ASSERT_EQ(editor->save(), Saved::yes);
    EXPECT_EQ(dialogue().seen().back().more, u"Map: 12\nPhone: 5550 1234\nAnn, Groups\nDi was added");

    const auto file = stored(key);
    EXPECT_EQ(file.address.phone, u"5550 9999");
    EXPECT_EQ(file.address.res_map, u"12");
    EXPECT_EQ(names(file), QStringList({u"Ann"_s, u"Ben"_s, u"Cy"_s, u"Di"_s}));
    EXPECT_EQ(file.people[0].groups.size(), 1u);
    EXPECT_EQ(file.people[1].status.size(), 1u);
}

TEST_P(FamilyRaceTest, MineAloneOverwritesAndStayingWritesNothing)
{
    change_elsewhere([](FamilyFile& file) { file.address.res_map = u"12"_s; });
    type_phone(*editor, u"5550 9999"_s);
    dialogue().expect_choice(changed_text, std::nullopt);
    EXPECT_EQ(editor->save(), Saved::no);
    EXPECT_TRUE(stored(key).address.phone.isEmpty());
    EXPECT_TRUE(editor->altered());
    dialogue().expect_choice(changed_text, 1);
    EXPECT_EQ(editor->save(), Saved::yes);
    EXPECT_EQ(stored(key).address.phone, u"5550 9999");
    EXPECT_TRUE(stored(key).address.res_map.isEmpty());
}

TEST_P(FamilyRaceTest, SomebodyTransferredMeanwhileIsNotPulledBack)
{
    const int other = add(u"Smith"_s, {u"Eve"_s});
    const int cy = editor->file().people[2].person_id;
    session().execute(u"UPDATE [tbl_people] SET [Surname_ID]=?,[position]=2 WHERE [person_id]=?;"_s, other, cy);
    type_phone(*editor, u"5550 9999"_s);
    dialogue().expect_choice(changed_text, 0);
    ASSERT_EQ(editor->save(), Saved::yes);
    EXPECT_EQ(names(stored(key)), QStringList({u"Ann"_s, u"Ben"_s}));
    EXPECT_EQ(names(stored(other)), QStringList({u"Eve"_s, u"Cy"_s}));
}

TEST_P(FamilyRaceTest, AFamilyRemovedMeanwhileIsKeptAsANewFile)
{
    people::remove_family_rows(session(), key);
    type_phone(*editor, u"5550 9999"_s);
    dialogue().expect_box(
        u"Unable to access this family file because another user has removed it from the database. The "
        "program is now entering the family editor in new file mode."_s,
        u"What was typed is kept. Saving it makes a new family file."_s);
    EXPECT_EQ(editor->save(), Saved::no);
    EXPECT_TRUE(editor->is_new());
    ASSERT_EQ(editor->save(), Saved::yes);
    EXPECT_NE(editor->file().family.Surname_ID, key);
    EXPECT_EQ(stored(editor->file().family.Surname_ID).address.phone, u"5550 9999");
}

TEST_P(FamilyRaceTest, VisitsItemNamesAndOrderOfDatesAreNoChange)
{
    change_elsewhere([](FamilyFile& file) {
        file.people[0].dates = {{1, {}, 0, {}, {}, false}, {2, {}, 0, {}, {}, false}};
    });
    ASSERT_TRUE(editor->open(key));
    session().execute(
        u"UPDATE [tbl_individual_date_setup] SET [position]=3-[position],[date_description]='Renamed';"_s);
    people::add_visit(session(), key, {core::Date{2024, 5, 1}, u"Ruth"_s, u"Tea"_s});
    type_phone(*editor, u"5550 9999"_s);
    EXPECT_EQ(editor->save(), Saved::yes);
    EXPECT_EQ(stored(key).visits.size(), 1u);
}

TEST_P(FamilyRaceTest, ATransferOverwritesNothingThatOthersStored)
{
    const int other = add(u"Smith"_s, {u"Eve"_s});
    const auto refusal = u"Nobody was transferred, as this family file was changed elsewhere while it was open here"_s;
    change_elsewhere([](FamilyFile& file) { file.address.phone = u"5550 1234"_s; });
    dialogue().expect_box(refusal);
    EXPECT_FALSE(editor->transfer_to_new(2));
    EXPECT_EQ(editor->file().address.phone, u"5550 1234");
    change_elsewhere([](FamilyFile& file) { file.address.res_map = u"12"_s; });
    dialogue().expect_box(refusal);
    EXPECT_FALSE(editor->transfer_to(2, other));
    EXPECT_EQ(names(stored(key)).size(), 3);
    EXPECT_EQ(stored(key).address.phone, u"5550 1234");
    EXPECT_EQ(stored(key).address.res_map, u"12");

    dialogue().expect_box(u"Cy has now been transferred to a new family file."_s);
    EXPECT_TRUE(editor->transfer_to_new(2));
    EXPECT_EQ(stored(key).address.res_map, u"12");
}

TEST_P(FamilyRaceTest, AFamilyBookedOutMeanwhileIsNotWritten)
{
    session().execute(u"UPDATE [tbl_surname] SET [booked_out]=-1,[booked_out_person]='Ruth';"_s);
    type_phone(*editor, u"5550 9999"_s);
    dialogue().expect_box(u"Unable to save this family file as it is booked out"_s);
    EXPECT_EQ(editor->save(), Saved::no);
    EXPECT_TRUE(stored(key).address.phone.isEmpty());
    EXPECT_FALSE(editor->may_edit());
}

TEST_P(FamilyRaceTest, SeveralProcessesEditOneFamilyInTurnAndLoseNothing)
{
    constexpr int saves = 8;
    editor.reset();
    desk.reset();
    church->close();
    const auto work = [&]() -> QByteArray {
        WorkingOffice working(*church);
        core::Office& office = working.office;
        int refused = 0;
        for (int saved = 0; saved < saves;) {
            FamilyEditor mine(office);
            if (!mine.open(key)) {
                ++refused;
                continue;
            }
            mine.change(
                {}, [](FamilyFile& file) { file.address.res_ref = QString::number(file.address.res_ref.toInt() + 1); });
            saved += mine.save() == Saved::yes;
        }
        return QByteArray::number(refused);
    };
    (void)run_together({work, work, work});
    church->reopen();
    EXPECT_EQ(stored(key).address.res_ref.toInt(), 3 * saves);
    EXPECT_EQ(locks(key), 0);
}

TEST_P(FamilyRaceTest, UnsavedWorkIsOfferedAgainAfterTheProgramDied)
{
    type_phone(*editor, u"5550 9999"_s);
    editor->keep_draft();
    auto drafts = people::Drafts(office()).all();
    ASSERT_EQ(drafts.size(), 1u);
    editor.reset(); // The destructor asks nothing and keeps the draft.

    change_elsewhere([](FamilyFile& file) { file.address.res_map = u"12"_s; });
    FamilyEditor again(office());
    ASSERT_TRUE(again.restore(drafts.front()));
    EXPECT_TRUE(again.altered());
    dialogue().expect_choice(changed_text, 0);
    ASSERT_EQ(again.save(), Saved::yes);
    EXPECT_EQ(stored(key).address.phone, u"5550 9999");
    EXPECT_EQ(stored(key).address.res_map, u"12");
    EXPECT_TRUE(people::Drafts(office()).all().empty());
}

TEST_P(FamilyRaceTest, ADraftOfARemovedFamilyBecomesANewFile)
{
    type_phone(*editor, u"5550 9999"_s);
    editor->keep_draft();
    const auto drafts = people::Drafts(office()).all();
    editor.reset();
    people::remove_family_rows(session(), key);
    FamilyEditor again(office());
    dialogue().expect_box(
        u"Unable to access this family file because another user has removed it from the database. The "
        "program is now entering the family editor in new file mode."_s);
    ASSERT_TRUE(again.restore(drafts.front()));
    EXPECT_TRUE(again.is_new());
    EXPECT_EQ(again.save(), Saved::yes);
}

} // namespace kindrel::test
