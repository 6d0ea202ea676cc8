#pragma once

#include "core/backup.h"

namespace kindrel::desktop {

/// "12.3 MB".
[[nodiscard]] QString size_words(qint64 bytes);
/// Day and time as the church writes them.
[[nodiscard]] QString moment_words(const QDateTime& moment, core::DayOrder order);
/// "1 family", "120 families".
[[nodiscard]] QString counted(qint64 count, const QString& one, const QString& several);
/// What became of a backup since it was made, and what it was made for.
[[nodiscard]] QString state_words(const core::KnownBackup& backup);
/// The newest that is sure to open and holds what somebody wanted to keep; null when there is none.
[[nodiscard]] const core::KnownBackup* last_verified(const std::vector<core::KnownBackup>& backups);
/// That a backup was made, with what is in it beneath.
[[nodiscard]] core::Message made_message(const core::BackupReport& report);

} // namespace kindrel::desktop
