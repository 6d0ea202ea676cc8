#include "core/locks.h"
#include "core/sqlite_session.h"
#include "desktop/desktop_fixture.h"
#include "desktop/mender/mender_window.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/note_bar.h"
#include "people/sort_key.h"

#include <QComboBox>
#include <QDirIterator>
#include <QLineEdit>
#include <QProgressBar>
#include <QPushButton>
#include <QTextBrowser>
#include <QThread>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;

namespace {

const QString mend_question = u"Mend church 1? A copy of its database is kept."_s;
const QString unlock_question = u"Remove every lock and marker of church 1? Nobody may be inside or at work on it."_s;
const QString aside_question = u"Set the damaged church file of church 1 aside, so that the next start begins an empty "
                               "church? Nobody may be inside."_s;
const QString no_address = u"2 families without an address record."_s;

/// Tells when it is asked from beside the window, and waits for the answer.
class WatchedWorkstation : public FakeWorkstation
{
public:
    WatchedWorkstation(const FakeWorkstation& like, std::function<void()> watch, const bool& fails)
        : FakeWorkstation(like), m_watch(std::move(watch)), m_fails(fails)
    {
    }
    [[nodiscard]] QString program_folder() const override
    {
        if (m_watch && QThread::currentThread() != QCoreApplication::instance()->thread())
            QMetaObject::invokeMethod(QCoreApplication::instance(), m_watch, Qt::BlockingQueuedConnection);
        if (m_fails)
            throw 0;
        return FakeWorkstation::program_folder();
    }

private:
    std::function<void()> m_watch;
    const bool& m_fails; ///< In a way that nobody reckons with.
};

class MenderWindowTest : public testing::Test
{
protected:
    MenderWindowTest() : look(*qobject_cast<QApplication*>(QCoreApplication::instance()))
    {
        for (const auto& [family, surname, person, name] :
             {std::tuple{1, u"Able"_s, 10, u"Ann"_s}, {2, u"Baker"_s, 20, u"Cid"_s}})
            add_family(family, surname, person, name);
    }
    void add_family(int family, const QString& surname, int person, const QString& name)
    {
        const QString sort_key = people::sort_key(surname);
        for (const auto& statement :
             {u"INSERT INTO [tbl_surname] ([Surname_ID],[surname],[sort_key],[Primary_name]) "
              "VALUES (%1,'%2','%3','%4');"_s.arg(family)
                  .arg(surname, sort_key, name),
              u"INSERT INTO [tbl_address] ([surname_id]) VALUES (%1);"_s.arg(family),
              u"INSERT INTO [tbl_people] ([person_id],[Surname_ID],[Name],[position],[sort_key]) "
              "VALUES (%1,%2,'%3',1,'%4');"_s.arg(person)
                  .arg(family)
                  .arg(name, sort_key),
              u"INSERT INTO [tbl_personal_details] ([person_id]) VALUES (%1);"_s.arg(person),
              u"INSERT INTO [tbl_id_surname] ([id_found]) VALUES (%1);"_s.arg(family),
              u"INSERT INTO [tbl_id_person] ([id_found]) VALUES (%1);"_s.arg(person)})
            place.in_database(statement);
    }
    void open(const core::StartRequest& request = {})
    {
        window = std::make_unique<desktop::MenderWindow>(desktop::MenderSurroundings{
            .workstation = [this] { return std::make_unique<WatchedWorkstation>(place.workstation, watch, fails); },
            .dialogue = place.dialogue,
            .clock = place.clock,
            .windows = windows,
            .request = request});
        window->show();
        settle();
    }
    void open_and_check()
    {
        open();
        press(*window, Qt::Key_F5);
    }
    void damage() { place.in_database(u"DELETE FROM [tbl_address];"_s); }
    void lock_at(const QString& machine)
    {
        FakeWorkstation other;
        other.machine = machine;
        const auto session = core::open_sqlite(database());
        ASSERT_TRUE(core::Locks(*session, other, place.clock).take(core::LockKind::family, 1));
    }
    void mark_busy() { DataFolder::write(in_church(u"lock.dat"_s), "1234567890"); }
    [[nodiscard]] int count(const QString& file, const QString& table)
    {
        const auto session = core::open_sqlite(file);
        auto rows = session->select(u"SELECT COUNT(*) FROM [%1];"_s.arg(table));
        return rows.first()->integer(core::Column{0});
    }
    void click(const QString& name)
    {
        QTest::mouseClick(&child<QPushButton>(*window, name), Qt::LeftButton);
        settle();
    }
    [[nodiscard]] bool offers(const QString& name) { return child<QPushButton>(*window, name).isEnabled(); }
    [[nodiscard]] QString focus() { return window->focusWidget() ? window->focusWidget()->objectName() : QString(); }
    [[nodiscard]] QString told() { return child<QTextBrowser>(*window, u"account"_s).toPlainText(); }
    [[nodiscard]] QStringList lines() { return told().split(u'\n'); }
    [[nodiscard]] QString outcome() { return window->chip().text(); }
    [[nodiscard]] QString in_church(const QString& name) { return place.data.root() + u"church1/"_s + name; }
    [[nodiscard]] QString database() { return in_church(u"KR10_records.kdl"_s); }
    /// Every file of the data folder with its content.
    [[nodiscard]] std::map<QString, QByteArray> everything()
    {
        std::map<QString, QByteArray> files;
        for (QDirIterator all(place.data.root(), QDir::Files | QDir::Hidden, QDirIterator::Subdirectories);
             all.hasNext();) {
            const QString file = all.next();
            files[file] = DataFolder::read(file);
        }
        return files;
    }

    TestStart place;
    std::function<void()> watch;
    bool fails = false;
    desktop::Look look;
    QTemporaryDir remembered_in;
    desktop::Remembered remembered{core::as_folder(remembered_in.path()), 1};
    desktop::Windows windows{remembered};
    std::unique_ptr<desktop::MenderWindow> window;
};

} // namespace

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

TEST_F(MenderWindowTest, ADamagedFileIsRecoveredIntoANewOneAndLeftAsItIs)
{
    QByteArray content = DataFolder::read(database());
    content.chop(content.size() / 20);
    DataFolder::write(database(), content);
    open_and_check();
    ASSERT_EQ(focus(), u"recover"_s) << told().toStdString();
    const QString fresh = in_church(u"fresh.kdl"_s);
    place.dialogue.expect_file(u"A new church file for what can be read"_s, fresh);
    place.dialogue.expect_confirm(u"Write what can be read of '%1' into '%2'?"_s.arg(database(), fresh), Answer::yes);
    press(*window, Qt::Key_Return);
    EXPECT_TRUE(outcome().startsWith(u"Recovered"_s)) << told().toStdString();
    EXPECT_TRUE(lines().contains(u"The new church file is '%1'; '%2' was left as it is."_s.arg(fresh, database())));
    EXPECT_TRUE(lines().contains(u"•  families: 2 rows"_s)) << told().toStdString();
    EXPECT_EQ(count(fresh, u"tbl_surname"_s), 2);
    EXPECT_EQ(DataFolder::read(database()), content);
    EXPECT_EQ(focus(), u"put_in_place"_s);

    place.dialogue.expect_file(u"A new church file for what can be read"_s, fresh);
    place.dialogue.expect_confirm(u"Write what can be read of '%1' into '%2'?"_s.arg(database(), fresh), Answer::yes);
    press(*window, Qt::Key_F5);
    click(u"recover"_s);
    EXPECT_EQ(outcome(), u"Failed"_s);
    EXPECT_TRUE(lines().contains(u"'%1' exists already; name a new file."_s.arg(fresh))) << told().toStdString();
}

TEST_F(MenderWindowTest, ARecoveredFileIsPutInPlaceAndTheChurchIsMended)
{
    damage();
    QByteArray content = DataFolder::read(database());
    content.chop(content.size() / 20);
    DataFolder::write(database(), content);
    open_and_check();
    const QString fresh = place.data.drive() + u"fresh.kdl"_s;
    place.dialogue.expect_file(u"A new church file for what can be read"_s, fresh);
    place.dialogue.expect_confirm(u"Write what can be read of '%1' into '%2'?"_s.arg(database(), fresh), Answer::yes);
    click(u"recover"_s);
    ASSERT_EQ(focus(), u"put_in_place"_s) << told().toStdString();
    place.dialogue.expect_confirm(u"Put '%1' in the place of the church file of church 1, which is kept in the folder "
                                  "'mended', and mend the church? Nobody may be inside."_s.arg(fresh),
                                  Answer::yes, Answer::no);
    press(*window, Qt::Key_Return);
    const QString aside = in_church(u"mended/KR10_records set aside 2024-05-15 103000.kdl"_s);
    EXPECT_TRUE(lines().contains(u"The recovered records stand in '%1' now."_s.arg(database())))
        << told().toStdString();
    EXPECT_TRUE(lines().contains(u"The damaged church file lies in '%1' now."_s.arg(aside))) << told().toStdString();
    EXPECT_EQ(DataFolder::read(aside), content);
    EXPECT_EQ(count(database(), u"tbl_address"_s), 2) << told().toStdString();
    EXPECT_FALSE(QFile::exists(fresh) || offers(u"put_in_place"_s));
}

TEST_F(MenderWindowTest, ADamagedFileIsSetAsideSoThatABackupCanBeRestored)
{
    open_and_check();
    EXPECT_FALSE(offers(u"set_aside"_s)); // A sound one stays.
    const QByteArray content(4096, 'x');
    DataFolder::write(database(), content);
    press(*window, Qt::Key_F5);
    place.dialogue.expect_confirm(aside_question, Answer::no, Answer::no);
    click(u"set_aside"_s);
    EXPECT_EQ(DataFolder::read(database()), content);

    place.dialogue.expect_confirm(aside_question, Answer::yes, Answer::no);
    click(u"set_aside"_s);
    EXPECT_EQ(outcome(), u"Set aside"_s) << told().toStdString();
    EXPECT_FALSE(QFile::exists(database()));
    const QString aside = in_church(u"mended/KR10_records set aside 2024-05-15 103000.kdl"_s);
    EXPECT_TRUE(lines().contains(u"The damaged church file lies in '%1' now."_s.arg(aside))) << told().toStdString();
    EXPECT_EQ(DataFolder::read(aside), content);
}

TEST_F(MenderWindowTest, AChurchWithoutRecordsIsToldAndADamagedFileElsewhereCanBeRecovered)
{
    const QString saved = place.data.drive() + u"saved.kdl"_s;
    ASSERT_TRUE(QFile::rename(database(), saved));
    open_and_check();
    EXPECT_EQ(lines().first(), u"There are no records of Church 1 here."_s);
    EXPECT_FALSE(offers(u"mend"_s));
    place.dialogue.expect_file(u"The damaged church file"_s, saved);
    place.dialogue.expect_file(u"A new church file for what can be read"_s, database());
    place.dialogue.expect_confirm(u"Write what can be read of '%1' into '%2'?"_s.arg(saved, database()), Answer::yes);
    click(u"recover"_s);
    EXPECT_EQ(outcome(), u"Recovered"_s) << told().toStdString();
    press(*window, Qt::Key_F5);
    EXPECT_EQ(outcome(), u"Sound"_s) << told().toStdString();
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
