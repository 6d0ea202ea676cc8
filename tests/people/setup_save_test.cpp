#include "people/family_store.h"
#include "people/group_details.h"
#include "people/link_tables.h"
#include "people/quick_add.h"
#include "people/setup_rows.h"
#include "setup_fixture.h"
#include "support/processes.h"

#include <random>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using core::Answer;
using enum SetupKind;

namespace {

/// A family whose first person, or whose home, carries the first two items of every list.
FamilyFile carrier()
{
    auto file = family(u"Naismith"_s, {u"Ann"_s});
    const std::vector<LinkRow> items{{1, {}, 0, {}, {}, false}, {2, {}, 0, {}, {}, false}};
    for (const auto& link : person_links())
        file.people[0].*link.rows = items;
    for (auto& row : file.people[0].ministries)
        row.type = static_cast<int>(MinistryState::active);
    file.family_groups = file.family_dates = items;
    file.residential = Suburb{1, SuburbType::residential, {}, {}, {}};
    file.postal = Suburb{2, SuburbType::postal, {}, {}, {}};
    file.people[0].Title = u"Title 1"_s;
    return file;
}

QStringList texts_of(const std::vector<LinkRow>& rows)
{
    QStringList found;
    for (const auto& row : rows)
        found += row.text;
    return found;
}

/// What the family and its first person carry of a list.
QStringList carried(const FamilyFile& file, SetupKind kind)
{
    const auto& person = file.people[0];
    switch (kind) {
    case status:
        return texts_of(person.status);
    case groups:
        return texts_of(person.groups);
    case ministries:
        return texts_of(person.ministries);
    case personal_dates:
        return texts_of(person.dates);
    case flexi_fields:
        return texts_of(person.flexi);
    case family_groups:
        return texts_of(file.family_groups);
    case family_dates:
        return texts_of(file.family_dates);
    case titles:
        return {person.Title};
    case occupations:
        return texts_of(person.occupations);
    case suburbs:
        return {file.residential ? file.residential->suburb + u' ' + file.residential->shown_postcode() : QString(),
                file.postal ? file.postal->suburb : QString()};
    }
    return {};
}

class SetupSaveTest : public SetupTest
{
protected:
    [[nodiscard]] FamilyFile add(const FamilyFile& file) { return save_family(session(), file, joined); }
    [[nodiscard]] FamilyFile read(const FamilyFile& file)
    {
        return load_family(session(), file.family.Surname_ID).value_or(FamilyFile{});
    }
    void remove(SetupEditor& editor, SetupKind kind, int index)
    {
        const auto& item = editor.list(kind)[index];
        desk->dialogue.expect_confirm(kind == suburbs
                                          ? u"Please confirm that you wish to remove this suburb"_s
                                          : u"Please confirm that you wish to remove this item '%1'"_s.arg(item.text),
                                      Answer::yes);
        if (kind == groups && item.users > 0)
            desk->dialogue.expect_confirm(u"Do you wish to remove everybody attached to this group?"_s, Answer::yes);
        EXPECT_TRUE(editor.remove(kind, index));
    }

    QDate joined{2020, 1, 1};
};

} // namespace

KINDREL_ON_BOTH_ENGINES(SetupSaveTest);

TEST_P(SetupSaveTest, EveryListIsSavedAsThoseWhoCarryItsItemsSeeIt)
{
    const auto file = add(carrier());
    auto editor = open();
    for (const auto& list : setup_lists()) {
        const auto kind = list.kind;
        ASSERT_TRUE(editor.rename(kind, 0, u"renamed"_s, u"4000"_s));
        remove(editor, kind, 1);
        ASSERT_TRUE(editor.move_up(kind, 1));
        ASSERT_TRUE(editor.add(kind, u"new"_s, u"5000"_s));
    }
    EXPECT_TRUE(editor.altered());

    ASSERT_TRUE(editor.save());

    EXPECT_FALSE(editor.altered());
    const auto seen = read(file);
    for (const auto& list : setup_lists()) {
        const auto third = QString::fromLatin1(list.text) + u" 3"_s;
        const bool postcodes = list.kind == suburbs;
        const QStringList order{postcodes ? third + u" 3000"_s : third, postcodes ? u"renamed 4000"_s : u"renamed"_s,
                                postcodes ? u"new 5000"_s : u"new"_s};
        EXPECT_EQ(stored(list.kind), order) << list.table;
        EXPECT_EQ(texts(editor.list(list.kind)), order) << list.table;
        EXPECT_EQ(editor.list(list.kind)[1].key, 1) << list.table;
        EXPECT_EQ(editor.list(list.kind)[2].key, 4) << list.table;
        const QStringList expected = list.kind == titles    ? QStringList{u"Title 1"_s}
                                     : list.kind == suburbs ? QStringList{u"renamed 4000"_s, {}}
                                                            : QStringList{u"renamed"_s};
        EXPECT_EQ(carried(seen, list.kind), expected) << list.table;
        EXPECT_EQ(number_of(session(), u"SELECT SUM([position]) FROM [%1];"_s.arg(QString::fromLatin1(list.table))), 6);
        if (!list.carriers.by_text) {
            EXPECT_EQ(number_of(session(),
                                u"SELECT COUNT(*) FROM [%1] WHERE [%2]=2;"_s.arg(
                                    QString::fromLatin1(list.carriers.table), QString::fromLatin1(list.carriers.item))),
                      0)
                << "A link to nothing was left in " << list.carriers.table;
        }
    }
}

TEST_P(SetupSaveTest, NothingIsSavedWhileTheNetworkIsGone)
{
    auto editor = open();
    ASSERT_TRUE(editor.add(titles, u"Deacon"_s));
    desk->office.mode = core::Mode::network; // Its folder names no church.
    desk->dialogue.expect_box(u"Unable to access your network files."_s);
    EXPECT_FALSE(editor.save());
    EXPECT_TRUE(editor.altered());
    EXPECT_EQ(stored(titles).size(), 3);
}

TEST_P(SetupSaveTest, TheMembersOfARemovedGroupLeaveItIntoTheirHistory)
{
    const auto file = add(full_family(false));
    (void)add(carrier());
    GroupDetails details;
    details.group_id = 1;
    details.leader = u"Ann"_s;
    ASSERT_TRUE(save_group_details(desk->office, details));
    auto editor = open();
    ASSERT_TRUE(editor.rename(groups, 0, u"renamed"_s));
    remove(editor, groups, 0);
    EXPECT_EQ(read(file).people[0].groups.size(), 2u) << "Nobody leaves before the save.";

    ASSERT_TRUE(editor.save());

    auto rows = session().select(u"SELECT [group],[date_in],[date_out],[completed],COUNT(*) FROM [qry_group_history] "
                                 "WHERE [group_id]<>2 GROUP BY [group],[date_in],[date_out],[completed] "
                                 "ORDER BY [group];"_s);
    QStringList history;
    for (const core::Row& row : rows) {
        history +=
            u"%1 %2 %3 %4 %5"_s.arg(row.text(core::Column{0}), row.text(core::Column{1}), row.text(core::Column{2}))
                .arg(row.number(core::Column{3}))
                .arg(row.number(core::Column{4}));
    }
    EXPECT_EQ(history, (QStringList{u"group 1 2020-01-01 2024-05-15 -1 4"_s, u"group 3 2020-01-01  0 3"_s}));
    EXPECT_EQ(carried(read(file), groups), QStringList{u"group 3"_s});
    EXPECT_EQ(load_group_details(session(), 1).leader, QString());
}

TEST_P(SetupSaveTest, AGroupThatIsMarkedAsNoLongerMeetingKeepsItsMembers)
{
    const auto file = add(carrier());
    auto editor = open();
    ASSERT_TRUE(editor.set_not_active(0, true));
    ASSERT_TRUE(editor.save());
    EXPECT_TRUE(read_setup_items(session(), groups)[0].not_active);
    EXPECT_EQ(read(file).people[0].groups.size(), 2u);
}

TEST_P(SetupSaveTest, AnUnalteredListIsNotWritten)
{
    auto editor = open();
    ASSERT_TRUE(editor.move_up(status, 2));
    ASSERT_TRUE(editor.move_down(status, 1));
    // A server's change mark moves with whatever else is done on it: there the rows tell who wrote them last.
    const auto mark = [&] {
        return GetParam() == core::EngineKind::sqlite
                   ? desk->office.session->change_mark()
                   : number_of(session(),
                               u"SELECT MAX(CAST(CAST([xmin] AS text) AS bigint)) FROM [tbl_status_setup];"_s);
    };
    const auto before = mark();
    ASSERT_TRUE(editor.save());
    EXPECT_EQ(mark(), before);
    ASSERT_TRUE(editor.move_up(status, 2));
    ASSERT_TRUE(editor.save());
    EXPECT_NE(mark(), before);
}

TEST_P(SetupSaveTest, ClosingWithoutSavingDropsEverything)
{
    {
        auto editor = open();
        ASSERT_TRUE(editor.add(titles, u"Dr"_s));
        ASSERT_TRUE(editor.rename(titles, 0, u"Prof"_s));
    }
    EXPECT_EQ(stored(titles), (QStringList{u"Title 1"_s, u"Title 2"_s, u"Title 3"_s}));
}

TEST_P(SetupSaveTest, GapsInThePositionsOfAnOlderFileDoNotMisplaceAnything)
{
    session().execute(u"UPDATE [tbl_title] SET [position]=[position]*10;"_s);
    auto editor = open();
    ASSERT_TRUE(editor.add(titles, u"Dr"_s));
    ASSERT_TRUE(editor.save());
    EXPECT_EQ(stored(titles), (QStringList{u"Title 1"_s, u"Title 2"_s, u"Title 3"_s, u"Dr"_s}));
}

TEST_P(SetupSaveTest, WhatIsAddedElsewhereMeanwhileStaysAtTheEnd)
{
    auto editor = open();
    SetupOffice other_desk(*church);
    remove(editor, occupations, 1);
    ASSERT_TRUE(editor.add(occupations, u"Baker"_s));
    ASSERT_TRUE(editor.add(occupations, u"Cook"_s));
    const auto nurse = add_occupation(other_desk.office, u"Nurse"_s);
    const auto cook = add_occupation(other_desk.office, u"COOK"_s);
    ASSERT_TRUE(nurse && cook);

    ASSERT_TRUE(editor.save());

    const QStringList expected{u"occupation 1"_s, u"occupation 3"_s, u"Baker"_s, u"Cook"_s, u"Nurse"_s};
    EXPECT_EQ(stored(occupations), expected);
    EXPECT_EQ(texts(editor.list(occupations)), expected);
    EXPECT_EQ(editor.list(occupations)[3].key, *cook) << "What both have added is one item.";
    EXPECT_EQ(editor.list(occupations)[4].key, *nurse);
    EXPECT_FALSE(editor.altered());
}

TEST_P(SetupSaveTest, AfterAFailureTheEarlierListsAreStoredAndTheRestCanBeSavedAgain)
{
    auto editor = open();
    ASSERT_TRUE(editor.add(status, u"Elder"_s));
    ASSERT_TRUE(editor.add(titles, u"Dr"_s));
    remove(editor, titles, 0);
    session().execute(u"ALTER TABLE [tbl_title] RENAME TO [tbl_title_away];"_s);

    EXPECT_THROW((void)editor.save(), core::DatabaseError);

    EXPECT_EQ(stored(status).back(), u"Elder"_s);
    EXPECT_FALSE(editor.list(status).altered());
    EXPECT_TRUE(editor.list(titles).altered());
    session().execute(u"ALTER TABLE [tbl_title_away] RENAME TO [tbl_title];"_s);
    ASSERT_TRUE(editor.save());
    EXPECT_EQ(stored(titles), (QStringList{u"Title 2"_s, u"Title 3"_s, u"Dr"_s}));
    EXPECT_EQ(editor.list(titles)[2].key, 4);
}

namespace {

/// `from` as it is stored, edited into `to`.
core::OrderedList<SetupItem> edited(const std::vector<SetupItem>& from, const std::vector<SetupItem>& to)
{
    core::OrderedList<SetupItem> list(from);
    while (!list.empty())
        list.remove(list.size() - 1);
    for (const auto& item : to)
        list.add(item);
    return list;
}

} // namespace

TEST_P(SetupSaveTest, AKilledSaveLeavesTheOldListOrTheNewOne)
{
    const auto& list = setup_list(suburbs);
    std::vector<SetupItem> before, after;
    for (int key = 1; key <= 300; ++key)
        before.push_back({key, u"suburb %1"_s.arg(key), u"3000"_s});
    std::ranges::reverse_copy(before, std::back_inserter(after));
    for (std::size_t place = 0; place < after.size(); place += 7)
        after[place].text += u" renamed"_s;
    std::erase_if(after, [](const SetupItem& item) { return item.key % 10 == 0; });
    const auto link = u"INSERT INTO [tbl_suburb] ([surname_id],[suburb_id],[Type]) VALUES (1,10,1);"_s;
    (void)save_setup_list(session(), list, edited(read_setup_items(session(), suburbs), before), joined);
    session().execute(link);
    desk->office.session.reset();
    church->close();
    std::mt19937 random(20240515);
    for (int round = 0; round < 30; ++round) {
        run_and_kill(
            [&](const Ready& ready) {
                const auto own = church->another();
                ready();
                for (;;) {
                    (void)save_setup_list(*own, list, edited(before, after), joined);
                    (void)save_setup_list(*own, list, edited(after, before), joined);
                    own->execute(link);
                }
            },
            std::chrono::microseconds(random() % 40000));
        church->reopen();
        const auto found = read_setup_items(session(), suburbs);
        EXPECT_TRUE(found == before || found == after) << found.size();
        const auto links = number_of(session(), u"SELECT COUNT(*) FROM [tbl_suburb];"_s);
        EXPECT_TRUE(found == before || links == 0) << "The item went without its links.";
        // The next round begins with the old list and its link.
        (void)save_setup_list(session(), list, edited(found, before), joined);
        if (links == 0)
            session().execute(link);
        church->close();
    }
    church->reopen();
}

} // namespace kindrel::test
