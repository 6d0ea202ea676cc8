#pragma once

#include "output/catalogue.h"
#include "output/report_layout.h"

#include <array>
#include <type_traits>

namespace kindrel::output {

/// Names, address and contacts beside each other, or beneath each other where the columns are narrow.
enum class EntryShape { side_by_side, stacked };
/// A band with the letter before the first surname of each letter.
enum class LetterBands { off, on };

/// One of the church directories.
struct DirectoryLayout
{
    ReportLayout report;
    EntryShape shape;
    LetterBands bands;
};
static_assert(std::is_standard_layout_v<DirectoryLayout>);

inline constexpr std::array directory_layouts{
    DirectoryLayout{{.title = "Church Directory"}, EntryShape::side_by_side, LetterBands::off},
};

/// `layout` is a DirectoryLayout.
[[nodiscard]] bool write_directory(const ReportInput& input, const void* layout, core::Progress& progress,
                                   pages::Flow& flow);
[[nodiscard]] std::span<const ReportDefinition> directory_reports();

} // namespace kindrel::output
