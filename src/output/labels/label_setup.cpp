#include "output/labels/label_setup.h"

#include "core/entry.h"
#include "core/side_file.h"
#include "core/windows1252.h"

#include <algorithm>
#include <array>
#include <span>
#include <string>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

constexpr qreal points_per_tenth = 72 / 254.0;
constexpr int smallest_label = 50; ///< Tenths of a millimetre in width and height.
constexpr int largest_page = 10000;
constexpr int most_labels_across = 50;
constexpr int smallest_text = 4;
constexpr int largest_text = 144;
constexpr int longest_font_name = 40;

struct GridField
{
    const char* name; ///< Behind the prefix of the sheet.
    int LabelGrid::*value;
};

constexpr std::array grid_fields{
    GridField{"page_width", &LabelGrid::page_width},
    GridField{"page_height", &LabelGrid::page_height},
    GridField{"columns", &LabelGrid::columns},
    GridField{"rows", &LabelGrid::rows},
    GridField{"width", &LabelGrid::width},
    GridField{"height", &LabelGrid::height},
    GridField{"column_gap", &LabelGrid::column_gap},
    GridField{"row_gap", &LabelGrid::row_gap},
    GridField{"left_margin", &LabelGrid::left_margin},
    GridField{"top_margin", &LabelGrid::top_margin},
    GridField{"start", &LabelGrid::start},
};

LabelGrid read_grid(const core::SideRecord& record, const std::string& prefix)
{
    LabelGrid grid;
    for (const auto& field : grid_fields)
        grid.*field.value = record.number(prefix + field.name);
    return grid;
}

void write_grid(core::SideRecord& record, const std::string& prefix, const LabelGrid& grid)
{
    for (const auto& field : grid_fields)
        record.set_number(prefix + field.name, grid.*field.value);
}

LabelFont read_font(const core::SideRecord& record, const std::string& prefix)
{
    return {record.text(prefix + "font"), record.number(prefix + "size"), record.flag(prefix + "bold"),
            record.flag(prefix + "italic")};
}

void write_font(core::SideRecord& record, const std::string& prefix, const LabelFont& font)
{
    record.set_text(prefix + "font", font.family);
    record.set_number(prefix + "size", font.size);
    record.set_flag(prefix + "bold", font.bold);
    record.set_flag(prefix + "italic", font.italic);
}

QString millimetres(int tenths)
{
    return u"%1 mm"_s.arg(tenths / 10.0, 0, 'f', 1);
}

/// One direction of the sheet, and its words in messages.
struct Direction
{
    const char *labels, *margin, *extent;
    int LabelGrid::*count;
    int LabelGrid::*size;
    int LabelGrid::*gap;
    int LabelGrid::*before;
    int LabelGrid::*page;
};

constexpr Direction across{"columns",
                           "left",
                           "width",
                           &LabelGrid::columns,
                           &LabelGrid::width,
                           &LabelGrid::column_gap,
                           &LabelGrid::left_margin,
                           &LabelGrid::page_width};
constexpr Direction down{"rows",
                         "top",
                         "height",
                         &LabelGrid::rows,
                         &LabelGrid::height,
                         &LabelGrid::row_gap,
                         &LabelGrid::top_margin,
                         &LabelGrid::page_height};

LabelFault fault_in(int LabelGrid::*value, const QString& text)
{
    const auto field = std::ranges::find(grid_fields, value, &GridField::value);
    return {text, QString::fromLatin1(field->name)};
}

LabelFault fault_of(const LabelGrid& grid, const Direction& direction)
{
    const auto labels = QString::fromLatin1(direction.labels), margin = QString::fromLatin1(direction.margin),
               extent = QString::fromLatin1(direction.extent);
    const int count = grid.*direction.count, size = grid.*direction.size, gap = grid.*direction.gap,
              before = grid.*direction.before, page = grid.*direction.page;
    if (page < smallest_label || page > largest_page)
        return fault_in(direction.page, u"The page's %1 must be between %2 and %3."_s.arg(
                                            extent, millimetres(smallest_label), millimetres(largest_page)));
    if (count < 1 || count > most_labels_across)
        return fault_in(direction.count,
                        u"There must be between 1 and %1 %2 on a sheet."_s.arg(most_labels_across).arg(labels));
    if (size < smallest_label)
        return fault_in(direction.size,
                        u"The label's %1 must be at least %2."_s.arg(extent, millimetres(smallest_label)));
    if (gap < 0 || before < 0)
        return fault_in(gap < 0 ? direction.gap : direction.before,
                        u"The %1 margin and the gap between the %2 cannot be less than zero."_s.arg(margin, labels));
    if (gap > page)
        return fault_in(direction.gap, u"The gap between the %1 cannot be larger than the page."_s.arg(labels));
    const auto needed = qint64(before) + qint64(count) * size + qint64(count - 1) * gap;
    if (needed > page)
        return fault_in(direction.count,
                        u"%1 %2 with the %3 margin and the gaps need %4, but the page's %5 is %6."_s.arg(count).arg(
                            labels, margin, millimetres(int(needed)), extent, millimetres(page)));
    return {};
}

LabelSetup read_setup(const core::SideRecord& record)
{
    return {{read_grid(record, "label_"), read_font(record, "label_name_"), read_font(record, "label_address_")},
            {read_grid(record, "tag_"), read_font(record, "tag_given_name_"), read_font(record, "tag_surname_"),
             read_font(record, "tag_church_"), record.flag("tag_shows_church"), record.flag("tag_shows_border")}};
}

void write_setup(core::SideRecord& record, const LabelSetup& setup)
{
    write_grid(record, "label_", setup.labels.grid);
    write_font(record, "label_name_", setup.labels.name);
    write_font(record, "label_address_", setup.labels.address);
    write_grid(record, "tag_", setup.tags.grid);
    write_font(record, "tag_given_name_", setup.tags.given_name);
    write_font(record, "tag_surname_", setup.tags.surname);
    write_font(record, "tag_church_", setup.tags.church);
    record.set_flag("tag_shows_church", setup.tags.shows_church);
    record.set_flag("tag_shows_border", setup.tags.shows_border);
}

template <class Value>
Value merged(const Value& stored, const Value& before, const Value& after)
{
    return after == before ? stored : after;
}

/// The measures stay together, because those of two sheets would fit neither.
LabelGrid merged(const LabelGrid& stored, const LabelGrid& before, const LabelGrid& after)
{
    auto grid = stored;
    grid.start = before.start == after.start ? stored.start : std::min(after.start, stored.labels());
    auto measures = after;
    measures.start = before.start;
    return measures == before ? grid : after;
}

/// `stored` with all that differs between the other two.
LabelSetup merged(const LabelSetup& stored, const LabelSetup& before, const LabelSetup& after)
{
    const auto part = [&](auto sheet, auto field) {
        return merged(stored.*sheet.*field, before.*sheet.*field, after.*sheet.*field);
    };
    constexpr auto labels = &LabelSetup::labels;
    constexpr auto tags = &LabelSetup::tags;
    return {{part(labels, &LabelSheet::grid), part(labels, &LabelSheet::name), part(labels, &LabelSheet::address)},
            {part(tags, &TagSheet::grid), part(tags, &TagSheet::given_name), part(tags, &TagSheet::surname),
             part(tags, &TagSheet::church), part(tags, &TagSheet::shows_church), part(tags, &TagSheet::shows_border)}};
}

/// A sheet or text of the setup, and what the names of its fields begin with.
struct Part
{
    const char* prefix;
    LabelFault fault;
};

LabelFault first_fault(const QString& of, std::span<const Part> parts)
{
    const auto faulty = std::ranges::find_if(parts, [](const Part& part) { return bool(part.fault); });
    if (faulty == parts.end())
        return {};
    return {of + faulty->fault.text, QString::fromLatin1(faulty->prefix) + faulty->fault.field};
}

} // namespace

QSizeF LabelGrid::sheet() const
{
    return QSizeF(page_width, page_height) * points_per_tenth;
}

QRectF LabelGrid::label(int place) const
{
    const QPointF at(left_margin + (place % columns) * (width + column_gap),
                     top_margin + (place / columns) * (height + row_gap));
    return {at * points_per_tenth, QSizeF(width, height) * points_per_tenth};
}

LabelFault fault_of(const LabelGrid& grid)
{
    for (const auto& direction : {across, down}) {
        if (auto fault = fault_of(grid, direction))
            return fault;
    }
    if (grid.start < 1 || grid.start > grid.labels())
        return fault_in(&LabelGrid::start, u"The first label must be between 1 and %1."_s.arg(grid.labels()));
    return {};
}

LabelFault fault_of(const LabelFont& font)
{
    const auto stored = core::to_windows1252(font.family);
    if (font.family.trimmed().isEmpty())
        return {u"A font must be chosen."_s, u"font"_s};
    if (!stored || stored->size() > longest_font_name)
        return {u"The font '%1' cannot be kept: its name is too long or holds unusual letters."_s.arg(font.family),
                u"font"_s};
    if (font.size < smallest_text || font.size > largest_text)
        return {u"The size of a font must be between %1 and %2 points."_s.arg(smallest_text).arg(largest_text),
                u"size"_s};
    return {};
}

LabelFault fault_of(const LabelSetup& setup)
{
    const auto& [labels, tags] = setup;
    const std::array of_labels{Part{"label_", fault_of(labels.grid)}, Part{"label_name_", fault_of(labels.name)},
                               Part{"label_address_", fault_of(labels.address)}};
    const std::array of_tags{Part{"tag_", fault_of(tags.grid)}, Part{"tag_given_name_", fault_of(tags.given_name)},
                             Part{"tag_surname_", fault_of(tags.surname)}, Part{"tag_church_", fault_of(tags.church)}};
    const auto fault = first_fault(u"Mailing labels: "_s, of_labels);
    return fault ? fault : first_fault(u"Name tags: "_s, of_tags);
}

LabelSetup load_label_setup(const core::Office& office)
{
    return read_setup(office.side.labels);
}

LabelSetup reload_label_setup(core::Office& office)
{
    if (auto record = core::read_side_file(office.paths, core::side_files::labels)) {
        record->fill_blanks();
        office.side.labels = *record;
    }
    return load_label_setup(office);
}

bool save_label_setup(core::Office& office, const LabelSetup& setup)
{
    if (!core::permitted(office, core::Area::report_outputs))
        return false;
    if (const auto fault = fault_of(setup)) {
        office.dialogue.show({fault.text});
        return false;
    }
    const auto before = load_label_setup(office);
    auto record = core::read_side_file(office.paths, core::side_files::labels).value_or(office.side.labels);
    record.fill_blanks();
    write_setup(record, merged(read_setup(record), before, setup));
    core::write_side_file(office.paths, record);
    office.side.labels = record;
    return true;
}

} // namespace kindrel::output
