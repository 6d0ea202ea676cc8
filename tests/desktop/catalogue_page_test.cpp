#include "core/files.h"
#include "desktop/desktop_fixture.h"
#include "desktop/output/preview_window.h"
#include "desktop/output/report_drawing.h"
#include "desktop/output/report_tree.h"
#include "desktop/shell/page.h"
#include "support/families.h"

#include <QComboBox>
#include <QLineEdit>
#include <QPushButton>
#include <QTableView>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

class CataloguePageTest : public DesktopTest
{
protected:
    void open(const QByteArray& own_layout = {})
    {
        auto naismith = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s});
        naismith.address.phone = u"5550 1234"_s;
        begin({naismith, family(u"Brown"_s, {u"Di"_s})});
        const auto folder = desk().office.paths.folder(core::Folder::custom);
        core::make_folder(folder);
        if (!own_layout.isEmpty())
            core::write_file(folder + u"who.rpy"_s, own_layout);
        running->open_area(u"reports"_s);
        settle();
    }
    [[nodiscard]] desktop::ReportTree& tree() { return child<desktop::ReportTree>(window(), u"catalogue"_s); }
    /// Whether something is drawn once the picture had its moment.
    [[nodiscard]] bool drawn()
    {
        auto& drawing = child<desktop::ReportDrawing>(window(), u"drawing"_s);
        drawing.draw_now();
        return !drawing.empty();
    }
    /// Strikes Di, the first on the list, has reports leave out phones, and comes back.
    void choose_in_tagging()
    {
        child<QPushButton>(window(), u"open_tagging"_s).click();
        settle();
        press(window(), Qt::Key_Return, Qt::ControlModifier);
        child<QTableView>(*window().page(), u"working_people"_s).setFocus();
        press(window(), Qt::Key_Delete);
        child<QAbstractButton>(*window().page(), u"withhold_phones"_s).setChecked(true);
        press(window(), Qt::Key_6, Qt::ControlModifier);
    }
    [[nodiscard]] QComboBox& people() { return child<QComboBox>(*window().page(), u"people"_s); }
    /// The texts of the chosen report's first page.
    [[nodiscard]] QStringList run()
    {
        window().activateWindow(); // A preview may stand before it.
        settle();
        press(window(), Qt::Key_P, Qt::ControlModifier);
        settle();
        return pages::texts_of(desk().windows.all<desktop::PreviewWindow>().back()->document().page(1), 1);
    }
    [[nodiscard]] QStringList families()
    {
        QStringList names;
        for (int row = 0; row < tree().topLevelItemCount(); ++row)
            names += tree().topLevelItem(row)->text(0);
        return names;
    }
};

} // namespace

TEST_F(CataloguePageTest, TheFamiliesStandInTheirOrderWithTheChurchsOwnAtTheEnd)
{
    open();

    EXPECT_EQ(families(),
              QStringList({u"Church Directories"_s, u"Check Lists"_s, u"Duty of Care"_s, u"Labels"_s,
                           u"Family Data Reports"_s, u"All Group Reports"_s, u"Individual Group Reports"_s,
                           u"Individual Group History"_s, u"Miscellaneous Report"_s, u"Photo Albums"_s,
                           u"BarCode Reports"_s, u"Names Report"_s, u"Custom Reports"_s, u"Custom Letters"_s}));
}

TEST_F(CataloguePageTest, BesideTheChosenReportStandsItsFirstPage)
{
    open();
    EXPECT_TRUE(drawn());

    press(window(), Qt::Key_Up); // To the family of reports, which is none itself.
    EXPECT_FALSE(drawn());

    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Down);
    EXPECT_TRUE(visible_texts(window()).contains(u"Directory 2"_s));
    EXPECT_TRUE(drawn());
}

TEST_F(CataloguePageTest, AnOwnLayoutIsFoundOnEnteringAndOpensInAPreviewOnTheChosenPaper)
{
    open("report per person\ntitle \"Who\"\neach person\nline [surname]\n");
    child<QComboBox>(window(), u"paper"_s).setCurrentIndex(1);
    tree().choose(u"custom report/who.rpy"_s);
    tree().setFocus();
    press(window(), Qt::Key_Return);
    settle();

    const auto previews = desk().windows.all<desktop::PreviewWindow>();
    ASSERT_EQ(previews.size(), 1u);
    const auto page = previews.front()->document().page(1);
    EXPECT_TRUE(pages::texts_of(page, 1).contains(u"Naismith"_s));
    EXPECT_EQ(page.size.toSize(), QSize(612, 792));
}

TEST_F(CataloguePageTest, WhoWantsOtherPeopleOnTheReportGoesOnToTagging)
{
    open();

    child<QPushButton>(window(), u"open_tagging"_s).click();
    settle();

    EXPECT_EQ(window().page()->objectName(), u"Tagging"_s);
}

TEST_F(CataloguePageTest, AReportIsMadeOfThePeopleChosenInTaggingAsItsStepsSayOrOfEverybody)
{
    open("report per person\ntitle \"Who\"\neach person\nline [surname] \" \" [phone]\n");
    tree().choose(u"custom report/who.rpy"_s);
    EXPECT_EQ(people().count(), 1);

    choose_in_tagging();
    EXPECT_EQ(people().currentText(), u"The people chosen in Tagging (2)"_s);
    const QString chosen = run().join(u'|');
    EXPECT_TRUE(chosen.contains(u"Naismith"_s)) << chosen.toStdString();
    EXPECT_FALSE(chosen.contains(u"Brown"_s) || chosen.contains(u"5550"_s)) << chosen.toStdString();

    people().setFocus();
    press(window(), Qt::Key_Up);
    const QString everybody = run().join(u'|');
    EXPECT_TRUE(everybody.contains(u"Brown"_s) && everybody.contains(u"5550"_s)) << everybody.toStdString();
}

TEST_F(CataloguePageTest, TheListOfTaggingGoesWithItsPageAndWithTheChurch)
{
    open();
    for (const bool closing : {true, false}) {
        choose_in_tagging();
        EXPECT_EQ(people().count(), 2);
        if (closing) {
            press(window(), Qt::Key_5, Qt::ControlModifier);
            press(window(), Qt::Key_W, Qt::ControlModifier);
        } else {
            begin_again();
        }
        press(window(), Qt::Key_6, Qt::ControlModifier);
        EXPECT_EQ(people().count(), 1);
        EXPECT_EQ(people().currentText(), u"Everybody"_s);
    }
}

TEST_F(CataloguePageTest, TheFirstReportIsChosenAndAnotherChoiceStaysOnEnteringAgain)
{
    open();
    EXPECT_EQ(tree().chosen()->leaf, u"Directory 1"_s);
    const int reports = tree().reports();
    tree().choose(u"k13"_s);
    core::write_file(desk().office.paths.folder(core::Folder::custom) + u"who.rpy"_s,
                     "report per person\neach person\nline [surname]\n");

    window().page()->entered();

    EXPECT_EQ(tree().chosen()->leaf, u"Directory 4 (Landscape)"_s);
    EXPECT_EQ(tree().reports(), reports + 1);
}

TEST_F(CataloguePageTest, AFaultyLayoutIsToldWhenItIsRunWithoutAPreviewAndNotBefore)
{
    open("report per person\ntitle \"Broken\"\neach person\nline [no such field]\n");
    tree().choose(u"custom report/who.rpy"_s);
    EXPECT_FALSE(drawn());
    EXPECT_TRUE(visible_texts(window()).contains(u"Run a custom report made within Kindrel"_s));

    place.dialogue.expect_box(u"The layout \"who.rpy\" cannot be used until this is put right:"_s);
    tree().setFocus();
    press(window(), Qt::Key_Return);
    EXPECT_TRUE(desk().windows.all<desktop::PreviewWindow>().empty());
}

} // namespace kindrel::test
