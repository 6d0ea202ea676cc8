#include "core/backup_files.h"
#include "core/backup_manifest.h"
#include "core/church_recovery.h"
#include "core/locks.h"
#include "core/marker.h"
#include "core/mender_checks.h"
#include "core/mender_hold.h"
#include "core/mender_obstacle.h"
#include "core/mender_place.h"
#include "core/mender_words.h"
#include "core/open_church.h"
#include "core/side_files.h"
#include "core/sqlite_session.h"
#include "core/verified_copy.h"

#include <QFile>
#include <QFileInfo>
#include <QStorageInfo>

#include <algorithm>
#include <filesystem>

// A damaged church file that makes way, for a backup or for a recovered file.
namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace checks = mender_checks;

namespace {

const QString journal = u"-journal"_s;

bool on_server(const MenderPlace& place)
{
    return place.paths.exists(Folder::church, connection_file.toString());
}

Marker alone_in(const MenderPlace& place, const QString& without_file)
{
    if (on_server(place))
        throw FileError(without_file);
    auto busy = Marker::take(place.paths, side_files::busy);
    if (!busy)
        throw FileError(checks::locked_by_marker());
    return std::move(*busy);
}

/// Locks that cannot be read are part of the damage.
void demand_nobody_known_inside(MenderPlace& place)
{
    QString others;
    try {
        if (place.session)
            others = checks::others_inside(place);
    } catch (const DatabaseError&) {
        return;
    }
    if (!others.isEmpty())
        throw FileError(others);
}

/// Throws where the database could not be looked at: it may be sound.
bool is_damaged(MenderPlace& place)
{
    const auto found = examine_church(place, {});
    if (const QString obstacle = obstacle_among(found); !obstacle.isEmpty())
        throw FileError(obstacle);
    return file_damaged(found);
}

/// Lets go of the file, which is to be moved, unless somebody else is at it.
void leave_file(MenderPlace& place)
{
    demand_nobody_known_inside(place);
    place.session.reset();
}

/// A church as it begins. What cannot be counted may be anything.
bool holds_nobody(MenderPlace& place)
{
    try {
        return place.session && checks::number_from(*place.session, u"SELECT (SELECT COUNT(*) FROM [tbl_surname])+"
                                                                    "(SELECT COUNT(*) FROM [tbl_people]);"_s) == 0;
    } catch (const DatabaseError&) {
        return false;
    }
}

QString place_aside(const MenderPlace& place)
{
    const QString time = place.clock.now().toString(u"yyyy-MM-dd HHmmss");
    return mended_place(place, u"KR10_records set aside %1.kdl"_s.arg(time));
}

/// It must never come to stand beside another database.
void move_journal(const QString& from, const QString& to)
{
    if (QFileInfo::exists(from + journal))
        move_privately(from + journal, to + journal);
}

/// The file gets a second name where the disk knows such, so that the church is never without a database, else another.
void name_also(const QString& file, const QString& name)
{
    std::error_code unknown;
    std::filesystem::create_hard_link(QFileInfo(file).filesystemFilePath(), QFileInfo(name).filesystemFilePath(),
                                      unknown);
    if (unknown)
        move_file(file, name);
}

/// `fresh` takes the place of the database, which is set aside. All or nothing.
QString exchange(const MenderPlace& place, const QString& fresh)
{
    const QString file = place.paths.database();
    HeldFile taken(fresh);
    HeldFile damaged(file);
    const QString aside = place_aside(place);
    move_journal(file, aside);
    taken.make_movable();
    damaged.make_movable();
    try {
        name_also(file, aside);
        move_privately(fresh, file);
    } catch (const FileError&) {
        if (QFileInfo::exists(aside)) {
            move_file(aside, file);
            QFile::remove(aside); // Its second name, which the system leaves alone.
        }
        move_journal(aside, file);
        throw;
    }
    return aside;
}

/// A missing database leaves at most its journal behind.
QString fill_gap(const MenderPlace& place, const QString& fresh)
{
    const QString file = place.paths.database();
    if (QFileInfo::exists(file + journal))
        move_privately(file + journal, place_aside(place) + journal);
    HeldFile taken(fresh);
    taken.make_movable();
    move_privately(fresh, file);
    return {};
}

/// Another church would be without it.
void demand_no_own_file(const MenderPlace& place, const QString& recovered)
{
    for (int church = 1; church <= booked_out_church; ++church) {
        const QFileInfo own(church_paths(place.paths, church).database());
        if (own.exists() && own == QFileInfo(recovered))
            throw FileError(u"'%1' is the database of church %2."_s.arg(recovered).arg(church));
    }
}

/// Codes tell churches apart; one that was never backed up has none.
void demand_of_church(const QString& own, Session& recovered)
{
    const QString code = summary_of(recovered, {}).church_code;
    if (!own.isEmpty() && !code.isEmpty() && own != code)
        throw FileError(u"The recovered file is of another church."_s);
}

/// `own_code` is the one of the church; empty where the file may be of any.
void demand_fit(const MenderPlace& place, const QString& recovered, const QString& own_code)
{
    if (!QFileInfo::exists(recovered))
        throw FileError(u"'%1' is missing."_s.arg(recovered));
    demand_no_own_file(place, recovered);
    check_church_file(recovered);
    MenderPlace fresh{.paths = place.paths,
                      .church = place.church,
                      .workstation = place.workstation,
                      .clock = place.clock,
                      .session = open_sqlite(recovered)};
    auto faults = checks::examine_version(fresh);
    std::ranges::copy_if(checks::examine_schema(fresh), std::back_inserter(faults),
                         [](const Finding& finding) { return finding.cure != Cure::mend; });
    if (!faults.empty())
        throw FileError(u"'%1' does not fit this edition: %2"_s.arg(recovered, faults.front().words));
    demand_of_church(own_code, *fresh.session);
}

/// The recovered file on the disk of the church, since names are exchanged on one disk only: a copy where it lies on
/// another, gone at the end unless it got its place.
class OnDiskOfChurch
{
public:
    OnDiskOfChurch(const MenderPlace& place, const QString& recovered) : m_recovered(recovered)
    {
        const auto disk_of = [](const QString& file) {
            return QStorageInfo(QFileInfo(file).absolutePath()).device();
        };
        const QString file = place.paths.database();
        if (disk_of(recovered) != disk_of(file))
            m_copy = file + u".unfinished"_s;
    }
    OnDiskOfChurch(const OnDiskOfChurch&) = delete;
    OnDiskOfChurch& operator=(const OnDiskOfChurch&) = delete;
    ~OnDiskOfChurch()
    {
        if (!m_copy.isEmpty())
            QFile::remove(m_copy);
    }
    [[nodiscard]] QString provide() const
    {
        if (m_copy.isEmpty())
            return m_recovered;
        remove_file(m_copy);
        copy_file(m_recovered, m_copy);
        flush_to_disk(m_copy);
        check_church_file(m_copy);
        return m_copy;
    }

private:
    QString m_recovered;
    QString m_copy; ///< Empty where none is needed.
};

/// The recovered file is in its place: what fails now is told beside that.
Mending mending_of(MenderPlace& place, std::span<const Check> more)
{
    Mending mending;
    try {
        open_to_mend(place);
        return mend_church(place, more);
    } catch (const DatabaseError& error) {
        mending.refusal = error.text();
    } catch (const FileError& error) {
        mending.refusal = error.text();
    }
    return mending;
}

} // namespace

QString checks::others_inside(MenderPlace& place)
{
    QStringList lines;
    for (const auto& lock : Locks(*place.session, place.workstation, place.clock).all()) {
        if (!lock.stale)
            lines += held_line(lock, DayOrder::day_first);
    }
    return lines.isEmpty()
               ? QString()
               : u"Somebody may be working in the church:\n%1\nWhen nobody is, unlock the church first."_s.arg(
                     lines.join(u'\n'));
}

QString checks::locked_by_marker()
{
    return u"The church is locked by 'lock.dat': another user is either compacting files, backing them up or restoring "
           "them. When nobody is, unlock the church first."_s;
}

bool file_damaged(const Findings& findings)
{
    return std::ranges::find(findings, Cure::recover, &Finding::cure) != findings.end();
}

bool gives_way(MenderPlace& place, bool damaged)
{
    return !on_server(place) && (damaged || !QFileInfo::exists(place.paths.database()) || holds_nobody(place));
}

QString set_database_aside(MenderPlace& place)
{
    const auto busy =
        alone_in(place, u"This church lies on a server: there is no file of it that could be set aside."_s);
    const QString file = place.paths.database();
    if (!QFileInfo::exists(file))
        throw FileError(u"There is no church file: start Kindrel and restore a backup."_s);
    if (!is_damaged(place))
        throw FileError(u"The church file is not damaged: start Kindrel to restore a backup."_s);
    leave_file(place);
    HeldFile held(file);
    const QString aside = place_aside(place);
    move_journal(file, aside);
    held.make_movable();
    move_privately(file, aside);
    place.closed = checks::missing(place.paths);
    return aside;
}

Placement put_in_place(MenderPlace& place, const QString& recovered, std::span<const Check> more)
{
    Placement placement;
    {
        const auto busy =
            alone_in(place, u"This church lies on a server: there a recovered file cannot take its place."_s);
        const bool there = QFileInfo::exists(place.paths.database());
        const bool damaged = there && is_damaged(place);
        if (there && !gives_way(place, damaged))
            throw FileError(mender_words::no_place_for_recovered());
        leave_file(place);
        // A sound church without any family got its code after the recovered file got another one.
        demand_fit(place, recovered, damaged ? code_of_damaged(place.paths.database()) : QString());
        const OnDiskOfChurch on_disk(place, recovered);
        const QString fresh = on_disk.provide();
        placement.aside = there ? exchange(place, fresh) : fill_gap(place, fresh);
        flush_to_disk(place.paths.database());
    }
    placement.mending = mending_of(place, more);
    return placement;
}

} // namespace kindrel::core
