#include "desktop/shell/item_picker.h"

#include "desktop/desktop_fixture.h"

#include <QLineEdit>
#include <QListWidget>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using desktop::ItemPicker;

namespace {

class ItemPickerTest : public testing::Test
{
protected:
    ItemPickerTest()
    {
        QObject::connect(&picker, &ItemPicker::chosen, &picker, [this](int key) { chosen.push_back(key); });
        QObject::connect(&picker, &ItemPicker::new_wanted, &picker, [this](const QString& text) { wanted += text; });
        picker.open();
        settle();
    }
    [[nodiscard]] QStringList offered() const
    {
        QStringList texts;
        const auto& list = child<QListWidget>(picker, u"items"_s);
        for (int row = 0; row < list.count(); ++row)
            texts += list.item(row)->text();
        return texts;
    }

    ItemPicker picker{u"Add: group"_s,
                      {{11, u"Home Group"_s}, {12, u"Youth"_s}, {13, u"Żeglarze (sailing)"_s}, {14, u"Young Mums"_s}},
                      u"Nothing is left to add."_s};
    std::vector<int> chosen;
    QStringList wanted;
};

} // namespace

TEST_F(ItemPickerTest, TypedWordsNarrowTheListWhateverTheirOrderCaseAndAccents)
{
    struct Case
    {
        QString typed;
        QStringList left;
    };
    for (const auto& [typed, left] : {Case{u"you"_s, {u"Youth"_s, u"Young Mums"_s}},
                                      Case{u"MUMS yo"_s, {u"Young Mums"_s}}, Case{u"zegl"_s, {u"Żeglarze (sailing)"_s}},
                                      Case{u"sail"_s, {u"Żeglarze (sailing)"_s}}, Case{u"roup"_s, {}}}) {
        child<QLineEdit>(picker, u"wanted"_s).clear();
        type(picker, typed);
        EXPECT_EQ(offered(), left) << typed.toStdString();
    }
    EXPECT_TRUE(visible_texts(picker).contains(u"Nothing is called “roup”."_s));
}

TEST_F(ItemPickerTest, TypeAndEnterTakeTheFirstMatch)
{
    type(picker, u"you"_s);
    press(picker, Qt::Key_Return);
    EXPECT_EQ(chosen, std::vector{12});
    EXPECT_FALSE(picker.isVisible());
}

TEST_F(ItemPickerTest, DownLeadsToTheFirstMatchThenToTheNext)
{
    type(picker, u"you"_s);
    press(picker, Qt::Key_Down);
    press(picker, Qt::Key_Down);
    press(picker, Qt::Key_Return);
    EXPECT_EQ(chosen, std::vector{14});
}

TEST_F(ItemPickerTest, TypingGoesOnFromTheList)
{
    press(picker, Qt::Key_Down);
    QTest::keyClicks(picker.focusWidget(), u"y"_s);
    type(picker, u"outh"_s);
    EXPECT_EQ(offered(), QStringList({u"Youth"_s}));
}

TEST_F(ItemPickerTest, EnterWithNothingTypedAndEscapeTakeNothing)
{
    press(picker, Qt::Key_Return);
    EXPECT_TRUE(picker.isVisible());
    press(picker, Qt::Key_Escape);
    EXPECT_FALSE(picker.isVisible());
    EXPECT_TRUE(chosen.empty());
}

TEST_F(ItemPickerTest, ANewItemIsAddedByDownAndEnterOnly)
{
    picker.allow_new();
    type(picker, u"Choir"_s);
    EXPECT_EQ(offered(), QStringList({u"Add “Choir”"_s}));
    press(picker, Qt::Key_Return);
    EXPECT_TRUE(wanted.isEmpty());
    press(picker, Qt::Key_Down);
    press(picker, Qt::Key_Return);
    EXPECT_EQ(wanted, QStringList({u"Choir"_s}));
    EXPECT_TRUE(chosen.empty());
}

TEST_F(ItemPickerTest, WhatIsCalledSoAlreadyIsNotOfferedAsNew)
{
    picker.allow_new();
    type(picker, u" youth "_s);
    EXPECT_EQ(offered(), QStringList({u"Youth"_s}));
}

} // namespace kindrel::test
