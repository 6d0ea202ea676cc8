#pragma once

#include "output/catalogue.h"

namespace kindrel::output {

/// The names of the list's people and nothing else.
[[nodiscard]] std::span<const ReportDefinition> names_reports();

} // namespace kindrel::output
