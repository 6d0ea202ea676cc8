// Saving a list of 2,000 suburbs, all of them moved, 100 renamed, 50 removed and 50 added, against the same statements
// on SQLite's C interface in the same run: one transaction that allocates the new keys, reads the stored rows, lends
// the touched keys, deletes and inserts.

#include "bare_sqlite.h"
#include "measure.h"

#include "core/schema.h"
#include "core/sqlite_session.h"
#include "people/setup_rows.h"

#include <QCoreApplication>
#include <QTemporaryDir>

using namespace kindrel;
using namespace kindrel::bench;
using namespace Qt::StringLiterals;

namespace {

constexpr int suburbs = 2000;
constexpr int renamed = 100;
constexpr int changed_rows = 50;
constexpr int rounds = 15;

using Items = std::vector<people::SetupItem>;

/// The list turned round, with the first ones renamed, the last ones gone and as many added.
core::OrderedList<people::SetupItem> edited(const Items& stored, int round)
{
    core::OrderedList<people::SetupItem> list(stored);
    int place = 0;
    list.sort_by([&place](const people::SetupItem&) { return --place; });
    for (int index = 0; index < renamed; ++index) {
        auto item = list[index];
        item.text = u"Renamed %1 %2"_s.arg(index).arg(round);
        list.replace(index, item);
    }
    for (int row = 0; row < changed_rows; ++row)
        list.remove(list.size() - 1);
    for (int row = 0; row < changed_rows; ++row)
        list.add({0, u"Added %1 %2"_s.arg(row).arg(round), u"4000"_s, false, 0});
    return list;
}

/// The same work with nothing around the engine.
class BareSave
{
public:
    explicit BareSave(const BareDatabase& database)
        : m_database(database), m_begin(prepare("BEGIN IMMEDIATE")), m_commit(prepare("COMMIT")),
          m_counter(prepare("SELECT [id_found] FROM [tbl_id_suburb] ORDER BY [id_found]")),
          m_prune(prepare("DELETE FROM [tbl_id_suburb] WHERE [id_found] < ?")),
          m_count(prepare("INSERT INTO [tbl_id_suburb] ([id_found]) VALUES (?)")),
          m_read(prepare("SELECT * FROM [Qry_suburb_list] ORDER BY [position],[suburb_id]")), m_lend(lend_statement()),
          m_unlend(prepare("DELETE FROM temp.[work_setup]")),
          m_unlink(prepare("DELETE FROM [tbl_suburb] WHERE [suburb_id] IN (SELECT [item] FROM [work_setup] "
                           "WHERE [removed]=-1)")),
          m_delete(prepare("DELETE FROM [tbl_suburb_setup] WHERE [suburb_id] IN (SELECT [item] FROM [work_setup])")),
          m_insert(prepare("INSERT INTO [tbl_suburb_setup] ([suburb_id],[suburb],[position],[postcode]) "
                           "VALUES (?,?,?,?)"))
    {
    }

    struct Row
    {
        int key;
        std::string text, postcode;
    };
    void run(const std::vector<Row>& rows, const std::vector<int>& removed) const
    {
        m_begin.run();
        const int next = allocate();
        (void)read();
        m_unlend.run();
        for (const auto& row : rows) {
            if (row.key != 0)
                lend(row.key, 0);
        }
        for (const int key : removed)
            lend(key, -1);
        m_unlink.run();
        m_delete.run();
        insert(rows, next);
        m_commit.run();
    }
    [[nodiscard]] std::vector<Row> read() const
    {
        std::vector<Row> rows;
        while (sqlite3_step(m_read.get()) == SQLITE_ROW) {
            const auto text = [this](int column) {
                const auto* found = reinterpret_cast<const char*>(sqlite3_column_text(m_read.get(), column));
                return std::string(found ? found : "");
            };
            rows.push_back({sqlite3_column_int(m_read.get(), 0), text(1), text(2)});
        }
        sqlite3_reset(m_read.get());
        return rows;
    }

private:
    [[nodiscard]] BareStatement prepare(const char* text) const { return {m_database.get(), text}; }
    [[nodiscard]] BareStatement lend_statement() const
    {
        m_database.run("CREATE TEMPORARY TABLE [work_setup] ([item] INTEGER PRIMARY KEY,[removed] bigint)");
        return prepare("INSERT INTO temp.[work_setup] ([item],[removed]) VALUES (?,?)");
    }
    [[nodiscard]] int allocate() const
    {
        int last = 0;
        while (sqlite3_step(m_counter.get()) == SQLITE_ROW)
            last = sqlite3_column_int(m_counter.get(), 0);
        sqlite3_reset(m_counter.get());
        sqlite3_bind_int(m_prune.get(), 1, last + 40);
        m_prune.run();
        for (int key = last + 40; key <= last + changed_rows; ++key) {
            sqlite3_bind_int(m_count.get(), 1, key);
            m_count.run();
        }
        return last + 1;
    }
    void lend(int key, int gone) const
    {
        sqlite3_bind_int(m_lend.get(), 1, key);
        sqlite3_bind_int(m_lend.get(), 2, gone);
        m_lend.run();
    }
    void insert(const std::vector<Row>& rows, int next) const
    {
        auto* statement = m_insert.get();
        for (int position = 0; const auto& row : rows) {
            sqlite3_bind_int(statement, 1, row.key != 0 ? row.key : next++);
            sqlite3_bind_text(statement, 2, row.text.c_str(), -1, SQLITE_STATIC);
            sqlite3_bind_int(statement, 3, ++position);
            sqlite3_bind_text(statement, 4, row.postcode.c_str(), -1, SQLITE_STATIC);
            m_insert.run();
        }
    }

    const BareDatabase& m_database;
    BareStatement m_begin, m_commit, m_counter, m_prune, m_count, m_read, m_lend, m_unlend, m_unlink, m_delete,
        m_insert;
};

std::unique_ptr<core::Session> make_church(const QString& file)
{
    auto session = core::create_sqlite(file);
    core::create_schema(*session);
    std::vector<people::SetupRow> rows;
    for (int place = 1, key = session->allocate(core::Entity::suburb, suburbs); place <= suburbs; ++place, ++key)
        rows.push_back({{key, u"Suburb %1"_s.arg(place), u"3000"_s, false, 0}, place});
    people::insert_setup_rows(*session, people::setup_list(people::SetupKind::suburbs), rows);
    return session;
}

/// The rows and removed keys of one round, as the bare side takes them.
struct BareRound
{
    std::vector<BareSave::Row> rows;
    std::vector<int> removed;
};

BareRound bare_round(const std::vector<BareSave::Row>& stored, int round)
{
    BareRound work;
    work.rows.assign(stored.rbegin(), stored.rend());
    for (int index = 0; index < renamed; ++index)
        work.rows[static_cast<std::size_t>(index)].text =
            "Renamed " + std::to_string(index) + ' ' + std::to_string(round);
    for (int row = 0; row < changed_rows; ++row) {
        work.removed.push_back(work.rows.back().key);
        work.rows.pop_back();
    }
    for (int row = 0; row < changed_rows; ++row)
        work.rows.push_back({0, "Added " + std::to_string(row) + ' ' + std::to_string(round), "4000"});
    return work;
}

bool same(const Items& ours, const std::vector<BareSave::Row>& bare)
{
    return std::ranges::equal(ours, bare, [](const people::SetupItem& item, const BareSave::Row& row) {
        return item.key == row.key && item.text.toStdString() == row.text &&
               item.postcode.toStdString() == row.postcode;
    });
}

} // namespace

int main(int count, char** arguments)
{
    const QCoreApplication application(count, arguments);
    const QTemporaryDir folder;
    const auto session = make_church(folder.filePath(u"ours.kdl"_s));
    const auto bare_file = folder.filePath(u"bare.kdl"_s);
    make_church(bare_file).reset();
    const BareDatabase database(bare_file.toStdString());
    const BareSave bare(database);
    const auto& list = people::setup_list(people::SetupKind::suburbs);
    std::printf("| %-34s |  items |   ours ms |   bare ms | ratio | goal |\n", "work");
    Comparison comparison;
    for (int round = 0; round < rounds; ++round) {
        const auto ours_work = edited(people::read_setup_items(*session, list.kind), round);
        const auto bare_work = bare_round(bare.read(), round);
        comparison.bare.add(milliseconds_of([&] { bare.run(bare_work.rows, bare_work.removed); }));
        comparison.ours.add(
            milliseconds_of([&] { (void)people::save_setup_list(*session, list, ours_work, QDate(2024, 5, 15)); }));
    }
    print("saving a list of suburbs", suburbs, comparison, 1.5);
    if (!same(people::read_setup_items(*session, list.kind), bare.read()))
        throw std::runtime_error("The two sides did not do the same work.");
    return 0;
}
