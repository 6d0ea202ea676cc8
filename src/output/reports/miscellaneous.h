#pragma once

#include "output/catalogue.h"

namespace kindrel::output {

/// The brief report, the residential and postal report and the report of all information.
[[nodiscard]] std::span<const ReportDefinition> miscellaneous_reports();

} // namespace kindrel::output
