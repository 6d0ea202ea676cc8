#include "desktop/people/speed_find.h"

#include "desktop/desktop_fixture.h"
#include "desktop/people/editor_page.h"
#include "desktop/people/family_card.h"
#include "support/families.h"

#include <QLineEdit>
#include <QPushButton>
#include <QSignalSpy>
#include <QTableView>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using desktop::SpeedFindWindow;

namespace {

class SpeedFindWindowTest : public DesktopTest
{
protected:
    void begin_and_ask()
    {
        begin({family(u"Adder"_s, {u"Una"_s}), family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s}),
               family(u"Nash"_s, {u"Carl"_s})});
        press(window(), Qt::Key_K, Qt::ControlModifier);
    }
    [[nodiscard]] SpeedFindWindow& popup() { return child<SpeedFindWindow>(window(), u"find"_s); }
    [[nodiscard]] QLineEdit& words() { return child<QLineEdit>(popup(), u"words"_s); }
    [[nodiscard]] QTableView& hits() { return child<QTableView>(popup(), u"hit_list"_s); }
    [[nodiscard]] QStringList shown()
    {
        QStringList texts;
        for (int row = 0; row < hits().model()->rowCount(); ++row)
            texts += hits().model()->index(row, 0).data().toString();
        return texts;
    }
    [[nodiscard]] QString opened()
    {
        settle();
        const auto* editor = qobject_cast<desktop::EditorPage*>(window().page());
        return editor ? editor->title() : QString();
    }
};

} // namespace

TEST_F(SpeedFindWindowTest, WordsInAnyOrderAndEnterOpenTheFamilyInTheEditor)
{
    begin_and_ask();
    EXPECT_EQ(popup().focusWidget(), &words());
    type(popup(), u"ben nais"_s);
    EXPECT_EQ(shown(), QStringList{u"Naismith"_s});
    press(popup(), Qt::Key_Return);
    EXPECT_FALSE(popup().isVisible());
    EXPECT_TRUE(opened().contains(u"Naismith"_s)) << opened().toStdString();
}

TEST_F(SpeedFindWindowTest, DownLeadsToTheFirstFamilyAndFurther)
{
    begin_and_ask();
    type(popup(), u"na"_s);
    EXPECT_EQ(shown(), (QStringList{u"Naismith"_s, u"Nash"_s}));
    press(popup(), Qt::Key_Down);
    EXPECT_EQ(hits().currentIndex().row(), 0);
    press(popup(), Qt::Key_Down);
    press(popup(), Qt::Key_Return);
    EXPECT_TRUE(opened().contains(u"Nash"_s)) << opened().toStdString();
}

TEST_F(SpeedFindWindowTest, LettersTypedInTheListGoOnWithTheWords)
{
    begin_and_ask();
    type(popup(), u"na"_s);
    press(popup(), Qt::Key_Down);
    QTest::keyClick(&hits(), Qt::Key_S);
    EXPECT_EQ(words().text(), u"nas"_s);
    EXPECT_EQ(popup().focusWidget(), &words());
    EXPECT_EQ(shown(), QStringList{u"Nash"_s});
}

TEST_F(SpeedFindWindowTest, WhoMayNotOpenFilesSeesTheCard)
{
    begin_and_ask();
    for (const auto right : {core::Area::search_for_family, core::Area::add_family, core::Area::read_only_family_data})
        desk().office.rights.set(right, false);
    type(popup(), u"nash"_s);
    press(popup(), Qt::Key_Return);
    const auto cards = desk().windows.all<desktop::FamilyCard>();
    ASSERT_EQ(cards.size(), 1U);
    EXPECT_EQ(cards[0]->surname_id(), stored[2].family.Surname_ID);
}

TEST_F(SpeedFindWindowTest, WhenNobodyAnswersASecondEnterOpensANewFamily)
{
    begin_and_ask();
    auto& add = child<QPushButton>(popup(), u"add_family"_s);
    EXPECT_FALSE(add.isVisible()) << "Nothing is typed yet.";
    type(popup(), u"xyz"_s);
    EXPECT_TRUE(visible_texts(popup()).contains(u"No family answers to \u201cxyz\u201d"_s));
    press(popup(), Qt::Key_Return);
    ASSERT_TRUE(popup().isVisible());
    ASSERT_TRUE(add.hasFocus());
    press(popup(), Qt::Key_Return);
    settle();
    ASSERT_TRUE(qobject_cast<desktop::EditorPage*>(window().page()));
    EXPECT_EQ(child<QLineEdit>(window(), u"surname"_s).text(), u"Xyz"_s);
}

TEST_F(SpeedFindWindowTest, ANumberThatWasTypedIsNoSurnameOfANewFamily)
{
    begin_and_ask();
    QSignalSpy wanted(&popup(), &SpeedFindWindow::family_wanted);
    type(popup(), u"555 123"_s);
    press(popup(), Qt::Key_Return);
    press(popup(), Qt::Key_Return);
    ASSERT_EQ(wanted.size(), 1);
    EXPECT_EQ(wanted[0][0].toString(), QString());
}

TEST_F(SpeedFindWindowTest, AFamilyThatAnotherWorkstationStoredIsThereTheNextTime)
{
    begin_and_ask();
    press(popup(), Qt::Key_Escape);
    EXPECT_FALSE(popup().isVisible());
    place.in_database(u"UPDATE [tbl_surname] SET [surname]='Viper' WHERE [surname]='Adder';"_s);
    press(window(), Qt::Key_K, Qt::ControlModifier);
    EXPECT_TRUE(popup().isVisible());
    EXPECT_EQ(popup().focusWidget(), &words());
    type(popup(), u"vip"_s);
    EXPECT_EQ(words().text(), u"vip"_s);
    EXPECT_EQ(shown(), QStringList{u"Viper"_s});
}

TEST_F(SpeedFindWindowTest, ItOpensFromAnyWindowAndGoesWhenAnotherIsTurnedTo)
{
    begin_and_ask();
    press(popup(), Qt::Key_Escape);
    desktop::open_family_card(desk(), {stored[0].family.Surname_ID}, 0);
    auto* card = desk().windows.all<desktop::FamilyCard>().at(0);
    settle();
    press(*card, Qt::Key_K, Qt::ControlModifier);
    EXPECT_TRUE(popup().isVisible());
    desktop::bring_forward(*card);
    settle();
    EXPECT_FALSE(popup().isVisible());
}

TEST_F(SpeedFindWindowTest, WithoutTheRightToItItStaysAway)
{
    begin({family(u"Adder"_s, {u"Una"_s})});
    desk().office.rights.set(core::Area::fast_find, false);
    place.dialogue.expect_box(
        u"Your password does not give access to \"%1\""_s.arg(core::area_name(core::Area::fast_find)));
    press(window(), Qt::Key_K, Qt::ControlModifier);
    EXPECT_FALSE(popup().isVisible());
}

} // namespace kindrel::test
