#include "core/restore.h"
#include "core/restore_swap.h"
#include "desktop/backup_fixture.h"

#include <QCheckBox>
#include <QLineEdit>

#include <functional>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;

namespace {

const QString replace_question = u"Do you wish to replace the data of 'Church1' by the backup of 15/05/2024 10:30?"_s;
const QString failed = u"Restoring files failed because:-"_s;
const QString unchanged = u"Nothing was changed."_s;

/// Once nothing can be stopped any more, and until the run ends, a folder stands where the record of the restore is.
class Obstructing : public core::SilentProgress
{
public:
    explicit Obstructing(const core::Paths& paths)
        : m_record(paths.folder(core::Folder::church) + u"restore_work/journal.json"_s)
    {
    }
    bool step(const QString& what) override { return what.isEmpty() || QDir().mkdir(m_record); }
    void end() override { QDir().rmdir(m_record); }

private:
    QString m_record;
};

class RestorePageTest : public BackupScreenTest
{
protected:
    void remove_a_family() { desk().office.session->execute(u"DELETE FROM [tbl_surname] WHERE [surname]='Nash';"_s); }
    void add_a_family()
    {
        desk().office.session->execute(
            u"INSERT INTO [tbl_surname] ([Surname_ID],[surname],[last_edit]) VALUES (900,'Later','2024-05-20');"_s);
    }
    /// A page that has something to save, parked behind the one of restoring.
    void park_unsaved_work()
    {
        open(u"setup"_s);
        press(window(), Qt::Key_Insert);
        type(window(), u"Deacon"_s);
        open(u"restore"_s);
    }
    /// What the comparison says of one kind: in the backup, now, what restoring would do.
    [[nodiscard]] QStringList line(const QString& kind)
    {
        const auto row = column(u"comparison"_s, 0).indexOf(kind);
        if (row < 0)
            return {};
        return {column(u"comparison"_s, 1)[row], column(u"comparison"_s, 2)[row], column(u"comparison"_s, 3)[row]};
    }
    [[nodiscard]] QString verdict() { return child<QLabel>(page(), u"verdict"_s).text(); }
};

} // namespace

TEST_F(RestorePageTest, TheChurchIsRestoredByKeyboardAndTheProgramStartsAnew)
{
    (void)back_up();
    remove_a_family();
    place.clock.set(QDate(2024, 6, 1));
    open(u"restore"_s);
    EXPECT_EQ(line(u"Families"_s), QStringList({u"2"_s, u"1"_s, u"1 more"_s}));
    const desktop::MainWindow* before = &window();
    press(window(), Qt::Key_Return);
    EXPECT_EQ(window().focusWidget()->objectName(), u"restore"_s);

    place.dialogue.expect_confirm(replace_question, Answer::yes, Answer::no);
    place.dialogue.expect_box(u"'Church1' is as it was on 15/05/2024 10:30."_s);
    press(window(), Qt::Key_Space);

    EXPECT_NE(&window(), before);
    EXPECT_EQ(page().objectName(), u"main_menu"_s);
    EXPECT_EQ(families(), 2);
    EXPECT_EQ(ended, 0);
    EXPECT_TRUE(place.dialogue.seen().back().more.contains(u"/Before_restore/Kindrel_church1_2024-06-01"_s));
    open(u"restore"_s);
    EXPECT_EQ(column(u"backups"_s, 2), QStringList({u"Verified, made before a restore"_s, u"Verified"_s}));
}

TEST_F(RestorePageTest, WhatWouldBeLostIsMarked)
{
    const QString portraits = place.data.paths().folder(core::Folder::portrait);
    DataFolder::write(portraits + u"1.jpg"_s, "old");
    (void)back_up();
    open(u"restore"_s);
    EXPECT_EQ(line(u"Families"_s), QStringList({u"2"_s, u"2"_s, QString()}));
    EXPECT_EQ(line(u"Other records added since"_s), QStringList());

    add_a_family();
    desk().office.session->execute(u"INSERT INTO [tbl_family_date] ([Surname_ID],[family_date_id]) VALUES (900,1);"_s);
    DataFolder::write(portraits + u"2.jpg"_s, "new");
    open(u"main_menu"_s);
    press(window(), Qt::Key_W, Qt::ControlModifier);
    open(u"restore"_s);
    press(window(), Qt::Key_Up);
    child<QTableWidget>(page(), u"backups"_s).clearSelection();
    child<QTableWidget>(page(), u"backups"_s).selectRow(0);

    EXPECT_EQ(line(u"Families"_s), QStringList({u"2"_s, u"3"_s, u"1 fewer"_s}));
    EXPECT_EQ(line(u"Photographs"_s), QStringList({u"1"_s, u"2"_s, u"1 fewer"_s}));
    EXPECT_EQ(line(u"Other records added since"_s), QStringList({u"0"_s, u"1"_s, u"1 fewer"_s}));
    EXPECT_EQ(line(u"Date"_s),
              QStringList({u"Made 15/05/2024 10:30"_s, u"Changed 20/05/2024"_s, u"Later changes would be lost"_s}));
    EXPECT_EQ(line(u"People"_s), QStringList({u"3"_s, u"3"_s, QString()}));
    EXPECT_EQ(verdict(), u"Marked lines would be lost"_s);
}

TEST_F(RestorePageTest, AnEncryptedBackupIsOpenedAndRestoredWithItsPassword)
{
    (void)back_up({.password = u"correct horse"_s});
    remove_a_family();
    open(u"restore"_s);
    EXPECT_EQ(line(u"Families"_s), QStringList());
    write(u"password"_s, u"correct house"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(line(u"Families"_s), QStringList());
    EXPECT_EQ(window().focusWidget()->objectName(), u"password"_s);

    type(window(), u"correct horse"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(line(u"Families"_s), QStringList({u"2"_s, u"1"_s, u"1 more"_s}));
    place.dialogue.expect_confirm(replace_question, Answer::yes);
    place.dialogue.expect_box(u"'Church1' is as it was on 15/05/2024 10:30."_s);
    push(u"restore"_s);
    EXPECT_EQ(families(), 2);
}

TEST_F(RestorePageTest, WhatIsNoBackupIsToldAndRefused)
{
    const QString damaged = stick.filePath(u"damaged.zip"_s), other = stick.filePath(u"other.zip"_s);
    QByteArray bytes = DataFolder::read(back_up());
    DataFolder::write(damaged, bytes.left(bytes.size() / 2));
    DataFolder::write(other, "no archive at all");
    remove_a_family();
    open(u"restore"_s);
    for (const auto& file : {damaged, other, stick.filePath(u"missing.zip"_s)}) {
        place.dialogue.expect_file(u"Backup to restore"_s, file);
        push(u"browse"_s);
        EXPECT_EQ(verdict(), u"This backup cannot be restored"_s) << file.toStdString();
        EXPECT_EQ(column(u"comparison"_s, 0), QStringList());
        place.dialogue.expect_box(failed);
        push(u"restore"_s);
        EXPECT_EQ(page().note().text(), unchanged);
    }
    EXPECT_EQ(families(), 1);
}

TEST_F(RestorePageTest, ABackupOfAnotherChurchIsMarkedAndRefused)
{
    (void)back_up();
    const QString file = back_up({.folder = stick.path()});
    desk().office.session->execute(u"UPDATE [tbl_startup] SET [church_code]='of another church';"_s);
    open(u"restore"_s);
    EXPECT_EQ(line(u"Church"_s), QStringList({u"Church1"_s, u"Church1"_s, u"Made of another church"_s}));
    place.dialogue.expect_box(failed, u"This backup was made of another church."_s);
    push(u"restore"_s);
    EXPECT_EQ(page().note().text(), unchanged);
}

TEST_F(RestorePageTest, WithoutAChoiceItAsksForOne)
{
    open(u"restore"_s);
    EXPECT_TRUE(texts().contains(u"No backup is chosen"_s));
    place.dialogue.expect_box(u"Please choose a backup to restore."_s);
    push(u"restore"_s);
}

TEST_F(RestorePageTest, AFileIsTypedAndTheSharedFilesStayWhereTheTickIsTakenOut)
{
    const QString letter = place.data.paths().folder(core::Folder::letter) + u"welcome.ltr"_s;
    DataFolder::write(letter, "old");
    const QString file = back_up({.folder = stick.path()});
    DataFolder::write(letter, "new");
    open(u"restore"_s);
    write(u"file"_s, file);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(line(u"Letters"_s), QStringList({u"1"_s, u"1"_s, u"Replaces files of the same name"_s}));
    push(u"with_shared_files"_s);
    place.dialogue.expect_confirm(replace_question, Answer::yes);
    place.dialogue.expect_box(u"'Church1' is as it was on 15/05/2024 10:30."_s);
    push(u"restore"_s);
    EXPECT_EQ(DataFolder::read(letter), "new");
}

TEST_F(RestorePageTest, DeclinedOrGivenUpNothingChanges)
{
    (void)back_up();
    remove_a_family();
    open(u"restore"_s);
    place.dialogue.expect_confirm(replace_question, Answer::no);
    push(u"restore"_s);
    EXPECT_EQ(page().note().text(), unchanged);

    GivingUp giving_up;
    begin_with(giving_up);
    open(u"restore"_s);
    place.dialogue.expect_confirm(replace_question, Answer::yes);
    push(u"restore"_s);
    EXPECT_EQ(page().note().text(), unchanged);
    EXPECT_EQ(families(), 1);
    running.reset();
}

TEST_F(RestorePageTest, WhereItCannotBeToldHowItEndedTheProgramStartsAnewAndSettlesIt)
{
    (void)back_up();
    remove_a_family();
    Obstructing obstructing(place.data.paths());
    begin_with(obstructing);
    open(u"restore"_s);
    place.dialogue.expect_confirm(replace_question, Answer::yes);
    place.dialogue.expect_box(
        u"It cannot be told yet whether the backup is in place. Start Kindrel again: it settles it."_s);
    push(u"restore"_s);
    EXPECT_EQ(page().objectName(), u"main_menu"_s);
    EXPECT_FALSE(core::restore_unsettled(place.data.paths()));
    EXPECT_EQ(families(), 1);
    running.reset();
}

TEST_F(RestorePageTest, APageThatStaysStopsIt)
{
    const QString question = u"Do you wish to save the changes made to the setup lists?"_s;
    (void)back_up();
    remove_a_family();
    open(u"restore"_s);
    park_unsaved_work();
    EXPECT_EQ(page().objectName(), u"Restore"_s);
    place.dialogue.expect_confirm_or_cancel(question, std::nullopt);
    push(u"restore"_s);
    EXPECT_EQ(page().objectName(), u"setup_family"_s);
    EXPECT_TRUE(page().altered());
    EXPECT_EQ(families(), 1);

    open(u"restore"_s);
    place.dialogue.expect_confirm_or_cancel(question, false);
    place.dialogue.expect_confirm(replace_question, Answer::no);
    push(u"restore"_s);
    EXPECT_EQ(page().objectName(), u"Restore"_s);
}

} // namespace kindrel::test
