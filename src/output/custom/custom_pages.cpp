#include "output/custom/custom_pages.h"

#include "output/custom/custom_layout_words.h"
#include "output/reports/barcode_place.h"
#include "people/person_files.h"

#include <algorithm>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

pages::TextStyle changed(pages::TextStyle style, const LayoutStyle& by, double factor)
{
    if (!by.font.isEmpty())
        style.family = by.font;
    if (by.size)
        style.size = *by.size * factor;
    if (by.plain)
        style.bold = style.italic = style.underline = false;
    style.bold |= by.bold;
    style.italic |= by.italic;
    style.underline |= by.underline;
    style.colour = by.colour.value_or(style.colour);
    return style;
}

pages::TextStyle& look_of(pages::TypeScale& type, BuiltInStyle style)
{
    switch (style) {
    case BuiltInStyle::body:
        return type.body;
    case BuiltInStyle::caption:
        return type.caption;
    case BuiltInStyle::small:
        return type.small;
    case BuiltInStyle::heading:
        return type.headings[0];
    case BuiltInStyle::heading2:
        return type.headings[1];
    case BuiltInStyle::heading3:
        break;
    }
    return type.headings[2];
}

/// Whether a text only parts what stands before it from what comes after.
bool only_separates(QStringView text)
{
    constexpr QStringView marks = u",;:/&.|-\u2013\u2014\u2022+";
    return std::ranges::all_of(text, [&](QChar c) { return c.isSpace() || marks.contains(c); });
}

QString without_leading_blanks(const QString& text)
{
    const auto first = std::ranges::find_if(text, [](QChar c) { return !c.isSpace(); });
    return text.sliced(first - text.begin());
}

/// Parts of a line that are printed together or not at all: a value with its captions.
struct Cluster
{
    std::vector<pages::Run> captions;
    std::vector<pages::Run> values; ///< With what follows them.
    bool has_value = false;
};

/// Fills the parts of one line or cell in from left to right.
class LineFiller
{
public:
    LineFiller(const CustomLooks& looks, bool always, const FieldSource& source)
        : m_looks(looks), m_always(always), m_source(source)
    {
    }

    FilledLine fill(const LayoutParts& parts)
    {
        for (const auto& part : parts) {
            if (!m_started && part.kind != LayoutPart::Kind::style)
                m_started = true;
            take(part);
        }
        end_stretch();
        m_line.printed = m_always || m_any_value || !m_any_field;
        return std::move(m_line);
    }

private:
    void take(const LayoutPart& part)
    {
        using Kind = LayoutPart::Kind;
        switch (part.kind) {
        case Kind::text:
            pending().push_back({part.text, m_style});
            break;
        case Kind::field:
            take_field(part.field);
            break;
        case Kind::style:
            m_style = m_looks.style(part.text);
            if (!m_started && m_looks.align(part.text))
                m_line.align = m_looks.align(part.text);
            break;
        case Kind::tab:
            end_stretch();
            m_line.runs.push_back({u"\t"_s, m_style});
            break;
        case Kind::open:
            m_outer = std::exchange(m_clusters, {});
            m_outer_pending = std::exchange(m_pending, {});
            break;
        case Kind::close:
            close_braces();
            break;
        }
    }

    std::vector<pages::Run>& pending() { return m_pending; }

    void take_field(const LayoutField& field)
    {
        const auto text = text_of(field, m_source);
        const auto* known = find_custom_field(field.name);
        count(known && counts(*known), !text.isEmpty());
        m_clusters.push_back({std::exchange(m_pending, {}), {{text, m_style}}, !text.isEmpty()});
    }

    /// The fields of the run are never empty; only the others tell whether a line has something to say.
    static bool counts(const CustomField& field)
    {
        return field.scope == FieldScope::family || field.scope == FieldScope::person ||
               field.scope == FieldScope::receipt;
    }

    void count(bool counts, bool has_value)
    {
        m_any_field |= counts;
        m_any_value |= counts && has_value;
    }

    /// What stands in braces becomes one value of the line.
    void close_braces()
    {
        Cluster braces{std::move(m_outer_pending), {}, false};
        const bool fields = !m_clusters.empty();
        const bool any = std::ranges::any_of(m_clusters, &Cluster::has_value);
        braces.values = printed_runs();
        braces.has_value = any || (!fields && !braces.values.empty());
        m_clusters = std::move(m_outer);
        m_clusters.push_back(std::move(braces));
    }

    void end_stretch()
    {
        std::ranges::move(printed_runs(), std::back_inserter(m_line.runs));
        m_clusters.clear();
    }

    /// The runs of the clusters that have a value. A text that would part the first of them from one that is left out
    /// goes too.
    std::vector<pages::Run> printed_runs()
    {
        auto rest = std::exchange(m_pending, {});
        if (m_clusters.empty())
            return rest;
        std::ranges::move(rest, std::back_inserter(m_clusters.back().values));
        std::vector<pages::Run> runs;
        for (auto& cluster : m_clusters) {
            if (!cluster.has_value && !m_always)
                continue;
            const bool first_left = runs.empty() && &cluster != &m_clusters.front();
            for (auto& caption : cluster.captions) {
                if (first_left && runs.empty())
                    caption.text = only_separates(caption.text) ? QString() : without_leading_blanks(caption.text);
                add(runs, caption);
            }
            for (auto& value : cluster.values)
                add(runs, value);
        }
        m_clusters.clear();
        return runs;
    }

    static void add(std::vector<pages::Run>& runs, pages::Run& run)
    {
        if (!run.text.isEmpty())
            runs.push_back(std::move(run));
    }

    const CustomLooks& m_looks;
    bool m_always;
    const FieldSource& m_source;
    pages::TextStyle m_style = m_looks.type().body;
    bool m_started = false; ///< Something has been printed, so that a style no longer aligns the line.
    bool m_any_field = false, m_any_value = false;
    std::vector<Cluster> m_clusters, m_outer;
    std::vector<pages::Run> m_pending, m_outer_pending;
    FilledLine m_line;
};

pages::TableStyle style_of(const LayoutTable& table)
{
    constexpr QRgb stripe = 0xfff4f4f4;
    pages::TableStyle style;
    style.lines = table.lines == LayoutLines::none   ? pages::TableLines::none
                  : table.lines == LayoutLines::rows ? pages::TableLines::rows
                                                     : pages::TableLines::grid;
    if (table.striped)
        style.stripe = stripe;
    return style;
}

} // namespace

CustomLooks::CustomLooks(const CustomLayout& layout, int percent)
{
    const double factor = percent / 100.0;
    pages::TextStyle body{.size = layout.text_size * factor};
    if (!layout.font.isEmpty())
        body.family = layout.font;
    const auto own_body = std::ranges::find(layout.styles, u"body"_s, &LayoutStyle::name);
    if (own_body != layout.styles.end())
        body = changed(body, *own_body, factor);
    m_type = pages::TypeScale::around(body);
    for (const auto& style : layout.styles) {
        const auto built_in = value_of(built_in_styles(), style.name);
        if (built_in && *built_in != BuiltInStyle::body)
            look_of(m_type, *built_in) = changed(look_of(m_type, *built_in), style, factor);
        m_looks.push_back(
            {style.name, built_in ? look_of(m_type, *built_in) : changed(body, style, factor), style.align});
    }
    for (const auto& [name, style] : built_in_styles()) {
        if (!find(name.toString()))
            m_looks.push_back({name.toString(), look_of(m_type, style), {}});
    }
}

const CustomLooks::Look* CustomLooks::find(const QString& name) const
{
    const auto found = std::ranges::find(m_looks, name, &Look::name);
    return found == m_looks.end() ? nullptr : &*found;
}

const pages::TextStyle& CustomLooks::style(const QString& name) const
{
    const auto* look = find(name);
    return look ? look->style : m_type.body;
}

std::optional<pages::Align> CustomLooks::align(const QString& name) const
{
    const auto* look = find(name);
    return look ? look->align : std::nullopt;
}

CustomPages::CustomPages(const CustomLayout& layout, const CustomLooks& looks, const core::Paths& paths)
    : m_layout(layout), m_looks(looks), m_paths(paths)
{
}

void CustomPages::write(pages::Writer& place, LayoutPlace section, const FieldSource& source)
{
    for (const auto& element : m_layout.section(section)) {
        const auto& condition = element.condition;
        if (!condition || text_of(condition->field, source).isEmpty() == condition->unless)
            write(place, element, source);
    }
}

void CustomPages::write(pages::Writer& place, const LayoutElement& element, const FieldSource& source)
{
    switch (element.kind) {
    case LayoutElement::Kind::line:
        write_line(place, element, source);
        break;
    case LayoutElement::Kind::row:
        write_row(place, element, source);
        break;
    case LayoutElement::Kind::rule:
        place.rule({.thickness = element.height});
        break;
    case LayoutElement::Kind::space:
        place.space(element.height);
        break;
    case LayoutElement::Kind::portrait:
        write_portrait(place, element, source);
        break;
    case LayoutElement::Kind::barcode:
        write_barcode(place, element, source);
        break;
    case LayoutElement::Kind::note:
        break;
    }
}

FilledLine CustomPages::fill(const LayoutParts& parts, bool always, const FieldSource& source) const
{
    return LineFiller(m_looks, always, source).fill(parts);
}

void CustomPages::write_line(pages::Writer& place, const LayoutElement& element, const FieldSource& source) const
{
    const auto line = fill(element.parts, element.always, source);
    if (line.printed && !line.runs.empty())
        place.paragraph(line.runs, {.align = line.align.value_or(pages::Align::left), .tabs = m_layout.tabs});
}

void CustomPages::write_row(pages::Writer& place, const LayoutElement& element, const FieldSource& source)
{
    std::vector<FilledLine> lines;
    for (const auto& cell : element.cells)
        lines.push_back(fill(cell, element.always, source));
    const auto has_fields = [](const LayoutParts& parts) {
        return std::ranges::any_of(parts, [](const auto& part) { return part.kind == LayoutPart::Kind::field; });
    };
    bool printed = std::ranges::none_of(element.cells, has_fields);
    for (std::size_t i = 0; i < lines.size(); ++i)
        printed |= lines[i].printed && has_fields(element.cells[i]);
    if (!printed)
        return;
    std::vector<pages::Cell> cells;
    for (std::size_t i = 0; i < lines.size(); ++i) {
        const auto align = lines[i].align.value_or(m_layout.table.columns[i].align);
        cells.push_back(pages::Cell::of([line = lines[i], align, this](pages::Writer& cell) {
            if (line.printed && !line.runs.empty())
                cell.paragraph(line.runs, {.align = align, .tabs = m_layout.tabs});
        }));
    }
    table(place).row(cells);
}

pages::Table& CustomPages::table(pages::Writer& place)
{
    if (m_table)
        return *m_table;
    std::vector<pages::TableColumn> columns;
    for (const auto& column : m_layout.table.columns)
        columns.push_back({column.width, column.share, column.heading, column.align});
    return m_table.emplace(place, std::move(columns), style_of(m_layout.table));
}

void CustomPages::write_portrait(pages::Writer& place, const LayoutElement& element, const FieldSource& source) const
{
    const QSizeF size(element.width, element.height);
    const auto file = source.person ? people::portrait_of_person(source.person->person_id)
                                    : people::portrait_of_family(source.family->family().Surname_ID);
    const auto picture = pages::Picture::from_file(m_paths.file(file.folder, file.name), size);
    place.picture(picture, size, element.align);
}

void CustomPages::write_barcode(pages::Writer& place, const LayoutElement& element, const FieldSource& source) const
{
    place.barcode(barcode_content(source.person->person_id), {element.width, element.height}, element.align);
}

} // namespace kindrel::output
