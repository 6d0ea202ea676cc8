#include "desktop/shell/note_bar.h"
#include "desktop/weekly_fixture.h"

#include <QComboBox>
#include <QWheelEvent>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

/// The reports by their places in the list.
enum Report { totals = 0, analysis = 2, month_totals = 3, year_totals = 6, comparison = 8 };

class WeeklyOutputTest : public WeeklyScreenTest
{
protected:
    void open_output(Report report)
    {
        open_page();
        turn_to_output(report);
    }
    void turn_to_output(Report report)
    {
        act(Qt::Key_PageDown, Qt::ControlModifier);
        reports().setCurrentRow(report);
    }
    [[nodiscard]] QListWidget& reports() { return child<QListWidget>(page(), u"output_type"_s); }
    [[nodiscard]] QComboBox& combo(const QString& name) { return child<QComboBox>(page(), name); }
    [[nodiscard]] int this_year() { return desk().office.clock.today().year(); }
    void run()
    {
        window().activateWindow(); // A preview may stand before it.
        settle();
        act(Qt::Key_P, Qt::ControlModifier);
    }
};

} // namespace

TEST_F(WeeklyOutputTest, CategoriesLeftOutOfAReportAndItsPeriodAreRememberedAndTooFewOrTooManyAreRefused)
{
    start(10, 0);
    open_page();
    act(Qt::Key_PageDown, Qt::ControlModifier);
    auto* reports = &child<QListWidget>(page(), u"output_type"_s);
    EXPECT_EQ(reports->currentRow(), 3); // The first that holds ten categories.
    act(Qt::Key_Home);
    place.dialogue.expect_box(
        u"For the records data report you are only able to select a maximum amount of 9 categories"_s);
    act(Qt::Key_Return);
    EXPECT_TRUE(previews().empty());
    EXPECT_EQ(in_focus(), u"A_att"_s);
    act(Qt::Key_Down);
    act(Qt::Key_Space);
    act(Qt::Key_P, Qt::ControlModifier);
    EXPECT_EQ(previews().size(), 1);

    begin_again();
    open_page();
    act(Qt::Key_PageDown, Qt::ControlModifier);
    reports = &child<QListWidget>(page(), u"output_type"_s);
    EXPECT_EQ(reports->currentRow(), 0);
    EXPECT_EQ(child<QListWidget>(page(), u"A_att"_s).item(1)->checkState(), Qt::Unchecked);
    child<QAbstractButton>(page(), u"A_att_none"_s).setFocus();
    act(Qt::Key_Space);
    place.dialogue.expect_box(u"Please select either a financial or attendance item"_s);
    act(Qt::Key_P, Qt::ControlModifier);
    EXPECT_TRUE(previews().empty());
}

TEST_F(WeeklyOutputTest, AChartThatAReportNeedsIsProposedThereAndTheOwnChoiceStays)
{
    start();
    open_output(analysis);
    EXPECT_EQ(combo(u"chart"_s).currentText(), u"3D Bar"_s);
    run();
    EXPECT_EQ(previews().size(), 1);
    reports().setCurrentRow(month_totals);
    EXPECT_EQ(combo(u"chart"_s).currentText(), u"No chart"_s);

    begin_again();
    open_output(month_totals);
    EXPECT_EQ(combo(u"chart"_s).currentText(), u"No chart"_s);
    combo(u"chart"_s).setFocus();
    act(Qt::Key_Down);
    act(Qt::Key_Down);
    reports().setCurrentRow(analysis);
    reports().setCurrentRow(month_totals);
    EXPECT_EQ(combo(u"chart"_s).currentText(), u"2D Bar"_s);
    run();
    EXPECT_EQ(previews().size(), 1);

    begin_again();
    open_output(month_totals);
    EXPECT_EQ(combo(u"chart"_s).currentText(), u"2D Bar"_s);
}

TEST_F(WeeklyOutputTest, UnsavedFiguresAreOfferedToBeSavedBeforeAReport)
{
    struct Case
    {
        std::optional<bool> answer;
        std::size_t previews;
        QString note, stored;
    };
    start();
    open_newest();
    enter(u"130"_s);
    turn_to_output(totals);
    for (const auto& [answer, windows, note, in_store] :
         {Case{std::nullopt, 0, {}, u"1:120"_s},
          Case{false, 1, u"The figures of 05/05/2024 are not saved; this report leaves them out."_s, u"1:120"_s},
          Case{true, 2, {}, u"1:130"_s}}) {
        place.dialogue.expect_confirm_or_cancel(
            u"The figures of 05/05/2024 are not saved, do you wish to save them before the report is made?"_s, answer);
        run();
        EXPECT_EQ(previews().size(), windows);
        EXPECT_EQ(window().page()->note().text(), note);
        EXPECT_EQ(stored(u"2024-05-05"_s), in_store);
    }
}

TEST_F(WeeklyOutputTest, AReportThatIsRefusedAsksNothingAboutUnsavedFiguresBeforeItWouldReadThemAndRemarksOnNone)
{
    start();
    open_newest();
    enter(u"130"_s);
    turn_to_output(month_totals);
    combo(u"year"_s).setCurrentText(u"207"_s);
    place.dialogue.expect_box(u"Incorrect format for the analysis year, eg. '2007'"_s);
    run();
    combo(u"year"_s).setCurrentText(u"2007"_s);
    place.dialogue.expect_confirm_or_cancel(
        u"The figures of 05/05/2024 are not saved, do you wish to save them before the report is made?"_s, false);
    place.dialogue.expect_box(u"No figures found for creating a report"_s);
    run();
    EXPECT_TRUE(previews().empty());
    EXPECT_EQ(window().page()->note().text(), QString());
}

TEST_F(WeeklyOutputTest, AYearTurnsByOneUnderTheKeysAndUnderTheWheelOnceTheCursorIsInIt)
{
    start();
    open_output(month_totals);
    auto& year = combo(u"year"_s);
    const auto turn_wheel = [&] {
        QWheelEvent wheel({1, 1}, {1, 1}, {}, {0, 120}, Qt::NoButton, Qt::NoModifier, Qt::NoScrollPhase, false);
        QCoreApplication::sendEvent(&year, &wheel);
        return year.currentText().toInt() - this_year();
    };
    EXPECT_EQ(turn_wheel(), 0);
    year.setFocus();
    act(Qt::Key_Up);
    EXPECT_EQ(year.currentText().toInt(), this_year() + 1);
    act(Qt::Key_Down);
    act(Qt::Key_Down);
    EXPECT_EQ(year.currentText().toInt(), this_year() - 1);
    EXPECT_EQ(turn_wheel(), 0);
}

TEST_F(WeeklyOutputTest, ARefusalOpensNoPreviewAndPutsTheCursorIntoWhatIsToBeMended)
{
    struct Case
    {
        Report report;
        QString field, typed, refusal;
    };
    start();
    open_output(totals);
    for (const auto& [report, field, typed, refusal] :
         {Case{totals, u"from"_s, u"05/03/XXXX"_s, u"Please enter the year too."_s},
          Case{totals, u"to"_s, u"05/03"_s, u"Please enter the year too."_s},
          Case{totals, u"to"_s, u"01/01/1999"_s,
               u"The date to end the search from is before the date to begin the search from"_s},
          Case{month_totals, u"year"_s, u"207"_s, u"Incorrect format for the analysis year, eg. '2007'"_s},
          Case{month_totals, u"year"_s, u"2007"_s, u"No figures found for creating a report"_s},
          Case{
              year_totals, u"to_year"_s, u"2099"_s,
              u"You can only do an analysis up to a maximum of 12 years, please decrease the gap in the years selected "
              "for analysis"_s}}) {
        reports().setCurrentRow(report);
        auto& widget = child<QWidget>(page(), field);
        auto* line = qobject_cast<QLineEdit*>(&widget);
        if (!line)
            line = combo(field).lineEdit();
        widget.setFocus();
        line->selectAll();
        write(typed);
        place.dialogue.expect_box(refusal);
        run();
        EXPECT_TRUE(previews().empty());
        EXPECT_EQ(in_focus(), field) << refusal.toStdString();
        EXPECT_EQ(line->selectedText(), typed) << refusal.toStdString();
        if (line->isModified())
            act(Qt::Key_Escape);
    }
    begin_again();
    open_output(month_totals);
    EXPECT_EQ(combo(u"year"_s).currentText().toInt(), this_year());
}

TEST_F(WeeklyOutputTest, AComparisonBeginsWithTheLastTwoYearsWhateverTheOtherReportsSpan)
{
    start();
    open_output(comparison);
    EXPECT_EQ(combo(u"from_year"_s).currentText().toInt(), this_year() - 1);
    reports().setCurrentRow(year_totals);
    EXPECT_EQ(combo(u"from_year"_s).currentText().toInt(), this_year() - 4);
    combo(u"from_year"_s).setCurrentText(u"2019"_s);
    run();
    EXPECT_EQ(previews().size(), 1);

    place.clock.set(desk().office.clock.today().addYears(1));
    begin_again();
    open_output(comparison);
    EXPECT_EQ(combo(u"from_year"_s).currentText().toInt(), this_year() - 1);
    EXPECT_EQ(combo(u"to_year"_s).currentText().toInt(), this_year());
    reports().setCurrentRow(year_totals);
    EXPECT_EQ(combo(u"from_year"_s).currentText(), u"2019"_s);
    EXPECT_EQ(combo(u"to_year"_s).currentText().toInt(), this_year());
}

TEST_F(WeeklyOutputTest, AReportOnTheYearSoFarIsOneOnTheYearSoFarTheNextTimeToo)
{
    start();
    open_output(totals);
    run();
    EXPECT_EQ(previews().size(), 1);
    const QDate later = desk().office.clock.today().addYears(1).addDays(7);
    place.clock.set(later);
    begin_again();
    open_output(totals);
    EXPECT_EQ(child<QLineEdit>(page(), u"from"_s).text(), core::Date({later.year(), 1, 1}).shown());
    EXPECT_EQ(child<QLineEdit>(page(), u"to"_s).text(), core::Date::from(later).shown());
    reports().setCurrentRow(month_totals);
    EXPECT_EQ(combo(u"year"_s).currentText().toInt(), later.year());
}

TEST_F(WeeklyOutputTest, ARefusalOverCategoriesPutsTheCursorIntoTheListThatCanMendIt)
{
    struct Case
    {
        int attendance, money;
        QString cleared, refusal, in_focus;
    };
    const auto too_many = u"For the records data report you are only able to select a maximum amount of 9 categories"_s;
    const auto none = u"Please select either a financial or attendance item"_s;
    start();
    open_page();
    for (const auto& one :
         {Case{0, 10, u"A_att_none"_s, too_many, u"A_fin"_s}, Case{0, 2, u"A_fin_none"_s, none, u"A_fin"_s},
          Case{1, 10, u"A_att_none"_s, too_many, u"A_fin"_s}, Case{2, 0, u"A_att_none"_s, none, u"A_att"_s},
          Case{10, 1, u"A_fin_none"_s, too_many, u"A_att"_s}}) {
        set_categories(one.attendance, one.money);
        act(Qt::Key_PageUp, Qt::ControlModifier);
        turn_to_output(totals);
        for (const auto& button : {u"A_att_all"_s, u"A_fin_all"_s, one.cleared})
            child<QAbstractButton>(page(), button).click();
        place.dialogue.expect_box(one.refusal);
        run();
        EXPECT_EQ(in_focus(), one.in_focus) << one.attendance << " and " << one.money;
    }
}

TEST_F(WeeklyOutputTest, TheChosenReportIsKeptAsText)
{
    start(1, 1);
    open_output(month_totals);
    const auto saved = [this] {
        const QString file = place.data.drive() + u"report.csv"_s;
        place.dialogue.expect_file(u"Save this list"_s, file);
        for (QAction* action : window().page()->actions())
            if (action->text() == u"Save as CSV")
                action->trigger();
        return DataFolder::read(file);
    };
    EXPECT_EQ(saved(),
              "\xEF\xBB\xBF"
              "Category,January,February,March,April,May,June,July,August,September,October,November,December,Year\r\n"
              "Category 1,,,,,120,,,,,,,,120\r\nCategory 2 ($),,,,,,,,,,,,,\r\n");
    reports().setCurrentRow(analysis);
    combo(u"chart"_s).setCurrentText(u"No chart"_s);
    EXPECT_TRUE(saved().contains("\r\n05/05/2024,120,\r\n")) << "text needs no chart";
}

} // namespace kindrel::test
