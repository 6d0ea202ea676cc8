#pragma once

#include "output/catalogue.h"
#include "output/report_layout.h"

#include <array>
#include <type_traits>

namespace kindrel::output {

enum class BarcodeColumn { none, bars, name, number, name_and_address, name_over_bars };
enum class ColumnHeadings { off, on };

/// A list of people with their barcodes.
struct BarcodeListLayout
{
    ReportLayout report;
    std::array<BarcodeColumn, 3> columns;
    ColumnHeadings headings = ColumnHeadings::off;
    int tick_spaces = 0;
};
static_assert(std::is_standard_layout_v<BarcodeListLayout>);

/// `layout` is a BarcodeListLayout.
[[nodiscard]] bool write_barcode_list(const ReportInput& input, const void* layout, core::Progress& progress,
                                      pages::Flow& flow);
/// A page of codes in three sizes, of the first people of the list, with what a reader should type at each.
[[nodiscard]] bool write_reader_test(const ReportInput& input, const void* layout, core::Progress& progress,
                                     pages::Flow& flow);
[[nodiscard]] std::span<const ReportDefinition> barcode_reports();

} // namespace kindrel::output
