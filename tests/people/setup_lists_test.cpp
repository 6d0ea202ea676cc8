#include "people/family_store.h"
#include "setup_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using enum SetupKind;

namespace {

const QDate today(2024, 5, 15);

class SetupListsTest : public SetupTest
{
};

/// Two full families; the second lives and gets its post in suburb 1, and its people carry one ministry less.
void add_carriers(core::Session& session)
{
    auto first = full_family(false);
    auto second = full_family(false);
    second.postal->suburb_id = 1;
    for (auto& member : second.people) {
        member.personal_pin.clear();
        member.ministries.pop_back();
        member.Title = u"Title 3"_s;
    }
    first.people.front().Title = u"Title 3"_s;
    (void)save_family(session, first, today);
    (void)save_family(session, second, today);
}

} // namespace

KINDREL_ON_BOTH_ENGINES(SetupListsTest);

TEST_P(SetupListsTest, EveryListIsReadInItsOrderWithThoseWhoCarryEachItem)
{
    add_carriers(session());
    const std::vector<std::pair<SetupKind, std::vector<int>>> users{
        {status, {6, 6, 0}},       {groups, {6, 0, 6}},        {ministries, {6, 0, 0}},   {personal_dates, {6, 0, 6}},
        {flexi_fields, {6, 0, 0}}, {family_groups, {2, 2, 0}}, {family_dates, {0, 2, 0}}, {titles, {0, 0, 4}},
        {occupations, {0, 6, 0}},  {suburbs, {2, 1, 0}}};
    ASSERT_EQ(users.size(), static_cast<std::size_t>(setup_list_count));
    for (const auto& [kind, expected] : users) {
        const auto& list = setup_list(kind);
        session().execute(u"UPDATE [%1] SET [position]=4-[position];"_s.arg(QString::fromLatin1(list.table)));
        const auto items = read_setup_items_with_users(session(), kind);
        ASSERT_EQ(items.size(), 3u) << list.table;
        for (std::size_t i = 0; i < 3; ++i) {
            EXPECT_EQ(items[i].key, 3 - static_cast<int>(i)) << list.table;
            EXPECT_EQ(items[i].users, expected[2 - i]) << list.table << ' ' << items[i].key;
            EXPECT_TRUE(items[i].text.endsWith(QString::number(items[i].key))) << items[i].text.toStdString();
            EXPECT_EQ(items[i].postcode, kind == suburbs ? u"3000"_s : QString());
        }
    }
}

TEST_P(SetupListsTest, AGroupThatNoLongerMeetsIsStillInTheList)
{
    session().execute(u"UPDATE [tbl_group_setup] SET [not_active]=-1 WHERE [group_id]=2;"_s);
    const auto items = read_setup_items(session(), groups);
    ASSERT_EQ(items.size(), 3u);
    EXPECT_FALSE(items[0].not_active);
    EXPECT_TRUE(items[1].not_active);
}

TEST(SetupTextTest, CaseBlanksAndHowAnAccentIsWrittenMakeNoDifference)
{
    const std::vector<std::tuple<QString, QString, bool>> cases{
        {u"Plumber"_s, u"  plumber\t"_s, true}, {u"Café"_s, u"CAFE\u0301"_s, true}, {u"Cafe"_s, u"Café"_s, false},
        {u"Day Care"_s, u"Day  Care"_s, false}, {u"Ärztin"_s, u"ärztin "_s, true},
    };
    for (const auto& [one, other, same] : cases)
        EXPECT_EQ(sameness(one) == sameness(other), same) << one.toStdString() << " / " << other.toStdString();
    EXPECT_NE(sameness(u"Richmond"_s, u"3121"_s), sameness(u"Richmond"_s, u"2753"_s));
}

} // namespace kindrel::test
