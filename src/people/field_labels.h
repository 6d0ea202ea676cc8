#pragma once

#include <QString>

namespace kindrel::people {

/// The caption of a stored name; empty for a name without a label.
[[nodiscard]] QString label_of(const char* stored_name);

} // namespace kindrel::people
