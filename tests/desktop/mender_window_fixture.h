#pragma once

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

inline const QString mend_question = u"Mend church 1? A copy of its database is kept."_s;
inline const QString unlock_question =
    u"Remove every lock and marker of church 1? Nobody may be inside or at work on it."_s;
inline const QString aside_question =
    u"Set the damaged church file of church 1 aside, so that the next start begins an empty "
    "church? Nobody may be inside."_s;
inline const QString no_address = u"2 families without an address record."_s;

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

} // namespace kindrel::test
