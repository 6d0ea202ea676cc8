#include "desktop/desktop_fixture.h"
#include "desktop/people/family_card.h"
#include "desktop/shell/link_button.h"
#include "desktop/shell/page.h"
#include "support/families.h"

#include <QFileInfo>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

class ChurchChoiceTest : public DesktopTest
{
protected:
    void click(const QString& task)
    {
        QTest::mouseClick(&child<desktop::LinkButton>(window(), task), Qt::LeftButton);
        settle();
    }
    bool set_up(int church)
    {
        return place.data.paths(core::Mode::normal, church).exists(core::Folder::church, u"loaded.dat"_s);
    }
};

} // namespace

TEST_F(ChurchChoiceTest, AnotherChurchTakesThePlaceOfTheOneThatIsOpen)
{
    begin({family(u"Naismith"_s, {u"Ann"_s})});
    place.dialogue.expect_choice(u"Load a New Church Database"_s, 2,
                                 QStringList({u"Church1"_s, u"Church2 (new)"_s, u"Church3 (new)"_s, u"Church4 (new)"_s,
                                              u"Church5 (new)"_s, u"Church6 (new)"_s, u"Church7 (new)"_s}));
    click(u"load_church"_s);

    EXPECT_EQ(desk().office.church, 3);
    EXPECT_EQ(window().windowTitle(), u"Kindrel (Church3)"_s);
    EXPECT_EQ(window().page()->title(), u"Church3"_s);
    EXPECT_EQ(child<desktop::LinkButton>(window(), u"Family File Total ="_s).figure(), u"0"_s);
}

TEST_F(ChurchChoiceTest, CreatingASecondChurchMarksBothAsSetUp)
{
    begin();
    EXPECT_FALSE(set_up(1));
    place.dialogue.expect_choice(u"Load a New Church Database"_s, 1);
    click(u"load_church"_s);
    EXPECT_TRUE(set_up(1));
    EXPECT_TRUE(set_up(2));
    EXPECT_FALSE(set_up(3));

    place.dialogue.expect_choice(u"Load a New Church Database"_s, 0,
                                 QStringList({u"Church1"_s, u"Church2"_s, u"Church3 (new)"_s, u"Church4 (new)"_s,
                                              u"Church5 (new)"_s, u"Church6 (new)"_s, u"Church7 (new)"_s}));
    click(u"load_church"_s);
    EXPECT_EQ(desk().office.church, 1);
}

TEST_F(ChurchChoiceTest, TurningAwayFromTheChooserChangesNothing)
{
    begin({family(u"Naismith"_s, {u"Ann"_s})});
    const auto* before = &window();
    place.dialogue.expect_choice(u"Load a New Church Database"_s, std::nullopt);
    click(u"load_church"_s);
    EXPECT_EQ(&window(), before);
    EXPECT_EQ(desk().office.church, 1);
}

TEST_F(ChurchChoiceTest, TrainingDataOpensAndLeavesNoMarks)
{
    begin();
    click(u"load_training"_s);
    EXPECT_EQ(desk().office.church, core::training_church);
    EXPECT_EQ(window().windowTitle(), u"Kindrel (Training Mode)"_s);
    EXPECT_FALSE(set_up(1));
}

TEST_F(ChurchChoiceTest, TheWindowsOfTheOldChurchGoWithIt)
{
    begin({family(u"Naismith"_s, {u"Ann"_s})});
    desktop::open_family_card(desk(), {stored[0].family.Surname_ID}, 0);
    click(u"load_training"_s);
    EXPECT_TRUE(desk().windows.all<desktop::FamilyCard>().empty());
    for (const QWidget* window : QApplication::topLevelWidgets())
        EXPECT_NE(window->objectName(), u"family_card"_s);
}

TEST_F(ChurchChoiceTest, AChurchThatIsBusyEndsTheProgramWithItsMessage)
{
    begin();
    core::write_side_file(place.data.paths(core::Mode::normal, 2), core::SideRecord(core::side_files::busy));
    place.dialogue.expect_choice(u"Load a New Church Database"_s, 1);
    place.dialogue.expect_box(u"Unable to Enter Kindrel"_s);
    click(u"load_church"_s);
    EXPECT_EQ(ended, 1);
    EXPECT_EQ(running->desk(), nullptr);
}

} // namespace kindrel::test
