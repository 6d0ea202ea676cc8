#pragma once

#include "output/catalogue.h"
#include "output/report_layout.h"
#include "people/records.h"

#include <array>
#include <type_traits>

namespace kindrel::output {

/// A contact that a directory prints: its caption, exactly, and where the value lies.
struct Contact
{
    const char16_t* caption;
    QString people::Address::*value;
};

/// Contacts that share a line.
using ContactLine = std::span<const Contact>;

inline constexpr std::array phone_and_fax{Contact{u"Family Ph: ", &people::Address::phone},
                                          Contact{u"  Family Fax: ", &people::Address::family_fax}};
inline constexpr std::array family_email{Contact{u"Family Email: ", &people::Address::family_email}};
inline constexpr std::array map_details{Contact{u"Map: ", &people::Address::res_map},
                                        Contact{u" Ref: ", &people::Address::res_ref}};

inline constexpr std::array<ContactLine, 3> family_contacts{phone_and_fax, family_email, map_details};

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
    std::span<const ContactLine> contacts;
};
static_assert(std::is_standard_layout_v<DirectoryLayout>);

inline constexpr std::array directory_layouts{
    DirectoryLayout{{.title = "Church Directory"}, EntryShape::side_by_side, LetterBands::off, family_contacts},
};

/// `layout` is a DirectoryLayout.
[[nodiscard]] bool write_directory(const ReportInput& input, const void* layout, core::Progress& progress,
                                   pages::Flow& flow);

} // namespace kindrel::output
