#include "core/compaction.h"

#include "core/marker.h"
#include "core/side_files.h"
#include "core/verified_copy.h"

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr qint64 free_bytes_needed = 4000000;
constexpr int log_rows_kept = 1000;

/// The logs that grow with every entry, and the field that tells the time.
struct Log
{
    const char16_t* table;
    const char16_t* time;
};
constexpr std::array logs{Log{u"tbl_security_archive", u"entered"}, Log{u"tbl_wardline_security_archive", u"entered"}};

/// Asked before the marker keeps others out.
bool enough_space(const Office& office)
{
    if (office.session->engine() != EngineKind::sqlite ||
        office.workstation.free_bytes(office.paths.folder(Folder::church)) >= free_bytes_needed)
        return true;
    office.dialogue.show(information(
        u"Your hard disk space is getting low. You need to have at least 40 Meg free before the compacting function "
        "will work, please exit %1 and make free some disk space."_s.arg(product)));
    return false;
}

/// SQLite rebuilds the file in one transaction: other workstations see the old content or the new one, and lose nothing
/// that they wrote meanwhile.
void rebuild(Session& session, const Paths& paths)
{
    const QString folder = as_folder(paths.file(Folder::church, u"compact"_s));
    make_folder(folder);
    verified_copy(session, folder + existing_name(folder, u"KR10_records.kdl"_s));
    session.execute(u"VACUUM;"_s);
}

void prune(Session& session, const Log& log)
{
    session.execute(u"DELETE FROM [%1] WHERE [%2] < (SELECT [%2] FROM [%1] ORDER BY [%2] DESC LIMIT 1 OFFSET %3);"_s
                        .arg(log.table, log.time)
                        .arg(log_rows_kept - 1));
}

} // namespace

bool compact_church(Office& office)
{
    if (!enough_space(office))
        return false;
    const auto busy = Marker::take(office.paths, side_files::busy);
    if (!busy)
        return false;
    compact_held_church(office);
    return true;
}

void compact_held_church(Office& office)
{
    Session& session = *office.session;
    if (session.engine() == EngineKind::sqlite) // A server tidies up by itself.
        rebuild(session, office.paths);
    Transaction transaction(session);
    write_setting(session, u"compact_count"_s, 0);
    for (const auto& log : logs)
        prune(session, log);
    transaction.commit();
    office.settings.compact_count = 0;
}

} // namespace kindrel::core
