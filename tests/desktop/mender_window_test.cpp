#include "desktop/mender_window_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;

TEST_F(MenderWindowTest, ASoundChurchIsToldAndCheckingChangesNothing)
{
    const auto before = everything();
    open();
    EXPECT_EQ(focus(), u"check"_s);
    EXPECT_FALSE(offers(u"mend"_s) || offers(u"unlock"_s) || offers(u"recover"_s)); // Looking comes first.
    press(*window, Qt::Key_Return);
    EXPECT_EQ(outcome(), u"Sound"_s) << told().toStdString();
    EXPECT_EQ(lines().first(), u"Church 1 is sound."_s);
    EXPECT_FALSE(offers(u"mend"_s));
    EXPECT_EQ(everything(), before);
}

TEST_F(MenderWindowTest, FindingsStandUnderWhatTakesThemAwayWithCountAndRemedy)
{
    damage();
    lock_at(u"office-2"_s);
    mark_busy();
    place.in_database(u"DROP INDEX [idx_pin_number];"_s);
    place.in_database(u"INSERT INTO [tbl_pin] ([person_id],[personal_pin]) VALUES (10,'104'),(20,'104');"_s);
    const auto before = everything();
    open_and_check();
    const QStringList all = lines();
    const auto locks = all.indexOf(u"Locks and markers that keep people out: 2 findings"_s);
    const auto mends = all.indexOf(u"What mending puts right: 2 findings"_s);
    const auto by_hand = all.indexOf(u"What a person must decide: 1 finding"_s);
    ASSERT_TRUE(0 < locks && locks < mends && mends < by_hand) << told().toStdString();
    const auto address = all.indexOf(u"•  "_s + no_address);
    EXPECT_TRUE(mends < address && address < by_hand) << told().toStdString();
    EXPECT_EQ(all.value(address + 1), u"An empty one is added for each."_s);
    EXPECT_TRUE(all.value(locks + 2).contains(u"'Able, Ann' is held by the workstation 'office-2'"));
    EXPECT_EQ(outcome(), u"5 findings"_s);
    EXPECT_EQ(focus(), u"unlock"_s); // What must come first.
    EXPECT_EQ(everything(), before);
}

TEST_F(MenderWindowTest, MendingAsksAndTellsWhatWasDoneAndWhereTheCopyLies)
{
    damage();
    open_and_check();
    ASSERT_EQ(focus(), u"mend"_s);
    place.dialogue.expect_confirm(mend_question, Answer::no, Answer::no);
    press(*window, Qt::Key_Return);
    EXPECT_EQ(count(database(), u"tbl_address"_s), 0);

    place.dialogue.expect_confirm(mend_question, Answer::yes, Answer::no);
    press(*window, Qt::Key_Return);
    EXPECT_EQ(lines().first(), u"Church 1 is sound."_s) << told().toStdString();
    EXPECT_TRUE(lines().contains(u"Mended: 1 finding"_s) && lines().contains(u"•  "_s + no_address));
    EXPECT_EQ(count(database(), u"tbl_address"_s), 2);
    const QString copy = in_church(u"mended/KR10_records before mending 2024-05-15 103000.kdl"_s);
    EXPECT_TRUE(lines().contains(u"The database as it was before: "_s + copy)) << told().toStdString();
    EXPECT_EQ(count(copy, u"tbl_address"_s), 0);
}

TEST_F(MenderWindowTest, AChurchInUseIsRefusedWithWhoIsInsideUntilItIsUnlocked)
{
    damage();
    lock_at(u"office-2"_s);
    open_and_check();
    place.dialogue.expect_confirm(mend_question, Answer::yes);
    click(u"mend"_s);
    EXPECT_EQ(outcome(), u"Refused"_s);
    EXPECT_EQ(lines().first(), u"Church 1: Nothing was changed."_s);
    EXPECT_TRUE(lines().value(2).startsWith(u"Family file 'Able, Ann' is held by the workstation 'office-2'"));
    EXPECT_EQ(count(database(), u"tbl_address"_s), 0);

    ASSERT_EQ(focus(), u"unlock"_s);
    place.dialogue.expect_confirm(unlock_question, Answer::yes, Answer::no);
    press(*window, Qt::Key_Return);
    EXPECT_TRUE(place.dialogue.seen().back().more.startsWith(u"Family file 'Able, Ann'")); // Whom it would hurt.
    EXPECT_TRUE(lines().contains(u"Removed: 1"_s)) << told().toStdString();
    ASSERT_EQ(focus(), u"mend"_s);
    place.dialogue.expect_confirm(mend_question, Answer::yes);
    press(*window, Qt::Key_Return);
    EXPECT_EQ(outcome(), u"Sound"_s) << told().toStdString();
}

TEST_F(MenderWindowTest, NothingIsDoneWhileTheProgramRunsOnThisWorkstation)
{
    damage();
    mark_busy();
    lock_at(place.workstation.machine);
    place.workstation.first_copy = false;
    open_and_check();
    for (const auto& [button, question] : {std::pair{u"mend"_s, mend_question}, {u"unlock"_s, unlock_question}}) {
        place.dialogue.expect_confirm(question, Answer::yes);
        click(button);
        EXPECT_EQ(outcome(), u"Refused"_s);
        EXPECT_EQ(lines().value(1), u"Kindrel is running on this workstation: leave it first."_s);
        EXPECT_TRUE(lines().value(2).startsWith(u"Family file 'Able, Ann' is held by this workstation"));
    }
    EXPECT_EQ(count(database(), u"tbl_address"_s), 0);
    EXPECT_EQ(count(database(), u"tbl_locked_family_files"_s), 1);
    EXPECT_TRUE(QFile::exists(in_church(u"lock.dat"_s)));
}

TEST_F(MenderWindowTest, WhereStartUpWouldAskThePersonChoosesTheChurchByKeyboard)
{
    DataFolder::make_church(place.data.root() + u"church3/"_s);
    for (const int church : {1, 3})
        core::write_side_file(place.data.paths(core::Mode::normal, church), core::SideRecord(core::side_files::set_up));
    core::SideRecord names(core::side_files::church_names);
    names.set_text("church_3", u"Saint Anne"_s);
    core::write_side_file(place.data.paths(), names);
    open();
    EXPECT_EQ(focus(), u"church"_s);
    press(*window, Qt::Key_F5);
    EXPECT_EQ(window->note().text(), u"Choose the church first: there are several on this data drive."_s);
    for (int down = 0; down < 3; ++down)
        press(*window, Qt::Key_Down);
    EXPECT_EQ(child<QComboBox>(*window, u"church"_s).currentText(), u"Church 3, Saint Anne"_s);
    press(*window, Qt::Key_F5);
    EXPECT_EQ(lines().first(), u"Church 3, Saint Anne is sound."_s) << told().toStdString();

    child<QComboBox>(*window, u"church"_s).setFocus();
    press(*window, Qt::Key_Up); // Church 2, of which nothing is known yet.
    EXPECT_EQ(lines().first(), u"Which church does not open?"_s);
    EXPECT_FALSE(offers(u"recover"_s));
}

TEST_F(MenderWindowTest, ADataDriveWithoutDataIsToldAndAnotherOneCanBeChosen)
{
    const QTemporaryDir empty;
    open({.church = 1, .data_drive = empty.path()});
    press(*window, Qt::Key_F5);
    EXPECT_EQ(outcome(), u"No data"_s) << told().toStdString();
    EXPECT_TRUE(QDir(empty.path()).isEmpty());

    place.dialogue.expect_file(u"Data drive: the folder in which 'Kindrel_10_Data' lies"_s, place.data.drive());
    click(u"browse"_s);
    press(*window, Qt::Key_F5);
    EXPECT_EQ(outcome(), u"Sound"_s) << told().toStdString();

    auto& drive = child<QLineEdit>(*window, u"data_drive"_s);
    drive.setFocus();
    drive.selectAll();
    type(*window, empty.path());
    press(*window, Qt::Key_Return);
    EXPECT_EQ(lines().first(), u"Which church does not open?"_s);
}

TEST_F(MenderWindowTest, TheWindowIsDrawnWhileItLooksAndStaysOpenUntilItHasLooked)
{
    open();
    int looked = 0;
    watch = [&] {
        ++looked;
        EXPECT_EQ(lines().first(), u"Looking at Church 1"_s);
        EXPECT_TRUE(child<QProgressBar>(*window, u"running"_s).isVisibleTo(window.get()));
        QTest::mouseClick(&child<QPushButton>(*window, u"check"_s), Qt::LeftButton);
        EXPECT_FALSE(window->close());
    };
    press(*window, Qt::Key_F5);
    EXPECT_EQ(looked, 1);
    EXPECT_EQ(outcome(), u"Sound"_s);
    EXPECT_TRUE(window->isVisible());
    EXPECT_FALSE(child<QProgressBar>(*window, u"running"_s).isVisibleTo(window.get()));
    EXPECT_TRUE(window->close());
}

TEST_F(MenderWindowTest, ADriveThatIsTypedAndNotConfirmedIsTheOneThatIsChecked)
{
    const DataFolder other;
    DataFolder::make_church(other.root() + u"church1/"_s);
    open();
    auto& drive = child<QLineEdit>(*window, u"data_drive"_s);
    drive.setFocus();
    drive.setText(other.drive());
    damage(); // Of the church that is not meant any more.
    press(*window, Qt::Key_F5);
    EXPECT_EQ(drive.text(), other.drive());
    EXPECT_EQ(outcome(), u"Sound"_s) << told().toStdString();
    EXPECT_FALSE(offers(u"mend"_s));
}

TEST_F(MenderWindowTest, WhereTheTypedDriveChangesTheChurchThePersonLooksFirst)
{
    const DataFolder other;
    DataFolder::make_church(other.root() + u"church3/"_s);
    core::write_side_file(other.paths(core::Mode::normal, 3), core::SideRecord(core::side_files::set_up));
    open();
    auto& drive = child<QLineEdit>(*window, u"data_drive"_s);
    drive.setFocus();
    drive.setText(other.drive());
    press(*window, Qt::Key_F5);
    EXPECT_EQ(lines().first(), u"Which church does not open?"_s);
    EXPECT_EQ(window->note().text(), u"See which church of this data drive is chosen, then check it."_s);
    EXPECT_EQ(child<QComboBox>(*window, u"church"_s).currentData(), 3);
}

TEST_F(MenderWindowTest, NoActReachesAChurchOfADriveThatWasTypedAfterTheCheck)
{
    damage();
    const DataFolder other;
    DataFolder::make_church(other.root() + u"church1/"_s);
    open_and_check();
    ASSERT_TRUE(offers(u"mend"_s));
    auto& drive = child<QLineEdit>(*window, u"data_drive"_s);
    const QSignalBlocker unconfirmed(&drive);
    drive.setText(other.drive());
    child<QPushButton>(*window, u"mend"_s).click(); // As its key does it, without leaving the field.
    EXPECT_EQ(lines().first(), u"Which church does not open?"_s);
    EXPECT_EQ(count(database(), u"tbl_address"_s), 0);
    EXPECT_FALSE(QFile::exists(other.root() + u"church1/mended"_s));
}

TEST_F(MenderWindowTest, WorkThatFailsInAnUnknownWayLeavesTheWindowUsable)
{
    open();
    watch = [this] {
        watch = {};
        fails = true;
    };
    press(*window, Qt::Key_F5);
    EXPECT_EQ(outcome(), u"Failed"_s) << told().toStdString();
    fails = false;
    press(*window, Qt::Key_F5);
    EXPECT_EQ(outcome(), u"Sound"_s) << told().toStdString();
    EXPECT_TRUE(window->close());
}

TEST_F(MenderWindowTest, AChurchThatCannotBeSeenIsCheckedAgainAndNotMovedAway)
{
    const QString connection = in_church(u"KR10_records.server"_s);
    DataFolder::write(connection, "host=127.0.0.1 port=1 dbname=church user=office");
    open_and_check();
    EXPECT_TRUE(told().contains(u"The server does not answer as it should: ")) << told().toStdString();
    EXPECT_FALSE(offers(u"set_aside"_s) || offers(u"put_in_place"_s) || offers(u"mend"_s));
    EXPECT_EQ(focus(), u"check"_s);
    QFile::remove(connection);
    press(*window, Qt::Key_Return);
    EXPECT_EQ(outcome(), u"Sound"_s) << told().toStdString();
}

TEST_F(MenderWindowTest, HelpOpensInAWindowOfItsOwn)
{
    open();
    press(*window, Qt::Key_F1);
    const auto help = windows.all<QTextBrowser>();
    ASSERT_EQ(help.size(), 1U);
    EXPECT_TRUE(help.front()->toPlainText().contains(u"Check looks at the records"));
}

TEST_F(MenderWindowTest, TheReportTellsEveryFindingAndNobodysName)
{
    damage();
    lock_at(u"office-2"_s);
    place.in_database(u"DROP INDEX [idx_pin_number];"_s);
    place.in_database(u"INSERT INTO [tbl_pin] ([person_id],[personal_pin]) VALUES (10,'104'),(20,'104');"_s);
    open_and_check();
    place.dialogue.expect_confirm(mend_question, Answer::yes);
    click(u"mend"_s); // Refused, with who is inside.
    const QString file = place.data.drive() + u"report.txt"_s;
    place.dialogue.expect_file(u"Save report"_s, file);
    press(*window, Qt::Key_S, Qt::ControlModifier);
    const QString report = QString::fromUtf8(DataFolder::read(file));
    for (const auto& words : {u"2024-05-15 10:30"_s, u"Outcome: Refused"_s, u"- "_s + no_address,
                              u"- A lock: Family file"_s, u"more than once with different content"_s})
        EXPECT_TRUE(report.contains(words)) << words.toStdString() << '\n' << report.toStdString();
    for (const auto& name : {u"Able"_s, u"Ann"_s, u"office-2"_s, u"104"_s, place.data.root()})
        EXPECT_FALSE(report.contains(name)) << name.toStdString() << '\n' << report.toStdString();
}

} // namespace kindrel::test
