#pragma once

#include "output/catalogue.h"
#include "output/report_layout.h"

#include <array>
#include <type_traits>

namespace kindrel::output {

/// What stands in an entry, and whether beside each other or beneath each other, as narrow columns need it.
enum class EntryShape {
    side_by_side, ///< Names, address and contacts.
    stacked,
    phones,  ///< Names and address, beside them the phone numbers of the family and its people.
    details, ///< The family, beside it its people with all their contacts.
    details_stacked
};
/// A band with the letter before the first surname of each letter, where the list has the surnames in order.
enum class LetterBands { off, on };

/// One of the church directories.
struct DirectoryLayout
{
    ReportLayout report;
    EntryShape shape;
    LetterBands bands;
};
static_assert(std::is_standard_layout_v<DirectoryLayout>);

/// `layout` is a DirectoryLayout.
[[nodiscard]] bool write_directory(const ReportInput& input, const void* layout, core::Progress& progress,
                                   pages::Flow& flow);
[[nodiscard]] std::span<const ReportDefinition> directory_reports();

} // namespace kindrel::output
