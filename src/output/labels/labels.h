#pragma once

#include "output/labels/label_setup.h"
#include "output/report_choices.h"
#include "output/report_layout.h"

#include <type_traits>

namespace kindrel::output {

enum class TagBars { none, bars, bars_and_number };

struct NameTagLayout
{
    ReportLayout report;
    TagBars bars;
};
static_assert(std::is_standard_layout_v<NameTagLayout>);

/// A label for each family of which the list still names somebody; one whose address is not known or hidden gets its
/// names alone.
[[nodiscard]] bool write_mailing_labels(const ReportInput& input, const void* layout, core::Progress& progress,
                                        pages::Flow& flow);
/// A tag for each person of the list. `layout` is a NameTagLayout.
[[nodiscard]] bool write_name_tags(const ReportInput& input, const void* layout, core::Progress& progress,
                                   pages::Flow& flow);
/// The sheet of the office's label setup.
[[nodiscard]] pages::PageSetup mailing_label_page(const ReportInput& input);
[[nodiscard]] pages::PageSetup name_tag_page(const ReportInput& input);

/// Whether the stored sheets can be printed.
[[nodiscard]] bool mailing_labels_printable(const core::Office& office);
[[nodiscard]] bool name_tags_printable(const core::Office& office);

/// The reports on sheets that need not be those of the office, nor saved, for their pictures: where there is nobody to
/// print they leave no page and say nothing. They are not part of the report tree.
[[nodiscard]] ReportChoice mailing_labels_on(const LabelSheet& sheet);
[[nodiscard]] ReportChoice name_tags_on(const TagSheet& sheet, TagBars bars = TagBars::none);

/// How a report on labels draws itself for its picture, on the sheet of the office; empty for any other report.
[[nodiscard]] ReportChoice::Write label_drawing(const ReportDefinition& report);

[[nodiscard]] std::span<const ReportDefinition> label_reports();

} // namespace kindrel::output
