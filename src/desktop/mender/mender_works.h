#pragma once

#include "core/startup.h"
#include "desktop/mender/account.h"

#include <functional>

namespace kindrel::desktop {

/// What a piece of work needs. Each makes a workstation of its own, so that the claim by which the program is kept
/// away meanwhile ends with the work.
struct MenderJob
{
    std::function<std::unique_ptr<core::Workstation>()> workstation;
    core::Clock& clock;
    core::StartRequest request;
    QString church; ///< In words.
};

/// The work itself, without windows: finds the church anew, does what is asked and tells what came of it. Every failure
/// is told too. Meant to run beside the window.
[[nodiscard]] Account check_church(const MenderJob& job);
[[nodiscard]] Account mend_church(const MenderJob& job);
[[nodiscard]] Account unlock_church(const MenderJob& job);
/// `makes_way`: a recovered file may take the place of the church's own, as the last account told.
[[nodiscard]] Account recover_church(const MenderJob& job, const RecoveryFiles& files, bool makes_way);
[[nodiscard]] Account set_church_aside(const MenderJob& job);
[[nodiscard]] Account put_church_in_place(const MenderJob& job, const QString& recovered);

} // namespace kindrel::desktop
