#include "people/family_store.h"
#include "setup_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using core::Answer;
using enum SetupKind;

namespace {

const auto remove_members = u"Do you wish to remove everybody attached to this group?"_s;
const auto sort_question = u"Please confirm that you wish to sort this group into an alphabetical order."_s;
const auto new_group = u"Unable to access this groups details as this is a new group and needs to be created and saved "
                       "first. Save this group now and then access this groups details?"_s;

class SetupEditorTest : public SetupRuleTest
{
};

} // namespace

TEST_F(SetupEditorTest, AnItemWithoutATextIsRefused)
{
    auto editor = open();
    struct Case
    {
        SetupKind kind;
        QString text, postcode, when_adding, when_renaming;
    };
    const std::vector<Case> cases{
        {occupations,
         u" \t"_s,
         {},
         u"Please enter an item before attempting to add a new item to the list"_s,
         u"Please enter an item"_s},
        {suburbs,
         {},
         u"3000"_s,
         u"Please enter a suburb before attempting to add a new suburb to the list"_s,
         u"Please enter a suburb"_s},
        {suburbs, u"Richmond"_s, u"  "_s,
         u"Please enter a suburb postcode before attempting to add a new suburb to the list"_s,
         u"Please enter a postcode"_s},
    };
    for (const auto& [kind, text, postcode, when_adding, when_renaming] : cases) {
        dialogue.expect_box(when_adding);
        EXPECT_FALSE(editor.add(kind, text, postcode));
        dialogue.expect_box(when_renaming);
        EXPECT_FALSE(editor.rename(kind, 1, text, postcode));
    }
    EXPECT_FALSE(editor.altered());
}

TEST_F(SetupEditorTest, AnItemThatExistsInAnotherSpellingIsRefused)
{
    auto editor = open();
    dialogue.expect_box(u"This item already exists in the list"_s, u"status 2"_s);
    EXPECT_FALSE(editor.add(status, u"  STATUS 2 "_s));
    dialogue.expect_box(u"This item already exists in the list"_s, u"status 2"_s);
    EXPECT_FALSE(editor.rename(status, 0, u"Status 2"_s));
    dialogue.expect_box(u"This suburb already exists in the list"_s, u"suburb 1 3000"_s);
    EXPECT_FALSE(editor.add(suburbs, u"Suburb 1"_s, u"3000 "_s));

    EXPECT_TRUE(editor.rename(status, 1, u" Status 2"_s)) << "An item's own spelling may change.";
    EXPECT_TRUE(editor.add(suburbs, u"suburb 1"_s, u"3001"_s)) << "Two places may bear one name.";

    EXPECT_EQ(texts(editor.list(status)), (QStringList{u"status 1"_s, u"Status 2"_s, u"status 3"_s}));
    EXPECT_EQ(texts(editor.list(suburbs)).back(), u"suburb 1 3001"_s);
}

TEST_F(SetupEditorTest, ATextThatItsFieldCannotHoldIsRefused)
{
    auto editor = open();
    EXPECT_TRUE(editor.add(titles, QString(255, u'x')));
    dialogue.expect_box(u"Please enter no more than 255 characters"_s);
    EXPECT_FALSE(editor.add(titles, QString(256, u'x')));
    dialogue.expect_box(u"Please enter no more than 255 characters"_s);
    EXPECT_FALSE(editor.rename(suburbs, 0, u"a"_s, QString(256, u'1')));
}

TEST_F(SetupEditorTest, WhatNeedsAChosenItemSaysSo)
{
    auto editor = open();
    for (const int none : {-1, 3}) {
        dialogue.expect_box(u"Please select an item for removing"_s);
        EXPECT_FALSE(editor.remove(status, none));
        dialogue.expect_box(u"Please select an item for renaming"_s);
        EXPECT_FALSE(editor.rename(status, none, u"new"_s));
        dialogue.expect_box(u"Please select an item for moving"_s);
        EXPECT_FALSE(editor.move_up(status, none));
        dialogue.expect_box(u"Please select an item for moving"_s);
        EXPECT_FALSE(editor.move_down(status, none));
        dialogue.expect_box(u"Please select a group first"_s);
        EXPECT_FALSE(editor.set_not_active(none, true));
        dialogue.expect_box(u"Please select a group first"_s);
        EXPECT_EQ(editor.group_for_details(none), std::nullopt);
    }
    EXPECT_FALSE(editor.altered());
}

TEST_F(SetupEditorTest, AnItemIsRemovedOnceItIsConfirmed)
{
    auto editor = open();
    const auto question = u"Please confirm that you wish to remove this item 'Title 2'"_s;
    dialogue.expect_confirm(question, Answer::no, Answer::no);
    EXPECT_FALSE(editor.remove(titles, 1));
    EXPECT_EQ(editor.count_line(titles), u"3 items exist"_s);
    for (const int left : {2, 1, 0}) {
        const auto text = editor.list(titles)[left / 2].text;
        dialogue.expect_confirm(u"Please confirm that you wish to remove this item '%1'"_s.arg(text), Answer::yes);
        EXPECT_TRUE(editor.remove(titles, left / 2));
        EXPECT_EQ(editor.count_line(titles), u"%1 items exist"_s.arg(left));
    }
    dialogue.expect_box(u"Unable to remove any items until you first add a new item"_s);
    EXPECT_FALSE(editor.remove(titles, -1));
}

TEST_F(SetupEditorTest, TheQuestionTellsHowManyCarryTheItem)
{
    auto file = full_family(false);
    file.people[0].Title = u"Title 1"_s;
    (void)save_family(church.session(), file, desk.clock.today());
    auto editor = open();
    const auto taken = u"It is taken from them when the list is saved."_s;
    struct Case
    {
        SetupKind kind;
        int index;
        QString question, more;
    };
    const std::vector<Case> cases{
        {status, 0, u"Please confirm that you wish to remove this item 'status 1'"_s,
         u"Carried by 3 people. "_s + taken},
        {status, 1, u"Please confirm that you wish to remove this item 'status 3'"_s, {}},
        {titles, 0, u"Please confirm that you wish to remove this item 'Title 1'"_s,
         u"Carried by 1 person. It stays with them."_s},
        {family_groups, 0, u"Please confirm that you wish to remove this item 'family_group 1'"_s,
         u"Carried by 1 family. "_s + taken},
        {suburbs, 0, u"Please confirm that you wish to remove this suburb"_s,
         u"suburb 1 3000\nCarried by 1 family. "_s + taken},
        {suburbs, 1, u"Please confirm that you wish to remove this suburb"_s, u"suburb 3 3000"_s},
    };
    dialogue.expect_confirm(u"Please confirm that you wish to remove this item 'status 2'"_s, Answer::yes);
    EXPECT_TRUE(editor.remove(status, 1));
    dialogue.expect_confirm(u"Please confirm that you wish to remove this suburb"_s, Answer::yes);
    EXPECT_TRUE(editor.remove(suburbs, 1));
    for (const auto& [kind, index, question, more] : cases) {
        dialogue.expect_confirm(question, Answer::no, Answer::no);
        EXPECT_FALSE(editor.remove(kind, index));
        EXPECT_EQ(dialogue.seen().back().more.toStdString(), more.toStdString());
    }
}

TEST_F(SetupEditorTest, AGroupThatPeopleCarryStaysUnlessEverybodyIsRemovedFromIt)
{
    (void)save_family(church.session(), full_family(false), desk.clock.today());
    auto editor = open();
    const auto question = u"Please confirm that you wish to remove this item 'group 3'"_s;
    dialogue.expect_confirm(question, Answer::yes, Answer::no);
    dialogue.expect_confirm(remove_members, Answer::no, Answer::no);
    EXPECT_FALSE(editor.remove(groups, 2));
    EXPECT_EQ(editor.list(groups).size(), 3);
    EXPECT_EQ(dialogue.seen().back().more,
              u"Carried by 3 people. They leave it when the list is saved, and their history keeps it."_s);

    dialogue.expect_confirm(question, Answer::yes);
    dialogue.expect_confirm(remove_members, Answer::yes);
    EXPECT_TRUE(editor.remove(groups, 2));
    dialogue.expect_confirm(u"Please confirm that you wish to remove this item 'group 2'"_s, Answer::yes);
    EXPECT_TRUE(editor.remove(groups, 1)) << "Nobody is in this one.";
    EXPECT_EQ(editor.list(groups).size(), 1);
}

TEST_F(SetupEditorTest, MovingIsRefusedAtTheEndsAndChangesNothing)
{
    auto editor = open();
    dialogue.expect_box(u"This is the highest position this item can be moved to"_s);
    EXPECT_FALSE(editor.move_up(ministries, 0));
    dialogue.expect_box(u"This is the lowest position this item can be moved to"_s);
    EXPECT_FALSE(editor.move_down(ministries, 2));
    EXPECT_FALSE(editor.altered());

    EXPECT_TRUE(editor.move_up(ministries, 1));
    EXPECT_TRUE(editor.move_down(ministries, 1));
    EXPECT_EQ(texts(editor.list(ministries)), (QStringList{u"ministry 2"_s, u"ministry 3"_s, u"ministry 1"_s}));
}

TEST_F(SetupEditorTest, SortingPutsAccentsAndCaseBesideTheirLetters)
{
    auto editor = open();
    for (int item = 3; item > 0; --item) {
        dialogue.expect_confirm(u"Please confirm that you wish to remove this suburb"_s, Answer::yes);
        ASSERT_TRUE(editor.remove(suburbs, item - 1));
        if (item > 1)
            continue;
        dialogue.expect_box(u"Not Enough groups available to conduct a sort"_s);
        EXPECT_FALSE(editor.sort(suburbs));
    }
    ASSERT_TRUE(editor.add(suburbs, u"Zürich"_s, u"1"_s));
    dialogue.expect_box(u"Not Enough groups available to conduct a sort"_s);
    EXPECT_FALSE(editor.sort(suburbs));
    for (const auto& [text, postcode] : std::vector<std::pair<QString, QString>>{{u"Eaton"_s, u"2"_s},
                                                                                 {u"Ōtaki"_s, u"1"_s},
                                                                                 {u"östlich"_s, u"1"_s},
                                                                                 {u"Eaton"_s, u"1"_s},
                                                                                 {u"Éaton"_s, u"1"_s},
                                                                                 {u"ebb"_s, u"1"_s},
                                                                                 {u"Zug"_s, u"1"_s}})
        ASSERT_TRUE(editor.add(suburbs, text, postcode));
    const auto typed = texts(editor.list(suburbs));
    dialogue.expect_confirm(sort_question, Answer::no, Answer::no);
    EXPECT_FALSE(editor.sort(suburbs));
    EXPECT_EQ(texts(editor.list(suburbs)), typed);

    dialogue.expect_confirm(sort_question, Answer::yes);
    EXPECT_TRUE(editor.sort(suburbs));

    EXPECT_EQ(texts(editor.list(suburbs)), (QStringList{u"Eaton 1"_s, u"Eaton 2"_s, u"Éaton 1"_s, u"ebb 1"_s,
                                                        u"östlich 1"_s, u"Ōtaki 1"_s, u"Zug 1"_s, u"Zürich 1"_s}));
}

TEST_F(SetupEditorTest, ANewGroupIsSavedBeforeItsDetailsAreOpened)
{
    auto editor = open();
    EXPECT_EQ(editor.group_for_details(1), 2);
    ASSERT_TRUE(editor.add(groups, u"Choir"_s));
    ASSERT_TRUE(editor.add(status, u"Elder"_s));
    dialogue.expect_confirm(new_group, Answer::no, Answer::no);
    EXPECT_EQ(editor.group_for_details(3), std::nullopt);
    EXPECT_EQ(number_of(church.session(), u"SELECT COUNT(*) FROM [tbl_group_setup];"_s), 3);

    dialogue.expect_confirm(new_group, Answer::yes);
    const auto key = editor.group_for_details(3);

    ASSERT_TRUE(key);
    EXPECT_EQ(number_of(church.session(), u"SELECT [group_id] FROM [tbl_group_setup] WHERE [group]='Choir';"_s), *key);
    EXPECT_FALSE(editor.list(groups).altered());
    EXPECT_TRUE(editor.list(status).altered()) << "The other lists wait for their own save.";
}

TEST_F(SetupEditorTest, NothingIsSavedWithoutTheRight)
{
    auto editor = open();
    desk.office.rights.set(core::Area::family_file_setup, false);
    const auto refusal = u"Your password does not give access to \"Family File Setup\""_s;
    ASSERT_TRUE(editor.add(groups, u"Choir"_s));
    dialogue.expect_box(refusal);
    EXPECT_FALSE(editor.save());
    dialogue.expect_confirm(new_group, Answer::yes);
    dialogue.expect_box(refusal);
    EXPECT_EQ(editor.group_for_details(3), std::nullopt);
    EXPECT_EQ(number_of(church.session(), u"SELECT COUNT(*) FROM [tbl_group_setup];"_s), 3);
}

} // namespace kindrel::test
