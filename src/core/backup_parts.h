#pragma once

#include "core/office.h"

namespace kindrel::core {

/// What the person may leave out of a backup.
struct BackupChoice
{
    bool with_pictures = true;
    bool with_documents = true;
    bool with_letters = true; ///< And custom layouts.
};

/// A folder that travels in a backup. Those that the churches of a data root share hold other churches' files too.
struct BackupPart
{
    const char16_t* name; ///< In the archive; ends in "/".
    const char16_t* words;
    Folder folder;
    bool BackupChoice::*choice; ///< Null: always there.
    bool shared;
};

[[nodiscard]] std::span<const BackupPart> backup_parts();
/// The part that an archive's file lies in; null for one that lies in none.
[[nodiscard]] const BackupPart* part_of(const QString& name);
[[nodiscard]] bool chosen(const BackupPart& part, const BackupChoice& choice);

/// A kind of record that a backup is compared by.
struct CountedKind
{
    const char16_t* words;
    const char16_t* table;
};
[[nodiscard]] std::span<const CountedKind> counted_kinds();

/// The church database in an archive, and the description of what is in it.
inline const QString database_entry = QStringLiteral("database/KR10_records.kdl");
inline const QString manifest_entry = QStringLiteral("manifest.json");

} // namespace kindrel::core
