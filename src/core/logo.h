#pragma once

#include "core/paths.h"

namespace kindrel::core {

/// The whole path of a logo, which lies with the church's pictures or in the program folder; empty when it is in
/// neither.
[[nodiscard]] QString logo_path(const Paths& paths, const QString& name);
/// The same of a workstation's own logo; one without a name of its own has the logo of the program folder.
[[nodiscard]] QString workstation_logo_path(const Paths& paths, const QString& name);

} // namespace kindrel::core
