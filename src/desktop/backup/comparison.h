#pragma once

#include "core/backup.h"

namespace kindrel::desktop {

/// One line of what a backup holds beside what there is.
struct ComparedLine
{
    QString what;
    QString then; ///< In the backup.
    QString now;
    QString outcome; ///< What restoring would do to it.
    bool loss = false;

    friend bool operator==(const ComparedLine&, const ComparedLine&) = default;
};

/// Kinds of which there is nothing on either side are left out. Reads the church's database and folders; throws
/// DatabaseError.
[[nodiscard]] std::vector<ComparedLine> compare(const core::Office& office, const core::BackupContents& backup);

} // namespace kindrel::desktop
