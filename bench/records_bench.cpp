// The register against SQLite's C interface on the same rows in the same run: the family list, opening one family,
// saving one family durably, and start-up to the numbers and the list of the main menu.

#include "bare_family.h"
#include "measure.h"

#include "core/postgres_session.h"
#include "core/schema.h"
#include "core/sqlite_session.h"
#include "people/address_book.h"
#include "people/family_store.h"
#include "people/link_tables.h"
#include "sample/church.h"

#include <QCoreApplication>
#include <QFile>
#include <QTemporaryDir>

#include <array>
#include <memory>

using namespace kindrel;
using namespace kindrel::bench;
using namespace Qt::StringLiterals;

namespace {

constexpr std::array sizes{1000, 10000, 60000};
const QDate today(2026, 11, 22);

constexpr auto list_text = "SELECT * FROM [qry_Kindrel_address_book] WHERE [condition] = 0 "
                           "ORDER BY [sort_key],[Primary_name],[surname_id];";

struct BareLine
{
    std::string surname, name, street, suburb, phone;
    int key, condition;
    bool booked_out;
};

std::string cell(sqlite3_stmt* statement, int column)
{
    const auto* text = reinterpret_cast<const char*>(sqlite3_column_text(statement, column));
    return text ? text : "";
}

int column_named(sqlite3_stmt* statement, const char* name)
{
    for (int column = 0; column < sqlite3_column_count(statement); ++column) {
        if (sqlite3_stricmp(sqlite3_column_name(statement, column), name) == 0)
            return column;
    }
    throw std::runtime_error(name);
}

std::vector<BareLine> bare_list(const BareStatement& list)
{
    auto* row = list.get();
    const std::array columns{column_named(row, "surname"), column_named(row, "Name"), column_named(row, "res_street"),
                             column_named(row, "suburb"), column_named(row, "phone")};
    const int key = column_named(row, "surname_id");
    const int condition = column_named(row, "condition");
    const int booked_out = column_named(row, "booked_out");
    std::vector<BareLine> lines;
    while (sqlite3_step(row) == SQLITE_ROW) {
        lines.push_back({cell(row, columns[0]), cell(row, columns[1]), cell(row, columns[2]), cell(row, columns[3]),
                         cell(row, columns[4]), sqlite3_column_int(row, key), sqlite3_column_int(row, condition),
                         sqlite3_column_int(row, booked_out) != 0});
    }
    sqlite3_reset(row);
    return lines;
}

std::vector<int> some_families(core::Session& session, int most)
{
    auto rows = session.select(u"SELECT [Surname_ID] FROM [tbl_surname] ORDER BY [Surname_ID];"_s);
    std::vector<int> all;
    for (const core::Row& row : rows)
        all.push_back(row.integer(core::Column{0}));
    std::vector<int> chosen;
    const auto step = std::max<std::size_t>(1, all.size() / static_cast<std::size_t>(most));
    for (std::size_t i = 0; i < all.size() && static_cast<int>(chosen.size()) < most; i += step)
        chosen.push_back(all[i]);
    return chosen;
}

void fill(core::Session& session, int people)
{
    core::create_schema(session);
    sample::fill_church(session, {.families = people * 10 / 28, .seed = 7, .training = false, .today = today}, {}, {});
}

void bench_lists(core::Session& session, BareDatabase* bare, int people, const std::string& engine)
{
    const auto ours = [&] {
        (void)people::read_address_book(session, people::FamilyList::active, false);
    };
    const auto ours_start = [&] {
        (void)people::family_totals(session);
        (void)people::read_address_book(session, people::FamilyList::active, false);
    };
    if (!bare) {
        const auto times = compare(
            ours, [] {}, 9);
        std::printf("| %-34s | %6d | %9.3f |\n", ("family list, " + engine).c_str(), people, times.ours.median());
        return;
    }
    const BareStatement list(bare->get(), list_text);
    const BareStatement totals(bare->get(), "SELECT COUNT(*), SUM([Condition]=0), SUM([Condition]=2), "
                                            "SUM([Condition]=3), SUM([Condition]=1), SUM([Condition]<2), "
                                            "SUM([booked_out]=-1), SUM([active_in_book]=-1) FROM [tbl_surname];");
    print("family list", people,
          compare(
              ours, [&] { (void)bare_list(list); }, 15),
          1.5);
    const auto bare_start = [&] {
        std::vector<std::string> cells;
        totals.read(cells);
        (void)bare_list(list);
    };
    print("totals and list of the main menu", people, compare(ours_start, bare_start, 15), 2);
}

void bench_families(core::Session& session, BareDatabase* bare, int people, const std::string& engine)
{
    const auto keys = some_families(session, 200);
    const auto open = [&] {
        for (const int key : keys)
            (void)people::load_family(session, key);
    };
    std::vector<people::FamilyFile> files;
    for (const int key : some_families(session, 20))
        files.push_back(people::load_family(session, key).value());
    const auto save = [&] {
        for (auto& file : files)
            file = people::save_family(session, file, today);
    };
    if (!bare) {
        const auto opened = compare(
            open, [] {}, 5);
        const auto saved = compare(
            save, [] {}, 5);
        std::printf("| %-34s | %6d | %9.3f |\n", ("opening 200 families, " + engine).c_str(), people,
                    opened.ours.median());
        std::printf("| %-34s | %6d | %9.3f |\n", ("saving 20 families, " + engine).c_str(), people,
                    saved.ours.median());
        return;
    }
    BareLoad load(*bare);
    const auto bare_open = [&] {
        for (const int key : keys)
            load.run(key);
    };
    print("opening 200 families", people, compare(open, bare_open, 9), 2);
    BareSave bare_save(*bare);
    const auto bare_saves = [&] {
        for (const auto& file : files)
            bare_save.run(file.family.Surname_ID, "2026-11-22");
    };
    print("saving 20 families durably", people, compare(save, bare_saves, 9), 1.5);
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
        const auto session = core::create_sqlite(file);
        fill(*session, people);
        BareDatabase bare(file.toStdString());
        bench_lists(*session, &bare, people, {});
        bench_families(*session, &bare, people, {});
        if (server.isEmpty())
            continue;
        const auto schema = u"bench_%1"_s.arg(people);
        core::open_postgres(server)->execute(u"CREATE SCHEMA [%1]"_s.arg(schema));
        const auto church = core::open_postgres(u"%1 options=-csearch_path=%2"_s.arg(server, schema));
        fill(*church, people);
        church->execute(u"ANALYZE"_s);
        bench_lists(*church, nullptr, people, "PostgreSQL");
        bench_families(*church, nullptr, people, "PostgreSQL");
    }
    return 0;
}
