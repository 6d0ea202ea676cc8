#include "people/family_store.h"
#include "people/filter_search.h"
#include "people/fusion_setup.h"
#include "setup_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using core::Answer;
using enum FusionMode;

namespace {

FilterItem item(FilterKind kind, int key, const QString& text)
{
    return {.kind = kind, .item = key, .text = text};
}

const auto choir = item(FilterKind::groups, 1, u"group 1"_s);
const auto band = item(FilterKind::groups, 2, u"group 2"_s);
const auto elder = item(FilterKind::status, 1, u"status 1"_s);

QStringList shown(const Fusion& fusion)
{
    QStringList texts;
    for (const auto& entry : fusion.entries)
        texts += entry.shown();
    return texts;
}

/// On a church file alone: rules that ask no engine.
class FusionSetupTest : public testing::Test
{
protected:
    FusionSetupTest() { fill_setup_lists(church.session()); }
    [[nodiscard]] FusionSetup open() { return FusionSetup(desk.office); }

    TestChurch church{core::EngineKind::sqlite};
    SetupOffice desk{church};
    ScriptedDialogue& dialogue = desk.dialogue;
};

class FusionTest : public EngineTest
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
    [[nodiscard]] FusionSetup open() { return FusionSetup(desk->office); }
    [[nodiscard]] std::vector<Fusion> stored() { return read_fusions(session()); }

    std::optional<SetupOffice> desk;
};

} // namespace

TEST_F(FusionSetupTest, AnEntryNeedsAFusion)
{
    auto setup = open();
    dialogue.expect_box(u"Please add a new fusion name before adding filters to it"_s);
    EXPECT_FALSE(setup.add_entry(-1, choir, or_plus));
    ASSERT_TRUE(setup.add(u"Leaders"_s));
    dialogue.expect_box(u"Please select a fusion group first before attempting to add filters to it"_s);
    EXPECT_FALSE(setup.add_entry(-1, choir, or_plus));
    EXPECT_TRUE(setup.add_entry(0, choir, or_plus));
}

TEST_F(FusionSetupTest, TheSameItemIsNotAddedTwice)
{
    auto setup = open();
    ASSERT_TRUE(setup.add(u"Leaders"_s));
    auto active = item(FilterKind::ministry, 1, u"ministry 1"_s);
    active.ministry = MinistryChoice::active;
    auto potential = active;
    potential.ministry = MinistryChoice::potential;
    auto date = item(FilterKind::dates, 1, u"date 1"_s);
    auto marked_date = date;
    marked_date.marks = Marks::marked;
    for (const auto& added : {choir, elder, active, potential, date})
        EXPECT_TRUE(setup.add_entry(0, added, or_plus)) << added.text.toStdString();
    for (const auto& [again, mode] : {std::pair{choir, and_minus}, {active, or_plus}, {marked_date, or_plus}}) {
        dialogue.expect_box(u"This filter has already been added to the filters list"_s);
        EXPECT_FALSE(setup.add_entry(0, again, mode)) << again.text.toStdString();
    }
    ASSERT_TRUE(setup.add(u"Others"_s));
    EXPECT_TRUE(setup.add_entry(1, choir, or_plus)) << "Another fusion may hold it too.";
}

TEST_F(FusionSetupTest, EntriesShowTheirModeStateAndMark)
{
    auto setup = open();
    ASSERT_TRUE(setup.add(u"Leaders"_s));
    auto ministry = item(FilterKind::ministry, 1, u"Music"_s);
    ministry.ministry = MinistryChoice::potential;
    auto diet = item(FilterKind::flexi, 1, u"Diet"_s);
    diet.marks = Marks::marked;
    diet.value = u"Vegan"_s;
    ASSERT_TRUE(setup.add_entry(0, choir, or_plus));
    ASSERT_TRUE(setup.add_entry(0, elder, or_minus));
    ASSERT_TRUE(setup.add_entry(0, ministry, and_plus));
    ASSERT_TRUE(setup.add_entry(0, diet, or_plus));
    ASSERT_TRUE(setup.set_mode(0, 3, and_minus));
    EXPECT_EQ(shown(setup.fusions()[0]),
              (QStringList{u"group 1 (OR+ Can be in Group)"_s, u"status 1 (OR- Can be Not in Group)"_s,
                           u"(Potential) Music (And+ Must be in group)"_s,
                           u"(Tag) Diet = Vegan (And- Must Not be in Group)"_s}));
}

TEST_F(FusionSetupTest, EntriesMoveAndStopAtTheEnds)
{
    auto setup = open();
    ASSERT_TRUE(setup.add(u"Leaders"_s));
    dialogue.expect_box(u"Please select an item for moving"_s);
    EXPECT_FALSE(setup.move_entry_up(0, -1));
    ASSERT_TRUE(setup.add_entry(0, choir, or_plus));
    ASSERT_TRUE(setup.add_entry(0, band, or_plus));
    dialogue.expect_box(u"Please select an item for moving"_s);
    EXPECT_FALSE(setup.move_entry_down(-1, 0));
    dialogue.expect_box(u"This is the highest position this item can be moved to"_s);
    EXPECT_FALSE(setup.move_entry_up(0, 0));
    dialogue.expect_box(u"This is the lowest position this item can be moved to"_s);
    EXPECT_FALSE(setup.move_entry_down(0, 1));
    EXPECT_EQ(setup.fusions()[0].entries.front().item.text, u"group 1"_s);

    EXPECT_TRUE(setup.move_entry_down(0, 0));
    EXPECT_EQ(setup.fusions()[0].entries.front().item.text, u"group 2"_s);
    EXPECT_TRUE(setup.move_entry_up(0, 1));
    EXPECT_EQ(setup.fusions()[0].entries.front().item.text, u"group 1"_s);
    EXPECT_TRUE(setup.remove_entry(0, 0));
    dialogue.expect_box(u"Please select an item for removing"_s);
    EXPECT_FALSE(setup.remove_entry(0, 1));
    EXPECT_EQ(shown(setup.fusions()[0]), QStringList{u"group 2 (OR+ Can be in Group)"_s});
}

TEST_F(FusionSetupTest, AFusionGoesOnceItIsConfirmed)
{
    auto setup = open();
    ASSERT_TRUE(setup.add(u"Leaders"_s));
    const auto question = u"Are you sure that you wish to delete this filter fusion"_s;
    dialogue.expect_confirm(question, Answer::no, Answer::no);
    EXPECT_FALSE(setup.remove(0));
    dialogue.expect_confirm(question, Answer::yes);
    EXPECT_TRUE(setup.remove(0));
    EXPECT_TRUE(setup.fusions().empty());
    dialogue.expect_box(u"Please select a fusion group first before attempting to delete it"_s);
    EXPECT_FALSE(setup.remove(0));
}

TEST_F(FusionSetupTest, NamesAreNeitherEmptyNorTwice)
{
    auto setup = open();
    ASSERT_TRUE(setup.add(u" Leaders "_s));
    ASSERT_TRUE(setup.add(u"Others"_s));
    dialogue.expect_box(u"Please enter a fusion name"_s);
    EXPECT_FALSE(setup.add(u"  "_s));
    dialogue.expect_box(u"This fusion already exists in the list"_s);
    EXPECT_FALSE(setup.add(u"LEADERS"_s));
    dialogue.expect_box(u"This fusion already exists in the list"_s);
    EXPECT_FALSE(setup.rename(1, u"leaders"_s));
    EXPECT_TRUE(setup.rename(0, u"leaders"_s));
    EXPECT_EQ(setup.fusions()[0].name, u"leaders"_s);
}

TEST_F(FusionSetupTest, MinistriesAreOfferedInBothStatesAndOfGroupsThoseThatMeet)
{
    church.session().execute(u"UPDATE [tbl_group_setup] SET [not_active]=-1 WHERE [group_id]=2;"_s);
    const auto setup = open();
    QStringList groups, ministries;
    for (const auto& choice : setup.choices(FilterKind::groups))
        groups += choice.text;
    for (const auto& choice : setup.choices(FilterKind::ministry))
        ministries +=
            u"%1 %2"_s.arg(choice.item).arg(choice.ministry == MinistryChoice::active ? u"active" : u"potential");
    EXPECT_EQ(groups, (QStringList{u"group 1"_s, u"group 3"_s}));
    EXPECT_EQ(ministries, (QStringList{u"1 active"_s, u"1 potential"_s, u"2 active"_s, u"2 potential"_s, u"3 active"_s,
                                       u"3 potential"_s}));
}

TEST_F(FusionSetupTest, NothingIsSavedWithoutTheRight)
{
    auto setup = open();
    ASSERT_TRUE(setup.add(u"Leaders"_s));
    desk.office.rights.set(core::Area::filter_fusion_setup, false);
    dialogue.expect_box(
        u"Your password does not give access to \"%1\""_s.arg(core::area_name(core::Area::filter_fusion_setup)));
    EXPECT_FALSE(setup.save());
    EXPECT_TRUE(read_fusions(church.session()).empty());
}

TEST_P(FusionTest, ASavedFusionComesBackAsItWas)
{
    auto setup = open();
    ASSERT_TRUE(setup.add(u"Leaders"_s));
    ASSERT_TRUE(setup.add(u"Others"_s));
    ASSERT_TRUE(setup.set_states(0, {.active = false, .privacy = true, .deceased = true}));
    auto diet = item(FilterKind::flexi, 1, u"flexi 1"_s);
    diet.marks = Marks::marked;
    diet.value = u"Vegan"_s;
    auto ministry = item(FilterKind::ministry, 2, u"ministry 2"_s);
    ministry.ministry = MinistryChoice::potential;
    for (const auto& [added, mode] :
         {std::pair{elder, and_plus}, {diet, or_minus}, {ministry, and_minus}, {choir, or_plus}})
        ASSERT_TRUE(setup.add_entry(0, added, mode));
    auto expected = setup.fusions().items();
    EXPECT_TRUE(setup.save());
    EXPECT_FALSE(setup.altered());
    expected[0].fusion_id = 1;
    expected[1].fusion_id = 2;
    EXPECT_EQ(stored(), expected);
    EXPECT_EQ(setup.fusions().items(), expected);
}

TEST_P(FusionTest, ASaveKeepsWhatOthersStoredMeanwhile)
{
    auto first = open();
    for (const auto& name : {u"One"_s, u"Two"_s, u"Three"_s})
        ASSERT_TRUE(first.add(name));
    ASSERT_TRUE(first.add_entry(1, elder, or_plus));
    ASSERT_TRUE(first.save());
    auto second = open();
    ASSERT_TRUE(second.add_entry(0, choir, and_plus));
    ASSERT_TRUE(second.add(u"Four"_s));
    desk->dialogue.expect_confirm(u"Are you sure that you wish to delete this filter fusion"_s, Answer::yes);
    ASSERT_TRUE(first.remove(1));
    ASSERT_TRUE(first.rename(1, u"Drei"_s));
    ASSERT_TRUE(second.save());
    ASSERT_TRUE(first.save());

    QStringList names;
    for (const auto& fusion : stored())
        names += u"%1 %2"_s.arg(fusion.name, shown(fusion).join(u','));
    EXPECT_EQ(names, (QStringList{u"One group 1 (And+ Must be in group)"_s, u"Drei "_s, u"Four "_s}));
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [Tbl_fusion_records];"_s), 1)
        << "A deleted fusion takes its entries along.";
}

TEST_P(FusionTest, ModesAndLostItemsDecideWhoIsFound)
{
    std::vector<FamilyFile> files;
    const auto add = [&](const QString& name, const std::vector<int>& groups, bool is_elder) {
        auto& person = files.emplace_back(family(name, {name})).people.front();
        for (const int group : groups)
            person.groups.push_back({group, {}, 0, {}, {}, false});
        if (is_elder)
            person.status.push_back({1, {}, 0, {}, {}, false});
    };
    add(u"Ada"_s, {1}, false);
    add(u"Ben"_s, {1, 2}, false);
    add(u"Cy"_s, {2}, true);
    add(u"Di"_s, {}, true);
    add(u"Eve"_s, {}, false);
    add_families(session(), files, desk->clock.today());
    const auto gone = item(FilterKind::groups, 9, u"gone"_s);
    const std::vector<std::pair<std::vector<FusionEntry>, QStringList>> cases{
        {{{choir, or_plus}, {elder, or_plus}}, {u"Ada"_s, u"Ben"_s, u"Cy"_s, u"Di"_s}},
        {{{choir, or_minus}}, {u"Ben"_s, u"Cy"_s, u"Di"_s, u"Eve"_s}},
        {{{choir, and_minus}}, {u"Cy"_s, u"Di"_s, u"Eve"_s}},
        {{{choir, and_plus}, {band, and_plus}}, {u"Ben"_s}},
        {{{choir, or_plus}, {band, and_minus}}, {u"Ada"_s}},
        {{{elder, or_plus}, {choir, or_plus}, {band, and_plus}}, {u"Ben"_s, u"Cy"_s}},
        {{{gone, and_plus}, {elder, or_plus}}, {u"Cy"_s, u"Di"_s}},
        {{{gone, and_minus}}, {}},
        {{}, {u"Ada"_s, u"Ben"_s, u"Cy"_s, u"Di"_s, u"Eve"_s}},
    };
    auto setup = open();
    for (std::size_t number = 0; number < cases.size(); ++number) {
        ASSERT_TRUE(setup.add(u"Fusion %1"_s.arg(number)));
        for (const auto& entry : cases[number].first)
            ASSERT_TRUE(setup.add_entry(static_cast<int>(number), entry.item, entry.mode));
    }
    ASSERT_TRUE(setup.save());
    for (std::size_t number = 0; number < cases.size(); ++number) {
        Filter filter{.families = FamilyList::all};
        apply(filter, setup.fusions()[static_cast<int>(number)]);
        QStringList names;
        for (const auto& member : find_people(session(), filter, {desk->clock.today()}).members)
            names += files[static_cast<std::size_t>(member.person_id - 1)].people.front().Name;
        EXPECT_EQ(names, cases[number].second) << number;
    }
}

TEST_P(FusionTest, ApplyingAFusionSetsTheSwitches)
{
    auto setup = open();
    const PersonStates states{.active = false, .contact = true};
    ASSERT_TRUE(setup.add(u"Contacts"_s));
    ASSERT_TRUE(setup.set_states(0, states));
    ASSERT_TRUE(setup.save());
    Filter filter{.families = FamilyList::active};
    apply(filter, stored().front());
    apply(filter, stored().front());
    EXPECT_EQ(filter.states, states);
    EXPECT_EQ(filter.fusions, std::vector{1});
    EXPECT_EQ(sentence(session(), filter, {}),
              u"Active Families; people who are contacts, or of no state; of the fusion Contacts"_s);
}

KINDREL_ON_BOTH_ENGINES(FusionTest);

} // namespace kindrel::test
