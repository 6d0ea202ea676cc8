#include "core/files.h"
#include "desktop/desktop_fixture.h"
#include "desktop/output/preview_window.h"
#include "desktop/output/report_tree.h"
#include "desktop/people/found_people_model.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/page.h"
#include "pages/find.h"
#include "people/filter.h"
#include "support/families.h"

#include <QAction>
#include <QComboBox>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QTableView>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

constexpr int birth_date = 4; ///< Its row among the orders.
const QString done = u"The tagging operation has successfully been completed"_s;

people::FamilyFile born(people::FamilyFile file, std::vector<core::Date> dates)
{
    for (std::size_t person = 0; person < dates.size(); ++person)
        file.people[person].birthdate = dates[person];
    return file;
}

/// Brown: Di; Naismith: Ann and Ben; Smith, booked out: Cy.
class TaggingPageTest : public DesktopTest
{
protected:
    TaggingPageTest()
    {
        begin({born(family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s}), {{1990, 3, 20}, {1988, 7, 1}}),
               born(family(u"Smith"_s, {u"Cy"_s}), {{1970, 3, 4}}), family(u"Brown"_s, {u"Di"_s})});
        place.in_database(u"UPDATE [tbl_address] SET [res_street]='3 Mill Lane';"_s);
        place.in_database(u"UPDATE [tbl_surname] SET [booked_out]=-1 WHERE [surname]='Smith';"_s);
        running->open_area(u"tagging"_s);
        settle();
    }
    [[nodiscard]] desktop::Page& page() { return *window().page(); }
    /// What stands beneath the steps, once the filter is done.
    [[nodiscard]] QWidget& bench() { return child<QWidget>(page(), u"bench"_s); }
    [[nodiscard]] QString open_step()
    {
        for (const auto* button : page().findChildren<QPushButton*>())
            if (button->isChecked())
                return button->objectName();
        return {};
    }
    void push(const QString& button)
    {
        child<QPushButton>(page(), button).setFocus();
        press(window(), Qt::Key_Space);
    }
    [[nodiscard]] QStringList listed()
    {
        QStringList names;
        const auto* model = child<QTableView>(bench(), u"working_people"_s).model();
        for (int row = 0; row < model->rowCount(); ++row)
            names += model->index(row, 0).data().toString();
        return names;
    }
    [[nodiscard]] QString text(const QString& label) { return child<QLabel>(bench(), label).text(); }
    void choose(const QString& list, int row)
    {
        child<QWidget>(bench(), list).setFocus();
        press(window(), Qt::Key_Home);
        for (int step = 0; step < row; ++step)
            press(window(), Qt::Key_Down);
    }
    /// The kind's second item stands chosen in the bulk change afterwards.
    void choose_second(int kind, const QString& item)
    {
        press(window(), Qt::Key_Return, Qt::ControlModifier);
        press(window(), Qt::Key_B, Qt::AltModifier);
        choose(u"kind"_s, kind);
        press(window(), Qt::Key_Tab);
        type(window(), item);
        settle();
    }
    void type_half_a_date(const QString& field)
    {
        child<QWidget>(bench(), field).setFocus();
        type(window(), u"1/2"_s);
        place.dialogue.expect_box(u"Incorrect format."_s); // On the way out of it.
    }
    [[nodiscard]] int rows(const QString& table)
    {
        auto found = desk().office.session->select(u"SELECT COUNT(*) FROM [%1];"_s.arg(table));
        return found.first()->integer(core::Column{0});
    }
    [[nodiscard]] bool preview_holds(const QString& words)
    {
        const auto& spool = desk().windows.all<desktop::PreviewWindow>().back()->document();
        for (int page = 1; page <= spool.page_count(); ++page)
            if (!pages::find(spool.page(page), words).empty())
                return true;
        return false;
    }
};

} // namespace

TEST_F(TaggingPageTest, TheStepsFollowEachOtherAndTheListTellsHowItCameAbout)
{
    QStringList steps;
    for (int step = 0; step < 8; ++step) {
        steps += open_step();
        press(window(), Qt::Key_PageDown, Qt::ControlModifier);
    }
    EXPECT_EQ(steps, QStringList({u"filter"_s, u"sort"_s, u"hidden"_s, u"range"_s, u"title"_s, u"format"_s,
                                  u"suppress"_s, u"process"_s}));
    EXPECT_EQ(listed(), QStringList({u"Di"_s, u"Ann"_s, u"Ben"_s, u"Cy"_s}));
    EXPECT_TRUE(text(u"state"_s).startsWith(u"4 people: ")) << text(u"state"_s).toStdString();
    EXPECT_EQ(page().status(), u"4 people"_s);
}

TEST_F(TaggingPageTest, WithoutAFileStatusTheFilterStepStaysOpen)
{
    child<QComboBox>(page(), u"file_status"_s).setFocus();
    press(window(), Qt::Key_Home);
    place.dialogue.expect_box(people::no_families_chosen.toString());
    press(window(), Qt::Key_PageDown, Qt::ControlModifier);
    EXPECT_EQ(open_step(), u"filter"_s);
    EXPECT_EQ(window().focusWidget()->objectName(), u"file_status"_s);
}

TEST_F(TaggingPageTest, TheSortStepOrdersAndNarrowsTheList)
{
    push(u"sort"_s);
    EXPECT_EQ(text(u"based_on"_s), u"Based on Today's date being 15/05/2024"_s);
    choose(u"orders"_s, birth_date);
    push(u"process"_s);
    EXPECT_EQ(listed(), QStringList({u"Cy"_s, u"Ann"_s, u"Ben"_s, u"Di"_s}));

    push(u"sort"_s);
    choose(u"search"_s, 1);
    choose(u"month"_s, 3);
    push(u"process"_s);
    EXPECT_EQ(listed(), QStringList({u"Cy"_s, u"Ann"_s}));
    EXPECT_TRUE(text(u"state"_s).contains(u"by Birth Date in March")) << text(u"state"_s).toStdString();

    push(u"sort"_s);
    choose(u"family_type"_s, 1);
    push(u"process"_s);
    EXPECT_EQ(listed(), QStringList({u"Cy"_s}));
}

TEST_F(TaggingPageTest, AnOrderByWhatMayNotBeSeenKeepsTheSortStepOpenAndTheListAsItWas)
{
    push(u"sort"_s);
    const QStringList before = listed();
    for (const auto& [order, right] :
         {std::pair(birth_date, core::Area::birth_dates), std::pair(birth_date + 1, core::Area::visitation_tab)}) {
        desk().office.rights = core::Rights::all();
        desk().office.rights.set(right, false);
        choose(u"orders"_s, order);
        place.dialogue.expect_box(u"Your password does not give access to \"%1\""_s.arg(core::area_name(right)));
        press(window(), Qt::Key_PageDown, Qt::ControlModifier);
        EXPECT_EQ(open_step(), u"sort"_s);
        EXPECT_EQ(listed(), before);
    }
}

TEST_F(TaggingPageTest, ASearchWithoutItsValueKeepsTheSortStepOpen)
{
    struct Case
    {
        int search;
        QString box, lacking;
    };
    push(u"sort"_s);
    choose(u"orders"_s, birth_date);
    for (const auto& [search, box, lacking] :
         {Case{1, u"Please select a month for the date search"_s, u"month"_s},
          Case{2, u"Please enter the ages you wish to conduct the date search for"_s, u"age_from"_s},
          Case{3, u"Please enter the dates you wish to conduct the date search for"_s, u"date_from"_s}}) {
        choose(u"search"_s, search);
        if (search == 1)
            choose(u"month"_s, 0);
        place.dialogue.expect_box(box);
        press(window(), Qt::Key_PageDown, Qt::ControlModifier);
        EXPECT_EQ(open_step(), u"sort"_s);
        EXPECT_EQ(window().focusWidget()->objectName(), lacking);
    }
}

TEST_F(TaggingPageTest, PeopleAreStruckAndAddedByHandAndThatIsTakenBack)
{
    push(u"sort"_s);
    child<QTableView>(bench(), u"working_people"_s).setFocus();
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Down, Qt::ShiftModifier);
    press(window(), Qt::Key_Delete);
    EXPECT_EQ(listed(), QStringList({u"Di"_s, u"Cy"_s}));
    EXPECT_EQ(page().note().text(), u"2 people struck from the list."_s);

    press(window(), Qt::Key_Insert);
    type(window(), u"nai b"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(listed(), QStringList({u"Di"_s, u"Ben"_s, u"Cy"_s}));
    EXPECT_TRUE(text(u"state"_s).endsWith(u"1 added and 1 struck by hand")) << text(u"state"_s).toStdString();
    press(window(), Qt::Key_Escape);
    child<QTableView>(bench(), u"working_people"_s).setFocus();
    press(window(), Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(listed(), QStringList({u"Di"_s, u"Cy"_s}));
    push(u"as_filtered"_s);
    EXPECT_EQ(listed().size(), 4);
}

TEST_F(TaggingPageTest, ABulkChangeTellsWhatItWouldDoDoesItAndIsTakenBack)
{
    choose_second(1, u"group 2"_s);
    EXPECT_EQ(text(u"count_tag_all"_s), u"3 people change, 1 in booked out families skipped"_s);
    EXPECT_EQ(rows(u"tbl_group"_s), 0);

    place.dialogue.expect_box(done, u"3 people change, 1 in booked out families skipped"_s);
    push(u"btn_tag_all"_s);
    EXPECT_EQ(rows(u"tbl_group"_s), 3);
    EXPECT_EQ(text(u"count_untag"_s), u"3 people change, 1 in booked out families skipped"_s);
    press(window(), Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(rows(u"tbl_group"_s), 0);
    EXPECT_EQ(page().note().text(), u"The change was taken back."_s);

    place.dialogue.expect_box(done);
    push(u"btn_tag_all"_s);
    place.dialogue.expect_box(done);
    push(u"btn_untag"_s);
    EXPECT_EQ(rows(u"tbl_group"_s), 0);
    push(u"offer"_s);
    EXPECT_EQ(rows(u"tbl_group"_s), 3);
}

TEST_F(TaggingPageTest, ABulkChangeIsStillTakenBackAfterSmallerActsAndOneThatChangedNobody)
{
    choose_second(1, u"group 2"_s);
    place.dialogue.expect_box(done);
    push(u"btn_tag_all"_s);
    const QString given = page().note().text();
    EXPECT_EQ(given, u"\u201cgroup 2\u201d was given to 3 people."_s);
    place.dialogue.expect_box(done);
    push(u"btn_tag_all"_s);
    EXPECT_EQ(page().note().text(), given);
    child<QTableView>(bench(), u"working_people"_s).setFocus();
    press(window(), Qt::Key_Delete);
    EXPECT_EQ(listed().size(), 3);

    press(window(), Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(listed().size(), 4);
    EXPECT_EQ(page().note().text(), given);
    desk().office.rights.set(core::Area::tagging, false);
    place.dialogue.expect_box(u"Your password does not give access to \"Tagging\""_s);
    press(window(), Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(page().note().text(), given);
    desk().office.rights.set(core::Area::tagging, true);
    press(window(), Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(rows(u"tbl_group"_s), 0);
    EXPECT_EQ(page().note().text(), u"The change was taken back."_s);
}

TEST_F(TaggingPageTest, ABulkChangeIsTakenBackByKeyFromTheLineThatFoundItsItem)
{
    choose_second(1, u"group 2"_s);
    EXPECT_EQ(window().focusWidget()->objectName(), u"item_filter");
    place.dialogue.expect_box(done);
    child<QPushButton>(bench(), u"btn_tag_all"_s).click(); // As its letter does, wherever the cursor stands.
    EXPECT_EQ(rows(u"tbl_group"_s), 3);
    EXPECT_EQ(child<QPushButton>(page(), u"offer"_s).shortcut(), QKeySequence(u"Alt+U"_s));
    press(window(), Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(rows(u"tbl_group"_s), 0);
}

TEST_F(TaggingPageTest, ADateIsGivenOnlyOnceItIsTypedAndTellsWhoseItReplaces)
{
    choose_second(3, u"2"_s);
    auto& date = child<QLineEdit>(bench(), u"date"_s);
    EXPECT_EQ(date.text(), QString());
    place.dialogue.expect_box(u"Please enter the date that the people are given"_s);
    push(u"btn_tag_all"_s);
    EXPECT_EQ(window().focusWidget(), &date);
    type(window(), u"01/02/2024"_s);
    place.dialogue.expect_box(done, u"3 people change, 1 in booked out families skipped"_s);
    push(u"btn_tag_all"_s);
    date.setFocus();
    date.selectAll();
    type(window(), u"02/02/2024"_s);
    place.dialogue.expect_box(done,
                              u"3 people get it in place of another value or mark, 1 in booked out families skipped"_s);
    push(u"btn_tag_all"_s);
}

TEST_F(TaggingPageTest, AHalfTypedDateThatIsOutOfSightHoldsNothingUp)
{
    push(u"sort"_s);
    choose(u"orders"_s, birth_date);
    choose(u"search"_s, 3);
    type_half_a_date(u"date_from"_s);
    choose(u"search"_s, 0);
    choose_second(3, u"2"_s);
    type_half_a_date(u"date"_s);
    choose_second(1, u"group 2"_s);
    place.dialogue.expect_box(done);
    push(u"btn_tag_all"_s);
    EXPECT_EQ(rows(u"tbl_group"_s), 3);
}

TEST_F(TaggingPageTest, SomebodyIsFoundAndListedByTheirOwnSurname)
{
    place.in_database(u"UPDATE [tbl_personal_details] SET [other_surname]='Achterberg' WHERE [person_id]=(SELECT "
                      "[person_id] FROM [tbl_people] WHERE [Name]='Ben');"_s);
    push(u"sort"_s);
    EXPECT_EQ(listed(), QStringList({u"Di"_s, u"Ann"_s, u"Ben Achterberg"_s, u"Cy"_s}));
    press(window(), Qt::Key_F, Qt::ControlModifier);
    type(window(), u"achterb"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(page().note().text(), u"\u201cNaismith, Ben Achterberg\u201d is on the list already."_s);

    const auto& ben = stored[0].people[1];
    const auto found = desktop::read_people(desk(), {{{ben.person_id, stored[0].family.Surname_ID}}, {}});
    ASSERT_TRUE(found && found->size() == 1);
    EXPECT_EQ(found->front().name, u"Ben Achterberg"_s);
}

TEST_F(TaggingPageTest, TheListIsPrintedOnlyWithTheRightToReports)
{
    push(u"sort"_s);
    for (const bool granted : {false, true}) {
        desk().office.rights.set(core::Area::report_outputs, granted);
        if (!granted)
            place.dialogue.expect_box(
                u"Your password does not give access to \"%1\""_s.arg(core::area_name(core::Area::report_outputs)));
        for (QAction* action : page().actions())
            if (action->text() == u"Print")
                action->trigger();
        settle();
        EXPECT_EQ(desk().windows.all<desktop::PreviewWindow>().size(), granted ? 1 : 0);
    }
}

TEST_F(TaggingPageTest, ABulkChangeAsksForItsItem)
{
    const QStringList kinds{u" Status "_s, u" Group "_s, u" Ministry "_s, u" Date Tag"_s, u" Flexi Tag"_s};
    for (int kind = 0; kind < kinds.size(); ++kind) {
        choose_second(kind, {});
        const QString end = kinds[kind] + u" until you choose one from the list"_s;
        place.dialogue.expect_box(u"Unable to tag the people with a "_s + end);
        push(u"btn_tag_all"_s);
        place.dialogue.expect_box(u"Unable to remove the people from the "_s + end);
        push(u"btn_untag"_s);
    }
}

TEST_F(TaggingPageTest, MinistryDateAndFlexiFieldAreGivenWithWhatStandsBesideThem)
{
    const auto give = [this] {
        place.dialogue.expect_box(done);
        push(u"btn_tag_all"_s);
    };
    choose_second(2, u"ministry 2"_s);
    choose(u"ministry_state"_s, 1);
    give();
    choose_second(3, u"2"_s);
    push(u"process"_s);
    child<QLineEdit>(bench(), u"date"_s).setFocus();
    child<QLineEdit>(bench(), u"date"_s).selectAll();
    type(window(), u"01/02/2024"_s);
    give();
    choose_second(4, u"2"_s);
    child<QLineEdit>(bench(), u"flexi"_s).setFocus();
    type(window(), u"blue"_s);
    child<QAbstractButton>(bench(), u"mark"_s).setFocus();
    press(window(), Qt::Key_Space);
    give();

    auto found = desk().office.session->select(
        u"SELECT m.[ministry_type],d.[in_date],f.[flexi_field],f.[flexi_tagged] FROM [tbl_ministry] m "
        "JOIN [tbl_individual_date] d ON d.[person_id]=m.[person_id] "
        "JOIN [tbl_flexi] f ON f.[person_id]=m.[person_id];"_s);
    const core::Row* row = found.first();
    ASSERT_TRUE(row);
    EXPECT_EQ(row->integer(core::Column{0}), 2);
    EXPECT_EQ(row->text(core::Column{1}), u"2024-02-01");
    EXPECT_EQ(row->text(core::Column{2}), u"blue");
    EXPECT_TRUE(row->flag(core::Column{3}));
}

TEST_F(TaggingPageTest, AReportIsMadeOfTheListAsTheStepsSay)
{
    push(u"range"_s);
    type(window(), u"N"_s);
    press(window(), Qt::Key_Tab);
    type(window(), u"N"_s);
    push(u"title"_s);
    type(window(), u"Camp in May"_s);
    push(u"process"_s);
    EXPECT_EQ(listed(), QStringList({u"Ann"_s, u"Ben"_s}));
    press(window(), Qt::Key_Return);
    EXPECT_TRUE(preview_holds(u"Naismith"_s));
    EXPECT_TRUE(preview_holds(u"Camp in May"_s));
    EXPECT_FALSE(preview_holds(u"Church Directory"_s));
    EXPECT_FALSE(preview_holds(u"Brown"_s));
}

TEST_F(TaggingPageTest, DetailsThatAreTickedAreLeftOutOfTheReport)
{
    push(u"process"_s);
    press(window(), Qt::Key_Return);
    EXPECT_TRUE(preview_holds(u"3 Mill Lane"_s));
    for (auto* preview : desk().windows.all<desktop::PreviewWindow>())
        preview->close();
    settle();

    push(u"hidden"_s);
    press(window(), Qt::Key_Space);
    EXPECT_TRUE(child<QAbstractButton>(bench(), u"withhold_addresses"_s).isChecked());
    push(u"process"_s);
    press(window(), Qt::Key_Return);
    EXPECT_TRUE(preview_holds(u"Naismith"_s));
    EXPECT_FALSE(preview_holds(u"3 Mill Lane"_s));
}

TEST_F(TaggingPageTest, LettersGoToTheAddressThatTheFormatStepChoseAndTellWhenTheyArePrinted)
{
    place.in_database(u"UPDATE [tbl_address] SET [post_street]='PO Box 7';"_s);
    core::make_folder(desk().office.paths.folder(core::Folder::letter));
    core::write_file(desk().office.paths.folder(core::Folder::letter) + u"Welcome.ltr"_s,
                     "{\\rtf1 [____Street_Address____]}");
    push(u"format"_s);
    choose(u"letter_address"_s, 1);
    push(u"process"_s);
    auto& tree = child<desktop::ReportTree>(bench(), u"catalogue"_s);
    tree.reload();
    tree.choose(u"letter/Welcome.ltr"_s);
    press(window(), Qt::Key_Return);
    ASSERT_EQ(desk().windows.all<desktop::PreviewWindow>().size(), 1);
    EXPECT_TRUE(preview_holds(u"3 Mill Lane"_s));
    EXPECT_FALSE(preview_holds(u"PO Box 7"_s));

    auto& preview = *desk().windows.all<desktop::PreviewWindow>().back();
    press(preview, Qt::Key_P, Qt::ControlModifier);
    EXPECT_EQ(printing.pages, 3);
    EXPECT_EQ(preview.note().text(), u"Letter Printing is now completed"_s);

    begin_again();
    running->open_area(u"tagging"_s);
    settle();
    EXPECT_EQ(child<QComboBox>(bench(), u"letter_address"_s).currentText(), u"Residential"_s);
}

TEST_F(TaggingPageTest, EveryStepFitsTheSmallestWindow)
{
    window().resize(1024, 768);
    for (int step = 0; step < 8; ++step) {
        settle();
        EXPECT_EQ(window().size(), QSize(1024, 768)) << open_step().toStdString();
        press(window(), Qt::Key_PageDown, Qt::ControlModifier);
    }
}

} // namespace kindrel::test
