#include "pages/writer.h"

#include "pages/barcode.h"
#include "pages/text_layout.h"

#include <algorithm>
#include <array>

using namespace Qt::StringLiterals;

namespace kindrel::pages {

namespace {

constexpr qreal least_gap = 8; ///< Between the texts of a spread.

qreal left_of(qreal wide, qreal room, Align align)
{
    return align == Align::right ? room - wide : align == Align::centre ? (room - wide) / 2 : 0;
}

QString without_leading_blanks(const QString& text)
{
    const auto first = std::ranges::find_if(text, [](QChar c) { return !c.isSpace(); });
    return text.sliced(first - text.begin());
}

} // namespace

Writer::Writer(std::shared_ptr<TextMetrics> metrics, const TypeScale& type, qreal width)
    : m_metrics(std::move(metrics)), m_type(type), m_width(width)
{
}

qreal Writer::tallest()
{
    return place_height() - (m_heading ? height_of(*m_heading) : 0);
}

void Writer::repeat_from_here(const Blocks& heading)
{
    Blocks all = m_heading ? *m_heading : Blocks();
    for (auto block : heading) {
        for (auto& item : block.items)
            item = moved(std::move(item), {m_indent, 0});
        all.push_back(std::move(block));
    }
    m_heading = std::make_shared<const Blocks>(std::move(all));
}

void Writer::write(Block block)
{
    if (m_indent != 0) {
        for (auto& item : block.items)
            item = moved(std::move(item), {m_indent, 0});
    }
    block.heading = m_heading;
    put(std::move(block));
}

void Writer::line(const QString& text, const TextStyle& style, Align align, LongText long_text)
{
    const Run run{text, style};
    paragraph(std::span(&run, 1), {.align = align, .long_text = long_text});
}

void Writer::paragraph(std::span<const Run> runs, const ParagraphStyle& style)
{
    space(style.before);
    for (auto& block : lay_out(runs, style, width(), metrics()))
        write(std::move(block));
    space(style.after);
}

void Writer::paragraph(std::initializer_list<Run> runs, const ParagraphStyle& style)
{
    paragraph(std::span(runs.begin(), runs.size()), style);
}

void Writer::spread(const QString& left, const QString& centre, const QString& right, const TextStyle& style)
{
    const auto shown = [&](const QString& text, qreal room) {
        return metrics().elided(text, style, room);
    };
    const auto room = width();
    const auto middle = shown(centre, room);
    const auto middle_width = metrics().width(middle, style);
    const auto side = middle.isEmpty() ? room : (room - middle_width) / 2 - least_gap;
    const auto end = shown(right, side);
    const auto end_width = metrics().width(end, style);
    const auto start = shown(left, middle.isEmpty() && !end.isEmpty() ? side - end_width - least_gap : side);

    Block block{.height = metrics().line_height(style)};
    const auto add = [&](const QString& text, qreal x, qreal wide, Align align) {
        if (!text.isEmpty())
            block.items.push_back(TextItem{.at = {x, metrics().ascent(style)},
                                           .width = wide,
                                           .align = align,
                                           .right_to_left = text.isRightToLeft(),
                                           .style = style,
                                           .text = text});
    };
    add(start, 0, metrics().width(start, style), Align::left);
    add(middle, (room - middle_width) / 2, middle_width, Align::centre);
    add(end, room - end_width, end_width, Align::right);
    write(std::move(block));
}

void Writer::captions(std::span<const CaptionValue> pairs)
{
    std::vector<Run> runs;
    for (const auto& pair : pairs) {
        if (pair.value.isEmpty())
            continue;
        // A caption may begin with the blanks that part it from the one before.
        runs.push_back({runs.empty() ? without_leading_blanks(pair.caption) : pair.caption, m_type.caption});
        runs.push_back({pair.value, m_type.body});
    }
    if (!runs.empty())
        paragraph(runs);
}

void Writer::caption(const QString& caption, const QString& value)
{
    captions({{caption, value}});
}

void Writer::heading(const QString& text, int level)
{
    const auto& style = m_type.headings[size_t(std::clamp(level, 1, int(m_type.headings.size())) - 1)];
    const Run run{text, style};
    space(style.size * 0.6);
    for (auto& block : lay_out(std::span(&run, 1), {}, width(), metrics())) {
        block.glue = Glue::to_next;
        write(std::move(block));
    }
    Block gap{.height = style.size * 0.2, .kind = BlockKind::space, .glue = Glue::to_next};
    write(std::move(gap));
}

void Writer::picture(const Picture& picture, QSizeF size, Align align)
{
    const QSizeF room(std::min(size.width(), width()), std::min(size.height(), tallest()));
    const auto shape = picture.empty() ? size : QSizeF(picture.pixels());
    const auto shown = shape.scaled(room, Qt::KeepAspectRatio);
    const PictureItem item{{QPointF(left_of(shown.width(), width(), align), 0), shown}, picture};
    write({.height = shown.height(), .items = {item}});
}

void Writer::barcode(const QString& content, QSizeF size, Align align)
{
    drawing(pages::barcode(content, size), align);
}

void Writer::tick_boxes(const TickBoxes& boxes)
{
    const auto wide = boxes.count * boxes.size + (boxes.count - 1) * boxes.gap;
    const auto left = left_of(wide, width(), boxes.align);
    RectsItem item{.outline = ink::black};
    for (int i = 0; i < boxes.count; ++i)
        item.rects.emplace_back(left + i * (boxes.size + boxes.gap), 1, boxes.size, boxes.size);
    write({.height = boxes.size + 2, .items = {item}});
}

void Writer::drawing(const Drawing& drawing, Align align)
{
    const auto factor = std::min({qreal(1), width() / drawing.size.width(), tallest() / drawing.size.height()});
    const QPointF at(left_of(drawing.size.width() * factor, width(), align), 0);
    Block block{.height = drawing.size.height() * factor};
    for (const auto& item : drawing.items)
        block.items.push_back(moved(factor < 1 ? scaled(item, factor) : item, at));
    write(std::move(block));
}

void Writer::rule(const Ruling& ruling)
{
    space(ruling.before);
    const LineItem line{{0, ruling.thickness / 2}, {width(), ruling.thickness / 2}, ruling.thickness, ruling.colour};
    write({.height = ruling.thickness, .items = {line}});
    space(ruling.after);
}

void Writer::space(qreal height)
{
    if (height > 0)
        write({.height = height, .kind = BlockKind::space});
}

Group::Group(Writer& writer, const QString& text, int level) : m_writer(writer), m_outer(writer.m_heading)
{
    writer.heading(text, level);
    Box again(writer.m_metrics, writer.type(), writer.width(), writer.place_height());
    again.heading(text + u" (continued)"_s, level);
    writer.repeat_from_here(again.blocks());
}

} // namespace kindrel::pages
