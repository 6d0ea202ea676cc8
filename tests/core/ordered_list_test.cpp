#include "core/ordered_list.h"

#include <gtest/gtest.h>

#include <string>

namespace kindrel::test {

using Words = std::vector<std::string>;
using List = core::OrderedList<std::string>;

TEST(OrderedListTest, MovesSwapNeighboursAndAreRefusedAtTheEnds)
{
    struct Case
    {
        bool up;
        int index;
        bool moved;
        Words after;
    };
    const std::vector<Case> cases{{true, 0, false, {"a", "b", "c"}},  {true, 1, true, {"b", "a", "c"}},
                                  {true, 2, true, {"a", "c", "b"}},   {true, -1, false, {"a", "b", "c"}},
                                  {false, 2, false, {"a", "b", "c"}}, {false, 0, true, {"b", "a", "c"}},
                                  {false, 1, true, {"a", "c", "b"}},  {false, -1, false, {"a", "b", "c"}}};
    for (const auto& [up, index, moved, after] : cases) {
        List list({"a", "b", "c"});
        EXPECT_EQ(up ? list.move_up(index) : list.move_down(index), moved) << up << index;
        EXPECT_EQ(list.items(), after) << up << index;
    }
}

TEST(OrderedListTest, AListBroughtBackToItsStoredStateIsNotAltered)
{
    List list({"a", "b"});
    EXPECT_FALSE(list.altered());
    list.insert(1, "new");
    EXPECT_TRUE(list.altered());
    list.remove(1);
    EXPECT_FALSE(list.altered());
    EXPECT_TRUE(list.move_down(0));
    EXPECT_TRUE(list.altered());
    EXPECT_EQ(list.stored(), (Words{"a", "b"}));
    EXPECT_TRUE(list.move_down(0));
    EXPECT_FALSE(list.altered());
}

TEST(OrderedListTest, EqualItemsKeepTheirOrderWhenSorted)
{
    List list({"pear", "fig", "plum", "elder", "lime"});
    list.sort_by([](const std::string& word) { return word.size(); });
    EXPECT_EQ(list.items(), (Words{"fig", "pear", "plum", "lime", "elder"}));
}

} // namespace kindrel::test
