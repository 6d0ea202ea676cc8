#include "desktop/desktop_fixture.h"
#include "desktop/shell/page.h"
#include "people/fusion.h"

#include <QAbstractButton>
#include <QAction>
#include <QComboBox>
#include <QLineEdit>
#include <QListView>
#include <QListWidget>
#include <QTableView>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

const QString leave_question = u"Do you wish to save the changes made to the fusions?"_s;

class FusionPageTest : public DesktopTest
{
protected:
    FusionPageTest()
    {
        begin();
        open();
    }

    void open()
    {
        running->open_area(u"fusions"_s);
        settle();
    }
    [[nodiscard]] QWidget& page() { return *window().page(); }
    [[nodiscard]] QString focus() { return window().focusWidget()->objectName(); }
    [[nodiscard]] QListView& names() { return child<QListView>(page(), u"fusions"_s); }
    [[nodiscard]] QListWidget& entries() { return child<QListWidget>(page(), u"entries"_s); }
    [[nodiscard]] QStringList entry_texts()
    {
        QStringList texts;
        for (int row = 0; row < entries().count(); ++row)
            texts += entries().item(row)->text();
        return texts;
    }
    [[nodiscard]] QString sentence() { return child<QLabel>(page(), u"sentence"_s).text(); }
    [[nodiscard]] std::vector<people::Fusion> stored() { return people::read_fusions(*desk().office.session); }

    void add_fusion(const QString& name)
    {
        press(window(), Qt::Key_Insert);
        type(window(), name);
        press(window(), Qt::Key_Return);
    }
    void choose_kind(const QString& kind)
    {
        child<QComboBox>(page(), u"kind"_s).setCurrentText(kind);
        press(window(), Qt::Key_F, Qt::ControlModifier);
    }
    void press_button(const QString& name)
    {
        child<QAbstractButton>(page(), name).setFocus();
        press(window(), Qt::Key_Space);
    }
};

} // namespace

TEST_F(FusionPageTest, AFusionIsBuiltByKeyboardInAllFourWaysAndSaved)
{
    add_fusion(u"Sunday"_s);
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_2, Qt::AltModifier);
    choose_kind(u"Status"_s);
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Plus);
    choose_kind(u"Ministry"_s);
    type(window(), u"potential ministry 3"_s);
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Minus);

    const QStringList expected{u"group 1 (OR+ Can be in Group)"_s, u"group 2 (OR- Can be Not in Group)"_s,
                               u"status 1 (And+ Must be in group)"_s,
                               u"(Potential) ministry 3 (And- Must Not be in Group)"_s};
    EXPECT_EQ(entry_texts(), expected);
    EXPECT_EQ(sentence(), u"People who are active, or of no state; in the group group 1 or in a group other than group "
                          "2, or in none; with the status status 1; not in the ministry ministry 3 (potential)."_s);
    EXPECT_TRUE(stored().empty());

    press(window(), Qt::Key_S, Qt::ControlModifier);
    const auto fusions = stored();
    ASSERT_EQ(fusions.size(), 1U);
    QStringList shown;
    for (const auto& entry : fusions.front().entries)
        shown += entry.shown();
    EXPECT_EQ(shown, expected);
    EXPECT_EQ(window().page()->status(), u"Saved"_s);
}

TEST_F(FusionPageTest, TheButtonsAddTheChosenItemEachInItsWay)
{
    add_fusion(u"Sunday"_s);
    choose_kind(u"Occupation"_s);
    for (const auto& [button, words] : std::initializer_list<std::pair<QString, QString>>{
             {u"orp"_s, u"occupation 1 (OR+ Can be in Group)"_s},
             {u"orm"_s, u"occupation 1 (OR- Can be Not in Group)"_s},
             {u"andp"_s, u"occupation 1 (And+ Must be in group)"_s},
             {u"andm"_s, u"occupation 1 (And- Must Not be in Group)"_s}}) {
        press_button(button);
        EXPECT_EQ(entry_texts(), QStringList(words));
        entries().setFocus();
        press(window(), Qt::Key_Delete);
    }
}

TEST_F(FusionPageTest, AMarkedDateIsShownWithItsTag)
{
    add_fusion(u"Sunday"_s);
    choose_kind(u"Dates"_s);
    press_button(u"marked"_s);
    press_button(u"orp"_s);
    EXPECT_EQ(entry_texts(), QStringList(u"(Tag) date_description 1 (OR+ Can be in Group)"_s));
}

TEST_F(FusionPageTest, AFlexiFieldCanBeAskedForByItsValue)
{
    place.in_database(u"INSERT INTO [tbl_flexi] ([person_id],[flexi_id],[flexi_field]) VALUES (1,1,'Piano');"_s);
    add_fusion(u"Sunday"_s);
    choose_kind(u"Flexi"_s);
    child<QComboBox>(page(), u"value"_s).setFocus();
    press(window(), Qt::Key_Down);
    press_button(u"andp"_s);
    EXPECT_EQ(entry_texts(), QStringList(u"flexi 1 = Piano (And+ Must be in group)"_s));
}

TEST_F(FusionPageTest, AnotherKindStartsWithItsFirstItemAndNothingTyped)
{
    add_fusion(u"Sunday"_s);
    choose_kind(u"Groups"_s);
    type(window(), u"group 2"_s);
    press(window(), Qt::Key_PageDown, Qt::ControlModifier);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(entry_texts(), QStringList(u"family_group 1 (OR+ Can be in Group)"_s));
}

TEST_F(FusionPageTest, AnEntryNeedsAFusion)
{
    choose_kind(u"Groups"_s);
    place.dialogue.expect_box(u"Please add a new fusion name before adding filters to it"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(focus(), u"new_fusion"_s);

    add_fusion(u"Sunday"_s);
    names().setFocus();
    press(window(), Qt::Key_Space, Qt::ControlModifier);
    choose_kind(u"Groups"_s);
    place.dialogue.expect_box(u"Please select a fusion group first before attempting to add filters to it"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(focus(), u"fusions"_s);
    EXPECT_EQ(entries().count(), 0);
}

TEST_F(FusionPageTest, AnItemStandsInAFusionOnce)
{
    add_fusion(u"Sunday"_s);
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    place.dialogue.expect_box(u"This filter has already been added to the filters list"_s);
    press(window(), Qt::Key_3, Qt::AltModifier);
    EXPECT_EQ(entries().count(), 1);
}

TEST_F(FusionPageTest, EntriesMoveAndStopAtTheEnds)
{
    add_fusion(u"Sunday"_s);
    entries().setFocus();
    place.dialogue.expect_box(u"Please select an item for moving"_s);
    press(window(), Qt::Key_Up, Qt::AltModifier);
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Return);
    entries().setFocus();
    place.dialogue.expect_box(u"This is the lowest position this item can be moved to"_s);
    press(window(), Qt::Key_Down, Qt::AltModifier);
    press(window(), Qt::Key_Up, Qt::AltModifier);
    EXPECT_EQ(entry_texts().first(), u"group 2 (OR+ Can be in Group)"_s);
    EXPECT_EQ(entries().currentRow(), 0);
    place.dialogue.expect_box(u"This is the highest position this item can be moved to"_s);
    press(window(), Qt::Key_Up, Qt::AltModifier);
}

TEST_F(FusionPageTest, SpaceStepsThroughTheWaysOfAnEntry)
{
    add_fusion(u"Sunday"_s);
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_4, Qt::AltModifier);
    entries().setFocus();
    press(window(), Qt::Key_Space);
    EXPECT_EQ(entry_texts(), QStringList(u"group 1 (OR+ Can be in Group)"_s));
    EXPECT_EQ(focus(), u"entries"_s);
}

TEST_F(FusionPageTest, DeletingAFusionAsks)
{
    add_fusion(u"Sunday"_s);
    names().setFocus();
    for (const auto answer : {core::Answer::no, core::Answer::yes}) {
        place.dialogue.expect_confirm(u"Are you sure that you wish to delete this filter fusion"_s, answer,
                                      core::Answer::no);
        press(window(), Qt::Key_Delete);
        EXPECT_EQ(names().model()->rowCount(), answer == core::Answer::yes ? 0 : 1);
    }
}

TEST_F(FusionPageTest, AFusionIsRenamedInPlaceAndARefusedNameStays)
{
    add_fusion(u"Sunday"_s);
    add_fusion(u"Monday"_s);
    names().setFocus();
    press(window(), Qt::Key_Return);
    type(window(), u"sunday"_s);
    place.dialogue.expect_box(u"This fusion already exists in the list"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(focus(), u"cell"_s);
    static_cast<QLineEdit*>(window().focusWidget())->selectAll();
    type(window(), u"Tuesday"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(names().model()->index(1, 0).data().toString(), u"Tuesday"_s);
}

TEST_F(FusionPageTest, TheSwitchesBelongToTheChosenFusion)
{
    add_fusion(u"Sunday"_s);
    press_button(u"contact"_s);
    add_fusion(u"Monday"_s);
    EXPECT_FALSE(child<QAbstractButton>(page(), u"contact"_s).isChecked());
    names().setFocus();
    press(window(), Qt::Key_Up);
    EXPECT_TRUE(child<QAbstractButton>(page(), u"contact"_s).isChecked());
    EXPECT_EQ(sentence(), u"People who are active or contacts, or of no state."_s);
}

TEST_F(FusionPageTest, LeavingAsksAndDoesAsItIsTold)
{
    struct Case
    {
        std::optional<bool> answer;
        bool stays;
        std::size_t stored;
    };
    for (const auto& [answer, stays, count] :
         {Case{std::nullopt, true, 0}, Case{false, false, 0}, Case{true, false, 1}}) {
        open();
        if (!window().page()->altered())
            add_fusion(u"Sunday"_s);
        place.dialogue.expect_confirm_or_cancel(leave_question, answer);
        press(window(), Qt::Key_W, Qt::ControlModifier);
        EXPECT_EQ(page().objectName() == u"Setup_Fusion", stays);
        EXPECT_EQ(stored().size(), count);
    }
}

TEST_F(FusionPageTest, CancelDropsEveryChangeAfterAsking)
{
    add_fusion(u"Sunday"_s);
    press(window(), Qt::Key_S, Qt::ControlModifier);
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    add_fusion(u"Monday"_s);
    place.dialogue.expect_confirm(u"Do you wish to drop every change since the fusions were saved?"_s,
                                  core::Answer::yes, core::Answer::no);
    for (QAction* action : window().page()->actions())
        if (action->text() == u"Cancel")
            action->trigger();
    EXPECT_EQ(names().model()->rowCount(), 1);
    EXPECT_EQ(entries().count(), 0);
    EXPECT_FALSE(window().page()->altered());
}

TEST_F(FusionPageTest, AFailedSaveIsToldAndLosesNothing)
{
    add_fusion(u"Sunday"_s);
    place.in_database(u"DROP TABLE [Tbl_fusion_group];"_s);
    place.dialogue.expect_box(u"Unable to save the fusions"_s);
    press(window(), Qt::Key_S, Qt::ControlModifier);
    EXPECT_TRUE(window().page()->altered());
    EXPECT_EQ(names().model()->rowCount(), 1);
}

TEST_F(FusionPageTest, WhatIsTypedButNotEnteredIsSavedToo)
{
    press(window(), Qt::Key_Insert);
    type(window(), u"Sunday"_s);
    EXPECT_TRUE(window().page()->altered());
    press(window(), Qt::Key_S, Qt::ControlModifier);
    ASSERT_EQ(stored().size(), 1U);
    EXPECT_EQ(stored().front().name, u"Sunday"_s);
}

TEST_F(FusionPageTest, ALostItemIsMarkedAndCountsForNothing)
{
    add_fusion(u"Sunday"_s);
    choose_kind(u"Groups"_s);
    press(window(), Qt::Key_Return);
    press(window(), Qt::Key_S, Qt::ControlModifier);
    press(window(), Qt::Key_W, Qt::ControlModifier);
    place.in_database(u"DELETE FROM [tbl_group_setup] WHERE [group_id]=1;"_s);
    open();
    EXPECT_EQ(entry_texts(), QStringList(u"group 1 (OR+ Can be in Group) \u2014 no longer exists"_s));
    EXPECT_EQ(sentence(),
              u"People who are active, or of no state; nobody, as the items of all its entries are gone."_s);
}

TEST_F(FusionPageTest, WhatIsGivenUpIsLeftThoughItCannotBeReadAgain)
{
    add_fusion(u"Helpers"_s);
    place.in_database(u"DROP TABLE [Tbl_fusion_group];"_s);
    place.dialogue.expect_confirm_or_cancel(leave_question, false);
    place.dialogue.expect_box(u"What is stored could not be read again."_s);
    place.dialogue.expect_confirm_or_cancel(u"Backup Kindrel files before exiting?"_s, false);
    EXPECT_TRUE(window().close());
}

} // namespace kindrel::test
