#include "people/saved_filters.h"

#include "filter_chance.h"
#include "people/filter_json.h"
#include "setup_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using core::Answer;

namespace {

class SavedFiltersTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (!church)
            return;
        fill_setup_lists(session());
        desk.emplace(*church);
    }
    [[nodiscard]] core::Office& office() { return desk->office; }
    [[nodiscard]] ScriptedDialogue& dialogue() { return desk->dialogue; }
    [[nodiscard]] QStringList names()
    {
        QStringList found;
        for (const auto& saved : saved_filters(session()))
            found += saved.name;
        return found;
    }

    std::optional<SetupOffice> desk;
};

} // namespace

TEST(FilterJsonTest, EveryFilterComesBackAsItWas)
{
    Chance chance(7);
    for (int number = 0; number < 500; ++number) {
        const auto filter = chance.filter(5);
        const auto read = filter_from_json(to_json(filter));
        ASSERT_EQ(read.fault, std::nullopt) << number;
        ASSERT_EQ(read.filter, filter) << number;
    }
    EXPECT_EQ(filter_from_json(to_json({})).filter, Filter());
}

TEST(FilterJsonTest, WhatIsNoFilterIsTurnedAway)
{
    const auto good = to_json({.families = FamilyList::active});
    const auto with = [&](const char* from, const char* to) {
        auto changed = good;
        EXPECT_TRUE(changed.contains(from)) << from;
        return changed.replace(from, to);
    };
    EXPECT_EQ(filter_from_json(good).fault, std::nullopt);
    EXPECT_EQ(filter_from_json(with("\"version\":1", "\"version\":2")).fault, FilterFault::newer);
    for (const auto& bad : {QByteArray(), QByteArray("[]"), QByteArray("{\"version\":1}"), good.left(good.size() - 5),
                            with("\"families\":1", "\"families\":8"), with("\"families\":1", "\"families\":\"1\""),
                            with("\"families\"", "\"family\""), with("\"version\":1", "\"version\":0")})
        EXPECT_EQ(filter_from_json(bad).fault, FilterFault::unreadable) << bad.toStdString();
}

TEST_P(SavedFiltersTest, AFilterIsKeptUnderItsNameForEveryWorkstation)
{
    Chance chance(8);
    auto first = chance.filter(0);
    first.items = {{.kind = FilterKind::groups, .item = 2, .text = u"as it was called"_s}};
    const auto key = save_filter(office(), u" Choir "_s, first);
    ASSERT_TRUE(key);
    ASSERT_TRUE(save_filter(office(), u"Ängste"_s, chance.filter(0)));
    ASSERT_TRUE(save_filter(office(), u"band"_s, chance.filter(0)));
    EXPECT_EQ(names(), (QStringList{u"Ängste"_s, u"band"_s, u"Choir"_s}));

    first.items.front().text = u"group 2"_s;
    EXPECT_EQ(load_filter(office(), *key), first) << "Items have the texts that they have now.";
}

TEST_P(SavedFiltersTest, AFilterOfTheSameNameIsReplacedOnceItIsConfirmed)
{
    const Filter old{.families = FamilyList::active}, fresh{.families = FamilyList::archive};
    const auto question = u"A filter named 'Choir' exists already, do you wish to replace it?"_s;
    const auto key = save_filter(office(), u"Choir"_s, old);
    dialogue().expect_confirm(question, Answer::no, Answer::no);
    EXPECT_EQ(save_filter(office(), u"CHOIR"_s, fresh), std::nullopt);
    EXPECT_EQ(load_filter(office(), *key), old);
    dialogue().expect_confirm(question, Answer::yes);
    EXPECT_EQ(save_filter(office(), u"CHOIR"_s, fresh), key);
    EXPECT_EQ(load_filter(office(), *key), fresh);
    EXPECT_EQ(names(), QStringList{u"CHOIR"_s});
}

TEST_P(SavedFiltersTest, NamesAreNeitherEmptyNorTwice)
{
    dialogue().expect_box(u"Please enter a name for this filter"_s);
    EXPECT_EQ(save_filter(office(), u" "_s, {}), std::nullopt);
    dialogue().expect_box(u"Please enter no more than 255 characters"_s);
    EXPECT_EQ(save_filter(office(), QString(256, u'x'), {}), std::nullopt);
    const auto choir = save_filter(office(), u"Choir"_s, {});
    ASSERT_TRUE(save_filter(office(), u"Band"_s, {}));
    dialogue().expect_box(u"A filter with this name already exists"_s);
    EXPECT_FALSE(rename_filter(office(), {*choir, u"Choir"_s}, u"BAND"_s));
    EXPECT_TRUE(rename_filter(office(), {*choir, u"Choir"_s}, u"choir"_s));
    EXPECT_EQ(names(), (QStringList{u"Band"_s, u"choir"_s}));
}

TEST_P(SavedFiltersTest, AFilterThatIsGoneOrTooNewIsRefused)
{
    const auto key = save_filter(office(), u"Choir"_s, {});
    session().execute(u"UPDATE [tbl_filter_memory] SET [content]='{\"version\":2}';"_s);
    dialogue().expect_box(u"Unable to use this filter as it was saved by a newer version of the program"_s);
    EXPECT_EQ(load_filter(office(), *key), std::nullopt);
    session().execute(u"UPDATE [tbl_filter_memory] SET [content]=NULL;"_s);
    dialogue().expect_box(u"Unable to use this filter as it cannot be read, please create it again"_s);
    EXPECT_EQ(load_filter(office(), *key), std::nullopt);

    dialogue().expect_confirm(u"Are you sure that you wish to delete the filter 'Choir'?"_s, Answer::no, Answer::no);
    EXPECT_FALSE(remove_filter(office(), {*key, u"Choir"_s}));
    dialogue().expect_confirm(u"Are you sure that you wish to delete the filter 'Choir'?"_s, Answer::yes);
    EXPECT_TRUE(remove_filter(office(), {*key, u"Choir"_s}));
    dialogue().expect_box(u"Unable to use this filter as another user has removed it"_s);
    EXPECT_EQ(load_filter(office(), *key), std::nullopt);
}

KINDREL_ON_BOTH_ENGINES(SavedFiltersTest);

TEST_P(SavedFiltersTest, OneThatAsksForBirthDatesOrVisitsNeedsTheirRight)
{
    const Filter by_age{.families = FamilyList::active, .ages = Ages{18, 30, {}}};
    const auto in_march = [](DateSource source) {
        Filter filter{.families = FamilyList::active};
        filter.dates.push_back({.source = source, .span = DateSpan::month, .month = 3});
        return filter;
    };
    for (const auto& [filter, right] : std::initializer_list<std::pair<Filter, core::Area>>{
             {by_age, core::Area::birth_dates},
             {in_march(DateSource::birth_date), core::Area::birth_dates},
             {in_march(DateSource::visits), core::Area::visitation_tab}}) {
        office().rights = core::Rights::all();
        const auto key = save_filter(office(), core::area_name(right).toString(), filter).value();
        EXPECT_EQ(load_filter(office(), key), filter);
        office().rights.set(right, false);
        dialogue().expect_box(u"Your password does not give access to \"%1\""_s.arg(core::area_name(right)));
        EXPECT_EQ(load_filter(office(), key), std::nullopt);
        session().execute(u"DELETE FROM [tbl_filter_memory];"_s);
    }
    office().rights.set(core::Area::birth_dates, false);
    const auto events = in_march(DateSource::events);
    EXPECT_EQ(load_filter(office(), save_filter(office(), u"Events"_s, events).value()), events);
}

TEST_P(SavedFiltersTest, ASavedFilterIsReplacedUnderItsNameWithoutAQuestion)
{
    const Filter old{.families = FamilyList::active}, fresh{.families = FamilyList::archive};
    const int key = save_filter(office(), u"Choir"_s, old).value();
    EXPECT_TRUE(replace_filter(office(), {key, u"Choir"_s}, fresh));
    EXPECT_EQ(load_filter(office(), key), fresh);
    EXPECT_EQ(names(), QStringList{u"Choir"_s});
}

TEST_P(SavedFiltersTest, OneThatAnotherUserRemovedIsNotMistakenForTheOneThatHasItsKeyNow)
{
    const Filter old{.families = FamilyList::active}, fresh{.families = FamilyList::archive};
    const SavedFilter gone{save_filter(office(), u"Choir"_s, old).value(), u"Choir"_s};
    session().execute(u"DELETE FROM [tbl_filter_memory];"_s);
    ASSERT_EQ(save_filter(office(), u"Easter"_s, fresh), gone.filter_id);

    const auto why = u"Unable to %1 this filter as another user has removed or renamed it"_s;
    dialogue().expect_box(why.arg(u"save"_s));
    EXPECT_FALSE(replace_filter(office(), gone, old));
    for (const auto& name : {u"Band"_s, u"EASTER"_s}) {
        dialogue().expect_box(why.arg(u"rename"_s));
        EXPECT_FALSE(rename_filter(office(), gone, name));
    }
    dialogue().expect_confirm(u"Are you sure that you wish to delete the filter 'Choir'?"_s, Answer::yes);
    dialogue().expect_box(why.arg(u"remove"_s));
    EXPECT_FALSE(remove_filter(office(), gone));
    EXPECT_EQ(names(), QStringList{u"Easter"_s});
    EXPECT_EQ(load_filter(office(), gone.filter_id), fresh);
}

} // namespace kindrel::test
