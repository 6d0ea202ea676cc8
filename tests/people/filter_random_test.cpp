#include "filter_chance.h"
#include "filter_reference.h"
#include "people/family_store.h"
#include "people/filter_search.h"
#include "people/fusion_rows.h"
#include "support/families.h"
#include "support/test_church.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;

namespace {

constexpr int families = 150, fusions = 12, filters = 1500;
const QDate today(2024, 5, 15);

class RandomFilterTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (!church)
            return;
        add_setup_items(session());
        files = chance.church(families);
        add_families(session(), files, today);
        std::vector<Fusion> added;
        for (int number = 1; number <= fusions; ++number)
            added.push_back(chance.fusion(number));
        save_fusions(session(), added, {});
        for (int key = 1; auto& fusion : added)
            fusion.fusion_id = key++;
        drawn = std::move(added);
    }

    Chance chance{20240515};
    std::vector<FamilyFile> files;
    std::vector<Fusion> drawn;
};

std::vector<int> keys(const std::vector<Member>& members)
{
    std::vector<int> found;
    for (const auto& member : members)
        found.push_back(member.person_id);
    return found;
}

} // namespace

TEST_P(RandomFilterTest, FindsWhomTheFilterMeansAndInOrder)
{
    int found_somebody = 0;
    for (int number = 0; number < filters; ++number) {
        const auto filter = chance.filter(fusions);
        const auto expected = keys(meant(files, filter, drawn, today));
        const auto found = find_people(session(), filter, {today});
        ASSERT_EQ(keys(found.members), expected) << "Filter " << number << ": " << found.criteria.toStdString();
        if (number % 5 == 0) {
            ASSERT_EQ(count_people(session(), filter, {today}), static_cast<int>(expected.size()));
        }
        found_somebody += !expected.empty();
    }
    EXPECT_GT(found_somebody, filters / 4) << "The filters drawn ask too much to tell anything.";
    EXPECT_LT(found_somebody, filters);
}

TEST_P(RandomFilterTest, TheEmptyingCriterionIsTheFirstThatLeavesNobody)
{
    int emptied = 0;
    for (int number = 0; number < filters / 10; ++number) {
        auto filter = chance.filter(fusions);
        const auto emptying = emptying_criterion(session(), filter, {today});
        ASSERT_EQ(emptying.has_value(), meant(files, filter, drawn, today).empty());
        if (!emptying)
            continue;
        ++emptied;
        const auto words = sentence(session(), filter, {today});
        EXPECT_TRUE(words.split(u"; "_s).contains(*emptying)) << words.toStdString();
    }
    EXPECT_GT(emptied, 10);
}

KINDREL_ON_BOTH_ENGINES(RandomFilterTest);

} // namespace kindrel::test
