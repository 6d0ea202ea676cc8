#include "output/reports/barcode_reports.h"

#include "output/family_lines.h"
#include "output/labels/labels.h"
#include "output/reports/barcode_place.h"
#include "pages/table.h"

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

// Points. Bars are 10 mm high or more, and rows so far apart that a reader held across one does not see the next.
constexpr qreal bars_height = 30;
constexpr qreal bars_column = 108;
constexpr qreal number_column = 80;
constexpr qreal space_width = 26;
constexpr qreal below_name = 4;
constexpr QSizeF cell_padding(4, 9);
constexpr QMarginsF margins{36, 32, 36, 32};

using enum BarcodeColumn;

constexpr BarcodeListLayout roll_bar_names_only{
    {.title = "Names and Barcodes", .page = {.margins = margins}, .text_size = 11}, {bars, name}};
constexpr BarcodeListLayout roll_bar_names_only2{
    {.title = "Names and Barcodes", .page = {.margins = margins}, .text_size = 11}, {name, bars}};
constexpr BarcodeListLayout roll_bar_names_only3{
    {.title = "Names and Barcodes", .page = {.margins = margins, .columns = 2}, .text_size = 10.5}, {bars, name}};
constexpr BarcodeListLayout roll_bar_names_only4{
    {.title = "Names and Barcodes", .page = {.margins = margins, .columns = 3}}, {name_over_bars}};
constexpr BarcodeListLayout roll_bar_names_address{
    {.title = "Names, Addresses and Barcodes", .page = {.margins = margins}, .text_size = 10},
    {name_and_address, bars}};
constexpr BarcodeListLayout roll_bar_check{
    {.title = "Check List with Barcodes", .page = {.margins = margins}, .text_size = 10},
    {name, bars},
    ColumnHeadings::on,
    7};
constexpr BarcodeListLayout roll_bar_id{
    {.title = "Personal IDs and Barcodes", .page = {.margins = margins}, .text_size = 11},
    {name, number, bars},
    ColumnHeadings::on};
constexpr NameTagLayout roll_bar_name_tag{{.title = "Name Tags with Barcode", .decorated = false}, TagBars::bars};
constexpr NameTagLayout roll_bar_name_tag_with_no{
    {.title = "Name Tags with Barcode and Personal ID", .decorated = false}, TagBars::bars_and_number};
constexpr ReportLayout Roll_bar_test{
    .title = "Test Your Barcode Reader", .page = {.margins = margins}, .text_size = 10};

pages::TableColumn table_column(BarcodeColumn column, ColumnHeadings headings)
{
    const auto heading = [&](const QString& text) {
        return headings == ColumnHeadings::on ? text : QString();
    };
    switch (column) {
    case bars:
        return {.width = bars_column, .heading = heading(u"Barcode"_s)};
    case number:
        return {.width = number_column, .heading = heading(u"Personal ID"_s)};
    default:
        return {.heading = heading(u"Name"_s)};
    }
}

std::vector<pages::TableColumn> columns_of(const BarcodeListLayout& list)
{
    std::vector<pages::TableColumn> columns;
    for (const auto column : list.columns) {
        if (column != none)
            columns.push_back(table_column(column, list.headings));
    }
    columns.insert(columns.end(), std::size_t(list.tick_spaces), pages::TableColumn{.width = space_width});
    return columns;
}

pages::TableStyle style_of(const BarcodeListLayout& list)
{
    pages::TableStyle style;
    style.padding = cell_padding.width();
    style.vertical_padding = cell_padding.height();
    style.vertical_align = pages::VerticalAlign::middle;
    style.lines = list.tick_spaces > 0 ? pages::TableLines::grid : pages::TableLines::rows;
    return style;
}

void write_cell(pages::Writer& cell, BarcodeColumn column, const ListedMember& listed)
{
    if (column == bars)
        return write_barcode(cell, listed.person.person_id, bars_height);
    const auto& body = cell.type().body;
    cell.line(listed.listed_name(), column == name ? body : body.bolder());
    if (column == name_and_address) {
        write_lines(cell, address_lines(listed.family, people::SuburbType::residential), body);
    } else if (column == name_over_bars) {
        cell.space(below_name);
        write_barcode(cell, listed.person.person_id, bars_height);
    }
}

pages::Cell cell_of(BarcodeColumn column, const ListedMember& listed)
{
    if (column == number)
        return {QString::number(listed.person.person_id)};
    return pages::Cell::of([column, &listed](pages::Writer& cell) { write_cell(cell, column, listed); });
}

people::Extent extent_of(const BarcodeListLayout& list)
{
    return list.columns[0] == name_and_address ? people::Extent(people::Part::address) : people::Extent();
}

/// A size in which the bars are tried.
struct TrialSize
{
    const char* name;
    qreal module, height;
};
constexpr std::array trial_sizes{TrialSize{"Large", 1.5, 48}, TrialSize{"Middle", 1, 36},
                                 TrialSize{"Small, as on lists", barcode_module, bars_height}};
constexpr std::size_t trial_people = 2;
constexpr qreal trial_bars_column = 230;
constexpr qreal hanging = 16; ///< The text of an instruction behind its number.

constexpr std::array instructions{
    u"Open a program that takes text, such as a text editor, and click into an empty line.",
    u"Scan each of the barcodes below. The reader should type what stands beside it, the dollar sign included, "
    u"and then press Enter by itself.",
    u"When the dollar sign or Enter is missing, set the reader up with its own manual: it should read Code 128, "
    u"send every character and end each code with Enter.",
    u"When only the small bars fail, hold the reader closer or further away, and print at actual size with fresh "
    u"toner.",
};

void write_instructions(pages::Flow& flow)
{
    pages::TableStyle style;
    style.lines = pages::TableLines::none;
    style.padding = 0;
    pages::Table steps(flow, {{.width = hanging}, {}}, style);
    int number = 0;
    for (const auto* text : instructions)
        steps.row({u"%1."_s.arg(++number), QStringView(text).toString()});
    flow.space(8);
}

void write_trials(pages::Table& table, const ListedMember& listed, const pages::TextStyle& typed)
{
    const auto content = barcode_content(listed.person.person_id);
    for (const auto& size : trial_sizes) {
        const auto bars_of_size = [&](pages::Writer& cell) {
            cell.barcode(content, {std::min(barcode_width(content, size.module), cell.width()), size.height});
        };
        table.row({listed.listed_name(), QString::fromUtf8(size.name), pages::Cell::of(bars_of_size),
                   pages::Cell(content, typed)});
    }
}

constexpr auto family_name = "BarCode Reports";

template <class Layout>
constexpr ReportDefinition barcode_report(const char* key, const char* leaf, const char* description,
                                          decltype(ReportDefinition::write) write, const Layout& layout)
{
    return {key, family_name, leaf, description, core::Area::report_outputs, write, &layout};
}

constexpr ReportDefinition tag_report(const char* key, const char* leaf, const char* description,
                                      const NameTagLayout& layout)
{
    auto report = barcode_report(key, leaf, description, write_name_tags, layout);
    report.page = name_tag_page;
    report.printable = name_tags_printable;
    return report;
}

constexpr std::array reports{
    barcode_report("k140", "Names Only, BarCode on left side", "One column, the barcode before the name",
                   write_barcode_list, roll_bar_names_only),
    barcode_report("k141", "Names Only, BarCode on right side", "One column, the barcode behind the name",
                   write_barcode_list, roll_bar_names_only2),
    barcode_report("k142", "Names Only, BarCode, in two columns", "Two columns of names with barcodes",
                   write_barcode_list, roll_bar_names_only3),
    barcode_report("k143", "Names Only, BarCode, in three columns", "Three columns of names with barcodes",
                   write_barcode_list, roll_bar_names_only4),
    barcode_report("k144", "Names, Address and BarCode", "Names with residential address and barcode",
                   write_barcode_list, roll_bar_names_address),
    barcode_report("k145", "Check list with names & Barcode", "Names with barcode and 7 spaces to tick",
                   write_barcode_list, roll_bar_check),
    tag_report("k146", "Name tags with BarCode", "Name tags on the sheets of the label setup", roll_bar_name_tag),
    tag_report("k147", "Name tags with BarCode and Personal ID", "Name tags with the number beneath the barcode",
               roll_bar_name_tag_with_no),
    barcode_report("k148", "Barcode Personal ID Report", "Names with Personal ID and barcode", write_barcode_list,
                   roll_bar_id),
    barcode_report("k149", "Test Your Barcode Reader Report", "Codes in three sizes and what the reader should type",
                   write_reader_test, Roll_bar_test),
};

} // namespace

bool write_barcode_list(const ReportInput& input, const void* layout, core::Progress& progress, pages::Flow& flow)
{
    const auto& list = *static_cast<const BarcodeListLayout*>(layout);
    pages::Table table(flow, columns_of(list), style_of(list));
    const auto write = [&](const ListedMember& listed) {
        std::vector<pages::Cell> cells;
        for (const auto column : list.columns) {
            if (column != none)
                cells.push_back(cell_of(column, listed));
        }
        table.row(cells);
    };
    return for_each_person(input, progress, write, extent_of(list));
}

bool write_reader_test(const ReportInput& input, const void*, core::Progress& progress, pages::Flow& flow)
{
    write_instructions(flow);
    pages::TableStyle style;
    style.vertical_padding = cell_padding.height();
    style.vertical_align = pages::VerticalAlign::middle;
    pages::Table table(flow,
                       {{.heading = u"Name"_s},
                        {.width = 90, .heading = u"Size"_s},
                        {.width = trial_bars_column, .heading = u"Barcode"_s},
                        {.width = 100, .heading = u"The reader types"_s}},
                       style);
    const std::span<const people::Member> members(input.list.members);
    const auto write = [&](const ListedMember& listed, std::size_t) {
        write_trials(table, listed, flow.type().body.bolder());
    };
    return for_each_person_of(input, members.first(std::min(members.size(), trial_people)), progress, write, {});
}

std::span<const ReportDefinition> barcode_reports()
{
    return reports;
}

} // namespace kindrel::output
