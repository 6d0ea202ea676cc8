#pragma once

#include "pages/writer.h"

#include <functional>
#include <initializer_list>
#include <memory>
#include <optional>
#include <vector>

namespace kindrel::pages {

struct TableColumn
{
    qreal width = 0; ///< Points; 0 takes a share of what the fixed columns leave.
    qreal share = 1;
    QString heading = {};
    Align align = Align::left;
    LongText long_text = LongText::wrap;
};

enum class TableLines : quint8 { none, rows, grid };
/// Exact rows keep their height (labels, tags) and shrink what does not fit.
enum class RowHeight : quint8 { at_least, exact };

struct TableStyle
{
    TableLines lines = TableLines::rows;
    QRgb line_colour = ink::hairline;
    qreal line_thickness = 0.5;
    qreal padding = 3;          ///< Left and right in a cell.
    qreal vertical_padding = 2; ///< Above and below.
    qreal row_height = 0;
    RowHeight height_rule = RowHeight::at_least;
    VerticalAlign vertical_align = VerticalAlign::top;
    QRgb heading_shade = ink::none;
    QRgb stripe = ink::none;                     ///< Behind every second row.
    std::optional<TextStyle> heading_style = {}; ///< The caption look when unset.
    std::optional<TextStyle> body_style = {};
};

/// A cell's text, or whatever `content` writes into the cell.
struct Cell
{
    QString text;
    std::optional<TextStyle> style = {};
    std::optional<Align> align = {};
    std::optional<VerticalAlign> vertical_align = {};
    QRgb shade = ink::none;
    int columns = 1; ///< How many it spans.
    std::function<void(Writer&)> content = {};

    Cell() = default;
    Cell(const QString& words) : text(words) {}
    Cell(const QString& words, const TextStyle& look) : text(words), style(look) {}
    [[nodiscard]] static Cell of(std::function<void(Writer&)> content);
    [[nodiscard]] static Cell tick_box(qreal size = 8);
};

/// Writes rows into a writer. Its headings stand above the first row and again at the top of each column that rows
/// run on into. A row too high for a column is divided between its lines.
class Table
{
public:
    Table(Writer& writer, std::vector<TableColumn> columns, TableStyle style = {});
    ~Table();
    Table(const Table&) = delete;
    Table& operator=(const Table&) = delete;

    void row(std::span<const Cell> cells);
    void row(std::initializer_list<Cell> cells) { row(std::span(cells.begin(), cells.size())); }
    void row(const QStringList& texts);

private:
    struct Place;
    enum class Part : quint8 { whole, first, middle, last };

    void write_heading();
    void write_cells(std::span<const Cell> cells, const TextStyle& look);
    [[nodiscard]] std::vector<Place> places(std::span<const Cell> cells, const TextStyle& look);
    void fill(Place& place, const Cell& cell, const TableColumn& column, const TextStyle& look);
    void fit(Place& place) const;
    [[nodiscard]] Block bounds(std::span<const Place> places, qreal height, Part part) const;
    [[nodiscard]] Block whole(std::span<const Place> places) const;
    void write_divided(std::span<const Place> places);

    Writer& m_writer;
    std::vector<TableColumn> m_columns;
    TableStyle m_style;
    std::vector<qreal> m_edges; ///< Left edge of each column, then the right edge of the last.
    std::shared_ptr<const Blocks> m_outer_heading;
    int m_rows = 0;
};

} // namespace kindrel::pages
