#include "core/backup_error.h"
#include "desktop/backup_fixture.h"

#include <QAbstractButton>
#include <QApplication>
#include <QDir>
#include <QLineEdit>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

const QString exit_question = u"Backup Kindrel files before exiting?"_s;
const QString made = u"The backup is made, opened again and compared."_s;
const QString failed = u"Backup failed because:-"_s;

/// Closes the windows as the application does when it is told to quit, and spares the tests to come the quitting.
class ClosesWindows : public QObject
{
public:
    ClosesWindows() { QCoreApplication::instance()->installEventFilter(this); }

protected:
    bool eventFilter(QObject*, QEvent* event) override
    {
        if (event->type() != QEvent::Quit)
            return false;
        QApplication::closeAllWindows();
        return true;
    }
};

class BackupPageTest : public BackupScreenTest
{
protected:
    [[nodiscard]] QStringList archives(const QString& folder)
    {
        return QDir(folder).entryList({u"Kindrel_church1_*"_s}, QDir::Files);
    }
    [[nodiscard]] QString own_folder_words() { return child<QLabel>(page(), u"own_folder"_s).text(); }
    void use_stick()
    {
        place.dialogue.expect_file(u"Folder for the backup"_s, stick.path());
        push(u"browse"_s);
    }
};

} // namespace

TEST_F(BackupPageTest, ABackupGoesIntoTheOwnFolderInTurnAndTellsWhatIsInIt)
{
    open(u"backup"_s);
    EXPECT_EQ(child<QLabel>(page(), u"last_backup"_s).text(), u"No verified backup yet"_s);
    EXPECT_TRUE(own_folder_words().contains(u"Backup1"_s));
    EXPECT_TRUE(texts().contains(u"1 TB are free there."_s) || texts().contains(u"1.0 TB are free there."_s))
        << texts().join(u'\n').toStdString();

    push(u"back_up"_s);

    const QString folder = place.data.paths().folder(core::Folder::church) + u"Backup1/"_s;
    ASSERT_EQ(archives(folder).size(), 1);
    EXPECT_TRUE(page().note().text().startsWith(made + u" Church1 with 2 families and 3 people, "_s))
        << page().note().text().toStdString();
    EXPECT_TRUE(page().note().text().contains(folder + archives(folder).first()));
    EXPECT_EQ(child<QLabel>(page(), u"last_backup"_s).text(), u"15/05/2024 10:30"_s);
    EXPECT_EQ(column(u"backups"_s, 0), QStringList{u"15/05/2024 10:30"_s});
    EXPECT_EQ(column(u"backups"_s, 2), QStringList{u"Verified"_s});
    EXPECT_EQ(page().status(), u"1 backup"_s);
    EXPECT_TRUE(own_folder_words().contains(u"Backup2"_s));
}

TEST_F(BackupPageTest, TheFolderOfTheLastTurnIsNamedWithWhatLiesThere)
{
    for (int turn = 0; turn < 5; ++turn)
        (void)back_up();
    open(u"backup"_s);
    EXPECT_TRUE(own_folder_words().contains(u"Backup1"_s));
    EXPECT_TRUE(texts().contains(u"One of five that take turns. The backup of 15/05/2024 10:30 that lies in it goes "
                                 "once the new one is compared."_s));
}

TEST_F(BackupPageTest, AnotherFolderAndWhatGoesAlongAreRemembered)
{
    open(u"backup"_s);
    use_stick();
    push(u"with_documents"_s);
    push(u"back_up"_s);
    ASSERT_EQ(archives(stick.path()).size(), 1);

    begin_again();
    open(u"backup"_s);
    EXPECT_EQ(child<QLineEdit>(page(), u"path"_s).text(), stick.path());
    EXPECT_TRUE(child<QAbstractButton>(page(), u"another_folder"_s).isChecked());
    EXPECT_FALSE(child<QAbstractButton>(page(), u"with_documents"_s).isChecked());
    EXPECT_TRUE(child<QAbstractButton>(page(), u"with_letters"_s).isChecked());
}

TEST_F(BackupPageTest, WhereNothingCanBeWrittenItIsToldAndNothingIsMade)
{
    struct Case
    {
        QString folder, box;
    };
    open(u"backup"_s);
    for (const auto& [folder, box] : {Case{{}, u"Please choose a folder for the backup."_s},
                                      Case{u"/nowhere/at/all"_s, failed}, Case{u"/proc"_s, failed}}) {
        write(u"path"_s, folder + u'x');
        press(window(), Qt::Key_Backspace);
        place.dialogue.expect_box(box);
        push(u"back_up"_s);
        EXPECT_EQ(page().note().text(), QString());
        EXPECT_EQ(page().status(), u"0 backups"_s);
    }
    EXPECT_TRUE(texts().contains(u"1 TB are free there."_s) || texts().contains(u"1.0 TB are free there."_s));
}

TEST_F(BackupPageTest, APasswordIsTypedTwiceAndWarnedOf)
{
    open(u"backup"_s);
    use_stick();
    EXPECT_TRUE(texts().contains(u"Without a password everybody who gets hold of the backup can read it."_s));
    write(u"password"_s, u"correct horse"_s);
    EXPECT_TRUE(
        child<QLabel>(page(), u"password_warning"_s).text().startsWith(u"Without this password nobody can open"_s));
    press(window(), Qt::Key_Return);
    type(window(), u"correct house"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(window().focusWidget()->objectName(), u"password_again"_s);
    EXPECT_TRUE(texts().contains(u"Not the same"_s));
    EXPECT_TRUE(archives(stick.path()).isEmpty());

    type(window(), u"correct horse"_s);
    press(window(), Qt::Key_Return);

    ASSERT_EQ(archives(stick.path()).size(), 1);
    const QString file = stick.filePath(archives(stick.path()).first());
    EXPECT_THROW((void)core::read_backup(file, {}), core::BackupError);
    EXPECT_TRUE(core::read_backup(file, u"correct horse"_s).encrypted);
    EXPECT_EQ(child<QLineEdit>(page(), u"password"_s).text(), QString());
}

TEST_F(BackupPageTest, OneThatIsGivenUpLeavesNothing)
{
    GivingUp giving_up;
    begin_with(giving_up);
    open(u"backup"_s);
    use_stick();
    push(u"back_up"_s);
    EXPECT_TRUE(QDir(stick.path()).isEmpty());
    EXPECT_EQ(page().note().text(), QString());
    EXPECT_EQ(page().status(), u"0 backups"_s);
    running.reset();
}

TEST_F(BackupPageTest, ABackupThatIsGoneOrAlteredIsNoLongerVerified)
{
    QFile gone(back_up({.folder = stick.path()}));
    QFile altered(back_up());
    ASSERT_TRUE(gone.remove());
    ASSERT_TRUE(altered.open(QIODevice::Append) && altered.write("x") == 1);
    altered.close();
    open(u"backup"_s);
    EXPECT_EQ(column(u"backups"_s, 2), QStringList({u"Not verified"_s, u"Not there"_s}));
    EXPECT_EQ(child<QLabel>(page(), u"last_backup"_s).text(), u"No verified backup yet"_s);
}

TEST_F(BackupPageTest, OnLeavingTheProgramABackupIsOffered)
{
    place.dialogue.expect_confirm_or_cancel(exit_question, std::nullopt);
    EXPECT_FALSE(window().close());
    EXPECT_EQ(ended, 0);
    EXPECT_EQ(place.dialogue.seen().back().more, u"No backup was made yet."_s);

    (void)back_up();
    place.dialogue.expect_confirm_or_cancel(exit_question, false);
    EXPECT_TRUE(window().close());
    EXPECT_EQ(ended, 1);
    EXPECT_EQ(place.dialogue.seen().back().more, u"The last backup was made on 15/05/2024 10:30."_s);
}

TEST_F(BackupPageTest, TheOfferedBackupIsMadeWithOneKeyAndTheProgramEnds)
{
    place.dialogue.expect_confirm_or_cancel(exit_question, true);
    EXPECT_FALSE(window().close());
    settle();
    EXPECT_EQ(page().objectName(), u"Backup"_s);
    EXPECT_EQ(page().note().text(), u"Kindrel ends once this backup is made."_s);

    place.dialogue.expect_box(made);
    press(window(), Qt::Key_Space);
    EXPECT_EQ(ended, 1);
    EXPECT_TRUE(place.dialogue.seen().back().more.startsWith(u"Church1 with 2 families and 3 people, "_s));
}

TEST_F(BackupPageTest, WhoeverGoesElsewhereFirstStaysInTheProgram)
{
    place.dialogue.expect_confirm_or_cancel(exit_question, true);
    EXPECT_FALSE(window().close());
    open(u"main_menu"_s);
    open(u"backup"_s);
    EXPECT_EQ(page().note().text(), QString());
    push(u"back_up"_s);
    EXPECT_TRUE(page().note().text().startsWith(made));
    EXPECT_EQ(ended, 0);
}

TEST_F(BackupPageTest, NobodyIsAskedWithoutTheRightNorWhenTheSessionEnds)
{
    desk().office.rights.set(core::Area::backup_data, false);
    EXPECT_TRUE(window().close());
    EXPECT_EQ(ended, 1);

    const ClosesWindows instead; // Comes after what the program itself watches.
    begin_again();
    QEvent quit(QEvent::Quit);
    QCoreApplication::sendEvent(QCoreApplication::instance(), &quit);
    EXPECT_EQ(ended, 2);
}

} // namespace kindrel::test
