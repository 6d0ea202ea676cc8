// Filters against the same statement through SQLite's C interface in the same run: one kind of item, and a mix of five
// kinds, which is also held against the one kind. With a server at hand its times stand beside.

#include "bare_sqlite.h"
#include "measure.h"

#include "core/postgres_session.h"
#include "core/schema.h"
#include "core/sqlite_session.h"
#include "people/filter_search.h"
#include "sample/church.h"

#include <QCoreApplication>
#include <QTemporaryDir>

#include <array>

using namespace kindrel;
using namespace kindrel::bench;
using namespace Qt::StringLiterals;
using people::Filter;
using people::FilterItem;
using people::FilterKind;

namespace {

constexpr std::array sizes{1000, 10000, 60000};
constexpr int rounds = 11;
const QDate today(2026, 11, 22);

constexpr auto from_active = "SELECT [person_id],[Surname_ID] FROM [qry_filter1_all] WHERE [Condition]=0 AND "
                             "(([Active]=0 AND [Privacy]=0 AND [Prospect]=0 AND [archive]=0 AND [contact]=0 AND "
                             "[Decease]=0) OR [Active]<>0)";
constexpr auto in_order = " ORDER BY [family_sort_key],[Primary_name],[Surname_ID],[position],[Name],[person_id];";

std::string carried(const QString& table, const QString& key, int item)
{
    return u" AND [person_id] IN (SELECT [person_id] FROM [%1] WHERE [%2]=%3)"_s.arg(table, key)
        .arg(item)
        .toStdString();
}

std::string not_alone(const QString& table, const QString& key, int item)
{
    return u" AND [person_id] NOT IN (SELECT [person_id] FROM [%1] l WHERE [%2]=%3 AND NOT EXISTS "
           "(SELECT 1 FROM [%1] o WHERE o.[person_id]=l.[person_id] AND o.[%2]<>%3))"_s.arg(table, key)
               .arg(item)
               .toStdString();
}

/// The item that most people carry.
int commonest(core::Session& session, const QString& table, const QString& key)
{
    auto rows = session.select(u"SELECT [%2] FROM [%1] GROUP BY [%2] ORDER BY COUNT(*) DESC,[%2];"_s.arg(table, key));
    return rows.first()->integer(core::Column{0});
}

/// One filter, and what the bare side asks.
struct Case
{
    std::string name;
    Filter filter;
    std::string bare;
};

std::vector<Case> cases_for(core::Session& session)
{
    const int status = commonest(session, u"tbl_status"_s, u"status_id"_s);
    const int group = commonest(session, u"tbl_group"_s, u"group_id"_s);
    const int ministry = commonest(session, u"tbl_ministry"_s, u"ministry_id"_s);
    const int occupation = commonest(session, u"tbl_occupation"_s, u"occupation_id"_s);
    const int flexi = commonest(session, u"tbl_flexi"_s, u"flexi_id"_s);
    Filter everybody{.families = people::FamilyList::active};
    auto one = everybody;
    one.items = {{.kind = FilterKind::status, .item = status}};
    auto without = everybody;
    without.items = {{.kind = FilterKind::status, .item = status, .exclude = true}};
    auto mix = one;
    mix.items.push_back({.kind = FilterKind::groups, .item = group, .exclude = true});
    mix.items.push_back({.kind = FilterKind::ministry, .item = ministry, .exclude = true});
    mix.items.push_back({.kind = FilterKind::occupation, .item = occupation, .exclude = true});
    mix.items.push_back({.kind = FilterKind::flexi, .item = flexi, .exclude = true});
    const auto in_status = carried(u"tbl_status"_s, u"status_id"_s, status);
    return {
        {"active families", everybody, std::string(from_active) + in_order},
        {"of a status", one, from_active + in_status + in_order},
        {"not of a status", without, from_active + not_alone(u"tbl_status"_s, u"status_id"_s, status) + in_order},
        {"five kinds", mix,
         from_active + in_status + not_alone(u"tbl_group"_s, u"group_id"_s, group) +
             not_alone(u"tbl_ministry"_s, u"ministry_id"_s, ministry) +
             not_alone(u"tbl_occupation"_s, u"occupation_id"_s, occupation) +
             not_alone(u"tbl_flexi"_s, u"flexi_id"_s, flexi) + in_order},
    };
}

/// Reads as plainly as the interface allows.
std::vector<std::pair<int, int>> read_bare(const BareStatement& statement)
{
    std::vector<std::pair<int, int>> members;
    while (sqlite3_step(statement.get()) == SQLITE_ROW)
        members.emplace_back(sqlite3_column_int(statement.get(), 0), sqlite3_column_int(statement.get(), 1));
    sqlite3_reset(statement.get());
    return members;
}

void require_same(const people::WorkingList& ours, const std::vector<std::pair<int, int>>& bare)
{
    const auto same = [](const people::Member& member, const std::pair<int, int>& pair) {
        return member.person_id == pair.first && member.surname_id == pair.second;
    };
    if (!std::ranges::equal(ours.members, bare, same))
        throw std::runtime_error("The two sides did not find the same people.");
}

void fill(core::Session& session, int people)
{
    core::create_schema(session);
    sample::fill_church(session, {.families = people * 10 / 28, .seed = 7, .training = false, .today = today}, {}, {});
}

void bench_file(core::Session& session, const BareDatabase& database, int people)
{
    double one_kind = 0;
    for (const auto& [name, filter, text] : cases_for(session)) {
        const BareStatement statement(database.get(), text);
        const auto found = people::find_people(session, filter, {today});
        require_same(found, read_bare(statement));
        const auto times = compare([&] { (void)people::find_people(session, filter, {today}); },
                                   [&] { (void)read_bare(statement); }, rounds);
        print(name + ", finds " + std::to_string(found.members.size()), people, times, 1.5);
        if (name == "of a status")
            one_kind = times.ours.median();
        if (name == "five kinds")
            std::printf("| %-34s | %6d | %9.3f | %9.3f | %5.2f | %4.1f |\n", "five kinds beside one", people,
                        times.ours.median(), one_kind, times.ours.median() / one_kind, 3.0);
    }
}

void bench_server(core::Session& session, int people)
{
    for (const auto& [name, filter, text] : cases_for(session)) {
        const auto times = compare([&] { (void)people::find_people(session, filter, {today}); }, [] {}, rounds);
        std::printf("| %-34s | %6d | %9.3f |\n", (name + ", PostgreSQL").c_str(), people, times.ours.median());
        std::fflush(stdout);
    }
}

} // namespace

int main(int count, char** arguments)
{
    const QCoreApplication application(count, arguments);
    const auto server = qEnvironmentVariable("KINDREL_TEST_SERVER");
    std::printf("| %-34s | people |   ours ms |   bare ms | ratio | goal |\n", "work");
    for (const int people : sizes) {
        const QTemporaryDir folder;
        const auto file = folder.filePath(u"church.kdl"_s);
        const auto session = core::create_sqlite(file);
        fill(*session, people);
        bench_file(*session, BareDatabase(file.toStdString()), people);
        if (server.isEmpty())
            continue;
        const auto schema = u"bench_%1"_s.arg(people);
        core::open_postgres(server)->execute(u"CREATE SCHEMA [%1]"_s.arg(schema));
        const auto church = core::open_postgres(u"%1 options=-csearch_path=%2"_s.arg(server, schema));
        fill(*church, people);
        church->execute(u"ANALYZE"_s);
        bench_server(*church, people);
    }
    return 0;
}
