#pragma once

#include "output/catalogue.h"
#include "output/report_layout.h"

#include <type_traits>

namespace kindrel::output {

enum class BlankColumn { narrow, wide, wide_and_small };
enum class RowSpacing { small, large };
enum class PrintName { off, on };

/// A sheet on which children are signed in and out. Each name carries its barcode.
struct SignInLayout
{
    ReportLayout report;
    BlankColumn blank;
    RowSpacing spacing;
    PrintName print_name;
};
static_assert(std::is_standard_layout_v<SignInLayout>);

/// `layout` is a SignInLayout.
[[nodiscard]] bool write_sign_in_sheet(const ReportInput& input, const void* layout, core::Progress& progress,
                                       pages::Flow& flow);
[[nodiscard]] std::span<const ReportDefinition> sign_in_reports();

} // namespace kindrel::output
