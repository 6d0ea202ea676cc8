#include "pages/table.h"

#include "pages/text_layout.h"

#include <algorithm>

namespace kindrel::pages {

namespace {

/// Left edges of the columns and the right edge of the last. Fixed widths shrink where they would leave the shared
/// columns less than a tenth of the room.
std::vector<qreal> edges_of(std::span<const TableColumn> columns, qreal room)
{
    qreal fixed = 0, shares = 0;
    for (const auto& column : columns)
        (column.width > 0 ? fixed : shares) += column.width > 0 ? column.width : column.share;
    const auto most = shares > 0 ? room * 0.9 : room;
    const auto shrink = fixed > most ? most / fixed : 1;
    const auto left = room - fixed * shrink;

    std::vector<qreal> edges{0};
    for (const auto& column : columns)
        edges.push_back(edges.back() + (column.width > 0 ? column.width * shrink : left * column.share / shares));
    return edges;
}

qreal offset_of(VerticalAlign align, qreal left_over)
{
    return align == VerticalAlign::bottom ? left_over : align == VerticalAlign::middle ? left_over / 2 : 0;
}

void add_content(Block& row, const Block& content, QPointF at)
{
    for (const auto& item : content.items)
        row.items.push_back(moved(item, at));
}

} // namespace

Cell Cell::of(std::function<void(Writer&)> content)
{
    Cell cell;
    cell.content = std::move(content);
    return cell;
}

Cell Cell::tick_box(qreal size)
{
    auto cell = of([size](Writer& writer) { writer.tick_boxes({.count = 1, .size = size, .align = Align::centre}); });
    cell.vertical_align = VerticalAlign::middle;
    return cell;
}

/// A cell's room in its row and what stands in it.
struct Table::Place
{
    qreal left = 0;
    qreal width = 0;
    VerticalAlign align = VerticalAlign::top;
    QRgb shade = ink::none;
    Blocks content = {};
    qreal height = 0;
};

Table::Table(Writer& writer, std::vector<TableColumn> columns, TableStyle style)
    : m_writer(writer), m_columns(std::move(columns)), m_style(std::move(style)),
      m_edges(edges_of(m_columns, writer.width())), m_outer_heading(writer.m_heading)
{
    if (std::ranges::any_of(m_columns, [](const auto& column) { return !column.heading.isEmpty(); }))
        write_heading();
}

Table::~Table()
{
    m_writer.m_heading = m_outer_heading;
}

void Table::write_heading()
{
    const auto look = m_style.heading_style.value_or(m_writer.type().caption.bolder());
    std::vector<Cell> cells;
    for (const auto& column : m_columns) {
        Cell cell(column.heading);
        cell.vertical_align = VerticalAlign::bottom;
        cell.shade = m_style.heading_shade;
        cells.push_back(cell);
    }
    auto block = whole(places(cells, look));
    block.glue = Glue::to_next;
    m_writer.write(block);
    m_writer.repeat_from_here({block});
}

void Table::row(std::span<const Cell> cells)
{
    ++m_rows;
    const auto filled = places(cells, m_style.body_style.value_or(m_writer.type().body));
    auto block = whole(filled);
    if (block.height > m_writer.tallest() && m_style.height_rule == RowHeight::at_least)
        write_divided(filled);
    else
        m_writer.write(std::move(block));
}

void Table::row(const QStringList& texts)
{
    const std::vector<Cell> cells(texts.begin(), texts.end());
    row(cells);
}

std::vector<Table::Place> Table::places(std::span<const Cell> cells, const TextStyle& look)
{
    static const Cell blank;
    std::vector<Place> all;
    size_t column = 0;
    for (size_t i = 0; column < m_columns.size(); ++i) {
        const auto& cell = i < cells.size() ? cells[i] : blank;
        const auto next = std::min(column + size_t(std::max(1, cell.columns)), m_columns.size());
        Place place{.left = m_edges[column], .width = m_edges[next] - m_edges[column]};
        place.align = cell.vertical_align.value_or(m_style.vertical_align);
        place.shade = cell.shade != ink::none ? cell.shade : m_rows % 2 == 0 && m_rows > 0 ? m_style.stripe : ink::none;
        fill(place, cell, m_columns[column], look);
        all.push_back(std::move(place));
        column = next;
    }
    return all;
}

void Table::fill(Place& place, const Cell& cell, const TableColumn& column, const TextStyle& look)
{
    const auto room = std::max(place.width - 2 * m_style.padding, qreal(1));
    if (cell.content) {
        const auto high = m_style.height_rule == RowHeight::exact ? m_style.row_height : m_writer.tallest();
        Box box(m_writer.m_metrics, m_writer.type(), room, high - 2 * m_style.vertical_padding);
        cell.content(box);
        place.content = box.take();
    } else if (!cell.text.isEmpty()) {
        const Run run{cell.text, cell.style.value_or(look)};
        const ParagraphStyle style{.align = cell.align.value_or(column.align), .long_text = column.long_text};
        place.content = lay_out(std::span(&run, 1), style, room, m_writer.metrics());
    }
    place.height = height_of(place.content);
    if (m_style.height_rule == RowHeight::exact)
        fit(place);
}

/// Shrinks content that is too high for an exact row.
void Table::fit(Place& place) const
{
    const auto room = m_style.row_height - 2 * m_style.vertical_padding;
    if (place.height <= room)
        return;
    const auto factor = room / place.height;
    for (auto& block : place.content) {
        block.height *= factor;
        for (auto& item : block.items)
            item = scaled(std::move(item), factor);
    }
    place.height = room;
}

/// Shading and lines of a row or of a part of one.
Block Table::bounds(std::span<const Place> places, qreal height, Part part) const
{
    Block row{.height = height};
    for (const auto& place : places) {
        if (place.shade != ink::none)
            row.items.push_back(RectsItem{.rects = {{place.left, 0, place.width, height}}, .fill = place.shade});
    }
    const auto thick = m_style.line_thickness, wide = m_edges.back();
    RectsItem lines{.fill = m_style.line_colour};
    const auto across = [&](qreal y) {
        lines.rects.emplace_back(-thick / 2, y - thick / 2, wide + thick, thick);
    };
    const auto down = [&](qreal x) {
        lines.rects.emplace_back(x - thick / 2, 0, thick, height);
    };
    const bool grid = m_style.lines == TableLines::grid;
    if (grid && (part == Part::whole || part == Part::first))
        across(0);
    if (m_style.lines != TableLines::none && (part == Part::whole || part == Part::last))
        across(height);
    if (grid) {
        down(0);
        for (const auto& place : places)
            down(place.left + place.width);
    }
    if (!lines.rects.empty())
        row.items.push_back(std::move(lines));
    return row;
}

Block Table::whole(std::span<const Place> places) const
{
    qreal tallest = 0;
    for (const auto& place : places)
        tallest = std::max(tallest, place.height);
    const bool exact = m_style.height_rule == RowHeight::exact;
    const auto height =
        exact ? m_style.row_height : std::max(m_style.row_height, tallest + 2 * m_style.vertical_padding);
    auto row = bounds(places, height, Part::whole);
    for (const auto& place : places) {
        const auto room = height - 2 * m_style.vertical_padding;
        auto y = m_style.vertical_padding + offset_of(place.align, room - place.height);
        for (const auto& block : place.content) {
            add_content(row, block, {place.left + m_style.padding, y});
            y += block.height;
        }
    }
    return row;
}

/// A row that no column can hold goes out line by line, so that it breaks wherever the column ends.
void Table::write_divided(std::span<const Place> places)
{
    size_t count = 0;
    for (const auto& place : places)
        count = std::max(count, place.content.size());
    for (size_t i = 0; i < count; ++i) {
        qreal height = 0;
        for (const auto& place : places)
            height = std::max(height, i < place.content.size() ? place.content[i].height : 0);
        const auto above = i == 0 ? m_style.vertical_padding : 0;
        const auto below = i + 1 == count ? m_style.vertical_padding : 0;
        const auto part = i == 0 ? Part::first : i + 1 == count ? Part::last : Part::middle;
        auto strip = bounds(places, above + height + below, part);
        for (const auto& place : places) {
            if (i < place.content.size())
                add_content(strip, place.content[i], {place.left + m_style.padding, above});
        }
        strip.glue = i == 0 || i + 2 == count ? Glue::to_next : Glue::none;
        m_writer.write(std::move(strip));
    }
}

} // namespace kindrel::pages
