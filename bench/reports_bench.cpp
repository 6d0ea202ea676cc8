// Every report of a whole church, from the database to the PDF, against a bare painter that draws the same texts, lines
// and pictures from memory: ratio, statements, time to the first page, and peak memory. A report's key as the second
// argument runs that one alone.
#include "bare_painter.h"
#include "quiet_dialogue.h"

#include "output/catalogue.h"

#include "core/schema.h"
#include "core/sqlite_session.h"
#include "core/system_workstation.h"
#include "pages/pdf.h"
#include "sample/church.h"

#include <QFile>
#include <QGuiApplication>
#include <QTemporaryDir>

#include <sqlite3.h>

#include <algorithm>
#include <atomic>
#include <chrono>
#include <cstdio>
#include <stdexcept>
#include <string_view>

using namespace Qt::StringLiterals;
using namespace kindrel;

namespace {

using Stopwatch = std::chrono::steady_clock;

constexpr int usual_families = 20'000;
/// So many hold the bare painter's work in memory; its time is reckoned up from them.
constexpr int most_pages_kept = 600;

double seconds_since(Stopwatch::time_point start)
{
    return std::chrono::duration<double>(Stopwatch::now() - start).count();
}

double peak_megabytes()
{
    QFile status(u"/proc/self/status"_s);
    if (!status.open(QIODevice::ReadOnly))
        return 0;
    for (const auto& line : status.readAll().split('\n')) {
        if (line.startsWith("VmHWM:"))
            return line.mid(6, line.indexOf("kB") - 6).trimmed().toDouble() / 1024;
    }
    return 0;
}

/// A church of its own, every family of it on the working list.
struct Church
{
    explicit Church(int families)
        : office{.paths = core::Paths(folder.path(), folder.path(), folder.path(), core::Mode::normal, 1),
                 .workstation = workstation,
                 .dialogue = dialogue,
                 .clock = clock}
    {
        office.session = core::create_sqlite(folder.filePath(u"KR10_records.kdl"_s));
        core::create_schema(*office.session);
        sample::fill_church(*office.session, {.families = families, .seed = 1, .today = clock.today()}, {}, {});
        office.church_name = u"A Church"_s;
        office.settings = core::read_settings(*office.session);
        office.rights = core::Rights::all();
        auto rows = office.session->select(
            u"SELECT p.[person_id],s.[Surname_ID] FROM [tbl_surname] s INNER JOIN [tbl_people] p "
            "ON p.[Surname_ID]=s.[Surname_ID] ORDER BY s.[sort_key],s.[Surname_ID],p.[position];"_s);
        for (const core::Row& row : rows)
            list.members.push_back({row.integer(core::Column{0}), row.integer(core::Column{1})});
        list.criteria = u"All Families"_s;
    }

    QTemporaryDir folder;
    core::SystemWorkstation workstation;
    bench::QuietDialogue dialogue;
    core::SystemClock clock;
    core::Office office;
    people::WorkingList list;
};

/// Statements that read, run by any SQLite connection of this process. Those that lend a list of keys are left out:
/// they write to memory.
std::atomic<int> statements = 0;

int count_statement(unsigned, void*, void* statement, void*)
{
    const std::string_view text = sqlite3_sql(static_cast<sqlite3_stmt*>(statement));
    statements += text.starts_with("SELECT") ? 1 : 0;
    return 0;
}

int watch_connection(sqlite3* connection, char**, const sqlite3_api_routines*)
{
    return sqlite3_trace_v2(connection, SQLITE_TRACE_STMT, count_statement, nullptr);
}

/// Seconds from the start.
struct Run
{
    double first_page = 0, pdf = 0;
    int statements = 0;
    int pages = 0;
};

Run run_report(Church& church, const output::ReportDefinition& report, const QString& file,
               std::vector<pages::Page>* keep)
{
    Run run;
    core::SilentProgress progress;
    const int before = statements;
    const auto start = Stopwatch::now();
    pages::PageSpool spool;
    spool.on_page([&](int number) {
        if (number == 1)
            run.first_page = seconds_since(start);
    });
    if (!output::run_report(report, {church.office, church.list}, progress, spool) || !pages::write_pdf(spool, file))
        throw std::runtime_error(report.leaf);
    run.pdf = seconds_since(start);
    run.statements = statements - before;
    run.pages = spool.page_count();
    for (int number = 1; keep && number <= std::min(run.pages, most_pages_kept); ++number)
        keep->push_back(spool.page(number));
    return run;
}

void measure(Church& church, const output::ReportDefinition& report)
{
    std::vector<pages::Page> kept;
    const auto run = run_report(church, report, church.folder.filePath(u"report.pdf"_s), &kept);
    const double drawn = bench::draw_bare(kept, church.folder.filePath(u"bare.pdf"_s));
    const double bare = drawn * run.pages / double(kept.size());
    std::printf("| %-5s | %-45s | %6d | %10.3f | %8.3f | %8.3f | %5.2f | %10d | %7.1f |\n", report.key, report.leaf,
                run.pages, run.first_page, run.pdf, bare, run.pdf / bare, run.statements, peak_megabytes());
    std::fflush(stdout);
}

} // namespace

int main(int argc, char** argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QGuiApplication application(argc, argv);
    const int families = argc > 1 ? QByteArray(argv[1]).toInt() : usual_families;
    sqlite3_auto_extension(reinterpret_cast<void (*)()>(watch_connection));
    Church church(families);
    std::printf("%d families, %zu people, %.1f MB before the first report\n\n", families, church.list.members.size(),
                peak_megabytes());
    std::printf(
        "| key   | report                                        |  pages | first page |    PDF s |   bare s | ratio | "
        "statements | peak MB |\n");
    for (const auto& report : output::catalogue()) {
        if (argc < 3 || std::string_view(argv[2]) == report.key)
            measure(church, report);
    }
}
