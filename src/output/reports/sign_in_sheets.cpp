#include "output/reports/sign_in_sheets.h"

#include "output/list_reader.h"
#include "output/reports/barcode_place.h"
#include "pages/table.h"

#include <array>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

constexpr auto title = "Sign In/Out Report";
constexpr QMarginsF margins{28, 30, 28, 30};

// Widths and heights in points; the name takes what the columns leave.
constexpr qreal time_width = 54;
constexpr qreal signature_width = 90;
constexpr qreal long_signature_width = 140;
constexpr qreal print_name_width = 90;
constexpr qreal narrow_blank = 48;
constexpr qreal wide_blank = 100;
constexpr qreal small_blank = 34;
constexpr qreal padding = 4;
constexpr qreal below_name = 2;

struct RowMeasures
{
    qreal text_size, bars, padding;
};
constexpr RowMeasures small_rows{9, 20, 4};
constexpr RowMeasures large_rows{11, 28.5, 5};

constexpr RowMeasures measures_of(RowSpacing spacing)
{
    return spacing == RowSpacing::small ? small_rows : large_rows;
}

constexpr SignInLayout layout(BlankColumn blank, RowSpacing spacing, PrintName print_name,
                              pages::Orientation orientation)
{
    return {{.title = title,
             .page = {.orientation = orientation, .margins = margins},
             .text_size = measures_of(spacing).text_size},
            blank,
            spacing,
            print_name};
}

using enum BlankColumn;
constexpr auto close = RowSpacing::small;
constexpr auto apart = RowSpacing::large;
constexpr auto plain = PrintName::off;
constexpr auto printed = PrintName::on;
constexpr auto portrait = pages::Orientation::portrait;
constexpr auto landscape = pages::Orientation::landscape;

constexpr auto sign_in_1 = layout(narrow, close, plain, portrait);
constexpr auto sign_in_2 = layout(narrow, apart, plain, portrait);
constexpr auto sign_in_3 = layout(wide, close, plain, portrait);
constexpr auto sign_in_4 = layout(wide, apart, plain, portrait);
constexpr auto sign_in_5 = layout(wide_and_small, close, plain, portrait);
constexpr auto sign_in_6 = layout(wide_and_small, apart, plain, portrait);
constexpr auto sign_in_7 = layout(narrow, close, printed, landscape);
constexpr auto sign_in_8 = layout(narrow, apart, printed, landscape);
constexpr auto sign_in_9 = layout(wide, close, printed, landscape);
constexpr auto sign_in_10 = layout(wide, apart, printed, landscape);
constexpr auto sign_in_11 = layout(wide_and_small, close, printed, landscape);
constexpr auto sign_in_12 = layout(wide_and_small, apart, printed, landscape);
constexpr auto sign_in_13 = layout(wide, close, plain, landscape);
constexpr auto sign_in_14 = layout(wide, apart, plain, landscape);

/// Longer where a landscape sheet has the room.
qreal signature_width_of(const SignInLayout& sheet)
{
    const bool roomy = sheet.report.page.orientation == landscape && sheet.print_name == PrintName::off;
    return roomy ? long_signature_width : signature_width;
}

std::vector<pages::TableColumn> columns_of(const SignInLayout& sheet)
{
    std::vector<pages::TableColumn> columns{{.heading = u"Name"_s}};
    for (const auto& time : {u"Time In"_s, u"Time Out"_s}) {
        columns.push_back({.width = time_width, .heading = time});
        if (sheet.print_name == PrintName::on)
            columns.push_back({.width = print_name_width, .heading = u"Print Name"_s});
        columns.push_back({.width = signature_width_of(sheet), .heading = u"Signature"_s});
    }
    columns.push_back({.width = sheet.blank == narrow ? narrow_blank : wide_blank});
    if (sheet.blank == wide_and_small)
        columns.push_back({.width = small_blank});
    return columns;
}

pages::TableStyle style_of(const RowMeasures& rows, const pages::TypeScale& type)
{
    pages::TableStyle style;
    style.lines = pages::TableLines::grid;
    style.padding = padding;
    style.vertical_padding = rows.padding;
    style.heading_shade = pages::ink::shade;
    style.heading_style = type.small.bolder();
    return style;
}

constexpr auto family_name = "Duty of Care";

constexpr ReportDefinition sheet(const char* key, const char* leaf, const char* description, const SignInLayout& layout)
{
    return {key, family_name, leaf, description, core::Area::report_outputs, write_sign_in_sheet, &layout};
}

constexpr std::array reports{
    sheet("k40", "Sign In/Out Report 1", "Narrow blank column, small spacing", sign_in_1),
    sheet("k41", "Sign In/Out Report 2", "Narrow blank column, large spacing", sign_in_2),
    sheet("k42", "Sign In/Out Report 3", "Wide blank column, small spacing", sign_in_3),
    sheet("k43", "Sign In/Out Report 4", "Wide blank column, large spacing", sign_in_4),
    sheet("k44", "Sign In/Out Report 5", "Wide and small blank column, small spacing", sign_in_5),
    sheet("k45", "Sign In/Out Report 6", "Wide and small blank column, large spacing", sign_in_6),
    sheet("k46", "Sign In/Out Report 7", "Landscape: Print Name, narrow blank column, small spacing", sign_in_7),
    sheet("k47", "Sign In/Out Report 8", "Landscape: Print Name, narrow blank column, large spacing", sign_in_8),
    sheet("k48", "Sign In/Out Report 9", "Landscape: Print Name, wide blank column, small spacing", sign_in_9),
    sheet("k49", "Sign In/Out Report 10", "Landscape: Print Name, wide blank column, large spacing", sign_in_10),
    sheet("k50", "Sign In/Out Report 11", "Landscape: Print Name, wide and small blank column, small spacing",
          sign_in_11),
    sheet("k51", "Sign In/Out Report 12", "Landscape: Print Name, wide and small blank column, large spacing",
          sign_in_12),
    sheet("k52", "Sign In/Out Report 13", "Landscape: wide blank column, small spacing", sign_in_13),
    sheet("k53", "Sign In/Out Report 14", "Landscape: wide blank column, large spacing", sign_in_14),
};

} // namespace

bool write_sign_in_sheet(const ReportInput& input, const void* layout, core::Progress& progress, pages::Flow& flow)
{
    const auto& sheet = *static_cast<const SignInLayout*>(layout);
    const auto& rows = measures_of(sheet.spacing);
    pages::Table table(flow, columns_of(sheet), style_of(rows, flow.type()));
    const auto write = [&](const ListedMember& listed) {
        table.row({pages::Cell::of([&](pages::Writer& cell) {
            cell.line(listed.listed_name());
            cell.space(below_name);
            write_barcode(cell, listed.person.person_id, rows.bars);
        })});
    };
    return for_each_person(input, progress, write, {});
}

std::span<const ReportDefinition> sign_in_reports()
{
    return reports;
}

} // namespace kindrel::output
