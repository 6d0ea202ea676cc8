#pragma once

#include "core/entry.h"
#include "desktop/shell/desk.h"

#include <optional>

namespace kindrel::desktop {

class Page;

/// What other pages that hold a lock or unsaved work do when an area is entered. Those that leave are closed; the area
/// stays closed when one does not.
enum class Parked {
    stay,
    setups_leave, ///< Those of areas that nobody may share: their locks would keep this one closed.
    leave_first
};

/// A row of the rail.
struct AreaDefinition
{
    const char* key;
    const char* title;
    const char* icon;
    std::optional<core::AreaId> area; ///< Whose rights open it; nothing: open to everybody.
    Parked parked;
    /// Null, after saying why, when the area cannot be entered.
    Page* (*make)(Desk&);
};

} // namespace kindrel::desktop
