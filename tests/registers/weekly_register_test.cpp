#include "register_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using enum registers::FigureKind;
using registers::whole;

namespace {

using WeeklyRegisterTest = RegisterTest;

} // namespace

KINDREL_ON_BOTH_ENGINES(WeeklyRegisterTest);

TEST_P(WeeklyRegisterTest, TheCategoriesAreListedAttendanceFirstInTheirOrder)
{
    session().execute(u"UPDATE [tbl_weekly_group] SET [position]=3-[position] WHERE [group_type]=1;"_s);
    start_with({first});

    QStringList names;
    for (const auto& row : weekly->rows())
        names += row.category.name;
    EXPECT_EQ(names, QStringList({u"Evening"_s, u"Morning"_s, u"Offering"_s}));
    ASSERT_TRUE(weekly->leave());
    EXPECT_TRUE(weekly->rows().empty());
}

TEST_P(WeeklyRegisterTest, FiguresAreAddedAlteredAndTakenAway)
{
    start_with({first, second});
    type(*weekly, {u"120", u"", u"$1,045.50"});
    EXPECT_TRUE(weekly->altered());
    ASSERT_TRUE(weekly->save());
    EXPECT_FALSE(weekly->altered());
    EXPECT_EQ(stored(second), u"1:120 3:$1045.50");

    type(*weekly, {u"", u"80", u"1045.55"});
    ASSERT_TRUE(weekly->save());
    EXPECT_EQ(stored(second), u"2:80 3:$1045.55");
    EXPECT_EQ(stored(first), u"");
    ASSERT_TRUE(weekly->save());
    EXPECT_EQ(stored(second), u"2:80 3:$1045.55") << "Saving what is not altered changes nothing.";
    ASSERT_TRUE(weekly->open(weekly->dates().back().key));
    type(*weekly, {u"7", u"8"});
    ASSERT_TRUE(weekly->save());
    EXPECT_EQ(stored(first), u"1:7 2:8");
    EXPECT_EQ(stored(second), u"2:80 3:$1045.55") << "Another date was touched.";
}

TEST_P(WeeklyRegisterTest, AFigureTypedBackIsNoWorkToSave)
{
    start_with({first});
    type(*weekly, {u"120"});
    ASSERT_TRUE(weekly->save());
    type(*weekly, {u"121"});
    EXPECT_TRUE(weekly->altered());
    type(*weekly, {u"120"});
    EXPECT_FALSE(weekly->altered());
}

TEST_P(WeeklyRegisterTest, ARefusedFigureLeavesTheOneBefore)
{
    start_with({first});
    type(*weekly, {u"99999", u"", u"99999"});
    dialogue().expect_box(u"Please enter a number under 99,000"_s);
    EXPECT_FALSE(weekly->enter_figure(0, u"100000"_s));
    dialogue().expect_box(u"Please enter an amount under $99,000"_s);
    EXPECT_FALSE(weekly->enter_figure(2, u"99999.01"_s));
    ASSERT_TRUE(weekly->save());
    EXPECT_EQ(stored(first), u"1:99999 3:$99999.00");
}

TEST_P(WeeklyRegisterTest, TheDateBeforeStandsBesideTheOpenOne)
{
    start_with({first});
    EXPECT_FALSE(weekly->last_date());
    type(*weekly, {u"100", u"", u"10"});
    ASSERT_TRUE(weekly->save());
    ASSERT_TRUE(weekly->add(third));
    EXPECT_EQ(weekly->last_date(), first);
    EXPECT_EQ(weekly->rows()[0].last, whole(100));
    EXPECT_EQ(weekly->rows()[1].last, std::nullopt);
    EXPECT_EQ(weekly->rows()[2].last, whole(10));

    ASSERT_TRUE(weekly->add(second));
    type(*weekly, {u"200"});
    EXPECT_EQ(weekly->last_date(), first);
    ASSERT_TRUE(weekly->change_date({2024, 5, 19}));
    EXPECT_EQ(weekly->last_date(), third) << "After another day was given.";
    EXPECT_EQ(weekly->rows()[0].last, std::nullopt);
    EXPECT_EQ(weekly->rows()[0].figure, whole(200));
}

TEST_P(WeeklyRegisterTest, HeadsAndMoneyAreTotalledApart)
{
    start_with({first});
    type(*weekly, {u"120", u"85", u"1045.55"});

    EXPECT_EQ(weekly->total(attendance), whole(205));
    EXPECT_EQ(weekly->total(money), core::Amount{10455500});
}

} // namespace kindrel::test
