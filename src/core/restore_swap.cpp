#include "core/restore_swap.h"

#include "core/backup_files.h"
#include "core/backup_manifest.h"
#include "core/files.h"

#include <QDir>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QUuid>

#include <ranges>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

const QString mark_name = u"last_restore"_s;

/// A swap with the whole paths of all that it moves.
struct Move
{
    QString place; ///< Where the church has it.
    QString fresh;
    QString kept; ///< What stood at the place before.
};

QString work_folder(const Paths& paths)
{
    return as_folder(paths.file(Folder::church, u"restore_work"_s));
}

QString journal_file(const Paths& paths)
{
    return work_folder(paths) + u"journal.json"_s;
}

/// The folder's path without its separator, which rename() wants.
QString without_end(const QString& folder)
{
    return QDir::cleanPath(folder);
}

bool there(const QString& path)
{
    const QFileInfo file(path);
    return file.exists() || file.isSymLink();
}

void move_there(const QString& from, const QString& to)
{
    make_private_folder(QFileInfo(to).path());
    move_file(from, to);
}

void apply(const Move& move)
{
    if (there(move.place))
        move_there(move.place, move.kept);
    move_there(move.fresh, move.place);
}

/// Each state that a kill can leave leads back to the first; being killed on the way does no harm.
void take_back(const Move& move)
{
    if (!there(move.fresh) && there(move.place))
        move_there(move.place, move.fresh);
    if (there(move.kept))
        move_there(move.kept, move.place);
}

struct Journal
{
    QString id;
    std::vector<Move> moves;
};

/// The record tells nothing that can be relied on.
struct DamagedJournal : FileError
{
    DamagedJournal() : FileError(u"The record of the restore is damaged."_s) {}
};

/// Names in the journal hold for every workstation, however it has mounted the data folder.
Move move_of(const Paths& paths, const QJsonObject& object, int number)
{
    const int place = object[u"folder"_s].toInt(-1);
    if (place < 0 || place >= folder_count)
        throw DamagedJournal();
    const auto folder = static_cast<Folder>(place);
    const QString work = work_folder(paths);
    return {without_end(paths.folder(folder) + object[u"name"_s].toString()),
            without_end(work + object[u"fresh"_s].toString()), work + u"kept/%1"_s.arg(number)};
}

std::optional<Journal> read_journal(const Paths& paths)
{
    const auto json = read_file(journal_file(paths));
    if (!json)
        return std::nullopt;
    const QJsonObject object = QJsonDocument::fromJson(*json).object();
    Journal journal{object[u"id"_s].toString(), {}};
    if (journal.id.isEmpty()) // What it kept of the church must not be removed for that.
        throw DamagedJournal();
    for (const auto& swap : object[u"swaps"_s].toArray())
        journal.moves.push_back(move_of(paths, swap.toObject(), static_cast<int>(journal.moves.size())));
    return journal;
}

void write_journal(const Paths& paths, const QString& id, const std::vector<Swap>& swaps)
{
    QJsonArray array;
    for (const Swap& swap : swaps)
        array.append(QJsonObject{
            {u"fresh"_s, swap.fresh}, {u"folder"_s, static_cast<int>(swap.folder)}, {u"name"_s, swap.name}});
    write_file(journal_file(paths), QJsonDocument(QJsonObject{{u"id"_s, id}, {u"swaps"_s, array}}).toJson());
    keep_private(journal_file(paths));
}

/// A database that lacks the table is not the one that was restored, for that was found sound.
bool bears_mark(Session& session, const QString& id)
{
    std::optional<Transaction> turn; // Where the answer to a commit was lost, the server may still be at it.
    if (session.engine() == EngineKind::postgres)
        turn.emplace(session);
    if (!tables_of(session).contains(u"tbl_setting"_s, Qt::CaseInsensitive))
        return false;
    auto rows = session.select(u"SELECT [value] FROM [tbl_setting] WHERE [setting]=?;"_s, mark_name);
    const Row* row = rows.first();
    return row && row->text(Column{0}) == id;
}

/// Held for as long as a program restores.
QString lock_file(const Paths& paths)
{
    return paths.file(Folder::church, u"restore.lock"_s);
}

/// Throws FileError when another program holds it. Of this workstation's programs, those that run no more do not.
void hold(QLockFile& running)
{
    running.setStaleLockTime(0);
    if (running.tryLock(0))
        return;
    qint64 process = 0;
    QString workstation, program;
    if (running.error() != QLockFile::LockFailedError || !running.getLockInfo(&process, &workstation, &program))
        throw FileError(u"Unable to write '%1'."_s.arg(running.fileName()));
    throw FileError(u"A backup is being restored at the workstation '%1'. Wait until that ends. When that computer "
                    "failed and does not come back, remove the file '%2'."_s.arg(workstation, running.fileName()));
}

/// Nothing of the restore is needed any more, or can be. True when it is in place.
bool finish(const Paths& paths, Session& session)
{
    const auto journal = read_journal(paths);
    const bool in_place = journal && bears_mark(session, journal->id);
    if (journal && !in_place) {
        for (const Move& move : journal->moves | std::views::reverse)
            take_back(move);
    }
    flush_to_disk(work_folder(paths));
    remove_file(journal_file(paths));
    QDir(work_folder(paths)).removeRecursively();
    return in_place;
}

FileError moved_to(const QString& place)
{
    return FileError(
        u"The record of an interrupted restore is damaged, so that it cannot be told how far the restore came. What it "
        "had made ready and what it had replaced was moved to '%1'. The church's database is whole and stays as it is; "
        "of the pictures, notebook pages, letters and settings some may be those of the backup. Look at them, or "
        "restore a backup once more."_s.arg(QDir::toNativeSeparators(place)));
}

bool finish_or_set_aside(const Paths& paths, Session& session)
{
    try {
        return finish(paths, session);
    } catch (const DamagedJournal&) {
        const QString place = mended_place(paths, u"restore_work"_s);
        move_file(without_end(work_folder(paths)), place);
        throw moved_to(place);
    }
}

} // namespace

RestoreWork::RestoreWork(const Paths& paths)
    : m_paths(paths), m_id(QUuid::createUuid().toString(QUuid::Id128)), m_running(lock_file(paths))
{
    hold(m_running);
    if (QFileInfo::exists(journal_file(paths)))
        throw FileError(u"Another restore was cut off meanwhile. Restore the backup once more."_s);
    QDir(work_folder(paths)).removeRecursively();
    make_private_folder(unpacked());
}

RestoreWork::~RestoreWork()
{
    if (!QFileInfo::exists(journal_file(m_paths)))
        QDir(work_folder(m_paths)).removeRecursively();
}

QString RestoreWork::unpacked() const
{
    return work_folder(m_paths) + u"unpacked/"_s;
}

void RestoreWork::mark(Session& fresh) const
{
    Transaction transaction(fresh);
    fresh.execute(u"DELETE FROM [tbl_setting] WHERE [setting]=?;"_s, mark_name);
    fresh.execute(u"INSERT INTO [tbl_setting] ([setting],[value]) VALUES (?,?);"_s, mark_name, m_id);
    transaction.commit();
}

void RestoreWork::swap(const std::vector<Swap>& swaps)
{
    flush_to_disk(work_folder(m_paths));
    write_journal(m_paths, m_id, swaps);
    const auto journal = read_journal(m_paths);
    flush_to_disk(work_folder(m_paths));
    for (const Move& move : journal->moves)
        apply(move);
    flush_to_disk(work_folder(m_paths));
}

void RestoreWork::demand_undisturbed() const
{
    const auto journal = read_journal(m_paths);
    if (!journal || journal->id != m_id)
        throw FileError(u"Somebody else ended this restore meanwhile. Restore the backup once more."_s);
}

bool RestoreWork::settle(Session& session)
{
    return finish_or_set_aside(m_paths, session);
}

bool restore_unsettled(const Paths& paths)
{
    return QFileInfo::exists(work_folder(paths));
}

void demand_no_restore(const Paths& paths)
{
    QLockFile running(lock_file(paths));
    hold(running);
}

bool settle_interrupted_restore(const Paths& paths, Session& session)
{
    if (!restore_unsettled(paths))
        return false;
    QLockFile running(lock_file(paths));
    hold(running);
    finish_or_set_aside(paths, session);
    return true;
}

} // namespace kindrel::core
