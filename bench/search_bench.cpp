// Search and speed find: the text search to its end against SQLite's C interface reading the same cells, the family
// list of one group, a key of speed find in processor time, and reading the families into its memory. On PostgreSQL the
// times stand alone.

#include "bare_sqlite.h"
#include "measure.h"
#include "quiet_dialogue.h"

#include "core/postgres_session.h"
#include "core/schema.h"
#include "core/sqlite_session.h"
#include "core/system_workstation.h"
#include "people/data_search.h"
#include "people/speed_find.h"
#include "people/text_search.h"
#include "sample/church.h"

#include <QCoreApplication>
#include <QTemporaryDir>

#include <ctime>

using namespace kindrel;
using namespace kindrel::bench;
using namespace Qt::StringLiterals;

namespace {

constexpr std::array sizes{1000, 10000, 60000};
constexpr int shown_hits = 100;
const QDate today(2026, 11, 22);

constexpr auto names_text = "SELECT [Surname_ID],[person_id],[Name],[surname],[other_surname],[middle_name],"
                            "[preferred_name] FROM [qry_search_names] "
                            "ORDER BY [sort_key],[Primary_name],[Surname_ID],[position];";
constexpr auto all_text =
    "SELECT [Surname_ID],[person_id],[Name],[surname],[other_surname],[middle_name],[phone],[family_fax],"
    "[family_email],[mobile_phone],[Personal_email],[business_phone],[business_fax],[business_email],[res_street],"
    "[res_street2],[res_state],[res_country],[res_map],[post_street],[post_street2],[post_state],[post_country] "
    "FROM [qry_search_all] ORDER BY [sort_key],[Primary_name],[Surname_ID],[position];";

/// An office on an empty church of the session, then filled.
struct Church
{
    Church(std::unique_ptr<core::Session> session, const QString& folder, int people)
        : office{.paths = core::Paths(folder, folder, folder, core::Mode::normal, 1),
                 .session = std::move(session),
                 .rights = core::Rights::all(),
                 .workstation = workstation,
                 .dialogue = dialogue,
                 .clock = clock}
    {
        core::create_schema(*office.session);
        sample::fill_church(*office.session,
                            {.families = people * 10 / 28, .seed = 7, .training = false, .today = today}, {}, {});
    }

    core::SystemWorkstation workstation;
    QuietDialogue dialogue;
    core::SystemClock clock;
    core::Office office;
};

std::vector<int> all_families(core::Session& session)
{
    auto rows = session.select(u"SELECT [Surname_ID] FROM [tbl_surname];"_s);
    std::vector<int> all;
    for (const core::Row& row : rows)
        all.push_back(row.integer(core::Column{0}));
    return all;
}

double processor_milliseconds_of(const Work& work)
{
    const std::clock_t start = std::clock();
    work();
    return 1000.0 * double(std::clock() - start) / CLOCKS_PER_SEC;
}

/// On a server, where there is no bare file to read, the times stand alone.
void bench_text_search(core::Office& office, const BareDatabase* database, int people)
{
    const auto families = all_families(*office.session);
    for (const auto& [what, fields, text] :
         {std::tuple("text search, names", people::SearchFields::names, names_text),
          std::tuple("text search, all fields", people::SearchFields::all, all_text)}) {
        const auto to_the_end = [&] {
            people::TextSearch search(office);
            while (search.next(u"smi"_s, fields, families)) {
            }
        };
        if (!database) {
            Times times;
            for (int round = 0; round < 5; ++round)
                times.add(milliseconds_of(to_the_end));
            std::printf("| %-34s | %6d | %9.3f |\n", what, people, times.median());
            continue;
        }
        const BareStatement bare(database->get(), text);
        std::vector<std::string> cells;
        const auto read = [&] {
            cells.clear();
            bare.read(cells);
        };
        print(what, people, compare(to_the_end, read, 9), 2);
    }
}

void bench_speed_find(core::Office& office, int people)
{
    Times reading;
    for (int round = 0; round < 5; ++round)
        reading.add(processor_milliseconds_of([&] { (void)people::SpeedFind(office).renew(); }));
    people::SpeedFind find(office);
    (void)find.renew();
    Times keys;
    for (const QString& words : {u"smith ann"_s, u"a b"_s, u"mar north"_s, u"0398 7"_s, u"x"_s})
        for (qsizetype typed = 1; typed <= words.size(); ++typed)
            keys.add(processor_milliseconds_of([&] {
                (void)find.renew();
                (void)find.find(words.first(typed), shown_hits);
            }));
    std::printf("| %-34s | %6d | %9.3f |\n", "speed find: reading, processor", people, reading.median());
    std::printf("| %-34s | %6d | %9.3f | worst %.3f, goal 10\n", "speed find: a key, processor", people, keys.median(),
                keys.worst());
}

void bench_data_search(core::Office& office, int people)
{
    std::vector<std::pair<double, const char*>> times;
    for (const auto& part : people::data_parts())
        times.emplace_back(milliseconds_of([&] { (void)people::people_with(office, part); }), part.name);
    const auto slowest = std::ranges::max(times);
    std::printf("| %-34s | %6d | %9.3f | %s\n", "data search: the slowest part", people, slowest.first, slowest.second);
}

void bench_postgres(const QString& server, const QString& folder, int people)
{
    const auto schema = u"bench_search_%1"_s.arg(people);
    core::open_postgres(server)->execute(u"CREATE SCHEMA [%1]"_s.arg(schema));
    Church church(core::open_postgres(u"%1 options=-csearch_path=%2"_s.arg(server, schema)), folder, people);
    church.office.session->execute(u"ANALYZE"_s);
    std::printf("PostgreSQL:\n");
    bench_text_search(church.office, nullptr, people);
    bench_speed_find(church.office, people);
    bench_data_search(church.office, people);
}

} // namespace

int main(int count, char** arguments)
{
    const QCoreApplication application(count, arguments);
    const auto server = qEnvironmentVariable("KINDREL_TEST_SERVER");
    std::printf("| %-34s | people |   ours ms |   bare ms | ratio | goal |\n", "work");
    for (const int people : sizes) {
        QTemporaryDir folder;
        const auto file = folder.filePath(u"church.kdl"_s);
        Church church(core::create_sqlite(file), folder.path() + u'/', people);
        const BareDatabase bare(file.toStdString());
        bench_text_search(church.office, &bare, people);
        bench_speed_find(church.office, people);
        bench_data_search(church.office, people);
        if (!server.isEmpty())
            bench_postgres(server, folder.path() + u'/', people);
    }
    return 0;
}
