#pragma once

#include "core/dialogue.h"
#include "desktop/mender/mender_works.h"

namespace kindrel::desktop {

/// What is asked before a piece of work that needs files. Each returns nullopt when the person turned away.

/// The files of a recovery.
[[nodiscard]] std::optional<RecoveryFiles> ask_for_recovery(core::Dialogue& dialogue, const Account& account,
                                                            const QString& data_drive);

/// The recovered church file that takes the place of the church's own.
[[nodiscard]] std::optional<QString> ask_for_placing(core::Dialogue& dialogue, const Account& account,
                                                     const MenderJob& job);

} // namespace kindrel::desktop
