#pragma once

#include "output/catalogue.h"

namespace kindrel::output {

/// Family by family, the people of the list with what they have of one kind of data.
[[nodiscard]] std::span<const ReportDefinition> family_data_reports();

} // namespace kindrel::output
