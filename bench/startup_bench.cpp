// Start-up to the filled main window, beyond opening the file, against the bare statements behind the same window: the
// totals and the list through SQLite's C interface.

#include "bare_sqlite.h"
#include "measure.h"

#include "core/install.h"
#include "core/schema.h"
#include "core/sqlite_session.h"
#include "core/system_workstation.h"
#include "desktop/running.h"
#include "desktop/shell/application.h"
#include "desktop/shell/printing.h"
#include "desktop/shell/progress.h"
#include "sample/church.h"

#include <QFile>
#include <QTemporaryDir>

#include <array>
#include <memory>

using namespace kindrel;
using namespace kindrel::bench;
using namespace Qt::StringLiterals;

namespace {

constexpr std::array sizes{1000, 10000, 60000};
constexpr int rounds = 7;

constexpr auto totals_text = "SELECT COUNT(*), SUM([Condition]=0), SUM([Condition]=2), SUM([Condition]=3), "
                             "SUM([Condition]=1), SUM([Condition]<2), SUM([booked_out]=-1), SUM([active_in_book]=-1) "
                             "FROM [tbl_surname];";
constexpr auto list_text = "SELECT * FROM [qry_Kindrel_address_book] WHERE [condition] = 0 "
                           "ORDER BY [sort_key],[Primary_name],[surname_id];";

/// Nobody sits at a measurement: what start-up has to say goes to standard error.
class UnattendedDialogue : public core::Dialogue
{
public:
    void show(const core::Message& message) override { std::fprintf(stderr, "%s\n", qPrintable(message.text)); }
    bool confirm(const core::Message&, core::Answer safe) override { return safe == core::Answer::yes; }
    std::optional<bool> confirm_or_cancel(const core::Message&) override { return std::nullopt; }
    std::optional<QString> ask_text(const core::Message&, bool) override { return std::nullopt; }
    std::optional<int> choose(const core::Message&, const QStringList&) override { return std::nullopt; }
    std::optional<QString> choose_file(const core::FileQuestion&) override { return std::nullopt; }
    void play(const QString&) override {}
};

/// Church 1 of a data folder of its own. The path of its database.
QString lay_church(const QString& drive, int people)
{
    core::install(QCoreApplication::applicationDirPath() + u'/', drive);
    const QString church = drive + u"Kindrel_10_Data/church1/"_s;
    QFile marker(church + u"loaded.dat"_s);
    if (!marker.open(QFile::WriteOnly) || marker.write("1234567890") != 10)
        throw std::runtime_error("The church cannot be laid down.");
    const QString file = church + u"KR10_records.kdl"_s;
    const auto session = core::create_sqlite(file);
    core::create_schema(*session);
    sample::fill_church(*session, {.families = people * 10 / 28, .seed = 7, .training = false, .today = {2026, 11, 22}},
                        {}, {});
    return file;
}

void bare_start(const std::string& file)
{
    const BareDatabase database(file);
    std::vector<std::string> cells;
    BareStatement(database.get(), totals_text).read(cells);
    BareStatement(database.get(), list_text).read(cells);
}

void bench_start(desktop::Application& application, int people)
{
    QTemporaryDir folder;
    const QString drive = folder.path() + u'/';
    const QString file = lay_church(drive, people);
    desktop::Look look(application);
    look.apply(desktop::Appearance::light, 100);
    UnattendedDialogue dialogue;
    application.set_dialogue(dialogue);
    desktop::QtProgress progress(dialogue);
    desktop::QtPrinting printing(dialogue, progress);
    core::SystemWorkstation workstation;
    core::SystemClock clock;
    const desktop::Surroundings surroundings{.workstation = workstation,
                                             .dialogue = dialogue,
                                             .clock = clock,
                                             .progress = progress,
                                             .printing = printing,
                                             .look = look,
                                             .data_drive = drive,
                                             .ended = [] {
                                             }};
    std::unique_ptr<desktop::Running> running;
    const auto open = [&] {
        (void)core::open_sqlite(file);
    };
    const auto start = [&] {
        running = std::make_unique<desktop::Running>(surroundings);
        if (!running->start(1))
            throw std::runtime_error("The program does not start.");
        QCoreApplication::processEvents();
    };
    start(); // The first start makes folders and the system backup.
    const auto opening = compare(
                             open, [] {}, rounds)
                             .ours.median();
    Comparison times;
    for (int round = 0; round < rounds; ++round) {
        running.reset(); // What the round before left open is closed on nobody's time.
        times.bare.add(milliseconds_of([&] { bare_start(file.toStdString()); }));
        times.ours.add(milliseconds_of(start));
    }
    const double ours = times.ours.median() - opening;
    const double bare = times.bare.median() - opening;
    std::printf("| %6d | %7.1f | %9.1f | %9.1f | %5.2f |\n", people, opening, ours, bare, ours / bare);
    std::fflush(stdout);
}

} // namespace

int main(int count, char** words)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    desktop::Application application(count, words);
    QCoreApplication::setApplicationName(u"kindrel"_s);
    QGuiApplication::setQuitOnLastWindowClosed(false);
    std::printf("| people | open ms | beyond ms | bare ms   | ratio |\n");
    for (const int people : sizes)
        bench_start(application, people);
    return 0;
}
