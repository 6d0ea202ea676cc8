#pragma once

#include "output/custom/custom_pages.h"

namespace kindrel::output {

/// What all that the layout prints asks the register for, and no more.
[[nodiscard]] people::Extent extent_of(const CustomLayout& layout);
[[nodiscard]] RunFacts facts_of(const ReportInput& input, const CustomLayout& layout);
[[nodiscard]] pages::PageSetup page_of(const CustomLayout& layout, const RunOptions& options);
/// Heads and foots the pages as the layout has it. The layout and the pages must live until the flow is finished.
void set_bands(pages::Flow& flow, const CustomLayout& layout, CustomPages& pages, const RunFacts& facts,
               const ReportInput& input);

/// Writes the report of the input's list. False when cancelled.
[[nodiscard]] bool write_custom_report(const CustomLayout& layout, const ReportInput& input, core::Progress& progress,
                                       pages::PageSpool& spool);

} // namespace kindrel::output
