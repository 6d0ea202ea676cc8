#pragma once

#include "output/catalogue.h"

namespace kindrel::output {

/// Who entered and left which groups when, by people or by groups.
[[nodiscard]] std::span<const ReportDefinition> group_history_reports();

} // namespace kindrel::output
