#pragma once

#include <QString>

namespace kindrel::apps {

/// How a stored name reads on the terminal; empty for a name without a label.
[[nodiscard]] QString label_of(const char* stored_name);

} // namespace kindrel::apps
