#include "output/reports/miscellaneous.h"

#include "output/family_lines.h"
#include "output/report_layout.h"
#include "output/reports/all_information.h"
#include "pages/table.h"
#include "people/field_labels.h"

#include <array>

namespace kindrel::output {

using namespace Qt::StringLiterals;
using people::label_of;

namespace {

constexpr qreal phone_width = 110;
constexpr qreal row_padding = 3;

constexpr ReportLayout brief_layout{.title = "Brief Report", .page = {.orientation = pages::Orientation::landscape}};
constexpr ReportLayout addresses_layout{.title = "Residential/Postal Report", .text_size = 8.25};
constexpr ReportLayout all_information_layout{.title = "All Information Report", .text_size = 9};

pages::TableStyle table_style()
{
    pages::TableStyle style;
    style.vertical_padding = row_padding;
    style.heading_shade = pages::ink::shade;
    return style;
}

QString all_names(const ListedFamily& listed)
{
    const auto& [primary, spouse, children, adults] = listed.household;
    return joined(u", ", {names_of(listed.family, adults, u" & "), names_of(listed.family, children, u", ")});
}

/// A family a line.
bool write_brief(const ReportInput& input, const void*, core::Progress& progress, pages::Flow& flow)
{
    pages::Table table(flow,
                       {{.share = 3, .heading = label_of("surname")},
                        {.share = 5, .heading = label_of("people")},
                        {.share = 7, .heading = label_of("address")},
                        {.width = phone_width, .heading = label_of("phone")}},
                       table_style());
    const auto write = [&](const ListedFamily& listed) {
        const auto& family = listed.family;
        const auto address = address_lines(family, people::SuburbType::residential).join(u", "_s);
        table.row({pages::Cell(family.family().surname, flow.type().body.bolder()), all_names(listed), address,
                   family.address().phone});
    };
    return for_each_family(input, progress, write, people::Part::address);
}

pages::Cell address_cell(const people::DisclosedFamily& family, people::SuburbType type)
{
    return {address_lines(family, type).join(u'\n')};
}

bool write_addresses(const ReportInput& input, const void*, core::Progress& progress, pages::Flow& flow)
{
    pages::Table table(flow,
                       {{.share = 11, .heading = label_of("family")},
                        {.share = 11, .heading = u"Residential address"_s},
                        {.share = 11, .heading = u"Postal address"_s},
                        {.share = 17, .heading = u"Contacts"_s}},
                       table_style());
    const auto write = [&](const ListedFamily& listed) {
        const auto names = [&](pages::Writer& cell) {
            cell.line(listed.family.family().surname, cell.type().body.bolder());
            write_line(cell, all_names(listed), cell.type().body);
        };
        const auto contacts = [&](pages::Writer& cell) {
            write_contacts(cell, family_contacts(listed.family));
        };
        table.row({pages::Cell::of(names), address_cell(listed.family, people::SuburbType::residential),
                   address_cell(listed.family, people::SuburbType::postal), pages::Cell::of(contacts)});
    };
    return for_each_family(input, progress, write, people::Part::address);
}

constexpr auto family_name = "Miscellaneous Report";

constexpr std::array reports{
    ReportDefinition{"k120", family_name, "Brief Report (Landscape)",
                     "A line for each family: its names, address and home phone", core::Area::report_outputs,
                     write_brief, &brief_layout},
    ReportDefinition{"k121", family_name, "Residential/Postal Report",
                     "The residential and postal address of each family beside each other, with its contacts",
                     core::Area::report_outputs, write_addresses, &addresses_layout},
    ReportDefinition{"k122", family_name, "All Information Report", "Everything in the family file",
                     core::Area::report_outputs, write_all_information, &all_information_layout},
};

} // namespace

std::span<const ReportDefinition> miscellaneous_reports()
{
    return reports;
}

} // namespace kindrel::output
