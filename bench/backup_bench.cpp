// Backing up a church of 60,000 people with its photographs, and restoring it, against a plain durable copy of the same
// bytes; compaction against SQLite's own VACUUM through its C interface on the same database.

#include "bare_sqlite.h"
#include "measure.h"

#include "core/backup.h"
#include "core/compaction.h"
#include "core/install.h"
#include "core/restore.h"
#include "core/schema.h"
#include "core/sqlite_session.h"
#include "core/startup.h"
#include "core/system_workstation.h"
#include "sample/church.h"

#include <QCoreApplication>
#include <QDirIterator>
#include <QFile>
#include <QRandomGenerator>
#include <QTemporaryDir>

#include <fcntl.h>
#include <unistd.h>

using namespace kindrel;
using namespace kindrel::bench;
using namespace Qt::StringLiterals;

namespace {

constexpr int people = 60'000;
constexpr int portraits = 4'000;
constexpr int portrait_bytes = 20'000;
constexpr int rounds = 3;

/// Nobody sits at a measurement: everything is agreed to, and what is told goes to standard error.
class AgreeingDialogue : public core::Dialogue
{
public:
    void show(const core::Message& message) override
    {
        std::fprintf(stderr, "%s\n%s\n", qPrintable(message.text), qPrintable(message.more));
    }
    bool confirm(const core::Message&, core::Answer) override { return true; }
    std::optional<bool> confirm_or_cancel(const core::Message&) override { return true; }
    std::optional<QString> ask_text(const core::Message&, bool) override { return std::nullopt; }
    std::optional<int> choose(const core::Message&, const QStringList&) override { return 0; }
    std::optional<QString> choose_file(const core::FileQuestion&) override { return std::nullopt; }
    void play(const QString&) override {}
};

void demand(bool done)
{
    if (!done)
        throw std::runtime_error("The work that was to be measured failed.");
}

void write(const QString& path, const QByteArray& content)
{
    QFile file(path);
    demand(file.open(QFile::WriteOnly) && file.write(content) == content.size());
}

/// Church 1 of a data folder of its own, with photographs, as it is after start-up.
struct Church
{
    explicit Church(const QString& drive)
    {
        core::install(QCoreApplication::applicationDirPath() + u'/', drive);
        folder = drive + u"Kindrel_10_Data/church1/"_s;
        write(folder + u"loaded.dat"_s, "1234567890");
        {
            const auto session = core::create_sqlite(file());
            core::create_schema(*session);
            sample::fill_church(*session,
                                {.families = people * 10 / 28, .seed = 7, .training = false, .today = {2026, 11, 22}},
                                {}, {});
        }
        office = core::start_up({core::Purpose::command_line, 1, drive}, workstation, dialogue, clock, progress);
        demand(office != nullptr);
        QRandomGenerator random(7);
        QByteArray picture(portrait_bytes, Qt::Uninitialized);
        for (int number = 1; number <= portraits; ++number) {
            std::ranges::generate(picture, [&] { return static_cast<char>(random.generate()); });
            write(office->paths.file(core::Folder::portrait, u"%1.jpg"_s.arg(number)), picture);
        }
    }
    [[nodiscard]] QString file() const { return folder + u"KR10_records.kdl"_s; }

    QString folder;
    core::SystemWorkstation workstation;
    AgreeingDialogue dialogue;
    core::SystemClock clock;
    core::SilentProgress progress;
    std::unique_ptr<core::Office> office;
};

void flush_to_disk(const QString& folder)
{
    const int opened = ::open(folder.toLocal8Bit().constData(), O_RDONLY);
    demand(opened >= 0 && ::syncfs(opened) == 0);
    ::close(opened);
}

/// The database and the photographs, on the disk at the end.
void copy_plainly(const Church& church, const QString& target)
{
    QStringList files{church.file()};
    QDirIterator pictures(church.office->paths.folder(core::Folder::portrait), QDir::Files);
    while (pictures.hasNext())
        files += pictures.next();
    for (int number = 0; const auto& file : files) {
        const auto copy = target + QString::number(number++);
        QFile::remove(copy);
        demand(QFile::copy(file, copy));
    }
    flush_to_disk(target);
}

void print_seconds(const char* what, const Comparison& times)
{
    std::printf("| %-42s | %8.2f | %8.2f | %5.2f |\n", what, times.ours.median() / 1000, times.bare.median() / 1000,
                times.ratio());
    std::fflush(stdout);
}

void measure_backups(Church& church)
{
    const QTemporaryDir copies(church.folder + u"copies"_s);
    const auto bare = [&] {
        copy_plainly(church, copies.path() + u'/');
    };
    QString backup;
    const auto back_up = [&](const QString& password) {
        const auto report = core::make_backup(*church.office, {.password = password}, church.progress);
        demand(report.has_value());
        backup = report->contents.file;
    };
    print_seconds("backup, encrypted, compared", compare([&] { back_up(u"a long password"_s); }, bare, rounds));
    print_seconds("backup, compared", compare([&] { back_up({}); }, bare, rounds));
    const auto restore = [&] {
        demand(core::restore_backup(*church.office, {.file = backup}, church.progress).has_value());
    };
    print_seconds("restore, with a backup of the state before", compare(restore, bare, rounds));
}

void measure_compaction(Church& church)
{
    const QString other = church.folder + u"other.kdl"_s;
    QFile::remove(other);
    demand(QFile::copy(church.file(), other));
    const BareDatabase database(other.toStdString());
    const auto vacuum = [&] {
        BareStatement(database.get(), "VACUUM;").run();
    };
    print_seconds("compaction, with the old content kept",
                  compare([&] { demand(core::compact_church(*church.office)); }, vacuum, rounds));
}

} // namespace

int main(int count, char** words)
{
    const QCoreApplication program(count, words);
    QCoreApplication::setApplicationName(u"kindrel"_s);
    const QTemporaryDir drive;
    Church church(drive.path() + u'/');
    std::printf("| %d people, %d photographs              | ours s   | bare s   | ratio |\n", people, portraits);
    measure_compaction(church);
    measure_backups(church);
    return 0;
}
