// Copying a church to a server and back, with everything compared, against the same rows going the same way through the
// engines' C interfaces: SQLite's to read and write files, libpq's COPY on the server, and nothing compared.

#include "bare_sqlite.h"
#include "measure.h"
#include "quiet_dialogue.h"

#include "core/copy_church.h"
#include "core/copy_church_tables.h"
#include "core/install.h"
#include "core/open_church.h"
#include "core/postgres_session.h"
#include "core/schema.h"
#include "core/sqlite_session.h"
#include "core/system_workstation.h"
#include "sample/church.h"

#include <QCoreApplication>
#include <QFile>
#include <QTemporaryDir>

#include <libpq-fe.h>

#include <array>
#include <cstring>

using namespace kindrel;
using namespace kindrel::bench;
using namespace Qt::StringLiterals;

namespace {

constexpr std::array sizes{1000, 10000, 60000};
constexpr int rounds = 3;
const QString database = u"copy_bench"_s;

/// The tables and, for each, its fields as both engines read them: "a","b","c".
struct Table
{
    std::string name, fields;
    int width = 0;
};

std::vector<Table> tables_in(core::Session& file)
{
    std::vector<Table> tables;
    for (const auto& name : core::church_tables(file)) {
        const auto rows = file.select(u"SELECT * FROM [%1] WHERE 1=0;"_s.arg(name));
        QStringList fields;
        for (int index = 0; index < rows.column_count(); ++index)
            fields += u'"' + rows.column_name(index).toLower() + u'"';
        tables.push_back({name.toStdString(), fields.join(u',').toStdString(), rows.column_count()});
    }
    return tables;
}

class BareServer
{
public:
    explicit BareServer(const QString& connection) : m_connection(PQconnectdb(connection.toUtf8().constData())) {}
    BareServer(const BareServer&) = delete;
    ~BareServer() { PQfinish(m_connection); }
    [[nodiscard]] PGconn* get() const { return m_connection; }
    void run(const std::string& text) const
    {
        PGresult* result = PQexec(m_connection, text.c_str());
        const auto status = PQresultStatus(result);
        PQclear(result);
        if (status == PGRES_FATAL_ERROR || status == PGRES_BAD_RESPONSE)
            throw std::runtime_error(PQerrorMessage(m_connection));
    }
    /// What follows a COPY until the server is ready again.
    void finish() const
    {
        while (PGresult* result = PQgetResult(m_connection)) {
            const auto status = PQresultStatus(result);
            PQclear(result);
            if (status == PGRES_FATAL_ERROR)
                throw std::runtime_error(PQerrorMessage(m_connection));
        }
    }

private:
    PGconn* m_connection;
};

void add_escaped(std::string& line, const char* text)
{
    for (; *text; ++text) {
        const auto* special = std::strchr("\\\n\r\t", *text);
        if (special)
            line += '\\';
        line += special ? (*text == '\n' ? 'n' : *text == '\r' ? 'r' : *text == '\t' ? 't' : '\\') : *text;
    }
}

void bare_to_server(const std::vector<Table>& tables, const std::string& file, const QString& connection)
{
    const BareDatabase source(file);
    const BareServer server(connection);
    server.run("BEGIN");
    std::string line;
    for (const auto& table : tables) {
        server.run("DELETE FROM \"" + table.name + "\"");
        server.run("COPY \"" + table.name + "\" (" + table.fields + ") FROM STDIN");
        const BareStatement rows(source.get(), "SELECT " + table.fields + " FROM \"" + table.name + "\"");
        while (sqlite3_step(rows.get()) == SQLITE_ROW) {
            line.clear();
            for (int column = 0; column < table.width; ++column) {
                const auto* text = reinterpret_cast<const char*>(sqlite3_column_text(rows.get(), column));
                if (column > 0)
                    line += '\t';
                if (text)
                    add_escaped(line, text);
                else
                    line += "\\N";
            }
            line += '\n';
            PQputCopyData(server.get(), line.data(), static_cast<int>(line.size()));
        }
        PQputCopyEnd(server.get(), nullptr);
        server.finish();
    }
    server.run("COMMIT");
}

/// Takes the next field off a line of COPY and binds it.
char* bind_field(sqlite3_stmt* statement, int place, char* at)
{
    char* end = at + std::strcspn(at, "\t\n");
    char* next = *end ? end + 1 : end;
    if (end - at == 2 && at[0] == '\\' && at[1] == 'N') {
        sqlite3_bind_null(statement, place);
        return next;
    }
    char* written = at;
    for (const char* read = at; read < end; ++read) {
        if (*read != '\\') {
            *written++ = *read;
            continue;
        }
        ++read;
        *written++ = *read == 'n' ? '\n' : *read == 'r' ? '\r' : *read == 't' ? '\t' : *read;
    }
    sqlite3_bind_text(statement, place, at, static_cast<int>(written - at), SQLITE_TRANSIENT);
    return next;
}

/// Into a copy of an empty church file.
void bare_from_server(const std::vector<Table>& tables, const QString& connection, const QString& file)
{
    const BareDatabase target(file.toStdString());
    const BareServer server(connection);
    target.run("BEGIN");
    for (const auto& table : tables) {
        target.run(("DELETE FROM \"" + table.name + "\"").c_str());
        std::string marks = "?";
        for (int column = 1; column < table.width; ++column)
            marks += ",?";
        const BareStatement added(target.get(),
                                  "INSERT INTO \"" + table.name + "\" (" + table.fields + ") VALUES (" + marks + ")");
        server.run("COPY \"" + table.name + "\" (" + table.fields + ") TO STDOUT");
        for (char* line = nullptr; PQgetCopyData(server.get(), &line, 0) > 0; PQfreemem(line)) {
            char* at = line;
            for (int place = 1; place <= table.width; ++place)
                at = bind_field(added.get(), place, at);
            added.run();
        }
        server.finish();
    }
    target.run("COMMIT");
}

/// Is asked whether the older copy may go.
class YesDialogue : public QuietDialogue
{
public:
    bool confirm(const core::Message&, core::Answer) override { return true; }
};

/// A program that stands in church 1.
struct Place
{
    explicit Place(const QString& drive)
        : office{.paths = {QCoreApplication::applicationDirPath() + u'/', drive, drive + u"Kindrel_10_Data/"_s,
                           core::Mode::normal, 1},
                 .church_name = u"Church1"_s,
                 .session = core::connect_church({QCoreApplication::applicationDirPath() + u'/', drive,
                                                  drive + u"Kindrel_10_Data/"_s, core::Mode::normal, 1}),
                 .rights = core::Rights::all(),
                 .workstation = workstation,
                 .dialogue = dialogue,
                 .clock = clock}
    {
    }
    void copy(const core::CopyEnd& to, bool replace)
    {
        if (!core::copy_church(office, {.to = to, .replace = replace}, progress))
            throw std::runtime_error("The church was not copied.");
    }
    core::SystemWorkstation workstation;
    YesDialogue dialogue;
    core::SystemClock clock;
    core::SilentProgress progress;
    core::Office office;
};

void lay_church(const QString& file, int people)
{
    const auto session = core::create_sqlite(file);
    core::create_schema(*session);
    sample::fill_church(*session, {.families = people * 10 / 28, .seed = 7, .training = false, .today = {2026, 11, 22}},
                        {}, {});
    session->execute(u"UPDATE [tbl_startup] SET [church_code]='measured';"_s);
}

void bench_to_server(const QString& drive, const QString& file, const QString& connection, int people)
{
    Place place(drive);
    place.copy({.connection = connection}, false);
    const auto tables = tables_in(*place.office.session);
    print("to the server, over an older copy", people,
          compare([&] { place.copy({.connection = connection}, true); },
                  [&] { bare_to_server(tables, file.toStdString(), connection); }, rounds),
          4);
}

void bench_from_server(const QString& drive, const QString& file, const QString& connection, int people)
{
    const QString empty = drive + u"empty.kdl"_s, copy = drive + u"copy.kdl"_s;
    core::create_schema(*core::create_sqlite(empty));
    const auto tables = tables_in(*core::open_sqlite(empty));
    QFile names(core::Paths({}, drive, drive + u"Kindrel_10_Data/"_s, core::Mode::normal, 1)
                    .file(core::Folder::church, core::connection_file.toString()));
    if (!QFile::remove(file) || !names.open(QFile::WriteOnly) || names.write(connection.toUtf8()) < 0)
        throw std::runtime_error("The church cannot be moved to the server.");
    names.close();
    Place place(drive);
    const auto ours = [&] {
        QFile::remove(copy);
        place.copy({.file = copy}, false);
    };
    const auto bare = [&] {
        QFile::remove(copy);
        QFile::copy(empty, copy);
        bare_from_server(tables, connection, copy);
    };
    Comparison times; // Another connection must be gone before the church counts as empty of people.
    for (int round = 0; round < rounds; ++round) {
        times.ours.add(milliseconds_of(ours));
        times.bare.add(milliseconds_of(bare));
        while (place.office.session
                   ->select(u"SELECT 1 FROM pg_stat_activity WHERE datname=current_database() AND "
                            "pid<>pg_backend_pid() AND backend_type='client backend'"_s)
                   .first()) {
        }
    }
    print("back into a new file", people, times, 4);
}

} // namespace

int main(int count, char** words)
{
    const QCoreApplication application(count, words);
    const auto server = qEnvironmentVariable("KINDREL_TEST_SERVER");
    if (server.isEmpty()) {
        std::printf("No server: run through tests/support/with-postgres.\n");
        return 1;
    }
    std::printf("| what                               | people | ours ms   | bare ms   | ratio | goal |\n");
    for (const int people : sizes) {
        QTemporaryDir folder;
        const QString drive = folder.path() + u'/';
        core::install(QCoreApplication::applicationDirPath() + u'/', drive);
        const QString file = drive + u"Kindrel_10_Data/church1/KR10_records.kdl"_s;
        QFile::remove(file);
        lay_church(file, people);
        const auto maker = core::open_postgres(server);
        maker->execute(u"CREATE DATABASE [%1]"_s.arg(database));
        const QString connection = u"%1 dbname=%2"_s.arg(server, database);
        bench_to_server(drive, file, connection, people);
        bench_from_server(drive, file, connection, people);
        maker->execute(u"DROP DATABASE [%1] WITH (FORCE)"_s.arg(database));
    }
    return 0;
}
