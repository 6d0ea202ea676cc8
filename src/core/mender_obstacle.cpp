#include "core/mender_obstacle.h"

#include "core/sqlite_session.h"

#include <algorithm>
#include <array>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace mender_checks {

namespace {

/// Kinds of findings that tell nothing of the church itself.
constexpr std::array obstacles{u"in_use", u"forbidden", u"missing", u"server", u"failed"};

Finding of_server(const DatabaseError& error)
{
    return {
        u"server"_s, u"The server does not answer as it should: %1"_s.arg(error.text().trimmed()), 1, Cure::by_hand,
        u"See that the server runs, that this workstation reaches it and that its user may enter, then check again."_s};
}

Finding failed(const DatabaseError& error)
{
    return {u"failed"_s, u"The church's database cannot be read just now: %1"_s.arg(error.text()), 1, Cure::by_hand,
            u"See that the disk and the network are well, then check again."_s};
}

bool answers(Session& session)
{
    try {
        (void)session.select(u"SELECT 1;"_s);
        return true;
    } catch (const DatabaseError&) {
        return false;
    }
}

} // namespace

Finding in_use()
{
    return {u"in_use"_s, u"Somebody is writing in the church just now."_s, 1, Cure::by_hand,
            u"Check again in a moment."_s};
}

Finding forbidden()
{
    return {u"forbidden"_s, u"This user may not read and write the church's file."_s, 1, Cure::by_hand,
            u"Let the user read and write the church's folder with all that is in it, or work as one who may."_s};
}

Finding missing(const Paths& paths)
{
    return {u"missing"_s, u"'%1' is missing."_s.arg(paths.database()), 1, Cure::by_hand,
            u"Start Kindrel and put back a backup with 'Restore Data', or put a recovered church file in its place "
            "(kindrel-mender put-in-place)."_s};
}

Finding closed(const DatabaseError& error)
{
    const auto* of_file = dynamic_cast<const FileDatabaseError*>(&error);
    if (!of_file)
        return of_server(error);
    switch (of_file->trouble()) {
    case FileTrouble::in_use:
        return in_use();
    case FileTrouble::forbidden:
        return forbidden();
    case FileTrouble::other:
        return failed(error);
    case FileTrouble::damage:
        break;
    }
    return {u"closed"_s, u"The church's database cannot be opened: %1"_s.arg(error.text()), 1, Cure::recover,
            backup_or_recover()};
}

Finding closed(const FileError& error)
{
    return {u"forbidden"_s, error.text(), 1, Cure::by_hand, forbidden().remedy};
}

Finding unreadable(const DatabaseError& error, Session& session)
{
    const auto* of_file = dynamic_cast<const FileDatabaseError*>(&error);
    const auto trouble = of_file ? of_file->trouble() : FileTrouble::other;
    if (trouble == FileTrouble::in_use || trouble == FileTrouble::forbidden)
        return closed(error);
    if (!of_file && !answers(session))
        return of_server(error);
    const QString words = u"A part of the database cannot be read: %1"_s.arg(error.text());
    if (trouble == FileTrouble::damage)
        return {u"unreadable"_s, words, 1, Cure::recover,
                u"What mending can put right comes first; if this stays, recover the church into a new file."_s};
    return {u"unreadable"_s, words, 1, Cure::by_hand,
            u"What mending can put right comes first; if this stays, put back a backup with 'Restore Data'."_s};
}

QString backup_or_recover()
{
    return u"Set the damaged file aside (kindrel-mender set-aside), start Kindrel, which begins an empty church then, "
           "and put back a backup with 'Restore Data'. Without a backup, let what can still be read be recovered into "
           "a new church file (kindrel-mender recover)."_s;
}

} // namespace mender_checks

bool out_of_sight(const Findings& findings)
{
    return !obstacle_among(findings).isEmpty();
}

QString obstacle_among(const Findings& findings)
{
    const auto first = std::ranges::find_if(findings, [](const Finding& finding) {
        return std::ranges::any_of(mender_checks::obstacles,
                                   [&](const char16_t* kind) { return finding.kind == QStringView(kind); });
    });
    return first == findings.end() ? QString() : in_one_line(*first);
}

QString in_one_line(const Finding& finding)
{
    return u"%1 %2"_s.arg(finding.words, finding.remedy);
}

} // namespace kindrel::core
