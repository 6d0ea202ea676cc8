// A bulk change of 20,000 people in a church of 60,000 against the bare statements through SQLite's C interface, on the
// same rows in the same run: a status given, a group given with its history, and the status taken away. Beside them how
// long the list and the line that tells beforehand take. On PostgreSQL the times stand alone.

#include "bare_sqlite.h"
#include "measure.h"
#include "quiet_dialogue.h"

#include "core/postgres_session.h"
#include "core/schema.h"
#include "core/sqlite_session.h"
#include "core/system_workstation.h"
#include "people/list_plan.h"
#include "people/search_words.h"
#include "people/tagging.h"
#include "sample/church.h"

#include <QCoreApplication>
#include <QTemporaryDir>

using namespace kindrel;
using namespace kindrel::bench;
using namespace Qt::StringLiterals;

namespace {

constexpr int people_in_church = 60000;
constexpr int people_tagged = 20000;
constexpr int rounds = 7;
constexpr double goal = 2;
constexpr int item = 9999; ///< Nobody carries it yet.
const QDate today(2026, 11, 22);

/// An office on a church of 60,000 people, with 20,000 of them on a list.
struct Church
{
    Church(const QString& folder, std::unique_ptr<core::Session> session)
        : office{.paths = core::Paths(folder, folder, folder, core::Mode::normal, 1),
                 .session = std::move(session),
                 .rights = core::Rights::all(),
                 .workstation = workstation,
                 .dialogue = dialogue,
                 .clock = clock}
    {
        core::create_schema(*office.session);
        sample::fill_church(*office.session,
                            {.families = people_in_church * 10 / 28, .seed = 7, .training = false, .today = today}, {},
                            {});
        office.session->execute(u"UPDATE [tbl_surname] SET [booked_out]=0;"_s);
        office.session->execute(u"UPDATE [tbl_record_access] SET [status]=-1,[groups]=-1;"_s);
        plan.filter.families = people::FamilyList::active;
        list = people::make_list(office, plan).list;
        list.members.resize(people_tagged);
    }

    core::SystemWorkstation workstation;
    core::SystemClock clock;
    QuietDialogue dialogue;
    core::Office office;
    people::ListPlan plan;
    people::WorkingList list;
};

people::TagItem item_of(people::TagKind kind)
{
    return {.kind = kind, .item = item, .text = u"Newcomers"_s};
}

double time_of_tagging(Church& church, people::TagKind kind, people::TagAct act)
{
    return milliseconds_of([&] {
        const auto change = people::tag(church.office, church.list, item_of(kind), act);
        if (!change || change->count.changed != people_tagged)
            throw std::runtime_error("The people were not tagged.");
    });
}

/// A statement run for each person of the list, in one transaction.
double time_of_statements(const BareDatabase& database, const people::WorkingList& list,
                          const std::vector<std::string>& texts)
{
    static int history_id = 100'000'000; // Beyond the keys that the program allocates.
    std::vector<BareStatement> statements;
    for (const auto& text : texts)
        statements.emplace_back(database.get(), text);
    return milliseconds_of([&] {
        database.run("BEGIN IMMEDIATE");
        for (const auto& member : list.members) {
            for (const auto& statement : statements) {
                sqlite3_bind_int(statement.get(), 1, member.person_id);
                sqlite3_bind_int(statement.get(), 2, item);
                sqlite3_bind_int(statement.get(), 3, ++history_id);
                statement.run();
            }
        }
        database.run("COMMIT");
    });
}

struct Case
{
    const char* what;
    people::TagKind kind;
    std::vector<std::string> give, take;
};

const std::vector<Case>& cases()
{
    static const std::vector<Case> all{
        {"status",
         people::TagKind::status,
         {"INSERT INTO [tbl_status] ([person_id],[status_id],[s_position]) VALUES (?,?,1)"},
         {"DELETE FROM [tbl_status] WHERE [person_id]=? AND [status_id]=?"}},
        {"group with history",
         people::TagKind::group,
         {"INSERT INTO [tbl_group] ([person_id],[group_id],[g_position]) VALUES (?,?,1)",
          "INSERT INTO [tbl_group_history] ([person_id],[group_id],[history_id],[date_in],[completed]) "
          "VALUES (?,?,?,'2026-11-22',0)"},
         {"DELETE FROM [tbl_group] WHERE [person_id]=? AND [group_id]=?",
          "UPDATE [tbl_group_history] SET [completed]=-1,[date_out]='2026-11-22' WHERE [person_id]=? AND [group_id]=? "
          "AND [completed]=0"}},
    };
    return all;
}

/// Each gives and takes in turn, so that both begin with the same rows.
void bench_changes(Church& church, const BareDatabase& database)
{
    for (const auto& [what, kind, give, take] : cases()) {
        Comparison given, taken;
        for (int round = 0; round < rounds; ++round) {
            given.bare.add(time_of_statements(database, church.list, give));
            taken.bare.add(time_of_statements(database, church.list, take));
            given.ours.add(time_of_tagging(church, kind, people::TagAct::give));
            taken.ours.add(time_of_tagging(church, kind, people::TagAct::take));
        }
        print(std::string("giving a ") + what, people_tagged, given, goal);
        print(std::string("taking a ") + what, people_tagged, taken, goal);
    }
}

void print_alone(const std::string& what, const Work& work)
{
    Times times;
    for (int round = 0; round < rounds; ++round)
        times.add(milliseconds_of(work));
    std::printf("| %-34s | %6d | %9.3f |\n", what.c_str(), people_tagged, times.median());
}

/// What a person waits for on the screen.
void bench_waiting(Church& church, const std::string& engine)
{
    print_alone("the list of the active people" + engine, [&] { (void)people::make_list(church.office, church.plan); });
    print_alone("everybody, for adding by hand" + engine, [&] {
        for (const auto& person : people::everybody(*church.office.session, false))
            (void)people::search_words(person.name + u' ' + person.surname);
    });
    print_alone("the line that tells beforehand" + engine, [&] {
        (void)people::count_tagging(church.office, church.list, item_of(people::TagKind::status), people::TagAct::give);
    });
}

void bench_postgres(const QString& folder, const QString& server)
{
    core::open_postgres(server)->execute(u"CREATE SCHEMA [bench_tagging]"_s);
    Church church(folder, core::open_postgres(u"%1 options=-csearch_path=bench_tagging"_s.arg(server)));
    church.office.session->execute(u"ANALYZE"_s);
    for (const auto& [what, kind, give, take] : cases()) {
        Times given, taken;
        for (int round = 0; round < rounds; ++round) {
            given.add(time_of_tagging(church, kind, people::TagAct::give));
            taken.add(time_of_tagging(church, kind, people::TagAct::take));
        }
        std::printf("| giving and taking a %s, PostgreSQL | %d | %.3f | %.3f |\n", what, people_tagged, given.median(),
                    taken.median());
    }
    bench_waiting(church, ", PostgreSQL");
}

} // namespace

int main(int count, char** arguments)
{
    const QCoreApplication application(count, arguments);
    std::printf("| %-34s | people |   ours ms |   bare ms | ratio | goal |\n", "work");
    QTemporaryDir folder;
    const auto root = folder.path() + u'/';
    const auto file = root + u"church.kdl"_s;
    {
        Church church(root, core::create_sqlite(file));
        const BareDatabase bare(file.toStdString());
        bench_changes(church, bare);
        bench_waiting(church, {});
    }
    const auto server = qEnvironmentVariable("KINDREL_TEST_SERVER");
    if (!server.isEmpty())
        bench_postgres(root, server);
    return 0;
}
