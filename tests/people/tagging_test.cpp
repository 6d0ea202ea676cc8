#include "people/editor_fixture.h"
#include "people/tagging.h"
#include "support/processes.h"

#include <map>
#include <random>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Area;
using core::Date;
using people::LinkRow;
using people::TagAct;
using people::TagItem;
using people::TagKind;
using people::WorkingList;

namespace {

const QString done = u"The tagging operation has successfully been completed"_s;

/// Three families: one to be changed, one booked out, one whose sections are closed.
class TaggingTest : public EditorTest
{
protected:
    void SetUp() override
    {
        EditorTest::SetUp();
        if (!church)
            return;
        open_family = add(u"Naismith"_s, {u"Ann"_s, u"Ben"_s});
        const int away = add(u"Smith"_s, {u"Cy"_s});
        const int closed = add(u"Brown"_s, {u"Di"_s});
        session().execute(u"UPDATE [tbl_surname] SET [booked_out]=-1 WHERE [Surname_ID]=?;"_s, away);
        session().execute(u"UPDATE [tbl_record_access] SET [status]=0,[groups]=0,[ministry]=0,[date]=0,[flexi]=0 WHERE "
                          "[surname_id]=?;"_s,
                          closed);
        list = WorkingList{};
        for (const int family : {open_family, away, closed}) {
            for (const auto& person : stored(family).people)
                list->members.push_back({person.person_id, family});
        }
    }
    people::BulkChange run(const TagItem& item, TagAct act)
    {
        dialogue().expect_box(done);
        return people::tag(office(), list, item, act).value();
    }
    [[nodiscard]] const std::vector<LinkRow>& rows(std::vector<LinkRow> people::Person::*of, std::size_t place = 0)
    {
        now = stored(open_family);
        return now.people[place].*of;
    }
    [[nodiscard]] qint64 count(const QString& what) { return number_of(session(), u"SELECT COUNT(*) FROM "_s + what); }

    int open_family = 0;
    std::optional<WorkingList> list;
    people::FamilyFile now;
};
KINDREL_ON_BOTH_ENGINES(TaggingTest);

struct KindCase
{
    TagItem item;
    const char16_t* table;
    std::vector<LinkRow> people::Person::*rows;
};

const KindCase kinds[]{
    {{.kind = TagKind::status, .item = 2}, u"tbl_status", &people::Person::status},
    {{.kind = TagKind::group, .item = 2}, u"tbl_group", &people::Person::groups},
    {{.kind = TagKind::ministry, .item = 2, .ministry = people::MinistryState::potential},
     u"tbl_ministry",
     &people::Person::ministries},
    {{.kind = TagKind::date, .item = 2, .date = Date{2024, 5, 1}, .tagged = true},
     u"tbl_individual_date",
     &people::Person::dates},
    {{.kind = TagKind::flexi, .item = 2, .field = u"blue"_s, .tagged = true}, u"tbl_flexi", &people::Person::flexi},
};

} // namespace

TEST_P(TaggingTest, EachKindIsGivenAndTakenWithAwayAndClosedFamiliesSkipped)
{
    for (const auto& [item, table, of] : kinds) {
        const auto planned = people::count_tagging(office(), *list, item, TagAct::give);
        const auto given = run(item, TagAct::give);
        EXPECT_EQ(given.count, planned);
        EXPECT_EQ(given.count, (people::TagCount{2, 0, 1, 1}));
        EXPECT_EQ(dialogue().seen().back().more,
                  u"2 people change, 1 in booked out families skipped, 1 in closed family files skipped");
        const auto& carried = rows(of);
        ASSERT_EQ(carried.size(), 1u);
        EXPECT_EQ(carried[0].item, 2);
        EXPECT_EQ(carried[0].field, item.field);
        EXPECT_EQ(carried[0].date, item.date);
        EXPECT_EQ(carried[0].tagged, item.tagged);

        EXPECT_EQ(run(item, TagAct::give).count.as_it_was, 2);
        EXPECT_EQ(count(u"[%1];"_s.arg(table)), 2);
        EXPECT_EQ(run(item, TagAct::take).count.changed, 2);
        EXPECT_EQ(run(item, TagAct::take).count.as_it_was, 2);
        EXPECT_EQ(count(u"[%1];"_s.arg(table)), 0);
    }
}

TEST_P(TaggingTest, WhoHasLeftTheRegisterMeanwhileGetsNoRow)
{
    list->members.resize(2);
    list->members.push_back({99999, open_family});

    const auto given = run({.kind = TagKind::status, .item = 2}, TagAct::give);

    EXPECT_EQ(given.count, (people::TagCount{2, 0, 0, 0}));
    EXPECT_EQ(count(u"[tbl_status] WHERE [status_id]=2;"_s), 2);
}

TEST_P(TaggingTest, APotentialMinistryStandsBesideAnActiveOne)
{
    TagItem item{.kind = TagKind::ministry, .item = 2};
    (void)run(item, TagAct::give);
    item.ministry = people::MinistryState::potential;
    (void)run(item, TagAct::give);
    EXPECT_EQ(rows(&people::Person::ministries).size(), 2u);
    (void)run(item, TagAct::take);
    ASSERT_EQ(rows(&people::Person::ministries).size(), 1u);
    EXPECT_EQ(rows(&people::Person::ministries)[0].type, 1);
}

TEST_P(TaggingTest, DatesAndFlexiFieldsGetTheirNewContentInPlace)
{
    const TagItem blue{.kind = TagKind::flexi, .item = 2, .field = u"blue"_s};
    const TagItem red{.kind = TagKind::flexi, .item = 2, .field = u"red"_s, .tagged = true};
    const TagItem may{.kind = TagKind::date, .item = 2, .date = Date{2024, 5, 1}, .tagged = true};
    const TagItem june{.kind = TagKind::date, .item = 2, .date = Date{2024, 6, 1}};
    for (const auto& [before, after] : {std::pair(blue, red), std::pair(may, june)}) {
        const auto of = kinds[int(before.kind) - 1].rows;
        (void)run(before, TagAct::give);
        const auto old_row = rows(of)[0];
        const auto again = run(after, TagAct::give);
        EXPECT_EQ(again.count, (people::TagCount{2, 0, 1, 1, 2}));
        ASSERT_EQ(rows(of).size(), 1u);
        EXPECT_EQ(rows(of)[0].field, after.field);
        EXPECT_EQ(rows(of)[0].date, after.date);
        EXPECT_EQ(rows(of)[0].tagged, after.tagged);
        EXPECT_EQ(people::undo_tagging(office(), again), 0);
        EXPECT_TRUE(rows(of)[0] == old_row);
    }
}

TEST_P(TaggingTest, BeforehandItTellsHowManyGetTheItemInPlaceOfAnotherValue)
{
    using people::TagCount;
    const std::vector<std::pair<TagCount, QString>> cases{
        {{.changed = 2}, u"2 people change"_s},
        {{.changed = 5, .as_it_was = 1, .replaced = 1},
         u"4 people get it, 1 gets it in place of another value or mark, 1 stays as it is"_s},
        {{.changed = 4, .replaced = 3}, u"1 person gets it, 3 get it in place of another value or mark"_s},
        {{.changed = 2, .replaced = 2}, u"2 people get it in place of another value or mark"_s},
    };
    for (const auto& [counted, words] : cases)
        EXPECT_EQ(counted.words(), words);

    TagItem item{.kind = TagKind::flexi, .item = 2};
    (void)run(item, TagAct::give);
    item.field = u"blue"_s;
    EXPECT_EQ(people::count_tagging(office(), *list, item, TagAct::give).replaced, 0) << "Nothing is lost.";
    (void)run(item, TagAct::give);
    EXPECT_EQ(people::count_tagging(office(), *list, item, TagAct::take).replaced, 0);
    item.tagged = true;
    EXPECT_EQ(people::count_tagging(office(), *list, item, TagAct::give).replaced, 2);
}

TEST_P(TaggingTest, AChangeIsTakenBackOnlyByWhoMayTagAndWhileTheNetworkAnswers)
{
    const auto given = run({.kind = TagKind::status, .item = 2}, TagAct::give);
    office().mode = core::Mode::network;
    dialogue().expect_box(u"Unable to access your network files."_s);
    EXPECT_FALSE(people::undo_tagging(office(), given));
    office().mode = core::Mode::normal;
    office().rights.set(Area::read_only_family_data, true);
    dialogue().expect_box(u"Unable to tag people as you only have read only access within family files"_s);
    EXPECT_FALSE(people::undo_tagging(office(), given));
    office().rights.set(Area::tagging, false);
    dialogue().expect_box(u"Your password does not give access to \"Tagging\""_s);
    EXPECT_FALSE(people::undo_tagging(office(), given));
    EXPECT_EQ(count(u"[tbl_status];"_s), 2);
}

TEST_P(TaggingTest, AGroupComesLastAndIsWrittenIntoTheHistory)
{
    for (const int group : {3, 1, 2})
        (void)run({.kind = TagKind::group, .item = group}, TagAct::give);
    const auto carried = rows(&people::Person::groups, 1);
    ASSERT_EQ(carried.size(), 3u);
    EXPECT_EQ(carried[0].item, 3);
    EXPECT_EQ(carried[2].item, 2);
    EXPECT_EQ(count(u"[tbl_group_history] WHERE [completed]=0;"_s), 6);
    (void)run({.kind = TagKind::group, .item = 1}, TagAct::take);
    EXPECT_EQ(count(u"[tbl_group_history] WHERE [completed]=-1 AND [group_id]=1 AND [date_out]='2024-05-15';"_s), 2);
}

TEST_P(TaggingTest, UndoneChangesLeaveNothingBehindButWhatWasChangedSince)
{
    const TagItem choir{.kind = TagKind::group, .item = 2};
    const auto given = run(choir, TagAct::give);
    EXPECT_EQ(people::undo_tagging(office(), given), 0);
    EXPECT_EQ(count(u"[tbl_group];"_s), 0);
    EXPECT_EQ(count(u"[tbl_group_history];"_s), 0);

    (void)run(choir, TagAct::give);
    const auto taken = run(choir, TagAct::take);
    EXPECT_EQ(people::undo_tagging(office(), taken), 0);
    EXPECT_EQ(count(u"[tbl_group];"_s), 2);
    EXPECT_EQ(count(u"[tbl_group_history] WHERE [completed]=0;"_s), 2);

    const auto again = run(choir, TagAct::take);
    auto file = stored(open_family);
    file.people.front().groups = {{2, {}, 0, {}, {}, false}};
    (void)people::save_family(session(), file, office().clock.today());
    EXPECT_EQ(people::undo_tagging(office(), again), 1);
    EXPECT_EQ(count(u"[tbl_group];"_s), 2);
}

TEST_P(TaggingTest, ARunIsRefusedInTheWordsOfItsKind)
{
    const WorkingList nobody;
    const TagItem status{.kind = TagKind::status, .item = 1};
    dialogue().expect_box(u"Unable to process the tagging function until you first select people to tag"_s);
    EXPECT_FALSE(people::tag(office(), std::nullopt, status, TagAct::give));
    dialogue().expect_box(u"No people exist for tagging"_s);
    EXPECT_FALSE(people::tag(office(), nobody, status, TagAct::give));
    dialogue().expect_box(u"No people exist for un-tagging"_s);
    EXPECT_FALSE(people::tag(office(), nobody, status, TagAct::take));
    dialogue().expect_box(u"No people have been found for tagging"_s);
    EXPECT_FALSE(people::tag(office(), WorkingList{{{9999, 9999}}, {}}, status, TagAct::give));
    const std::pair<TagKind, QString> words[]{{TagKind::status, u" Status "_s},
                                              {TagKind::group, u" Group "_s},
                                              {TagKind::ministry, u" Ministry "_s},
                                              {TagKind::date, u" Date Tag"_s},
                                              {TagKind::flexi, u" Flexi Tag"_s}};
    for (const auto& [kind, word] : words) {
        dialogue().expect_box(u"Unable to tag the people with a "_s + word + u" until you choose one from the list"_s);
        EXPECT_FALSE(people::tag(office(), list, {.kind = kind}, TagAct::give));
        dialogue().expect_box(u"Unable to remove the people from the "_s + word +
                              u" until you choose one from the list"_s);
        EXPECT_FALSE(people::tag(office(), list, {.kind = kind}, TagAct::take));
    }
    dialogue().expect_box(u"Please enter the date that the people are given"_s);
    EXPECT_FALSE(people::tag(office(), list, {.kind = TagKind::date, .item = 1}, TagAct::give));
    office().rights.set(Area::read_only_family_data, true);
    dialogue().expect_box(u"Unable to tag people as you only have read only access within family files"_s);
    EXPECT_FALSE(people::tag(office(), list, status, TagAct::give));
    office().rights.set(Area::tagging, false);
    dialogue().expect_box(u"Your password does not give access to \"Tagging\""_s);
    EXPECT_FALSE(people::tag(office(), list, status, TagAct::give));
    EXPECT_EQ(count(u"[tbl_status];"_s), 0);
}

TEST_P(TaggingTest, BookedOutWorkTagsTheFamiliesThatAreHereToBeChanged)
{
    session().execute(u"UPDATE [tbl_surname] SET [active_in_book]=-1 WHERE [booked_out]=-1;"_s);
    office().mode = core::Mode::booked_out;
    EXPECT_EQ(run({.kind = TagKind::status, .item = 1}, TagAct::give).count, (people::TagCount{1, 0, 3, 0}));
}

TEST_P(TaggingTest, AKillWhileTaggingLeavesEverybodyOrNobodyTaggedAndTheHistoryWithThem)
{
    for (int more = 0; more < 60; ++more) {
        const auto file = people::save_family(session(), family(u"Holm"_s, {u"Ada"_s, u"Bo"_s}), desk->clock.today());
        for (const auto& person : file.people)
            list->members.push_back({person.person_id, file.family.Surname_ID});
    }
    const qint64 all = 122;
    desk.reset();
    std::mt19937 random(20261123);
    std::map<qint64, int> found;
    for (int round = 0; round < 20; ++round) {
        church->close();
        run_and_kill(
            [&](const Ready& ready) {
                WorkingOffice own(*church);
                ready();
                for (;;) {
                    for (const auto act : {TagAct::give, TagAct::take})
                        (void)people::tag(own.office, list, {.kind = TagKind::group, .item = 2}, act);
                }
            },
            std::chrono::microseconds(random() % 60000));
        church->reopen();
        const auto members = count(u"[tbl_group];"_s);
        ++found[members];
        EXPECT_EQ(count(u"[tbl_group_history] WHERE [date_out] IS NULL;"_s), members);
    }
    EXPECT_EQ(found[0] + found[all], 20);
}

} // namespace kindrel::test
