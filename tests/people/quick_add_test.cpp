#include "people/quick_add.h"
#include "people/setup_rows.h"
#include "setup_fixture.h"
#include "support/processes.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using enum SetupKind;

namespace {

class QuickAddTest : public SetupTest
{
};

} // namespace

KINDREL_ON_BOTH_ENGINES(QuickAddTest);

TEST_P(QuickAddTest, ANewItemStandsBelowTheLowest)
{
    session().execute(u"UPDATE [tbl_occupation_setup] SET [position]=41 WHERE [occupation_id]=2;"_s);

    EXPECT_EQ(add_occupation(desk->office, u"  Midwife "_s), 4);
    EXPECT_EQ(add_new_suburb(desk->office, u" Richmond"_s, u"3121 "_s), 4);

    const auto rows = read_setup_rows(session(), setup_list(occupations));
    EXPECT_EQ(rows.back(), (SetupRow{{.key = 4, .text = u"Midwife"_s}, 42}));
    EXPECT_EQ(stored(suburbs).back(), u"Richmond 3121"_s);
}

TEST_P(QuickAddTest, WhatDiffersInCaseOrBlanksOnlyIsNotAddedAgain)
{
    const auto counter = u"SELECT MAX([id_found]) FROM [tbl_id_occupation];"_s;
    EXPECT_EQ(add_occupation(desk->office, u" OCCUPATION 2\t"_s), 2);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_occupation_setup];"_s), 3);
    EXPECT_EQ(number_of(session(), counter), 3) << "A key was used up.";

    EXPECT_EQ(add_new_suburb(desk->office, u"Suburb 1"_s, u" 3000"_s), 1);
    EXPECT_EQ(add_new_suburb(desk->office, u"Suburb 1"_s, u"3001"_s), 4) << "Another place of that name.";
}

TEST_P(QuickAddTest, WhatIsMissingIsAskedForAndNothingIsAdded)
{
    auto& dialogue = desk->dialogue;
    dialogue.expect_box(u"Please enter a Occupation"_s);
    EXPECT_FALSE(add_occupation(desk->office, u" "_s));
    dialogue.expect_box(u"Please enter a suburb"_s);
    EXPECT_FALSE(add_new_suburb(desk->office, {}, u"3000"_s));
    dialogue.expect_box(u"Please enter a postcode"_s);
    EXPECT_FALSE(add_new_suburb(desk->office, u"Richmond"_s, u" "_s));
    dialogue.expect_box(u"Please enter no more than 255 characters"_s);
    EXPECT_FALSE(add_occupation(desk->office, QString(256, u'x')));
    EXPECT_EQ(stored(occupations).size() + stored(suburbs).size(), 6);
}

TEST_P(QuickAddTest, WhoFillsInFamiliesOrSetsUpTheListsMayAdd)
{
    const auto read_only = u"Unable to add this item as you only have read only access within family files"_s;
    const auto no_access = u"Your password does not give access to \"Family File Setup\""_s;
    struct Case
    {
        std::vector<core::Area> granted;
        QString refusal = {};
    };
    int added = 0;
    for (const auto& [granted, refusal] :
         {Case{{core::Area::search_for_family}}, Case{{core::Area::add_family}}, Case{{core::Area::family_file_setup}},
          Case{{core::Area::family_file_setup, core::Area::read_only_family_data}},
          Case{{core::Area::search_for_family, core::Area::read_only_family_data}, read_only},
          Case{{core::Area::roll}, no_access}}) {
        desk->office.rights = {};
        for (const auto area : granted)
            desk->office.rights.set(area, true);
        if (!refusal.isEmpty())
            desk->dialogue.expect_box(refusal);
        EXPECT_EQ(add_occupation(desk->office, u"job %1"_s.arg(added)).has_value(), refusal.isEmpty());
        added += refusal.isEmpty();
    }
    EXPECT_EQ(stored(occupations).size(), 3 + added);
}

TEST_P(QuickAddTest, NothingIsAddedWhileTheNetworkIsGone)
{
    desk->office.mode = core::Mode::network; // Its folder names no church.
    desk->dialogue.expect_box(u"Unable to access your network files."_s);
    EXPECT_FALSE(add_occupation(desk->office, u"Cook"_s));
    EXPECT_EQ(stored(occupations).size(), 3);
}

TEST_P(QuickAddTest, WorkstationsThatAddAndSaveAtOnceLoseNothingAndDoubleNothing)
{
    constexpr int jobs = 20;
    const auto add_all = [this](bool loud) {
        return [this, loud] {
            desk->office.session = church->another();
            for (int job = 0; job < jobs; ++job) {
                const auto text = u"job %1"_s.arg(job);
                (void)add_occupation(desk->office, loud ? text.toUpper() : text);
            }
            return QByteArray();
        };
    };
    const auto save_meanwhile = [this] {
        desk->office.session = church->another();
        for (int round = 0; round < jobs; ++round) {
            auto editor = open();
            if (!editor.add(occupations, u"own %1"_s.arg(round)) || !editor.save())
                return QByteArray("refused");
        }
        return QByteArray();
    };
    desk->office.session.reset();
    church->close();

    const auto results = run_together({add_all(true), add_all(false), save_meanwhile});

    church->reopen();
    EXPECT_EQ(results, std::vector<QByteArray>(3));
    QSet<QString> found;
    for (const auto& text : stored(occupations))
        found.insert(sameness(text));
    EXPECT_EQ(found.size(), 3 + 2 * jobs);
    EXPECT_EQ(stored(occupations).size(), found.size());
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(DISTINCT [position]) FROM [tbl_occupation_setup];"_s), found.size());
}

} // namespace kindrel::test
