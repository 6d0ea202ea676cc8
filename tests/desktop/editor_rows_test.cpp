#include "desktop/people/editor_rows.h"

#include "desktop/editor_bench_fixture.h"
#include "desktop/people/card_list_view.h"
#include "desktop/people/editor_tabs.h"
#include "desktop/shell/item_picker.h"
#include "support/families.h"

#include <QAbstractButton>
#include <QLineEdit>
#include <QListWidget>
#include <QTableWidget>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;
using core::Date;
using desktop::EditorTab;
using people::LinkRow;
using people::RowList;

namespace {

LinkRow carried(int item, const QString& text, std::optional<Date> date = {})
{
    return {item, text, 0, date, {}, false};
}

class EditorRowsTest : public EditorBenchTest
{
protected:
    [[nodiscard]] QTableView& table(const QString& name) { return child<QTableView>(*tab, name); }
    /// Puts the cursor into a list, at a row of it where there is one.
    void go_to(const QString& name, int row = 0)
    {
        table(name).setFocus();
        table(name).setCurrentIndex(table(name).model()->index(row, 0));
    }
    [[nodiscard]] QStringList rows(const QString& name)
    {
        QStringList lines;
        const auto& model = *table(name).model();
        for (int row = 0; row < model.rowCount(); ++row) {
            QStringList line;
            for (int column = 0; column < model.columnCount(); ++column)
                line += model.index(row, column).data().toString();
            lines += line.join(u'|');
        }
        return lines;
    }
    [[nodiscard]] desktop::ItemPicker& picker() { return *tab->findChildren<desktop::ItemPicker*>().back(); }
    [[nodiscard]] QStringList offered()
    {
        press(*tab, Qt::Key_Insert);
        QStringList texts;
        const auto& list = child<QListWidget>(picker(), u"items"_s);
        for (int row = 0; row < list.count(); ++row)
            texts += list.item(row)->text();
        close(Qt::Key_Escape);
        return texts;
    }
    void pick(const QString& typed)
    {
        press(*tab, Qt::Key_Insert);
        type(picker(), typed);
        close(Qt::Key_Return);
    }
    /// Without a window manager nobody brings back the window behind.
    void close(Qt::Key key)
    {
        press(picker(), key);
        tab->activateWindow();
        settle();
    }
};

people::FamilyFile naismiths()
{
    auto file = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s});
    file.people[0].groups = {carried(2, u"group 2"_s), carried(1, u"group 1"_s)};
    return file;
}

} // namespace

TEST_F(EditorRowsTest, AnItemIsAddedByTypingItsName)
{
    open(naismiths());
    show(desktop::make_groups_tab);
    go_to(u"groups"_s);
    pick(u"3"_s);
    EXPECT_EQ(rows(u"groups"_s), QStringList({u"group 2"_s, u"group 1"_s, u"group 3"_s}));
    EXPECT_EQ(in_focus(), &table(u"groups"_s));
    EXPECT_EQ(table(u"groups"_s).currentIndex().row(), 2);
    bench->choose_person(1);
    EXPECT_EQ(rows(u"groups"_s), QStringList());
}

TEST_F(EditorRowsTest, OnlyWhatCanBeCarriedIsOffered)
{
    open(naismiths());
    place.in_database(u"UPDATE [tbl_group_setup] SET [not_active]=-1 WHERE [group_id]=3;"_s);
    show(desktop::make_groups_tab);
    go_to(u"groups"_s);
    EXPECT_EQ(offered(), QStringList());
    bench->choose_person(1);
    EXPECT_EQ(offered(), QStringList({u"group 1"_s, u"group 2"_s}));
}

TEST_F(EditorRowsTest, AMinistryIsCarriedAsActiveOrPotential)
{
    open(naismiths());
    show(desktop::make_groups_tab);
    go_to(u"ministries"_s);
    pick(u"pot 2"_s);
    EXPECT_EQ(rows(u"ministries"_s), QStringList({u"(Potential) ministry 2"_s}));
    EXPECT_EQ(person().ministries.front().text, u"ministry 2"_s);
    press(*tab, Qt::Key_Space);
    EXPECT_EQ(rows(u"ministries"_s), QStringList({u"(Active) ministry 2"_s}));
    pick(u"pot 2"_s);
    press(*tab, Qt::Key_Space);
    EXPECT_EQ(rows(u"ministries"_s), QStringList({u"(Active) ministry 2"_s, u"(Potential) ministry 2"_s}));
    EXPECT_EQ(offered().size(), 4);
}

TEST_F(EditorRowsTest, AnOccupationThatIsNotInTheListIsAddedToIt)
{
    open(naismiths());
    show(desktop::make_groups_tab);
    go_to(u"occupations"_s);
    press(*tab, Qt::Key_Insert);
    type(picker(), u"Beekeeper"_s);
    press(picker(), Qt::Key_Down);
    close(Qt::Key_Return);
    EXPECT_EQ(rows(u"occupations"_s), QStringList({u"Beekeeper"_s}));
    EXPECT_EQ(people::read_setup_items(*desk().office.session, people::SetupKind::occupations).back().key,
              person().occupations.front().item);
}

TEST_F(EditorRowsTest, RemovingAsksInTheWordsOfTheList)
{
    auto file = full_family(false);
    open(std::move(file));
    struct Case
    {
        EditorTab* (*make)(desktop::EditorBench&);
        QString table;
        QString question;
    };
    const QString row = u"Please confirm that you wish to remove this row"_s;
    for (const auto& [make, name, question] :
         {Case{desktop::make_groups_tab, u"status"_s, row}, Case{desktop::make_groups_tab, u"family_groups"_s, row},
          Case{desktop::make_dates_tab, u"flexi"_s,
               u"Please confirm that you wish to remove this flexi from this person"_s},
          Case{desktop::make_dates_tab, u"dates"_s,
               u"Please confirm that you wish to remove this date from this person"_s},
          Case{desktop::make_dates_tab, u"family_dates"_s,
               u"Please confirm that you wish to remove this date from this family"_s},
          Case{desktop::make_events_tab, u"events"_s, row}}) {
        show(make);
        go_to(name);
        const auto before = rows(name);
        place.dialogue.expect_confirm(question, Answer::no, Answer::no);
        press(*tab, Qt::Key_Delete);
        EXPECT_EQ(rows(name), before);
        place.dialogue.expect_confirm(question, Answer::yes);
        press(*tab, Qt::Key_Delete);
        EXPECT_EQ(rows(name), before.mid(1)) << name.toStdString();
    }
}

TEST_F(EditorRowsTest, AltWithAnArrowMovesARowAsFarAsTheListGoes)
{
    open(naismiths());
    show(desktop::make_groups_tab);
    go_to(u"groups"_s);
    press(*tab, Qt::Key_Down, Qt::AltModifier);
    EXPECT_EQ(rows(u"groups"_s), QStringList({u"group 1"_s, u"group 2"_s}));
    place.dialogue.expect_box(u"Unable to move this row down as it is at the bottom of the list"_s);
    press(*tab, Qt::Key_Down, Qt::AltModifier);
    press(*tab, Qt::Key_Up, Qt::AltModifier);
    place.dialogue.expect_box(u"Unable to move this row up as it is at the top of the list"_s);
    press(*tab, Qt::Key_Up, Qt::AltModifier);
    EXPECT_EQ(rows(u"groups"_s), QStringList({u"group 2"_s, u"group 1"_s}));
}

TEST_F(EditorRowsTest, ANewDateIsTypedAtOnceAndMayLackItsYear)
{
    open(naismiths());
    show(desktop::make_dates_tab);
    go_to(u"dates"_s);
    pick(u"2"_s);
    ASSERT_EQ(in_focus()->objectName(), u"cell"_s);
    type(*tab, u"12/03/xxxx"_s);
    press(*tab, Qt::Key_Return);
    EXPECT_EQ(rows(u"dates"_s), QStringList({u"date_description 2|12/03/XXXX|"_s}));
    EXPECT_EQ(person().dates.front().date, (Date{Date::unknown_year, 3, 12}));
    EXPECT_EQ(in_focus(), &table(u"dates"_s));
}

TEST_F(EditorRowsTest, DatesAreTypedShortAndTakenAwayByEmptyingTheCell)
{
    auto file = naismiths();
    file.people[0].dates = {carried(1, u"date_description 1"_s)};
    open(std::move(file));
    show(desktop::make_dates_tab);
    const auto today = Date::from(place.clock.today());
    const auto in_a_week = Date::from(place.clock.today().addDays(7));
    for (const auto& [typed, date] : {std::pair{u"t"_s, std::optional(today)}, {u"+7"_s, in_a_week}, {u" "_s, {}}}) {
        go_to(u"dates"_s);
        press(*tab, Qt::Key_Return);
        type(*tab, typed);
        press(*tab, Qt::Key_Return);
        EXPECT_EQ(person().dates.front().date, date) << typed.toStdString();
    }
}

TEST_F(EditorRowsTest, TypingBeginsInTheCellAtOnce)
{
    auto file = naismiths();
    file.people[0].flexi = {carried(1, u"flexi 1"_s)};
    file.people[0].flexi[0].field = u"old"_s;
    open(std::move(file));
    show(desktop::make_dates_tab);
    go_to(u"flexi"_s);
    press(*tab, Qt::Key_Right);
    type(*tab, u"n"_s);
    ASSERT_EQ(in_focus()->objectName(), u"cell"_s);
    type(*tab, u"ew"_s);
    EXPECT_TRUE(tab->finish_typing());
    EXPECT_EQ(rows(u"flexi"_s), QStringList({u"flexi 1|new|"_s}));
}

TEST_F(EditorRowsTest, WhatIsTypedForOnePersonNeverReachesAnother)
{
    auto file = naismiths();
    for (auto& each : file.people)
        each.dates = {carried(1, u"date_description 1"_s)};
    open(std::move(file));
    show(desktop::make_dates_tab);
    go_to(u"dates"_s);
    press(*tab, Qt::Key_Return);
    type(*tab, u"soon"_s);
    place.dialogue.expect_box(u"Incorrect format."_s);
    QTest::keyClick(in_focus(), Qt::Key_Return);
    bench->choose_person(1);
    settle();
    EXPECT_FALSE(tab->findChild<QLineEdit*>(u"cell"_s));
    EXPECT_EQ(rows(u"dates"_s), QStringList({u"date_description 1||"_s}));
}

TEST_F(EditorRowsTest, AnotherChangeLeavesAnOpenCellAlone)
{
    auto file = naismiths();
    file.people[0].dates = {carried(1, u"date_description 1"_s)};
    open(std::move(file));
    show(desktop::make_dates_tab);
    go_to(u"dates"_s);
    press(*tab, Qt::Key_Return);
    type(*tab, u"12/03"_s);
    bench->editor.change(u"phone"_s, [](people::FamilyFile& changed) { changed.address.phone = u"555 1234"_s; });
    bench->show_again();
    type(*tab, u"/1990"_s);
    press(*tab, Qt::Key_Return);
    EXPECT_EQ(person().dates.front().date, (Date{1990, 3, 12}));
}

TEST_F(EditorRowsTest, TheHistoryFollowsTheGroupsOfTheChosenPersonOnceTheyAreSaved)
{
    open(naismiths());
    show(desktop::make_groups_tab);
    const auto& history = child<QTableWidget>(*tab, u"Group history"_s);
    EXPECT_EQ(history.rowCount(), 2);
    go_to(u"groups"_s);
    place.dialogue.expect_confirm(u"Please confirm that you wish to remove this row"_s, Answer::yes);
    press(*tab, Qt::Key_Delete);
    EXPECT_EQ(bench->editor.save(), people::Saved::yes);
    bench->show_again();
    QStringList closed;
    for (int row = 0; row < history.rowCount(); ++row)
        if (history.item(row, 3)->text() == u"Yes"_s)
            closed += history.item(row, 0)->text();
    EXPECT_EQ(closed, QStringList({u"group 2"_s}));
    bench->choose_person(1);
    EXPECT_EQ(history.rowCount(), 0);
}

TEST_F(EditorRowsTest, ADateThatCannotBeReadIsRefusedAndStaysInItsCell)
{
    auto file = naismiths();
    file.family_dates = {carried(1, u"date_description 1"_s, Date{1988, 8, 8})};
    open(std::move(file));
    show(desktop::make_dates_tab);
    go_to(u"family_dates"_s);
    press(*tab, Qt::Key_Return);
    type(*tab, u"31/02/2020"_s);
    place.dialogue.expect_box(u"Incorrect format."_s);
    press(*tab, Qt::Key_Return);
    ASSERT_EQ(in_focus()->objectName(), u"cell"_s);
    EXPECT_EQ(static_cast<QLineEdit*>(in_focus())->selectedText(), u"31/02/2020"_s);
    EXPECT_EQ(this->file().family_dates.front().date, (Date{1988, 8, 8}));
}

TEST_F(EditorRowsTest, TheTodayButtonAsksBeforeItReplacesADate)
{
    auto file = naismiths();
    file.events = {{Date{2011, 5, 6}, u"Moved here"_s}};
    open(std::move(file));
    show(desktop::make_events_tab);
    go_to(u"events"_s);
    const QString question = u"A date has already been entered, do you wish to change this date to today's date"_s;
    place.dialogue.expect_confirm(question, Answer::no);
    click(u"now"_s);
    EXPECT_EQ(rows(u"events"_s), QStringList({u"06/05/2011|Moved here"_s}));
    place.dialogue.expect_confirm(question, Answer::yes);
    click(u"now"_s);
    EXPECT_EQ(this->file().events.front().event_date, Date::from(place.clock.today()));
}

TEST_F(EditorRowsTest, SpaceTagsAndUntagsARow)
{
    auto file = naismiths();
    file.people[0].flexi = {carried(1, u"flexi 1"_s)};
    open(std::move(file));
    show(desktop::make_dates_tab);
    go_to(u"flexi"_s);
    press(*tab, Qt::Key_Space);
    EXPECT_EQ(rows(u"flexi"_s), QStringList({u"flexi 1||Yes"_s}));
    press(*tab, Qt::Key_Space);
    EXPECT_EQ(rows(u"flexi"_s), QStringList({u"flexi 1||"_s}));
}

TEST_F(EditorRowsTest, EventsAndContactsAreTypedOneAfterTheOther)
{
    open(naismiths());
    show(desktop::make_events_tab);
    go_to(u"events"_s);
    press(*tab, Qt::Key_Insert);
    for (const auto& text : {u"Moved here"_s, u"06/05/11"_s, u"Sold the boat"_s}) {
        type(*tab, text);
        press(*tab, Qt::Key_Return);
    }
    press(*tab, Qt::Key_Return); // Without a date.
    EXPECT_EQ(rows(u"events"_s), QStringList({u"06/05/2011|Moved here"_s, u"|Sold the boat"_s}));
    type(*tab, u"Gone"_s);
    press(*tab, Qt::Key_Return);
    type(*tab, u"soon"_s);
    place.dialogue.expect_box(u"Incorrect format."_s);
    press(*tab, Qt::Key_Return);
    EXPECT_EQ(static_cast<QLineEdit*>(in_focus())->selectedText(), u"soon"_s);
    EXPECT_EQ(rows(u"events"_s).size(), 2);
}

TEST_F(EditorRowsTest, AClosedSectionAndAReadOnlyFileCannotBeChanged)
{
    auto file = naismiths();
    file.people[0].status = {carried(1, u"status 1"_s)};
    file.access.groups = false;
    open(std::move(file));
    show(desktop::make_groups_tab);
    go_to(u"groups"_s);
    EXPECT_EQ(rows(u"groups"_s), QStringList());
    EXPECT_EQ(visible_texts(*tab).count(desktop::closed_words()), 2);
    press(*tab, Qt::Key_Insert);
    EXPECT_TRUE(tab->findChildren<desktop::ItemPicker*>().empty());

    desk().office.rights.set(core::Area::read_only_family_data, true);
    bench->show_again();
    go_to(u"status"_s);
    for (const auto key : {Qt::Key_Insert, Qt::Key_Delete, Qt::Key_Space, Qt::Key_Return})
        press(*tab, key);
    EXPECT_TRUE(tab->findChildren<desktop::ItemPicker*>().empty());
    EXPECT_EQ(rows(u"status"_s), QStringList({u"status 1"_s}));
    EXPECT_FALSE(child<QAbstractButton>(*tab, u"add"_s).isVisibleTo(tab.get()));
}

TEST_F(EditorRowsTest, AVisitOfTodayIsAdded)
{
    open(naismiths());
    show(desktop::make_events_tab);
    click(u"add_to_visitation"_s);
    ASSERT_EQ(file().visits.size(), 1U);
    EXPECT_TRUE(visible_texts(*tab).join(u'\n').contains(u"Ann & Ben Naismith"_s));
}

} // namespace kindrel::test
