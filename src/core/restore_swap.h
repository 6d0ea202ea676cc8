#pragma once

#include "core/paths.h"
#include "core/session.h"

#include <QLockFile>

namespace kindrel::core {

/// Takes the place of a folder of the church, or of one file in it.
struct Swap
{
    QString fresh; ///< In the folder of the restore.
    Folder folder;
    QString name; ///< Empty: the folder itself.
};

/// The folder in which a restore is made ready, `restore_work` in the church folder, and its journal. From begin() on
/// the church's folders may be a mixture, until settle_interrupted_restore() was called: it puts everything back
/// unless the database bears the mark of this restore, which it gets together with its new content.
class RestoreWork
{
public:
    /// Whatever lies there is removed, so an interrupted restore must be settled before. Throws FileError, also when
    /// another program restores.
    explicit RestoreWork(const Paths& paths);
    /// Leaves a restore that was begun and not settled to the next that settles it.
    ~RestoreWork();
    RestoreWork(const RestoreWork&) = delete;
    RestoreWork& operator=(const RestoreWork&) = delete;

    /// Where the backup is unpacked to; ends in the separator.
    [[nodiscard]] QString unpacked() const;
    /// Writes the mark of this restore into the database that is to take the church's place.
    void mark(Session& fresh) const;
    /// Puts the fresh files in their places, once they are safely on the disk, and keeps those that stood there. All of
    /// that is on the disk when this returns. Throws FileError.
    void swap(const std::vector<Swap>& swaps);
    /// Throws FileError when somebody else settled this restore meanwhile: files and database would not fit together.
    void demand_undisturbed() const;
    /// settle_interrupted_restore() for this one. True when the database bears its mark: the restore is in place.
    bool settle(Session& session);

private:
    Paths m_paths;
    QString m_id;
    QLockFile m_running;
};

/// True while a restore is under way or was cut off: there is something to settle once nobody is at it.
[[nodiscard]] bool restore_unsettled(const Paths& paths);

/// Throws FileError while a program restores.
void demand_no_restore(const Paths& paths);

/// Brings a restore that was cut off to its end: finished when the database has its new content, else taken back.
/// Nothing happens when there was none. To be called before anybody works in the church: by start-up once the
/// database is open, by whoever removes a busy marker that was left behind, and before every backup and restore.
/// True when there was one. Throws DatabaseError or FileError; it can be called again then. A restore that another
/// program is still at is left alone: FileError. One whose record is damaged is moved into the folder `mended` and told
/// by a FileError; files and database stay as they are.
bool settle_interrupted_restore(const Paths& paths, Session& session);

} // namespace kindrel::core
