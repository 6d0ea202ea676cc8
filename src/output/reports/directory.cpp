#include "output/reports/directory.h"

#include "output/reports/directory_entries.h"
#include "people/sort_key.h"

#include <QSet>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

using pages::Orientation::landscape;
using pages::Orientation::portrait;

constexpr DirectoryLayout layout(pages::Orientation orientation, int columns, double text_size, EntryShape shape,
                                 LetterBands bands = LetterBands::off)
{
    const auto rule = columns > 1 ? pages::ColumnRule::hairline : pages::ColumnRule::none;
    return {{.title = "Church Directory",
             .page = {.orientation = orientation, .columns = columns, .column_rule = rule},
             .text_size = text_size},
            shape,
            bands};
}

constexpr std::array layouts{
    layout(portrait, 1, 9.5, EntryShape::side_by_side),
    layout(portrait, 2, 9, EntryShape::stacked),
    layout(portrait, 2, 9, EntryShape::stacked, LetterBands::on),
    layout(landscape, 3, 9, EntryShape::stacked),
    layout(landscape, 3, 9, EntryShape::stacked, LetterBands::on),
    layout(portrait, 1, 9.5, EntryShape::details),
    layout(portrait, 2, 9, EntryShape::details_stacked),
    layout(portrait, 3, 8, EntryShape::details_stacked),
    layout(landscape, 3, 9, EntryShape::details_stacked),
    layout(landscape, 4, 8, EntryShape::stacked),
    layout(landscape, 4, 8, EntryShape::stacked, LetterBands::on),
    layout(landscape, 2, 9.5, EntryShape::phones),
    layout(landscape, 2, 9.5, EntryShape::phones, LetterBands::on),
    layout(landscape, 2, 8.5, EntryShape::details),
};

constexpr ReportDefinition directory(const char* key, const char* leaf, const char* description, std::size_t row)
{
    return {key, "Church Directories", leaf, description, core::Area::report_outputs, write_directory, &layouts[row]};
}

constexpr std::array reports{
    directory("k10", "Directory 1", "One column: names, address, phone, fax, e-mail and map details", 0),
    directory("k11", "Directory 2", "Two columns: names, address, phone, fax, e-mail and map details", 1),
    directory("k12", "Directory 3", "Two columns under the letters of the alphabet: names, address and contacts", 2),
    directory("k13", "Directory 4 (Landscape)", "Three columns: names, address, phone, fax, e-mail and map details", 3),
    directory("k14", "Directory 5 (Landscape)",
              "Three columns under the letters of the alphabet: names, address and contacts", 4),
    directory("k15", "Directory 6", "One column: each family with all the contacts of its people", 5),
    directory("k16", "Directory 7", "Two columns: each family with all the contacts of its people", 6),
    directory("k17", "Directory 8", "Three columns: each family with all the contacts of its people", 7),
    directory("k18", "Directory 9 (Landscape)", "Three wide columns: each family with all the contacts of its people",
              8),
    directory("k19", "Directory 10 (Landscape)", "Four columns: names, address, phone, fax, e-mail and map details", 9),
    directory("k20", "Directory 11 (Landscape)",
              "Four columns under the letters of the alphabet: names, address and contacts", 10),
    directory("k21", "Directory 12 (Landscape)", "Two columns: names, address and all phone and mobile numbers", 11),
    directory("k22", "Directory 13 (Landscape)",
              "Two columns under the letters of the alphabet: names, address and all phone and mobile numbers", 12),
    directory("k23", "Directory 14 (Landscape)", "Two wide columns: each family with all the contacts of its people",
              13),
};

struct Entry
{
    void (*write)(pages::Flow&, const ListedFamily&);
    people::Extent extent;
};

Entry entry_of(EntryShape shape)
{
    using people::Part;
    switch (shape) {
    case EntryShape::stacked:
        return {write_stacked, Part::address};
    case EntryShape::phones:
        return {write_with_phones, Part::address | Part::details};
    case EntryShape::details:
        return {write_with_details, Part::address | Part::details};
    case EntryShape::details_stacked:
        return {write_details_stacked, Part::address | Part::details};
    case EntryShape::side_by_side:
        break;
    }
    return {write_side_by_side, Part::address};
}

/// Whether no letter comes back once the list has gone on to another: bands would then tell the reader where to look.
/// What begins with no letter may stand before them as well as behind them.
bool runs_by_letter(const ReportInput& input)
{
    auto& session = *input.office.session;
    people::lend(session, input.list);
    auto rows = session.select(u"SELECT w.[surname_id],s.[sort_key] FROM [work_people] w "
                               "INNER JOIN [tbl_surname] s ON s.[Surname_ID]=w.[surname_id] "
                               "GROUP BY w.[surname_id],s.[sort_key] ORDER BY MIN(w.[place]);"_s);
    const auto key = rows.column(u"sort_key");
    const auto no_letter = pages::filing_letter({});
    QSet<QString> seen;
    QString letter;
    for (const core::Row& row : rows) {
        const auto next = pages::filing_letter(row.text(key));
        if (next != letter && seen.contains(next))
            return false;
        letter = next;
        if (letter != no_letter)
            seen.insert(letter);
    }
    return true;
}

} // namespace

bool write_directory(const ReportInput& input, const void* layout, core::Progress& progress, pages::Flow& flow)
{
    const auto& directory = *static_cast<const DirectoryLayout*>(layout);
    const auto entry = entry_of(directory.shape);
    const bool has_bands = directory.bands == LetterBands::on && runs_by_letter(input);
    const auto write = [&](const ListedFamily& listed) {
        if (has_bands)
            flow.separator(people::sort_key(listed.family.family().surname));
        entry.write(flow, listed);
    };
    return for_each_family(input, progress, write, entry.extent);
}

std::span<const ReportDefinition> directory_reports()
{
    return reports;
}

} // namespace kindrel::output
