#pragma once

#include "core/office.h"
#include "people/records.h"

#include <QDateTime>

namespace kindrel::people {

/// Unsaved work on a family, kept on this workstation until it is saved or dropped.
struct Draft
{
    FamilyFile stored; ///< As it was when the editor opened it; key 0 for a new file.
    FamilyFile typed;
    QDateTime kept;
};

/// The drafts of one church on this workstation, in its local settings folder: a file for each family, for the owner
/// alone. They outlive a crash and a power cut.
class Drafts
{
public:
    explicit Drafts(const core::Office& office);

    /// Takes the place of an earlier draft of the family. Throws core::FileError.
    void keep(const Draft& draft) const;
    /// A draft that is not there is no error.
    void forget(int surname_id) const;
    /// Newest first. A file that cannot be read as a draft is passed over and stays.
    [[nodiscard]] std::vector<Draft> all() const;

private:
    QString m_folder;
};

} // namespace kindrel::people
