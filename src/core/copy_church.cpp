#include "core/copy_church.h"

#include "core/backup.h"
#include "core/backup_manifest.h"
#include "core/backup_meter.h"
#include "core/copy_church_tables.h"
#include "core/entry.h"
#include "core/locks.h"
#include "core/marker.h"
#include "core/open_church.h"
#include "core/postgres_session.h"
#include "core/schema.h"
#include "core/sqlite_session.h"
#include "core/verified_copy.h"

#include <QFile>
#include <QFileInfo>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

const QString failed = u"Copying the church failed because:-"_s;
const QString cancel_question = u"Do you wish to stop copying?"_s;
const QString somebody_inside = u"Unable to copy the church while somebody is working in it."_s;
const QString not_empty = u"There is a church already where the copy is to go. It is replaced only when it is an older "
                          "copy of the same church, and only on request."_s;
const QString another_church = u"What is there already is another church, or cannot be told from one."_s;
const QString another_edition = u"What is there already was made by another edition of Kindrel. Start Kindrel with it "
                                "once, which brings it up to date, or make room."_s;
const QString replace_question = u"Do you wish to replace the older copy of '%1'?"_s;

/// How many other programs are connected to the session's server database.
int others_connected(Session& session)
{
    if (session.engine() != EngineKind::postgres)
        return 0;
    auto rows = session.select(u"SELECT COUNT(*) FROM pg_stat_activity WHERE datname=current_database() AND "
                               "pid<>pg_backend_pid() AND usesysid IS NOT NULL AND COALESCE(backend_type,'client "
                               "backend')='client backend'"_s); // Of another role's only the rest is to be seen.
    return rows.first()->integer(Column{0});
}

/// True when nobody holds a lock or a connection. What this workstation left behind when it failed does not count.
bool nobody_inside(Office& office, Session& session)
{
    auto held = Locks(session, office.workstation, office.clock).all();
    std::erase_if(held, &HeldLock::stale);
    QStringList lines;
    for (const HeldLock& lock : held)
        lines += held_line(lock, office.day_order());
    if (const int others = others_connected(session))
        lines += u"Connected to the database on the server: %1."_s.arg(others);
    if (!lines.isEmpty())
        office.dialogue.show({.text = somebody_inside, .more = lines.join(u'\n')});
    return lines.isEmpty();
}

QString code_of(Session& session)
{
    auto rows = session.select(u"SELECT [church_code] FROM [tbl_startup];"_s);
    const Row* row = rows.first();
    return row ? row->text(Column{0}) : QString();
}

/// Whether what is there already may give way. Throws DatabaseError with the reason when it may not.
bool may_replace(Office& office, Session& there, const CopyRequest& request)
{
    const QString code = code_of(*office.session);
    if (!request.replace)
        throw DatabaseError(not_empty);
    if (!church_tables(there).contains(u"tbl_startup"_s) || code.isEmpty() || code_of(there) != code)
        throw DatabaseError(another_church);
    if (read_version(there) != schema_version)
        throw DatabaseError(another_edition);
    return nobody_inside(office, there) &&
           office.dialogue.confirm({.text = replace_question.arg(office.church_name), .icon = Icon::question},
                                   Answer::no);
}

/// The church for as long as it is copied: nobody writes in it, and it is read as it was at the beginning.
class Source
{
public:
    explicit Source(const Paths& paths) : m_holder(connect_church(paths)), m_turn_to_write(*m_holder)
    {
        if (m_holder->engine() == EngineKind::sqlite)
            return; // The turn to write holds the whole file, and what has it can read.
        m_reader = connect_to_read(paths);
        m_reading.emplace(*m_reader);
    }
    [[nodiscard]] Session& session() { return m_reader ? *m_reader : *m_holder; }

private:
    std::unique_ptr<Session> m_holder;
    Transaction m_turn_to_write;
    std::unique_ptr<Session> m_reader;
    std::optional<Transaction> m_reading;
};

/// One run, and the report of how far it has come.
class Copying
{
public:
    Copying(const Paths& paths, Progress& progress)
        : m_source(paths), m_run(progress, u"Copying"_s, ByteMeter::meter_steps, cancel_question),
          m_meter(progress, works_per_row * count_rows(m_source.session()))
    {
    }
    /// The target is inside a transaction.
    CopyReport fill(Session& target) { return report_on(copy_tables(m_source.session(), target, m_done)); }
    CopyReport fill(const QString& new_file)
    {
        return report_on(copy_to_new_file(m_source.session(), new_file, m_done));
    }

private:
    static constexpr int works_per_row = 2; ///< Each is written and compared.

    static CopyReport report_on(const ChurchSums& sums)
    {
        CopyReport report{.tables = sums.size()};
        for (const TableSum& sum : sums)
            report.rows += sum.rows;
        return report;
    }

    Source m_source;
    ProgressRun m_run;
    ByteMeter m_meter;
    RowsDone m_done = [this](int rows) {
        m_meter.add(rows);
    };
};

std::optional<CopyReport> copy_to_server(Office& office, const CopyRequest& request, Progress& progress)
{
    const auto target = open_postgres(request.to.connection);
    const bool fresh = church_tables(*target).isEmpty();
    if (!fresh && !may_replace(office, *target, request))
        return std::nullopt;
    Copying copying(office.paths, progress);
    Transaction writing(*target);
    if (fresh)
        create_schema(*target);
    const CopyReport report = copying.fill(*target);
    writing.commit();
    return report;
}

/// What a run that was cut off left of the file is removed with what the engine kept beside it.
void remove_unfinished(const QString& file)
{
    remove_file(file);
    remove_file(file + u"-journal"_s);
}

std::optional<CopyReport> copy_to_new_or_old_file(Office& office, const CopyRequest& request, Progress& progress)
{
    const QString& file = request.to.file;
    std::unique_ptr<Session> there;
    if (QFileInfo::exists(file)) {
        if (QFileInfo(file) == QFileInfo(office.paths.database()) && office.session->engine() == EngineKind::sqlite)
            throw DatabaseError(u"This is the church's own file."_s);
        there = open_sqlite(file);
        if (!may_replace(office, *there, request))
            return std::nullopt;
    }
    const QString unfinished = file + u".unfinished"_s;
    remove_unfinished(unfinished);
    try {
        const CopyReport report = Copying(office.paths, progress).fill(unfinished);
        check_church_file(unfinished);
        if (there) {
            there->replace_content(unfinished);
            remove_file(unfinished);
        } else {
            move_file(unfinished, file);
        }
        return report;
    } catch (...) {
        QFile::remove(unfinished);
        throw;
    }
}

/// Another church's folder may be in the middle of a whole-database operation.
bool target_is_busy(const Office& office, const CopyEnd& to)
{
    const QString folder = as_folder(QFileInfo(to.file).absolutePath());
    return !to.file.isEmpty() && folder != office.paths.folder(Folder::church) &&
           QFileInfo::exists(folder + existing_name(folder, QLatin1String(side_files::busy.name)));
}

} // namespace

CopyEnd copy_end(const QString& words)
{
    const bool server =
        words.contains(u'=') || words.startsWith(u"postgresql://"_s) || words.startsWith(u"postgres://"_s);
    if (words.endsWith(u".server"_s, Qt::CaseInsensitive) && (!server || QFileInfo::exists(words))) {
        const auto content = read_file(words);
        if (!content)
            throw FileError(u"'%1' is not there."_s.arg(words));
        return {.connection = QString::fromUtf8(*content).trimmed()};
    }
    return server && !words.endsWith(u".kdl"_s) ? CopyEnd{.connection = words}
                                                : CopyEnd{.file = QFileInfo(words).absoluteFilePath()};
}

std::optional<CopyReport> copy_church(Office& office, const CopyRequest& request, Progress& progress)
{
    if (!enter(office, AreaId::backup))
        return std::nullopt;
    std::optional<CopyReport> report;
    const bool done = backup_rules::attempt(office, failed, [&] {
        const auto marker = Marker::take(office.paths, side_files::busy);
        if (!marker || target_is_busy(office, request.to))
            office.dialogue.show(backup_rules::busy(failed));
        else if (nobody_inside(office, *office.session)) {
            provide_church_code(*office.session); // By which the copy is known for this church's.
            report = request.to.file.isEmpty() ? copy_to_server(office, request, progress)
                                               : copy_to_new_or_old_file(office, request, progress);
        }
    });
    return done ? report : std::nullopt;
}

} // namespace kindrel::core
