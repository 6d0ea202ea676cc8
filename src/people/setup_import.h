#pragma once

#include "core/dialogue.h"
#include "people/setup_lists.h"

#include <optional>

namespace kindrel::people {

/// The items of a text file, one a line; for suburbs the suburb and its postcode with a comma, a semicolon or a tab
/// between them. The text is UTF-8 or Windows-1252, blank lines do not count. Nullopt after saying which line is bad,
/// and why.
[[nodiscard]] std::optional<std::vector<SetupItem>> read_setup_file(core::Dialogue& dialogue, SetupKind kind,
                                                                    const QString& file);

} // namespace kindrel::people
