#include "core/open_church.h"

#include "core/copy_church_tables.h"
#include "core/marker.h"
#include "core/postgres_session.h"
#include "core/side_files.h"
#include "core/sqlite_session.h"

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr int looks_at_marker = 7;
constexpr std::chrono::seconds between_looks{1};

/// The marker of the workstation that opens. Nullopt when another one kept it for all the looks, or when the person
/// gave up.
std::optional<Marker> wait_for_turn(const Paths& paths, Clock& clock, Progress& progress)
{
    for (int look = 1; look <= looks_at_marker; ++look) {
        if (look > 1 && !clock.wait(between_looks, progress))
            return std::nullopt;
        if (auto marker = Marker::take(paths, side_files::opening))
            return marker;
    }
    return std::nullopt;
}

/// A database of a server may have been made for a church that was not copied into it yet.
void prime(Session& session)
{
    if (session.engine() == EngineKind::postgres && church_tables(session).isEmpty())
        throw DatabaseError(u"The database on the server is empty: no church was copied into it yet."_s);
    auto rows = session.select(u"SELECT COUNT(*) FROM [qry_search_window];"_s);
    (void)rows.first();
}

void refuse_entry(Dialogue& dialogue)
{
    dialogue.play({});
    dialogue.show(information(
        u"Unable to Enter %1 as a security lock is on, please use the Kindrel Mender Program to reset the security "
        "lock so that access can be granted into the program"_s.arg(product)));
}

/// The server that the church folder names; nullopt for a church file.
std::optional<QString> server_of(const Paths& paths)
{
    const auto connection = read_file(paths.file(Folder::church, connection_file.toString()));
    return connection ? std::optional(QString::fromUtf8(*connection).trimmed()) : std::nullopt;
}

bool answers(Session& session)
{
    if (session.engine() == EngineKind::sqlite)
        return true;
    try {
        (void)session.select(u"SELECT 1;"_s);
        return true;
    } catch (const DatabaseError&) {
        return false;
    }
}

void ensure_row(Session& session, const QString& table, const QString& key_field, int key)
{
    const auto missing = [&] {
        auto rows = session.select(u"SELECT * FROM [%1] WHERE [%2]=?;"_s.arg(table, key_field), key);
        return !rows.first();
    };
    if (key == 0 || !missing())
        return;
    Transaction transaction(session);
    if (missing())
        session.execute(u"INSERT INTO [%1] ([%2]) VALUES (?);"_s.arg(table, key_field), key);
    transaction.commit();
}

} // namespace

bool church_present(const Paths& paths)
{
    return paths.exists(Folder::church, u"KR10_records.kdl"_s) ||
           paths.exists(Folder::church, connection_file.toString());
}

std::unique_ptr<Session> connect_church(const Paths& paths)
{
    const auto server = server_of(paths);
    return server ? open_postgres(*server) : open_sqlite(paths.database());
}

std::unique_ptr<Session> connect_to_read(const Paths& paths)
{
    const auto server = server_of(paths);
    return server ? open_postgres_snapshot(*server) : open_sqlite(paths.database());
}

std::unique_ptr<Session> connect_in_turn(const Paths& paths, Mode mode, Clock& clock, Progress& progress)
{
    if (mode != Mode::network)
        return connect_church(paths);
    const auto turn = wait_for_turn(paths, clock, progress);
    return turn ? connect_church(paths) : nullptr;
}

std::unique_ptr<Session> open_church(const Paths& paths, Mode mode, Dialogue& dialogue, Clock& clock,
                                     Progress& progress)
{
    try {
        auto session = connect_in_turn(paths, mode, clock, progress);
        if (session)
            prime(*session);
        else
            refuse_entry(dialogue);
        return session;
    } catch (const DatabaseError& error) {
        dialogue.show(unable_to_connect(error.text()));
    } catch (const FileError& error) {
        dialogue.show(unable_to_connect(error.text()));
    }
    return nullptr;
}

Message unable_to_connect(const QString& why)
{
    return information(
        u"Unable to connect to the family database file, this could have occurred if the database file has become "
        "corrupted, (use the Kindrel Mender utility that came with Kindrel to fix this) or the database file has been "
        "deleted, or another program has locked you out of the database file, if this is so try rebooting your "
        "computer. Kindrel is now going to shut down."_s,
        why);
}

Message busy_notice()
{
    return information(
        u"Unable to Enter Kindrel"_s,
        u"Another user is either compacting files, upgrading them, backing them up, restoring files or booking out "
        "families. Please try latter. If you are permanently locked out of Kindrel then use the Kindrel Mender program "
        "to unlock Kindrel"_s);
}

bool network_guard(const Office& office)
{
    const bool folder_there = office.mode != Mode::network || church_present(office.paths);
    if (!office.shared() || (folder_there && answers(*office.session)))
        return true;
    office.dialogue.show(
        information(u"Unable to access your network files."_s,
                    u"A break in the connection between this computer and your network server has occured."_s));
    return false;
}

void ensure_companion_rows(Session& session, int person_id, int surname_id)
{
    ensure_row(session, u"tbl_personal_details"_s, u"person_id"_s, person_id);
    ensure_row(session, u"tbl_address"_s, u"surname_id"_s, surname_id);
}

} // namespace kindrel::core
