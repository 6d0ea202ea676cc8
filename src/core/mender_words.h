#pragma once

#include "core/church_recovery.h"
#include "core/mender.h"

/// What the mender says on the terminal and in its window alike.
namespace kindrel::core::mender_words {

[[nodiscard]] QString mending_question(int church);
[[nodiscard]] QString unlocking_question(int church);
[[nodiscard]] QString recovering_question(const QString& damaged, const QString& fresh);
[[nodiscard]] QString setting_aside_question(int church);
[[nodiscard]] QString placing_question(int church, const QString& recovered);

/// Why nothing is done while the program runs on the same workstation.
[[nodiscard]] QString running_here();
[[nodiscard]] QString nothing_changed();

/// "1950 rows, 3 refused, a part could not be read".
[[nodiscard]] QString came_of(const RecoveredTable& table);
[[nodiscard]] bool came_whole(const RecoveredTable& table);
[[nodiscard]] QString where_recovered(const QString& damaged, const QString& fresh);
[[nodiscard]] QString where_set_aside(const QString& aside);
/// How to go on without the damaged file.
[[nodiscard]] QString after_setting_aside();
/// How to go on with the new church file.
[[nodiscard]] QString after_recovering();
/// Why a new church file does not come in the place of the church's own.
[[nodiscard]] QString no_place_for_recovered();
/// Where both files lie after the recovered one was put in place.
[[nodiscard]] QStringList where_put(const Placement& placement, const QString& database);

} // namespace kindrel::core::mender_words
