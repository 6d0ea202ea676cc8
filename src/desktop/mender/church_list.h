#pragma once

#include "core/startup.h"

#include <vector>

namespace kindrel::desktop {

/// A church that the mender can look at.
struct ListedChurch
{
    int number;
    QString name; ///< "Church 3, Saint Anne", "Training data".
    bool present; ///< Its folder holds a database or names a server.
};

/// The churches of a data drive.
struct ChurchList
{
    QString data_drive;
    std::vector<ListedChurch> churches;
    int chosen = 0; ///< The one that start-up would take; 0 where it would ask.
};

/// Looks as start-up does. A damaged settings file is passed over, and so is a data folder that is not there.
[[nodiscard]] ChurchList list_churches(const core::StartRequest& request, const core::Workstation& workstation);

} // namespace kindrel::desktop
