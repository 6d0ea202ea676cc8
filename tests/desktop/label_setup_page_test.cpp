#include "desktop/desktop_fixture.h"
#include "desktop/output/preview_window.h"
#include "desktop/output/sheet_picture.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/page.h"
#include "output/labels/label_setup.h"
#include "output/labels/label_stock.h"
#include "support/families.h"

#include <QComboBox>
#include <QDir>
#include <QDoubleSpinBox>
#include <QSpinBox>
#include <QTabWidget>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

const QString save_question = u"The label setup has been altered. Do you wish to save it?"_s;

class LabelSetupPageTest : public DesktopTest
{
protected:
    void SetUp() override
    {
        begin({family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s}), family(u"Okafor"_s, {u"Cy"_s})});
        open();
    }
    void open()
    {
        running->open_area(u"labels"_s);
        settle();
    }
    void choose(const QString& stock)
    {
        for (int step = 0; step < 30 && stock_shown() != stock; ++step)
            press(window(), Qt::Key_Down);
        ASSERT_EQ(stock_shown(), stock);
    }
    void save() { press(window(), Qt::Key_S, Qt::ControlModifier); }
    void close_page() { press(window(), Qt::Key_W, Qt::ControlModifier); }
    void other_tab() { press(window(), Qt::Key_PageDown, Qt::ControlModifier); }
    [[nodiscard]] QTabWidget& tabs() { return child<QTabWidget>(window(), u"label_tabs"_s); }
    [[nodiscard]] bool in_page() { return window().page()->objectName() == u"label_setup"_s; }
    [[nodiscard]] QString stock_shown() { return child<QComboBox>(window(), u"label_stock"_s).currentText(); }
    [[nodiscard]] double shown(const QString& field) { return child<QDoubleSpinBox>(window(), field).value(); }
    /// With its print, as it is once the picture had its moment.
    [[nodiscard]] desktop::SheetPicture& sheet(const QString& name = u"label_sheet"_s)
    {
        auto& picture = child<desktop::SheetPicture>(window(), name);
        picture.draw_now();
        return picture;
    }
    /// Where on the sheet the text begins, as it is printed.
    [[nodiscard]] QPointF printed_at(const QString& text) { return printed_at(text, *sheet().page()); }
    [[nodiscard]] static QPointF printed_at(const QString& text, const pages::Page& page)
    {
        for (const auto& item : page.items)
            if (const auto* line = std::get_if<pages::TextItem>(&item); line && line->text.trimmed() == text)
                return line->at;
        return {-1, -1};
    }
    /// As the next start of the program would read it.
    [[nodiscard]] output::LabelSetup stored() { return output::reload_label_setup(desk().office); }
};

} // namespace

TEST_F(LabelSetupPageTest, AStockIsChosenAndSavedByKeyboardAndTheNextStartHasIt)
{
    choose(u"A4, 5 x 13, 38.1 x 21.2 mm"_s);
    EXPECT_EQ(shown(u"label_width"_s), 38.1);
    EXPECT_EQ(shown(u"label_top_margin"_s), 10.7);
    tab_to(u"label_name_size"_s);
    type(window(), u"9"_s);
    tab_to(u"label_address_italic"_s);
    press(window(), Qt::Key_Space);
    EXPECT_EQ(window().page()->chip().text(), u"Altered"_s);

    save();

    EXPECT_FALSE(window().page()->altered());
    EXPECT_EQ(window().page()->note().text(),
              u"The label setup is saved. The next labels and tags are printed by it."_s);
    begin_again();
    const auto labels = output::load_label_setup(desk().office).labels;
    EXPECT_STREQ(output::stock_of(labels.grid)->name, "A4, 5 x 13, 38.1 x 21.2 mm");
    EXPECT_EQ(labels.name.size, 9);
    EXPECT_TRUE(labels.address.italic);
    open();
    EXPECT_EQ(stock_shown(), u"A4, 5 x 13, 38.1 x 21.2 mm"_s);
    EXPECT_FALSE(window().page()->altered());
}

TEST_F(LabelSetupPageTest, AMeasureOfOnesOwnIsKeptWhileStocksAreLookedAt)
{
    const auto bought = stock_shown();
    tab_to(u"label_left_margin"_s);
    type(window(), u"8.4"_s);
    EXPECT_EQ(stock_shown(), u"Own measurements"_s);
    EXPECT_NEAR(printed_at(u"Ann & Ben Naismith"_s).x(), 8.4 / 25.4 * 72 + 9, 0.05) << "the picture follows";

    window().page()->find();
    choose(u"A4, 1 x 1, 199.6 x 289.1 mm"_s);
    EXPECT_EQ(shown(u"label_left_margin"_s), 5.2);
    press(window(), Qt::Key_Home);
    EXPECT_EQ(stock_shown(), u"Own measurements"_s);
    EXPECT_EQ(shown(u"label_left_margin"_s), 8.4);

    tab_to(u"label_left_margin"_s);
    type(window(), u"7.2"_s);
    EXPECT_EQ(stock_shown(), bought) << "measures of a stock are known again";
    EXPECT_FALSE(window().page()->altered());
}

TEST_F(LabelSetupPageTest, ARefusedNumberLeadsToItsFieldOnWhicheverTabAndNothingIsWritten)
{
    const QString too_many =
        u"12 columns with the left margin and the gaps need 796.7 mm, but the page's width is 210.0 mm."_s;
    const auto before = stored();
    tab_to(u"label_columns"_s);
    type(window(), u"12"_s);
    EXPECT_EQ(sheet().fault(), too_many) << "told beside the field before it is refused";
    other_tab();
    place.dialogue.expect_box(u"Mailing labels: "_s + too_many);

    save();

    EXPECT_EQ(window().focusWidget()->objectName(), u"label_columns"_s);
    EXPECT_EQ(stored(), before);
    EXPECT_TRUE(window().page()->altered());
    place.dialogue.expect_box(too_many);
    press(window(), Qt::Key_P, Qt::ControlModifier);
    EXPECT_TRUE(desk().windows.all<desktop::PreviewWindow>().empty());
    type(window(), u"2"_s);
    EXPECT_EQ(sheet().fault(), QString()) << "the refused number was selected and is replaced";

    other_tab();
    tab_to(u"tag_church_size"_s);
    type(window(), u"200"_s);
    place.dialogue.expect_box(u"Name tags: The size of a font must be between 4 and 144 points."_s);
    save();
    EXPECT_EQ(window().focusWidget()->objectName(), u"tag_church_size"_s);
    type(window(), u"12"_s);
    save();
    EXPECT_EQ(stored().labels.grid.columns, 2);
    EXPECT_EQ(stored().tags.church.size, 12);
}

TEST_F(LabelSetupPageTest, TheLabelToStartAtIsChosenInThePictureByArrowsAndByMouse)
{
    struct Step
    {
        Qt::Key key;
        int start; ///< On a sheet of 3 by 8.
    };
    tab_to(u"label_sheet"_s);
    const auto first = printed_at(u"Ann & Ben Naismith"_s);
    for (const auto& [key, start] :
         {Step{Qt::Key_Left, 1}, Step{Qt::Key_Up, 1}, Step{Qt::Key_Right, 2}, Step{Qt::Key_Down, 5},
          Step{Qt::Key_Left, 4}, Step{Qt::Key_Up, 1}, Step{Qt::Key_End, 24}, Step{Qt::Key_Down, 24},
          Step{Qt::Key_Right, 24}, Step{Qt::Key_Home, 1}}) {
        press(window(), key);
        EXPECT_EQ(child<QSpinBox>(window(), u"label_start"_s).value(), start) << key;
    }
    QTest::mouseClick(&sheet(), Qt::LeftButton, {}, sheet().middle_of(8).toPoint());
    EXPECT_EQ(child<QSpinBox>(window(), u"label_start"_s).value(), 8);
    const auto grid = stored().labels.grid;
    const auto moved = grid.label(7).topLeft() - grid.label(0).topLeft();
    EXPECT_NEAR(printed_at(u"Ann & Ben Naismith"_s).x(), (first + moved).x(), 0.05);
    EXPECT_NEAR(printed_at(u"Ann & Ben Naismith"_s).y(), (first + moved).y(), 0.05);
    save();
    EXPECT_EQ(stored().labels.grid.start, 8);
}

TEST_F(LabelSetupPageTest, TheNameTagsShowTheChurchAndTheirBorderAsTicked)
{
    other_tab();
    const auto texts = [this] {
        return pages::texts_of(*sheet(u"tag_sheet"_s).page(), 1);
    };
    const auto church = desk().office.church_name;
    EXPECT_TRUE(texts().contains(church));
    tab_to(u"tag_shows_church"_s);
    press(window(), Qt::Key_Space);
    EXPECT_FALSE(texts().contains(church));
    EXPECT_TRUE(texts().contains(u"Okafor"_s));
    const auto unframed = sheet(u"tag_sheet"_s).page()->items.size();
    tab_to(u"tag_shows_border"_s);
    press(window(), Qt::Key_Space);
    EXPECT_EQ(sheet(u"tag_sheet"_s).page()->items.size(), unframed + 3) << "a frame for each of three people";
    EXPECT_TRUE(stored().tags.shows_church) << "nothing is saved yet";
}

TEST_F(LabelSetupPageTest, AnUnsavedSetupIsAskedForOnLeaving)
{
    const auto before = stored();
    press(window(), Qt::Key_End);
    place.dialogue.expect_confirm_or_cancel(save_question, std::nullopt);
    close_page();
    EXPECT_TRUE(in_page());
    EXPECT_EQ(stored(), before);

    place.dialogue.expect_confirm_or_cancel(save_question, true);
    close_page();
    EXPECT_FALSE(in_page());
    const auto saved = stored();
    EXPECT_EQ(saved.labels.grid, output::label_stocks().back().grid);

    open();
    press(window(), Qt::Key_Home);
    press(window(), Qt::Key_Down);
    place.dialogue.expect_confirm_or_cancel(save_question, false);
    close_page();
    EXPECT_FALSE(in_page());
    EXPECT_EQ(stored(), saved);
}

TEST_F(LabelSetupPageTest, TheTestSheetShowsTheEdgesOfEveryLabelOfTheSheetAsItIsEdited)
{
    choose(u"Letter, 2 x 5, 4 x 2 in"_s);
    tab_to(u"label_start"_s);
    type(window(), u"4"_s);

    press(window(), Qt::Key_P, Qt::ControlModifier);

    const auto previews = desk().windows.all<desktop::PreviewWindow>();
    ASSERT_EQ(previews.size(), 1u);
    const auto& document = previews.front()->document();
    ASSERT_EQ(document.page_count(), 1);
    const auto page = document.page(1);
    EXPECT_EQ(page.size.toSize(), QSize(612, 792));
    const auto grid = output::label_stocks()[15].grid;
    std::vector<QRectF> frames;
    for (const auto& item : page.items)
        if (const auto* rects = std::get_if<pages::RectsItem>(&item))
            frames.insert(frames.end(), rects->rects.begin(), rects->rects.end());
    ASSERT_EQ(frames.size(), 10u);
    for (int place_on_sheet = 0; place_on_sheet < 10; ++place_on_sheet)
        EXPECT_EQ(frames[std::size_t(place_on_sheet)], grid.label(place_on_sheet)) << place_on_sheet;
    EXPECT_EQ(pages::texts_of(page, 1).join(u' '), u"1 2 3 4 5 6 7 8 9 10"_s);
}

TEST_F(LabelSetupPageTest, ThePrintWaitsAMomentAndUntilItIsSeen)
{
    const auto family = u"Ann & Ben Naismith"_s;
    auto& picture = child<desktop::SheetPicture>(window(), u"label_sheet"_s);
    const auto first = printed_at(family);

    child<QSpinBox>(window(), u"label_start"_s).setValue(4);
    EXPECT_EQ(printed_at(family, *picture.page()), first);
    EXPECT_EQ(picture.accessibleName(), u"The sheet, starting at label 4 of 24"_s) << "the labels do not wait";

    tabs().setCurrentIndex(1);
    picture.draw_now();
    EXPECT_EQ(printed_at(family, *picture.page()), first);
    tabs().setCurrentIndex(0);
    EXPECT_GT(printed_at(family).y(), first.y());
}

TEST_F(LabelSetupPageTest, APrintThatCannotBeMadeLeavesTheSheetEmptyWithoutABox)
{
    ASSERT_FALSE(sheet().empty());
    place.in_database(u"DROP TABLE [tbl_people];"_s);

    press(window(), Qt::Key_Down);

    EXPECT_TRUE(sheet().empty());
    EXPECT_EQ(sheet().fault(), QString());
}

TEST_F(LabelSetupPageTest, AStoredSheetThatCannotBePrintedIsToldInThePictureAlone)
{
    close_page();
    auto record = desk().office.side.labels;
    record.set_number("label_columns", 12);
    core::write_side_file(desk().office.paths, record);

    open();

    EXPECT_TRUE(sheet().fault().startsWith("12 columns "_L1)) << sheet().fault().toStdString();
    EXPECT_TRUE(sheet().empty());
}

TEST_F(LabelSetupPageTest, SavingKeepsAndShowsWhatAnotherWorkstationSavedMeanwhile)
{
    auto theirs = desk().office.side.labels;
    theirs.set_number("tag_church_size", 14);
    core::write_side_file(desk().office.paths, theirs);
    choose(u"A4, 5 x 13, 38.1 x 21.2 mm"_s);

    save();

    EXPECT_FALSE(window().page()->altered());
    EXPECT_EQ(child<QSpinBox>(window(), u"tag_church_size"_s).value(), 14);
    EXPECT_EQ(stored().tags.church.size, 14);
    EXPECT_EQ(stored().labels.grid.columns, 5);
}

TEST_F(LabelSetupPageTest, WhatAnotherWorkstationSavedMeanwhileIsShown)
{
    close_page();
    const auto mine = desk().office.side.labels;
    auto theirs = stored();
    theirs.labels.grid.start = 3;
    ASSERT_TRUE(output::save_label_setup(desk().office, theirs));
    desk().office.side.labels = mine;

    open();

    EXPECT_EQ(child<QSpinBox>(window(), u"label_start"_s).value(), 3);
}

} // namespace kindrel::test
