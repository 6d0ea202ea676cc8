#include "desktop/desktop_fixture.h"
#include "desktop/shell/ordered_list_editor.h"

#include <QAbstractButton>
#include <QLineEdit>
#include <QTableView>

#include <algorithm>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

/// A list of names that refuses empty and repeated ones.
class Names : public desktop::ListOperations
{
public:
    explicit Names(QStringList& names) : m_names(names) {}

    [[nodiscard]] desktop::ListCaptions captions() const override { return {.fields = {u"Name"_s}}; }
    [[nodiscard]] int count() const override { return int(m_names.size()); }
    [[nodiscard]] desktop::ListRow row(int index) const override { return {.texts = {m_names[index]}}; }
    [[nodiscard]] QString count_line() const override { return u"%1 names"_s.arg(count()); }
    [[nodiscard]] bool add(const QStringList& texts) override
    {
        if (!fits(texts.front()))
            return false;
        m_names += texts.front();
        return true;
    }
    [[nodiscard]] bool rename(int index, const QStringList& texts) override
    {
        if (!fits(texts.front()))
            return false;
        m_names[index] = texts.front();
        return true;
    }
    [[nodiscard]] bool remove(int index) override
    {
        m_names.removeAt(index);
        return true;
    }
    [[nodiscard]] bool move_up(int index) override { return swap(index, index - 1); }
    [[nodiscard]] bool move_down(int index) override { return swap(index, index + 1); }
    [[nodiscard]] bool sort() override
    {
        m_names.sort();
        return true;
    }
    [[nodiscard]] std::optional<QString> import() override { return std::nullopt; }

private:
    [[nodiscard]] bool fits(const QString& name) const { return !name.isEmpty() && !m_names.contains(name); }
    bool swap(int from, int to)
    {
        const bool there = to >= 0 && to < count();
        if (there)
            m_names.swapItemsAt(from, to);
        return there;
    }

    QStringList& m_names;
};

class OrderedListEditorTest : public testing::Test
{
protected:
    OrderedListEditorTest()
    {
        editor.show();
        editor.activateWindow();
        editor.focus_list();
        settle();
    }
    [[nodiscard]] QLineEdit* cell() { return editor.findChild<QLineEdit*>(u"cell"_s); }
    void click(const QString& button) { QTest::mouseClick(&child<QAbstractButton>(editor, button), Qt::LeftButton); }

    QStringList names{u"Cedar"_s, u"Ash"_s, u"Birch"_s};
    desktop::OrderedListEditor editor{std::make_unique<Names>(names), u"names"_s};
};

} // namespace

TEST_F(OrderedListEditorTest, ItemsAreTypedOneAfterTheOther)
{
    press(editor, Qt::Key_Insert);
    type(editor, u"Elm"_s);
    press(editor, Qt::Key_Return);
    type(editor, u"Fir"_s);
    press(editor, Qt::Key_Return);
    EXPECT_EQ(names, QStringList({u"Cedar"_s, u"Ash"_s, u"Birch"_s, u"Elm"_s, u"Fir"_s}));
    EXPECT_EQ(editor.current(), 4);
    EXPECT_FALSE(editor.typing());
    EXPECT_TRUE(visible_texts(editor).contains(u"5 names"_s));
}

TEST_F(OrderedListEditorTest, TheChosenItemStaysChosenWhereverItGoes)
{
    press(editor, Qt::Key_Down, Qt::AltModifier);
    EXPECT_EQ(names, QStringList({u"Ash"_s, u"Cedar"_s, u"Birch"_s}));
    EXPECT_EQ(editor.current(), 1);
    press(editor, Qt::Key_Down, Qt::AltModifier);
    EXPECT_EQ(editor.current(), 2);
    press(editor, Qt::Key_Up, Qt::AltModifier);
    EXPECT_EQ(editor.current(), 1);
    click(u"sort"_s);
    EXPECT_EQ(names, QStringList({u"Ash"_s, u"Birch"_s, u"Cedar"_s}));
    EXPECT_EQ(editor.current(), 2);
}

TEST_F(OrderedListEditorTest, EnterRenamesInPlaceAndEscapeLeavesTheItemAsItWas)
{
    press(editor, Qt::Key_Return);
    ASSERT_TRUE(cell());
    QTest::keyClicks(cell(), u"Cherry"_s);
    QTest::keyClick(cell(), Qt::Key_Return);
    settle();
    EXPECT_EQ(names.front(), u"Cherry"_s);
    EXPECT_FALSE(cell());

    press(editor, Qt::Key_Return);
    ASSERT_TRUE(cell());
    QTest::keyClicks(cell(), u"Plum"_s);
    QTest::keyClick(cell(), Qt::Key_Escape);
    settle();
    EXPECT_EQ(names.front(), u"Cherry"_s);
}

TEST_F(OrderedListEditorTest, ARefusedNameStaysInItsCellWithItsTextSelected)
{
    press(editor, Qt::Key_Return);
    ASSERT_TRUE(cell());
    QTest::keyClicks(cell(), u"Birch"_s);
    QTest::keyClick(cell(), Qt::Key_Return);
    settle();
    ASSERT_TRUE(cell());
    EXPECT_EQ(cell()->selectedText(), u"Birch"_s);
    EXPECT_EQ(editor.focusWidget(), cell());
    EXPECT_FALSE(editor.finish_typing());
    EXPECT_EQ(names, QStringList({u"Cedar"_s, u"Ash"_s, u"Birch"_s}));
}

TEST_F(OrderedListEditorTest, DeleteInAFieldBelongsToItsText)
{
    press(editor, Qt::Key_Insert);
    type(editor, u"Elm"_s);
    press(editor, Qt::Key_Home);
    press(editor, Qt::Key_Delete);
    EXPECT_EQ(child<QLineEdit>(editor, u"new_0"_s).text(), u"lm"_s);
    EXPECT_EQ(names.size(), 3);
    editor.focus_list();
    press(editor, Qt::Key_Delete);
    EXPECT_EQ(names, QStringList({u"Ash"_s, u"Birch"_s}));
    EXPECT_EQ(editor.current(), 0);
}

} // namespace kindrel::test
