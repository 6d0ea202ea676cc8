#pragma once

#include "core/office.h"

#include <span>
#include <vector>

namespace kindrel::core {

/// What takes a finding away.
enum class Cure {
    mend,    ///< mend_church().
    unlock,  ///< unlock_church().
    recover, ///< recover_church(): the file is damaged, and what can be read of it goes into a new one.
    by_hand  ///< A person must decide.
};

/// A damage in words for the church office.
struct Finding
{
    QString kind; ///< A word that stays the same, for programs.
    QString words;
    int count = 1;
    Cure cure = Cure::mend;
    QString remedy; ///< What the cure does, or what to do by hand.
};
using Findings = std::vector<Finding>;

/// The church that is looked at, which start-up may refuse to open. Without a session its database cannot be opened.
struct MenderPlace
{
    Paths paths;
    int church = 1;
    Workstation& workstation;
    Clock& clock;
    std::unique_ptr<Session> session = {};
    Finding closed = {}; ///< Why there is none.
};

/// Opens the database of the place, or tells there why it does not open.
void open_to_mend(MenderPlace& place);

/// One kind of damage. Row checks need a session and are mended inside one transaction, in their order, whether or not
/// they found anything; file checks are mended after it.
struct Check
{
    enum class On { rows, files };
    On on;
    Findings (*examine)(MenderPlace& place);
    void (*mend)(MenderPlace& place); ///< Null: nothing to mend.
};

/// Looks for everything that may be wrong with database and folder and changes nothing. `more` are the checks of other
/// rooms, which come last.
[[nodiscard]] Findings examine_church(MenderPlace& place, std::span<const Check> more);
/// True where the findings tell that the database could not be looked at, so that nothing is known of its state.
[[nodiscard]] bool out_of_sight(const Findings& findings);
/// True where the file itself is, so that it may be set aside.
[[nodiscard]] bool file_damaged(const Findings& findings);

/// What mending came to.
struct Mending
{
    QString refusal; ///< Why nothing was done; empty when mending ran.
    QString copy;    ///< The copy of the database as it was before.
    Findings mended, left;
};

/// Takes away every finding that mending cures, after a verified copy was laid into the church's folder `mended`. The
/// rows are mended in one transaction. Refuses while somebody else may be inside. Throws DatabaseError or FileError:
/// the rows are then as they were. What fails after the rows were mended is told among what is left.
[[nodiscard]] Mending mend_church(MenderPlace& place, std::span<const Check> more);

/// Removes every lock and every marker of the church, whoever left it; what was removed, in words. Throws DatabaseError
/// or FileError, the latter also while a restore runs.
QStringList unlock_church(MenderPlace& place);

/// Moves the file of a damaged database into the folder `mended` and tells its place there: the next start begins an
/// empty church, into which a backup can be restored. Throws FileError when the database is not known to be damaged,
/// lies on a server, or somebody is at work on it.
[[nodiscard]] QString set_database_aside(MenderPlace& place);

/// Whether a recovered file may take the place of the church's own: where that is missing, `damaged` as the church's
/// findings tell, or without any family, as it is after it was set aside and the program started once. Never on a
/// server.
[[nodiscard]] bool gives_way(MenderPlace& place, bool damaged);

/// What putting a recovered file in place came to.
struct Placement
{
    QString aside;   ///< Where the former file lies now; empty when there was none.
    Mending mending; ///< Of the church as it is now.
};

/// Gives a recovered church file the place of a database that gives_way(), then mends the church. The former file
/// is set aside as set_database_aside() does it; the recovered one is moved, or copied from another disk. Killed at any
/// moment, both are there, and the church has one of them. Throws DatabaseError or FileError when the recovered file is
/// not sound or not of this church, or where the former one may not be set aside; everything is then as it was.
[[nodiscard]] Placement put_in_place(MenderPlace& place, const QString& recovered, std::span<const Check> more);

/// A place of its own in the church's folder `mended`, which is made, for a file of this name.
[[nodiscard]] QString mended_place(const MenderPlace& place, const QString& name);
/// Moves a file into the folder `mended`.
void set_aside(const MenderPlace& place, const QString& file);

/// "1 family", "12 families".
[[nodiscard]] QString counted(int count, const QString& one, const QString& many);

} // namespace kindrel::core
