#include "core/vision_setup.h"

#include "workplace.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

class VisionSetupTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (church)
            place.emplace(*church);
    }
    [[nodiscard]] VisionSetup open()
    {
        auto setup = VisionSetup::open(place->office);
        EXPECT_TRUE(setup);
        return std::move(*setup);
    }
    [[nodiscard]] Settings stored() { return read_settings(session()); }

    std::optional<Workplace> place;
};
KINDREL_ON_BOTH_ENGINES(VisionSetupTest);

TEST_P(VisionSetupTest, WhatIsSavedIsStoredAndUsedByTheOffice)
{
    auto setup = open();
    EXPECT_FALSE(setup.altered());
    auto& wanted = setup.settings();
    wanted.vision = u"To serve\nthis town"_s;
    wanted.church_vision = u"To serve"_s;
    wanted.Include_vision_reports = true;
    wanted.vision_font = u"Georgia"_s;
    wanted.vision_font_size = 12;
    wanted.vision_format = 3;
    wanted.vision_alignment = 2;
    wanted.vision_thick_line = true;
    wanted.footer_vision = u"St Mark's"_s;
    wanted.include_vision_footer = true;
    EXPECT_TRUE(setup.altered());

    ASSERT_TRUE(setup.save());

    EXPECT_FALSE(setup.altered());
    const auto now = stored();
    EXPECT_EQ(now.vision, u"To serve\r\nthis town"_s);
    EXPECT_EQ(now.church_vision, u"To serve"_s);
    EXPECT_TRUE(now.Include_vision_reports && now.vision_thick_line && now.include_vision_footer);
    EXPECT_FALSE(now.vision_line || now.footer_line);
    EXPECT_EQ(now.vision_font, u"Georgia"_s);
    EXPECT_EQ((std::array{now.vision_font_size, now.vision_format, now.vision_alignment}), (std::array{12, 3, 2}));
    EXPECT_EQ(place->office.settings.footer_vision, u"St Mark's"_s);
    EXPECT_EQ(place->office.settings.vision_font_size, 12);
}

TEST_P(VisionSetupTest, TheLineEndsOfOtherProgramsAreNoChange)
{
    write_setting(session(), u"vision"_s, u"One\r\nTwo"_s);
    auto setup = open();
    EXPECT_EQ(setup.settings().vision, u"One\nTwo"_s);
    EXPECT_FALSE(setup.altered());
    setup.settings().footer_line = true;
    ASSERT_TRUE(setup.save());
    EXPECT_EQ(stored().vision, u"One\r\nTwo"_s);
}

TEST_P(VisionSetupTest, WhatAnotherWorkstationChangedMeanwhileStaysAndIsFollowed)
{
    auto setup = open();
    write_setting(session(), u"footer_vision"_s, u"of the other"_s);
    write_setting(session(), u"title_logo"_s, true);
    setup.settings().vision = u"of this one"_s;

    ASSERT_TRUE(setup.save());

    EXPECT_EQ(stored().vision, u"of this one"_s);
    EXPECT_EQ(stored().footer_vision, u"of the other"_s);
    EXPECT_TRUE(stored().title_logo);
    EXPECT_EQ(setup.settings().footer_vision, u"of the other"_s);
    EXPECT_EQ(place->office.settings.footer_vision, u"of the other"_s);
    EXPECT_FALSE(place->office.settings.title_logo) << "it belongs to another area";
}

TEST_P(VisionSetupTest, WhatReportsCouldNotPrintIsRefusedAndNothingIsWritten)
{
    struct Case
    {
        QString field, refusal;
        std::function<void(Settings&)> alter;
    };
    const QString size = u"Please choose letters from 6 to 48 points high."_s;
    const QString high = u"The vision statement would take more than a third of every page of a report."_s;
    const Case cases[]{
        {u"vision_font_size"_s, size,
         [](Settings& s) {
             s.vision_font_size = 5;
         }},
        {u"vision_font_size"_s, size,
         [](Settings& s) {
             s.vision_font_size = 49;
         }},
        {u"vision"_s, u"The vision statement is too long: there is room for 1000 characters."_s,
         [](Settings& s) {
             s.vision = QString(1001, u'v');
         }},
        {u"footer_vision_line2"_s, u"The line at the foot of reports is too long: there is room for 120 characters."_s,
         [](Settings& s) {
             s.footer_vision_line2 = QString(121, u'f');
         }},
        {u"vision"_s, high,
         [](Settings& s) {
             s.Include_vision_reports = true;
             s.vision = QString(300, u'v');
             s.vision_font_size = 40;
         }},
        {u"church_vision"_s, high,
         [](Settings& s) {
             s.Include_vision_reports = true;
             s.church_vision = QString(30, u'\n');
         }},
        {u"footer_vision"_s, u"The lines at the foot would take more than a sixth of every page of a report."_s,
         [](Settings& s) {
             s.include_vision_footer = true;
             s.footer_vision = QString(100, u'f');
             s.vision_font_size = 48;
         }},
    };
    const QString before = stored().vision_font;
    for (const auto& given : cases) {
        SCOPED_TRACE(given.refusal.toStdString());
        auto setup = open();
        setup.settings().vision_font = u"Never"_s;
        given.alter(setup.settings());
        place->dialogue.expect_box(given.refusal);
        EXPECT_FALSE(setup.save());
        EXPECT_EQ(setup.faulty(), given.field);
        EXPECT_TRUE(setup.altered());
        EXPECT_EQ(stored().vision_font, before);
    }
}

TEST_P(VisionSetupTest, WhatFitsAnUprightPageAloneIsRefused)
{
    auto head = open();
    head.settings().Include_vision_reports = true;
    head.settings().vision = QString(17, u'\n');
    place->dialogue.expect_box(
        u"The vision statement would take more than a third of every landscape page of a report."_s);
    EXPECT_FALSE(head.save());

    auto foot = open();
    foot.settings().include_vision_footer = true;
    foot.settings().vision_font_size = 40;
    place->dialogue.expect_box(
        u"The lines at the foot would take more than a sixth of every landscape page of a report."_s);
    EXPECT_FALSE(foot.save());
    EXPECT_EQ(foot.faulty(), u"footer_vision"_s);
    EXPECT_FALSE(stored().Include_vision_reports || stored().include_vision_footer);
}

TEST_P(VisionSetupTest, LettersOfTheReportsOwnSizeCountAsElevenPoints)
{
    write_setting(session(), u"vision_font_size"_s, 0);
    auto setup = open();
    setup.settings().Include_vision_reports = true;
    setup.settings().vision = QString(13, u'\n');
    EXPECT_TRUE(setup.save());

    setup.settings().vision += u'\n';
    place->dialogue.expect_box(
        u"The vision statement would take more than a third of every landscape page of a report."_s);
    EXPECT_FALSE(setup.save());
    EXPECT_EQ(stored().vision.count(u'\n'), 13);
}

TEST_P(VisionSetupTest, ALongStatementThatReportsDoNotPrintIsKept)
{
    auto setup = open();
    setup.settings().vision = QString(1000, u'v');
    setup.settings().vision_font_size = 48;
    EXPECT_TRUE(setup.save());
    EXPECT_EQ(stored().vision.size(), 1000);
}

TEST_P(VisionSetupTest, WithoutTheRightTheSetupStaysClosed)
{
    place->grant_only({Area::security});
    place->dialogue.expect_box(u"Your password does not give access to \"%1\""_s.arg(area_name(Area::vision_setup)));
    EXPECT_FALSE(VisionSetup::open(place->office));
}

} // namespace kindrel::test
