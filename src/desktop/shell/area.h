#pragma once

#include "core/rights.h"
#include "desktop/shell/desk.h"

#include <optional>

namespace kindrel::desktop {

class Page;

/// A row of the rail.
struct AreaDefinition
{
    const char* key;
    const char* title;
    const char* icon;
    std::optional<core::Area> right; ///< Nothing: open to everybody.
    /// Null, after saying why, when the area cannot be entered.
    Page* (*make)(Desk&);
};

} // namespace kindrel::desktop
