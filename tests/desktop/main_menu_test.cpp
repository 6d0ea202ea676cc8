#include "desktop/areas.h"
#include "desktop/desktop_fixture.h"
#include "desktop/output/preview_window.h"
#include "desktop/people/family_card.h"
#include "desktop/people/family_list.h"
#include "desktop/shell/link_button.h"
#include "desktop/shell/page.h"
#include "support/families.h"

#include <QComboBox>
#include <QHeaderView>
#include <QTableView>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using people::FileStatus;

namespace {

people::FamilyFile with_status(people::FamilyFile file, FileStatus status)
{
    file.family.Condition = status;
    return file;
}

std::vector<people::FamilyFile> some_families()
{
    return {family(u"Adder"_s, {u"Una"_s}), family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s}), family(u"Nash"_s, {u"Carl"_s}),
            with_status(family(u"Old"_s, {u"Olga"_s}), FileStatus::archive)};
}

class MainMenuTest : public DesktopTest
{
protected:
    [[nodiscard]] QTableView& list() { return child<QTableView>(window(), u"families"_s); }
    [[nodiscard]] QStringList shown()
    {
        QStringList names;
        for (int row = 0; row < list().model()->rowCount(); ++row)
            names += list().model()->index(row, 0).data().toString();
        return names;
    }
};

} // namespace

TEST_F(MainMenuTest, TheListNarrowsWithEveryLetterTyped)
{
    begin(some_families());
    EXPECT_EQ(shown(), QStringList({u"Adder"_s, u"Naismith"_s, u"Nash"_s}));
    type(window(), u"n"_s);
    EXPECT_EQ(shown(), QStringList({u"Naismith"_s, u"Nash"_s}));
    type(window(), u"ai"_s);
    EXPECT_EQ(shown(), QStringList({u"Naismith"_s}));
    EXPECT_EQ(window().page()->status(), u"1 of 3 families"_s);
}

TEST_F(MainMenuTest, DownLeadsFromTheFilterToTheFirstFamilyAndEnterOpensIt)
{
    begin(some_families());
    type(window(), u"na"_s);
    press(window(), Qt::Key_Down);
    EXPECT_TRUE(list().hasFocus());
    EXPECT_EQ(list().currentIndex().row(), 0);
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Return);

    EXPECT_EQ(window().page()->objectName(), u"Editor"_s);
    EXPECT_EQ(window().page()->title(), u"Nash Family File"_s);
}

TEST_F(MainMenuTest, SpaceAndControlEnterLookAtTheCardWithoutOpeningTheFile)
{
    begin(some_families());
    type(window(), u"na"_s);
    press(window(), Qt::Key_Return, Qt::ControlModifier);
    const auto cards = desk().windows.all<desktop::FamilyCard>();
    ASSERT_EQ(cards.size(), 1U);
    EXPECT_EQ(cards[0]->surname_id(), stored[1].family.Surname_ID);

    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Space);
    EXPECT_EQ(desk().windows.all<desktop::FamilyCard>().size(), 2U);
    EXPECT_EQ(window().page()->objectName(), u"main_menu"_s);
}

TEST_F(MainMenuTest, AFamilyLookedAtTwiceHasOneCard)
{
    begin(some_families());
    press(window(), Qt::Key_Return, Qt::ControlModifier);
    press(window(), Qt::Key_Return, Qt::ControlModifier);
    EXPECT_EQ(desk().windows.all<desktop::FamilyCard>().size(), 1U);
}

TEST_F(MainMenuTest, ATotalIsALinkToTheFamiliesThatItCounts)
{
    begin(some_families());
    auto& archive = child<desktop::LinkButton>(window(), u"Archive Families"_s);
    EXPECT_EQ(archive.figure(), u"1"_s);
    EXPECT_EQ(child<desktop::LinkButton>(window(), u"Family File Total ="_s).figure(), u"4"_s);

    QTest::mouseClick(&archive, Qt::LeftButton);

    EXPECT_EQ(shown(), QStringList({u"Old"_s}));
    EXPECT_EQ(child<QComboBox>(window(), u"family_list"_s).currentText(), u"Archive Families"_s);
    EXPECT_TRUE(archive.isChecked());
}

TEST_F(MainMenuTest, FamiliesSavedElsewhereAppearWhenThePageIsEntered)
{
    begin(some_families());
    place.in_database(u"UPDATE [tbl_surname] SET [condition]=0;"_s);
    press(window(), Qt::Key_1, Qt::ControlModifier);
    EXPECT_EQ(shown().size(), 4);
    EXPECT_EQ(child<desktop::LinkButton>(window(), u"Archive Families"_s).figure(), u"0"_s);
}

TEST_F(MainMenuTest, AnEmptyListSaysWhatToDoNext)
{
    begin(some_families());
    type(window(), u"xyz"_s);
    EXPECT_TRUE(visible_texts(window()).contains(u"No family answers to \u201cxyz\u201d"_s));
}

TEST_F(MainMenuTest, TheListIsSavedInTheFileThatWasChosen)
{
    begin(some_families());
    const QString file = place.data.drive() + u"list.csv"_s;
    place.dialogue.expect_file(u"Save this list"_s, file);
    const auto actions = window().page()->actions();
    for (QAction* action : actions)
        if (action->text() == u"Save as CSV")
            action->trigger();
    EXPECT_TRUE(DataFolder::read(file).contains("\r\nNaismith,Ann,"));
}

TEST_F(MainMenuTest, TheListAsItStandsIsPrinted)
{
    begin(some_families());
    type(window(), u"nash"_s);
    press(window(), Qt::Key_P, Qt::ControlModifier);

    const auto previews = desk().windows.all<desktop::PreviewWindow>();
    ASSERT_EQ(previews.size(), 1U);
    const QStringList texts = pages::texts_of(previews[0]->document().page(1), 1);
    EXPECT_TRUE(texts.contains(u"Nash"_s));
    EXPECT_FALSE(texts.contains(u"Adder"_s));
}

TEST_F(MainMenuTest, WithoutTheRightToFindFamiliesNoneAreListed)
{
    begin(some_families());
    desk().office.rights.set(core::Area::fast_find, false);
    desk().office.rights.set(core::Area::search_for_family, false);
    desktop::MainWindow other(desk(), desktop::all_areas(), look);
    other.show();
    EXPECT_EQ(child<QTableView>(other, u"families"_s).model()->rowCount(), 0);
    EXPECT_TRUE(visible_texts(other).contains(u"Your password does not open the list of families"_s));
}

TEST_F(MainMenuTest, TheColumnsFillTheListAndNoMore)
{
    begin(some_families());
    const auto& list = child<QTableView>(window(), u"families"_s);
    for (const int width : {1024, 800, 1400, 720}) {
        window().resize(width, 600);
        settle();
        EXPECT_EQ(list.horizontalHeader()->length(), list.viewport()->width()) << "in a window of " << width;
    }
}

} // namespace kindrel::test
