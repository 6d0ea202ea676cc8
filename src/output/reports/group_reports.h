#pragma once

#include "output/catalogue.h"

namespace kindrel::output {

/// Everybody on the list, status by status, ministry by ministry or family group by family group.
[[nodiscard]] std::span<const ReportDefinition> all_group_reports();
/// The members of each group, group by group on pages of their own.
[[nodiscard]] std::span<const ReportDefinition> individual_group_reports();

} // namespace kindrel::output
