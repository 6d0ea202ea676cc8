#include "core/mender.h"

#include "core/backup_files.h"
#include "core/backup_manifest.h"
#include "core/locks.h"
#include "core/marker.h"
#include "core/mender_checks.h"
#include "core/mender_obstacle.h"
#include "core/open_church.h"
#include "core/restore_swap.h"
#include "core/side_files.h"
#include "core/sqlite_session.h"

#include <QFile>
#include <QFileInfo>

#include <algorithm>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

namespace checks = mender_checks;

constexpr std::array own_checks{
    Check{Check::On::rows, checks::examine_engine, checks::mend_engine},
    Check{Check::On::rows, checks::examine_doubles, checks::mend_doubles},
    Check{Check::On::rows, checks::examine_schema, checks::mend_schema},
    Check{Check::On::rows, checks::examine_orphans, checks::mend_orphans},
    Check{Check::On::rows, checks::examine_companions, checks::mend_companions},
    Check{Check::On::rows, checks::examine_version, nullptr},
    Check{Check::On::rows, checks::examine_positions, checks::mend_positions},
    Check{Check::On::rows, checks::examine_counters, checks::mend_counters},
    Check{Check::On::rows, checks::examine_locks, nullptr},
    Check{Check::On::files, checks::examine_markers, nullptr},
    Check{Check::On::files, checks::examine_leftovers, checks::mend_leftovers},
    Check{Check::On::files, checks::examine_side_files, checks::mend_side_files},
};

std::vector<Check> with_own(std::span<const Check> more)
{
    std::vector<Check> all(own_checks.begin(), own_checks.end());
    std::ranges::copy(more, std::back_inserter(all));
    return all;
}

Finding unwritable(const FileError& error)
{
    return {u"unreadable_file"_s, error.text(), 1, Cure::by_hand,
            u"See that this workstation may read and write the church's folders."_s};
}

/// A check that fails tells of a damage too.
Findings examined(MenderPlace& place, const Check& check)
{
    try {
        return check.examine(place);
    } catch (const DatabaseError& error) {
        return {checks::unreadable(error, *place.session)};
    } catch (const FileError& error) {
        return {unwritable(error)};
    }
}

/// The same words once: several checks may stumble over one damage.
void add_new(Findings& findings, Findings more)
{
    for (auto& finding : more) {
        if (std::ranges::find(findings, finding.words, &Finding::words) == findings.end())
            findings.push_back(std::move(finding));
    }
}

bool has(const Findings& findings, QStringView kind)
{
    return std::ranges::any_of(findings, [&](const Finding& finding) { return finding.kind == kind; });
}

/// Why the church must not be mended now; empty when it may.
QString refusal_for(MenderPlace& place, const Findings& findings)
{
    if (const QString obstacle = obstacle_among(findings); !obstacle.isEmpty())
        return obstacle;
    if (!place.session || has(findings, u"damaged"))
        return u"The database itself is damaged and cannot be mended in its place. "_s + checks::backup_or_recover();
    if (has(findings, u"version"))
        return u"The database is of another version of the program and is left alone."_s;
    const auto by_hand = [](const Finding& finding) {
        return finding.kind == u"doubles" && finding.cure == Cure::by_hand;
    };
    if (place.session->engine() == EngineKind::postgres && std::ranges::any_of(findings, by_hand))
        return u"Entries that must differ are there more than once, so that the church cannot be copied, and nothing is "
               "mended without a copy. Put them right by hand first."_s;
    return {};
}

/// Tells it also where the names of what is locked cannot be read.
bool nothing_locked(Session& session)
{
    try {
        return std::ranges::all_of(checks::lock_tables(), [&](const QString& table) {
            return checks::number_from(session, u"SELECT COUNT(*) FROM [%1];"_s.arg(table)) == 0;
        });
    } catch (const DatabaseError&) {
        return false;
    }
}

/// Why somebody may be inside; empty when nobody is. Locks that cannot be read may be anybody's.
QString inside(MenderPlace& place)
{
    try {
        return checks::others_inside(place);
    } catch (const DatabaseError& error) {
        if (nothing_locked(*place.session))
            return {};
        return u"It cannot be told whether somebody is working in the church, since its locks cannot be read: %1\nWhen "
               "nobody is, unlock the church first."_s.arg(error.text());
    }
}

/// The copy must be sound and hold as many rows as the church. What is about to be mended does not count.
void verify(Session& church, const QString& file)
{
    const auto copy = open_sqlite(file);
    if (const auto faults = checks::faults_of_file(*copy); !faults.isEmpty())
        throw DatabaseError(u"The copy '%1' is damaged: %2"_s.arg(file, faults.first()));
    for (const auto& table : tables_of(*copy)) {
        const QString count = u"SELECT COUNT(*) FROM [%1];"_s.arg(table);
        if (checks::number_from(church, count) != checks::number_from(*copy, count))
            throw DatabaseError(u"The copy '%1' does not hold all of '%2'."_s.arg(file, table));
    }
}

/// A server church is copied table by table into a church file, for which its tables and keys must be right. Nothing
/// is lost by this: tables and indexes that are missing are made, and of rows that are the same one stays.
void make_fit_for_copy(MenderPlace& place)
{
    if (place.session->engine() != EngineKind::postgres)
        return;
    Transaction transaction(*place.session);
    checks::mend_doubles(place);
    checks::mend_schema(place);
    transaction.commit();
}

QString copy_before_mending(MenderPlace& place)
{
    const QString time = place.clock.now().toString(u"yyyy-MM-dd HHmmss");
    const QString file = mended_place(place, u"KR10_records before mending %1.kdl"_s.arg(time));
    const QString unfinished = file + u".unfinished"_s;
    remove_file(unfinished);
    try {
        place.session->copy_to(unfinished);
        verify(*place.session, unfinished);
        move_file(unfinished, file);
    } catch (...) {
        QFile::remove(unfinished);
        throw;
    }
    return file;
}

void mend_rows(MenderPlace& place, std::span<const Check> all)
{
    Transaction transaction(*place.session);
    for (const auto& check : all) {
        if (check.on == Check::On::rows && check.mend)
            check.mend(place);
    }
    transaction.commit();
}

/// The rows are mended by now: what fails here is left, and the rest goes on.
void mend_files(MenderPlace& place, std::span<const Check> all, Findings& left)
{
    for (const auto& check : all) {
        if (check.on == Check::On::rows || !check.mend)
            continue;
        try {
            check.mend(place);
        } catch (const FileError& error) {
            left.push_back(unwritable(error));
        } catch (const DatabaseError& error) {
            left.push_back(checks::unreadable(error, *place.session));
        }
    }
}

/// What could not be settled because the record of the restore is damaged, in words: it lies in `mended` now.
QString settle_cut_off_restore(MenderPlace& place)
{
    try {
        settle_interrupted_restore(place.paths, *place.session);
        return {};
    } catch (const FileError& error) {
        if (restore_unsettled(place.paths))
            throw;
        return error.text();
    }
}

/// Mends behind the marker, which keeps everybody else out from before the look at the locks.
void mend_alone(MenderPlace& place, std::span<const Check> all, Mending& mending)
{
    const auto busy = Marker::take(place.paths, side_files::busy);
    mending.refusal = busy ? inside(place) : checks::locked_by_marker();
    if (!mending.refusal.isEmpty())
        return;
    make_fit_for_copy(place);
    mending.copy = copy_before_mending(place);
    if (const auto told = settle_cut_off_restore(place); !told.isEmpty())
        mending.left.push_back({u"leftovers"_s, told, 1, Cure::by_hand,
                                u"Look at the pictures, pages and letters, or restore a backup once more."_s});
    mend_rows(place, all);
    mend_files(place, all, mending.left);
}

/// Findings that are gone from `now`.
Findings without(const Findings& before, const Findings& now)
{
    Findings gone;
    for (const auto& finding : before) {
        if (std::ranges::find(now, finding.words, &Finding::words) == now.end())
            gone.push_back(finding);
    }
    return gone;
}

bool remove_marker(const MenderPlace& place, const SideFile& marker)
{
    const QString name = QLatin1String(marker.name);
    if (!place.paths.exists(marker.folder, name))
        return false;
    remove_file(place.paths.file(marker.folder, name));
    return true;
}

/// Locks that nobody can name any more.
QStringList empty_lock_tables(Session& session)
{
    QStringList removed;
    for (const auto& table : checks::lock_tables()) {
        if (const int count = session.execute(u"DELETE FROM [%1];"_s.arg(table)); count > 0)
            removed += u"%1 in '%2'"_s.arg(counted(count, u"lock"_s, u"locks"_s), table);
    }
    return removed;
}

QStringList remove_locks(MenderPlace& place)
{
    QStringList removed;
    Locks locks(*place.session, place.workstation, place.clock);
    for (const auto& lock : locks.all()) {
        if (locks.unlock(lock.kind, lock.key) > 0)
            removed += held_line(lock, DayOrder::day_first);
    }
    return removed;
}

} // namespace

Findings examine_church(MenderPlace& place, std::span<const Check> more)
{
    Findings findings;
    if (!place.session)
        findings.push_back(place.closed);
    for (const auto& check : with_own(more)) {
        if (check.on == Check::On::files || (place.session && !out_of_sight(findings)))
            add_new(findings, examined(place, check));
    }
    return findings;
}

Mending mend_church(MenderPlace& place, std::span<const Check> more)
{
    Mending mending;
    const auto before = examine_church(place, more);
    mending.refusal = refusal_for(place, before);
    if (!mending.refusal.isEmpty())
        return mending;
    if (std::ranges::any_of(before, [](const Finding& finding) { return finding.cure == Cure::mend; }))
        mend_alone(place, with_own(more), mending);
    if (!mending.refusal.isEmpty())
        return mending;
    add_new(mending.left, examine_church(place, more));
    mending.mended = without(before, mending.left);
    return mending;
}

QStringList unlock_church(MenderPlace& place)
{
    demand_no_restore(place.paths);
    QStringList removed;
    if (place.session) {
        if (const auto told = settle_cut_off_restore(place); !told.isEmpty())
            removed += told;
        checks::make_lock_tables(place);
        try {
            removed += remove_locks(place);
        } catch (const DatabaseError&) {
            removed += empty_lock_tables(*place.session);
        }
    }
    for (const auto* marker : {&side_files::busy, &side_files::opening}) {
        if (remove_marker(place, *marker))
            removed += u"The marker '%1'"_s.arg(QLatin1String(marker->name));
    }
    return removed;
}

QString mended_place(const MenderPlace& place, const QString& name)
{
    return mended_place(place.paths, name);
}

void set_aside(const MenderPlace& place, const QString& file)
{
    move_privately(file, mended_place(place, QFileInfo(file).fileName()));
}

QString counted(int count, const QString& one, const QString& many)
{
    return u"%1 %2"_s.arg(count).arg(count == 1 ? one : many);
}

} // namespace kindrel::core
