#pragma once

#include "core/backup.h"

#include <optional>

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

/// What there is now of all that a backup can hold.
struct Present
{
    core::ChurchSummary church;
    std::vector<qint64> files; ///< Of core::backup_parts(), one after another.
};

/// Reads it anew only once something was stored, for backups are walked through with the arrow keys.
class PresentState
{
public:
    explicit PresentState(const core::Office& office) : m_office(office) {}
    /// Reads the church's database and folders; throws DatabaseError.
    [[nodiscard]] const Present& now();
    /// Files come and go, which the database does not tell.
    void forget() { m_present.reset(); }

private:
    const core::Office& m_office;
    std::optional<Present> m_present;
    qint64 m_change_mark = 0;
};

/// Kinds of which there is nothing on either side are left out.
[[nodiscard]] std::vector<ComparedLine> compare(const Present& present, const core::BackupContents& backup,
                                                core::DayOrder order);

} // namespace kindrel::desktop
