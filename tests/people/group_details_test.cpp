#include "people/group_details.h"
#include "setup_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;

namespace {

class GroupDetailsTest : public SetupTest
{
};

} // namespace

KINDREL_ON_BOTH_ENGINES(GroupDetailsTest);

TEST_P(GroupDetailsTest, DetailsAreLoadedAsTheyWereSavedLast)
{
    GroupDetails details;
    details.group_id = 2;
    EXPECT_EQ(load_group_details(session(), 2), details) << "A group begins without details.";
    for (const auto& field : group_detail_fields())
        details.*std::get<QString GroupDetails::*>(field.member) = u"first "_s + QString::fromLatin1(field.name);
    ASSERT_TRUE(save_group_details(desk->office, details));
    EXPECT_EQ(load_group_details(session(), 2), details);

    details.leader = u"Żółć"_s;
    details.comments.clear();
    ASSERT_TRUE(save_group_details(desk->office, details));
    EXPECT_EQ(load_group_details(session(), 2), details);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_group_details];"_s), 1);
}

TEST_P(GroupDetailsTest, NothingIsSavedWithoutTheRightOrForAGroupThatIsGone)
{
    GroupDetails details;
    details.group_id = 9;
    desk->dialogue.expect_box(u"Unable to save these details as the group is no longer in the list of groups"_s);
    EXPECT_FALSE(save_group_details(desk->office, details));
    details.group_id = 1;
    desk->office.rights.set(core::Area::family_file_setup, false);
    desk->dialogue.expect_box(u"Your password does not give access to \"Family File Setup\""_s);
    EXPECT_FALSE(save_group_details(desk->office, details));
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_group_details];"_s), 0);
}

} // namespace kindrel::test
