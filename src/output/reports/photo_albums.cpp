#include "output/reports/photo_albums.h"

#include "output/decoration.h"
#include "output/family_lines.h"
#include "output/report_layout.h"
#include "pages/table.h"
#include "pages/text_layout.h"
#include "people/person_files.h"

#include <QDir>
#include <QHash>

#include <algorithm>
#include <array>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

/// What stands with a photograph: the name beneath it, or the contacts beside it.
enum class AlbumText { name, contacts, both_addresses };

struct AlbumLayout
{
    ReportLayout report;
    int columns;
    int rows; ///< Of a page.
    AlbumText text;
};

constexpr AlbumLayout album(int columns, int rows, double text_size, AlbumText text)
{
    return {{.title = "Photo Album", .text_size = text_size}, columns, rows, text};
}

constexpr std::array layouts{
    album(3, 4, 9, AlbumText::name),       album(3, 3, 9.5, AlbumText::name),
    album(2, 4, 8, AlbumText::contacts),   album(2, 3, 8, AlbumText::contacts),
    album(1, 6, 9, AlbumText::contacts),   album(1, 5, 9.5, AlbumText::contacts),
    album(1, 4, 9.5, AlbumText::contacts), album(1, 3, 10, AlbumText::both_addresses),
};

// Points, and the shape of a portrait.
constexpr qreal row_padding = 6;
constexpr qreal text_gap = 12;
constexpr qreal inset = 2;
constexpr QSizeF portrait_shape(3, 4);
constexpr int name_lines = 2;
// Of a column's width that a photograph takes, at most.
constexpr qreal alone_share = 0.5;
constexpr qreal beside_share = 0.4;
constexpr qreal smaller = 0.95;
constexpr qreal smallest_text = 5.5;
constexpr qreal endless = 10000;

/// One person's place in the album.
struct Entry
{
    pages::Picture portrait;
    QString name;
    QStringList residential, postal;
    CaptionLines contacts;
};

/// How large everything is on the pages of one run.
struct Measures
{
    qreal row_height;
    qreal name_height; ///< Of the name beneath a photograph.
    QSizeF frame;
};

/// What header and footer leave of a page: the height to which a picture without end is cut.
qreal page_room(const ReportInput& input, const AlbumLayout& layout, const pages::Flow& flow)
{
    pages::PageSpool spool;
    pages::Flow trial(spool, flow.setup(), flow.type());
    const auto& title = input.options.title;
    decorate(trial, title.isEmpty() ? QString::fromUtf8(layout.report.title) : title, input);
    trial.picture({}, {1, endless});
    trial.finish();
    qreal room = 0;
    for (const auto& item : spool.page(1).items) {
        if (const auto* picture = std::get_if<pages::PictureItem>(&item))
            room = std::max(room, picture->where.height());
    }
    return room;
}

Measures measures(const ReportInput& input, const AlbumLayout& layout, pages::Flow& flow)
{
    const auto row_height = page_room(input, layout, flow) / layout.rows;
    const bool beneath = layout.text == AlbumText::name;
    const auto name_height =
        beneath ? name_lines * flow.metrics().line_height(flow.type().body.bolder()) + row_padding : 0;
    const auto column_width = (flow.width() - (layout.columns - 1) * text_gap) / layout.columns;
    const QSizeF most(column_width * (beneath ? alone_share : beside_share),
                      row_height - 2 * row_padding - name_height);
    return {row_height, name_height, portrait_shape.scaled(most, Qt::KeepAspectRatio)};
}

/// The photographs that there are: the folder is read once, for looking for each person's file costs a share on the
/// network several answers each.
class Portraits
{
public:
    explicit Portraits(const core::Paths& paths) : m_folder(paths.folder(core::Folder::portrait))
    {
        for (const auto& file : QDir(m_folder).entryList(QDir::Files))
            m_files.insert(file.toLower(), file);
    }

    [[nodiscard]] pages::Picture of(const people::Person& person, QSizeF frame) const
    {
        const auto file = m_files.constFind(people::portrait_of_person(person.person_id).name.toLower());
        return file == m_files.constEnd() ? pages::Picture() : pages::Picture::from_file(m_folder + *file, frame);
    }

private:
    QString m_folder;
    QHash<QString, QString> m_files; ///< By their names in small letters.
};

Entry entry_of(const Portraits& portraits, const ListedMember& listed, QSizeF frame)
{
    auto contacts = family_contacts(listed.family);
    std::ranges::move(personal_contacts(listed), std::back_inserter(contacts));
    return {portraits.of(listed.person, frame), joined(u" ", {listed.name(), listed.surname()}),
            address_lines(listed.family, people::SuburbType::residential),
            address_lines(listed.family, people::SuburbType::postal), std::move(contacts)};
}

/// The frame, always of one size, and the photograph in the middle of it.
pages::Drawing framed(const pages::Picture& portrait, QSizeF frame)
{
    pages::Drawing drawing{frame, {pages::RectsItem{.rects = {{{}, frame}}, .outline = pages::ink::hairline}}};
    if (portrait.empty())
        return drawing;
    const auto size = QSizeF(portrait.pixels()).scaled(frame - QSizeF(2 * inset, 2 * inset), Qt::KeepAspectRatio);
    const auto left_over = (frame - size) / 2;
    drawing.items.push_back(pages::PictureItem{{QPointF(left_over.width(), left_over.height()), size}, portrait});
    return drawing;
}

pages::TableStyle exact_rows(qreal height)
{
    pages::TableStyle style;
    style.lines = pages::TableLines::none;
    style.padding = 0;
    style.vertical_padding = 0;
    style.row_height = height;
    style.height_rule = pages::RowHeight::exact;
    return style;
}

void write_address(pages::Writer& place, const QString& caption, const QStringList& lines)
{
    if (lines.isEmpty())
        return;
    place.space(row_padding);
    place.line(caption, place.type().caption);
    write_lines(place, lines, place.type().body);
}

/// On one line where there is room, else on lines of their own.
void write_on_one_line(pages::Writer& place, const QStringList& lines)
{
    const auto& body = place.type().body;
    const auto all = lines.join(u", "_s);
    if (place.metrics().width(all, body) <= place.width())
        write_line(place, all, body);
    else
        write_lines(place, lines, body);
}

void write_text(pages::Writer& place, const Entry& entry, AlbumText text)
{
    place.line(entry.name, place.type().headings[1]);
    if (text == AlbumText::contacts)
        write_on_one_line(place, entry.residential);
    write_contacts(place, entry.contacts);
    if (text != AlbumText::both_addresses)
        return;
    write_address(place, u"Residential address"_s, entry.residential);
    write_address(place, u"Postal address"_s, entry.postal);
}

/// Whether the line breaks none of the words.
bool holds_words(pages::Writer& place, const Entry& entry, AlbumText text)
{
    const auto holds = [&](const QString& words, const pages::TextStyle& style) {
        return pages::widest_word(words, style, place.metrics()) <= place.width();
    };
    const auto& type = place.type();
    bool all = holds(entry.name, type.headings[1]);
    for (const auto& line : text == AlbumText::both_addresses ? entry.residential + entry.postal : entry.residential)
        all = all && holds(line, type.body);
    for (const auto& line : entry.contacts) {
        for (const auto& pair : line)
            all = all && holds(pair.caption, type.caption) && holds(pair.value, type.body);
    }
    return all;
}

/// The text in letters so small that it fits without breaking a word, as long as they can be read.
void write_fitted_text(pages::Writer& cell, const Entry& entry, AlbumText text, qreal height,
                       const std::shared_ptr<pages::TextMetrics>& metrics)
{
    const auto& body = cell.type().body;
    for (auto size = body.size;; size *= smaller) {
        pages::Box trial(metrics, pages::TypeScale::around(body.sized(size)), cell.width(), height);
        write_text(trial, entry, text);
        const bool fits = pages::height_of(trial.blocks()) <= height && holds_words(trial, entry, text);
        if (!fits && size * smaller >= smallest_text)
            continue;
        for (auto& block : trial.take())
            cell.write(std::move(block));
        return;
    }
}

/// The photograph with the name beneath it.
pages::Cell named_photograph(const Entry& entry, const Measures& measures)
{
    return pages::Cell::of([&entry, &measures](pages::Writer& cell) {
        cell.drawing(framed(entry.portrait, measures.frame), pages::Align::centre);
        cell.space(row_padding / 2);
        pages::Table name(cell, {{.align = pages::Align::centre}}, exact_rows(measures.name_height - row_padding / 2));
        name.row({pages::Cell(entry.name, cell.type().body.bolder())});
    });
}

/// Fills the rows of an album from left to right.
class Album
{
public:
    Album(pages::Flow& flow, const AlbumLayout& layout, const Measures& measures)
        : m_layout(layout), m_measures(measures), m_table(flow, columns(layout, measures), style(measures))
    {
    }
    void add(Entry entry)
    {
        m_entries.push_back(std::move(entry));
        if (int(m_entries.size()) == m_layout.columns)
            write_row();
    }
    void write_row()
    {
        if (m_entries.empty())
            return;
        std::vector<pages::Cell> cells;
        for (const auto& entry : m_entries)
            add_cells(cells, entry);
        m_table.row(cells);
        m_entries.clear();
    }

private:
    static std::vector<pages::TableColumn> columns(const AlbumLayout& layout, const Measures& measures)
    {
        std::vector<pages::TableColumn> columns;
        for (int column = 0; column < layout.columns; ++column) {
            if (layout.text != AlbumText::name)
                columns.insert(columns.end(), {{.width = measures.frame.width()}, {.width = text_gap}});
            columns.push_back({.share = 1});
            if (column + 1 < layout.columns)
                columns.push_back({.width = text_gap});
        }
        return columns;
    }
    static pages::TableStyle style(const Measures& measures)
    {
        auto style = exact_rows(measures.row_height);
        style.vertical_padding = row_padding;
        return style;
    }
    void add_cells(std::vector<pages::Cell>& cells, const Entry& entry) const
    {
        if (m_layout.text == AlbumText::name) {
            cells.insert(cells.end(), {named_photograph(entry, m_measures), pages::Cell()});
            return;
        }
        const auto photograph = [this, &entry](pages::Writer& cell) {
            cell.drawing(framed(entry.portrait, m_measures.frame));
        };
        const auto text = [this, &entry](pages::Writer& cell) {
            write_fitted_text(cell, entry, m_layout.text, m_measures.row_height - 2 * row_padding, m_metrics);
        };
        cells.insert(cells.end(), {pages::Cell::of(photograph), pages::Cell(), pages::Cell::of(text), pages::Cell()});
    }

    const AlbumLayout& m_layout;
    const Measures& m_measures;
    std::shared_ptr<pages::TextMetrics> m_metrics = std::make_shared<pages::TextMetrics>();
    pages::Table m_table;
    std::vector<Entry> m_entries; ///< Of the row begun.
};

bool write_album(const ReportInput& input, const void* layout, core::Progress& progress, pages::Flow& flow)
{
    const auto& chosen = *static_cast<const AlbumLayout*>(layout);
    const auto sizes = measures(input, chosen, flow);
    const Portraits portraits(input.office.paths);
    Album album(flow, chosen, sizes);
    const auto write = [&](const ListedMember& listed) {
        album.add(entry_of(portraits, listed, sizes.frame));
    };
    if (!for_each_person(input, progress, write, people::Part::address | people::Part::details))
        return false;
    album.write_row();
    return true;
}

constexpr ReportDefinition report(const char* key, const char* leaf, const char* description, std::size_t row)
{
    return {key, "Photo Albums", leaf, description, core::Area::report_outputs, write_album, &layouts[row]};
}

constexpr std::array reports{
    report("k130", "Album 1", "12 photos per page in three columns, with names", 0),
    report("k131", "Album 2", "9 photos per page in three columns, with names", 1),
    report("k132", "Album 3", "8 photos per page in two columns, with address and contacts", 2),
    report("k133", "Album 4", "6 photos per page in two columns, with address and contacts", 3),
    report("k134", "Album 5", "6 photos per page in one column, with address and contacts", 4),
    report("k135", "Album 6", "5 photos per page in one column, with address and contacts", 5),
    report("k136", "Album 7", "4 photos per page in one column, with address and contacts", 6),
    report("k137", "Album 8", "3 photos per page in one column, with both addresses and contacts", 7),
};

} // namespace

std::span<const ReportDefinition> photo_album_reports()
{
    return reports;
}

} // namespace kindrel::output
