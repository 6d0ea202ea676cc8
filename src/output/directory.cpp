#include "output/directory.h"

#include "output/family_lines.h"
#include "pages/table.h"
#include "pages/text_metrics.h"

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

// Widths and heights in points; the shares divide what the gutters leave. Phone and fax fit on one line of contacts.
constexpr qreal names_share = 15;
constexpr qreal address_share = 15;
constexpr qreal contacts_share = 28;
constexpr qreal gutter = 12;
constexpr qreal entry_padding = 5;

const pages::TextStyle& surname_style(const pages::Writer& place)
{
    return place.type().headings[1];
}

void write_names(pages::Writer& place, const ListedFamily& listed)
{
    const auto& body = place.type().body;
    place.line(listed.family.family().surname, surname_style(place));
    write_line(place, names_of(listed.family, listed.household.adults, u" & "), body.bolder());
    write_line(place, names_of(listed.family, listed.household.children, u", "), body);
}

void write_address(pages::Writer& place, const people::DisclosedFamily& family)
{
    write_lines(place, address_lines(family, people::SuburbType::residential), place.type().body);
}

pages::TableStyle entry_style()
{
    pages::TableStyle style;
    style.padding = 0;
    style.vertical_padding = entry_padding;
    return style;
}

/// Brings the first line of a cell down to the baseline of the surname beside it.
void align_with_surname(pages::Writer& place)
{
    auto& metrics = place.metrics();
    place.space(metrics.ascent(surname_style(place)) - metrics.ascent(place.type().body));
}

bool write_side_by_side(const ReportInput& input, const DirectoryLayout& layout, core::Progress& progress,
                        pages::Flow& flow)
{
    pages::Table entries(flow,
                         {{.share = names_share},
                          {.width = gutter},
                          {.share = address_share},
                          {.width = gutter},
                          {.share = contacts_share}},
                         entry_style());
    const QString gap;
    const auto write = [&](const ListedFamily& listed) {
        if (layout.bands == LetterBands::on)
            flow.separator(listed.family.family().surname);
        const auto names = [&listed](pages::Writer& cell) {
            write_names(cell, listed);
        };
        const auto address = [&listed](pages::Writer& cell) {
            align_with_surname(cell);
            write_address(cell, listed.family);
        };
        const auto contacts = [&listed](pages::Writer& cell) {
            align_with_surname(cell);
            write_contacts(cell, family_contacts(listed.family));
        };
        entries.row({pages::Cell::of(names), gap, pages::Cell::of(address), gap, pages::Cell::of(contacts)});
    };
    return for_each_family(input, progress, write, people::Part::address);
}

bool write_stacked(const ReportInput& input, const DirectoryLayout& layout, core::Progress& progress, pages::Flow& flow)
{
    const auto write = [&](const ListedFamily& listed) {
        if (layout.bands == LetterBands::on)
            flow.separator(listed.family.family().surname);
        const pages::Keep together(flow);
        write_names(flow, listed);
        write_address(flow, listed.family);
        write_contacts(flow, family_contacts(listed.family));
        flow.space(2 * entry_padding);
    };
    return for_each_family(input, progress, write, people::Part::address);
}

constexpr auto family_name = "Church Directories";

constexpr std::array reports{
    ReportDefinition{"k10", family_name, "Directory 1",
                     "One column: names, address, phone, fax, e-mail and map details", core::Area::report_outputs,
                     write_directory, &directory_layouts[0]},
};

} // namespace

bool write_directory(const ReportInput& input, const void* layout, core::Progress& progress, pages::Flow& flow)
{
    const auto& directory = *static_cast<const DirectoryLayout*>(layout);
    const auto write = directory.shape == EntryShape::stacked ? write_stacked : write_side_by_side;
    return write(input, directory, progress, flow);
}

std::span<const ReportDefinition> directory_reports()
{
    return reports;
}

} // namespace kindrel::output
