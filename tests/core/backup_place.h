#pragma once

#include "core/backup.h"
#include "core/open_church.h"
#include "core/restore.h"
#include "core/restore_swap.h"
#include "support/data_folder.h"
#include "support/test_church.h"

#include <QDir>
#include <QDirIterator>
#include <QMap>

#include <csignal>
#include <set>

#include <sys/resource.h>

namespace kindrel::test {

/// Says yes to everything and notes what was said.
class YesDialogue : public core::Dialogue
{
public:
    void show(const core::Message& message) override
    {
        told += message.text + u'\n' + message.more;
        if (on_show)
            on_show();
    }
    bool confirm(const core::Message& message, core::Answer) override
    {
        asked += message.text;
        if (on_confirm)
            on_confirm();
        return true;
    }
    std::optional<bool> confirm_or_cancel(const core::Message&) override { return true; }
    std::optional<QString> ask_text(const core::Message&, bool) override { return std::nullopt; }
    std::optional<int> choose(const core::Message&, const QStringList&) override { return std::nullopt; }
    std::optional<QString> choose_file(const core::FileQuestion&) override { return std::nullopt; }
    void play(const QString&) override {}

    QStringList told, asked;
    std::function<void()> on_confirm, on_show;
};

/// Gives up at a certain step; 0: at none.
class StoppingProgress : public core::Progress
{
public:
    explicit StoppingProgress(int last = 0) : m_last(last) {}
    void begin(const QString&, int steps, const QString&) override { announced = steps; }
    bool step(const QString&) override { return ++taken != m_last; }
    void end() override { ended = true; }

    int announced = 0;
    int taken = 0;
    bool ended = false;

private:
    int m_last;
};

/// Runs through, and notes at which steps files came or went since the one before: work of another kind begins there.
class PhaseProgress : public core::Progress
{
public:
    explicit PhaseProgress(const QString& folder) : m_folder(folder) {}
    void begin(const QString&, int steps, const QString&) override { announced = steps; }
    bool step(const QString&) override
    {
        ++taken;
        QStringList names;
        for (QDirIterator all(m_folder, QDir::Files, QDirIterator::Subdirectories); all.hasNext();)
            names += all.next();
        names.sort();
        if (names != m_names)
            m_phases.push_back(taken);
        m_names = names;
        return true;
    }
    void end() override {}
    /// Where to give up another such run: around those steps, at the first and the last ones, and here and there.
    [[nodiscard]] std::set<int> stops() const
    {
        constexpr int beside = 2, last_ones = 10, apart = 97;
        std::set<int> found;
        for (const int phase : m_phases) {
            for (int step = phase - beside; step <= phase + beside; ++step)
                found.insert(std::clamp(step, 1, announced));
        }
        for (int step = announced - last_ones; step <= announced; ++step)
            found.insert(step);
        for (int step = 1; step <= announced; step += apart)
            found.insert(step);
        return found;
    }

    int announced = 0;
    int taken = 0;

private:
    QString m_folder;
    QStringList m_names;
    std::vector<int> m_phases;
};

/// No file of this process may grow beyond `bytes`: like a full disk.
inline void fill_disk(rlim_t bytes)
{
    signal(SIGXFSZ, SIG_IGN);
    const rlimit limit{bytes, bytes};
    setrlimit(RLIMIT_FSIZE, &limit);
}

/// A program that is started in a church.
struct StartedOffice
{
    explicit StartedOffice(const core::Paths& paths, core::Dialogue* other_dialogue = nullptr)
        : office{.paths = paths,
                 .church_name = QStringLiteral("Morning"),
                 .session = core::connect_church(paths),
                 .rights = core::Rights::all(),
                 .workstation = workstation,
                 .dialogue = other_dialogue ? *other_dialogue : dialogue,
                 .clock = clock}
    {
    }
    FakeWorkstation workstation;
    YesDialogue dialogue;
    FixedClock clock;
    core::SilentProgress silent;
    core::Office office;
};

/// A church with a little of everything, in the folders of an installation.
class BackupPlace
{
public:
    explicit BackupPlace(core::EngineKind engine)
    {
        if (engine == core::EngineKind::sqlite) {
            DataFolder::make_church(church());
        } else {
            server.emplace(engine);
            DataFolder::write(church() + core::connection_file.toString(), server->connection().toUtf8());
        }
        started.emplace(paths());
        write_church(QStringLiteral("first"));
    }
    [[nodiscard]] core::Paths paths() const { return data.paths(); }
    [[nodiscard]] QString church() const { return data.root() + QStringLiteral("church1/"); }
    [[nodiscard]] core::Office& office() { return started->office; }
    [[nodiscard]] core::Session& session() { return *started->office.session; }
    [[nodiscard]] YesDialogue& dialogue() { return started->dialogue; }

    /// Every record and file of the church tells `word`.
    void write_church(const QString& word)
    {
        using namespace Qt::StringLiterals;
        session().execute(u"DELETE FROM [tbl_surname];"_s);
        for (int family = 1; family <= 20; ++family)
            session().execute(u"INSERT INTO [tbl_surname] ([Surname_ID],[surname],[last_edit]) VALUES (?,?,?);"_s,
                              family, word, u"2024-05-01"_s);
        for (const auto& name : files_of(word))
            DataFolder::write(data.root() + name, word.toUtf8() + " in " + name.toUtf8());
        QFile::remove(data.root() + files_of(word == u"first" ? u"second"_s : u"first"_s).first());
    }
    /// What a person would find in the church: its families and the content of its files.
    [[nodiscard]] QMap<QString, QByteArray> state(core::Session& reading) const
    {
        using namespace Qt::StringLiterals;
        QMap<QString, QByteArray> found;
        auto rows = reading.select(u"SELECT [Surname_ID],[surname] FROM [tbl_surname] ORDER BY [Surname_ID];"_s);
        for (const core::Row& row : rows)
            found[u"families"_s] += row.text(core::Column{0}).toUtf8() + row.text(core::Column{1}).toUtf8() + ' ';
        for (const auto& folder : folders()) {
            for (const auto& name : QDir(data.root() + folder).entryList(QDir::Files))
                found[folder + name] = DataFolder::read(data.root() + folder + name);
        }
        return found;
    }
    [[nodiscard]] QMap<QString, QByteArray> state() { return state(session()); }
    /// Nothing of an unfinished operation is left.
    [[nodiscard]] QStringList leftovers() const
    {
        using namespace Qt::StringLiterals;
        QStringList found = QDir(church()).entryList({u"*work"_s, u"lock.dat"_s}, QDir::AllEntries);
        for (const auto& folder : QDir(church()).entryList({u"B*"_s}, QDir::Dirs))
            found += QDir(church() + folder).entryList({u"*.unfinished*"_s});
        return found;
    }
    [[nodiscard]] QStringList archives() const
    {
        using namespace Qt::StringLiterals;
        QStringList found;
        for (const auto& folder : QDir(church()).entryList({u"B*"_s}, QDir::Dirs)) {
            for (const auto& name : QDir(church() + folder).entryList({u"*.zip"_s}))
                found += church() + folder + u'/' + name;
        }
        return found;
    }
    /// The path of a fresh backup; empty when it failed.
    [[nodiscard]] QString back_up(const core::BackupRequest& request = {})
    {
        const auto report = core::make_backup(office(), request, started->silent);
        EXPECT_TRUE(report) << dialogue().told.join(u'\n').toStdString();
        return report ? report->contents.file : QString();
    }

    DataFolder data;
    std::optional<TestChurch> server;
    std::optional<StartedOffice> started;

private:
    static QStringList folders()
    {
        using namespace Qt::StringLiterals;
        return {u"church1/Portrait/"_s, u"church1/NBook/"_s,  u"church1/Roster_history/"_s,
                u"images/"_s,           u"Audio/"_s,          u"Wardline/"_s,
                u"letter/"_s,           u"custom/"_s,         u"plugin letters/"_s,
                u"plugin reports/"_s,   u"Directory Setup/"_s};
    }
    static QStringList files_of(const QString& word)
    {
        using namespace Qt::StringLiterals;
        return {u"church1/Portrait/%1.jpg"_s.arg(word),
                u"church1/Portrait/1.jpg"_s,
                u"church1/NBook/F1.fll"_s,
                u"church1/Roster_history/1.txt"_s,
                u"images/logo.jpg"_s,
                u"Audio/chime.wav"_s,
                u"Wardline/check ö.pdf"_s,
                u"letter/welcome.ltr"_s,
                u"custom/own.rpt"_s,
                u"plugin letters/title.plg"_s,
                u"plugin reports/title.plg"_s,
                u"Directory Setup/a.dat"_s};
    }
};

/// A test of backups on both engines.
class BackupPlaceTest : public testing::TestWithParam<core::EngineKind>
{
protected:
    void SetUp() override
    {
        if (!TestChurch::available(GetParam()))
            GTEST_SKIP() << "No server: run through ./test, or tests/support/with-postgres.";
        place.emplace(GetParam());
    }
    std::optional<BackupPlace> place;
};

} // namespace kindrel::test
