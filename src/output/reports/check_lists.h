#pragma once

#include "output/catalogue.h"
#include "output/report_layout.h"

#include <type_traits>

namespace kindrel::output {

/// A list of names with spaces to tick or to write in. All measures are points.
struct CheckListLayout
{
    ReportLayout report;
    int tick_spaces;
    qreal space_width;
    qreal row_height;
};
static_assert(std::is_standard_layout_v<CheckListLayout>);

/// `layout` is a CheckListLayout.
[[nodiscard]] bool write_check_list(const ReportInput& input, const void* layout, core::Progress& progress,
                                    pages::Flow& flow);
[[nodiscard]] std::span<const ReportDefinition> check_list_reports();

} // namespace kindrel::output
