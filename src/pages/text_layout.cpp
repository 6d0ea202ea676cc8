#include "pages/text_layout.h"

#include <QTextBoundaryFinder>
#include <QTextLayout>

#include <algorithm>
#include <optional>

using namespace Qt::StringLiterals;

namespace kindrel::pages {

namespace {

constexpr qreal units = units_per_point;
constexpr qreal usual_tab = 36;

Qt::Alignment layout_alignment(Align align)
{
    switch (align) {
    case Align::centre:
        return Qt::AlignHCenter;
    case Align::right:
        return Qt::AlignRight;
    case Align::left:
    case Align::justified:
        break;
    }
    return Qt::AlignLeft;
}

bool runs_right_to_left(QStringView text)
{
    return std::ranges::any_of(text, [](QChar c) {
        const auto direction = c.direction();
        return direction == QChar::DirR || direction == QChar::DirAL || direction == QChar::DirRLE ||
               direction == QChar::DirRLO || direction == QChar::DirRLI;
    });
}

QString with_line_separators(QString text)
{
    return text.replace("\r\n"_L1, "\n"_L1).replace(u'\r', u'\n').replace(u'\n', QChar(QChar::LineSeparator));
}

qreal shift_of(Align align, qreal left_over)
{
    return align == Align::right ? left_over : align == Align::centre ? left_over / 2 : 0;
}

/// One line of text that needs no breaking, shaped only where a width is asked for. Nullopt where layout is needed.
std::optional<Block> plain_line(std::span<const Run> runs, const ParagraphStyle& style, qreal room,
                                TextMetrics& metrics)
{
    Block block;
    qreal x = 0, ascent = 0, height = 0;
    for (const auto& run : runs) {
        const auto about = metrics.plain_width(run.text, run.style, room - x);
        if (!about)
            return std::nullopt;
        ascent = std::max(ascent, metrics.ascent(run.style));
        height = std::max(height, metrics.line_height(run.style));
        if (run.text.isEmpty())
            continue;
        const bool ends_here = style.align == Align::left && &run == &runs.back();
        const auto width = ends_here ? *about : metrics.width(run.text, run.style);
        block.items.push_back(
            TextItem{.at = {x, 0}, .width = width, .align = style.align, .style = run.style, .text = run.text});
        x += width;
    }
    const auto shift = style.indent + style.first_indent + shift_of(style.align, room - x);
    for (auto& item : block.items)
        std::get<TextItem>(item).at = {std::get<TextItem>(item).at.x() + shift, ascent};
    block.height = height * style.line_spacing;
    return block;
}

/// Cuts the runs so that they stay on one line.
std::vector<Run> elided(std::span<const Run> runs, qreal room, TextMetrics& metrics)
{
    std::vector<Run> kept;
    for (const auto& run : runs) {
        auto text = run.text;
        text.replace(u'\n', u' ').replace(u'\r', u' ').replace(u'\t', u' ');
        const auto width = metrics.width(text, run.style);
        if (width > room) {
            kept.push_back({metrics.elided(text, run.style, room), run.style});
            break;
        }
        kept.push_back({text, run.style});
        room -= width;
    }
    return kept;
}

/// Text that has to be broken, mixed or turned right to left.
class Paragraph
{
public:
    Paragraph(std::span<const Run> runs, const ParagraphStyle& style, TextMetrics& metrics);
    [[nodiscard]] Blocks lines(qreal width);

private:
    struct Stretch
    {
        int start = 0;
        int end = 0;
        TextStyle style;
    };

    void set_options(qreal line_start);
    [[nodiscard]] Block block_of(const QTextLine& line, bool last, qreal room);
    void add_pieces(Block& block, const QTextLine& line, int end, qreal stretch, qreal baseline) const;
    [[nodiscard]] TextItem whole(const QTextLine& line, int end, qreal baseline) const;
    [[nodiscard]] int trimmed_end(const QTextLine& line) const;
    [[nodiscard]] qreal stretch_of(const QTextLine& line, int end, bool last, qreal room) const;

    const ParagraphStyle& m_style;
    std::vector<Stretch> m_stretches;
    QString m_text;
    bool m_right_to_left = false;
    QTextLayout m_layout;
};

Paragraph::Paragraph(std::span<const Run> runs, const ParagraphStyle& style, TextMetrics& metrics) : m_style(style)
{
    QList<QTextLayout::FormatRange> formats;
    for (const auto& run : runs) {
        const auto start = int(m_text.size());
        m_text += with_line_separators(run.text);
        m_stretches.push_back({start, int(m_text.size()), run.style});
        QTextCharFormat format;
        format.setFont(metrics.font(run.style));
        formats.push_back({start, int(m_text.size()) - start, format});
    }
    m_right_to_left = m_text.isRightToLeft();
    m_layout.setText(m_text);
    m_layout.setFont(metrics.font(m_stretches.front().style));
    m_layout.setFormats(formats);
}

void Paragraph::set_options(qreal line_start)
{
    QTextOption option(layout_alignment(m_style.align) | Qt::AlignAbsolute);
    option.setWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere);
    option.setTextDirection(m_right_to_left ? Qt::RightToLeft : Qt::LeftToRight);
    option.setTabStopDistance(usual_tab * units);
    QList<QTextOption::Tab> tabs;
    for (const auto tab : m_style.tabs) {
        if (tab > line_start)
            tabs.push_back({(tab - line_start) * units, QTextOption::LeftTab});
    }
    option.setTabs(tabs);
    m_layout.setTextOption(option);
}

Blocks Paragraph::lines(qreal width)
{
    std::vector<qreal> rooms;
    auto line_start = m_style.indent + m_style.first_indent;
    set_options(line_start);
    m_layout.beginLayout();
    for (auto line = m_layout.createLine(); line.isValid(); line = m_layout.createLine()) {
        rooms.push_back(std::max(width - line_start, qreal(1)));
        line.setLineWidth(rooms.back() * units);
        line.setPosition({line_start * units, 0});
        line_start = m_style.indent;
        set_options(line_start);
    }
    m_layout.endLayout();

    Blocks blocks;
    const auto count = m_layout.lineCount();
    for (int i = 0; i < count; ++i) {
        // A line is read with the tab stops that it was laid out with, which count from its own start.
        set_options(m_style.indent + (i == 0 ? m_style.first_indent : 0));
        blocks.push_back(block_of(m_layout.lineAt(i), i == count - 1, rooms[size_t(i)]));
    }
    return blocks;
}

Block Paragraph::block_of(const QTextLine& line, bool last, qreal room)
{
    Block block;
    block.height = (line.ascent() + line.descent() + std::max(line.leading(), qreal(0))) / units * m_style.line_spacing;
    const auto baseline = line.ascent() / units;
    const auto end = trimmed_end(line);
    if (end == line.textStart())
        return block;
    if (m_right_to_left || runs_right_to_left(QStringView(m_text).sliced(line.textStart(), end - line.textStart())))
        block.items.push_back(whole(line, end, baseline));
    else
        add_pieces(block, line, end, stretch_of(line, end, last, room), baseline);
    return block;
}

int Paragraph::trimmed_end(const QTextLine& line) const
{
    auto end = line.textStart() + line.textLength();
    while (end > line.textStart() && m_text[end - 1].isSpace())
        --end;
    return end;
}

/// What each blank of a justified line grows by.
qreal Paragraph::stretch_of(const QTextLine& line, int end, bool last, qreal room) const
{
    const auto words = QStringView(m_text).sliced(line.textStart(), end - line.textStart());
    const auto after = line.textStart() + line.textLength();
    const bool broken_here = last || m_text[after - 1] == QChar(QChar::LineSeparator);
    const auto blanks = words.count(u' ');
    if (m_style.align != Align::justified || broken_here || blanks == 0)
        return 0;
    return std::max(qreal(0), room - line.naturalTextWidth() / units) / qreal(blanks);
}

/// Pieces end where the look changes, at tabs, and at blanks of a justified line.
void Paragraph::add_pieces(Block& block, const QTextLine& line, int end, qreal stretch, qreal baseline) const
{
    qreal grown = 0;
    for (const auto& part : m_stretches) {
        for (int from = std::max(part.start, line.textStart()), to = from; from < std::min(part.end, end); from = to) {
            const auto ends_piece = [&](int i) {
                return m_text[i] == u'\t' || (stretch > 0 && m_text[i] == u' ');
            };
            to = from;
            while (to < std::min(part.end, end) && !ends_piece(to))
                ++to;
            if (to > from) {
                const auto x = line.cursorToX(from) / units;
                block.items.push_back(TextItem{.at = {x + grown, baseline},
                                               .width = line.cursorToX(to) / units - x,
                                               .align = m_style.align,
                                               .style = part.style,
                                               .text = m_text.mid(from, to - from)});
            }
            for (; to < std::min(part.end, end) && ends_piece(to); ++to)
                grown += m_text[to] == u' ' ? stretch : 0;
        }
    }
}

TextItem Paragraph::whole(const QTextLine& line, int end, qreal baseline) const
{
    TextItem item{.at = {line.naturalTextRect().x() / units, baseline},
                  .width = line.naturalTextWidth() / units,
                  .align = m_style.align,
                  .right_to_left = m_right_to_left,
                  .style = {},
                  .text = m_text.mid(line.textStart(), end - line.textStart()).replace(u'\t', u' ')};
    for (const auto& part : m_stretches) {
        const auto length = std::min(part.end, end) - std::max(part.start, line.textStart());
        if (length > 0)
            item.spans.push_back({length, part.style});
    }
    item.style = item.spans.front().style;
    if (item.spans.size() == 1)
        item.spans.clear();
    return item;
}

void keep_ends_together(Blocks& lines)
{
    if (lines.size() < 2)
        return;
    lines.front().glue = Glue::to_next;
    lines[lines.size() - 2].glue = Glue::to_next;
}

} // namespace

Blocks lay_out(std::span<const Run> runs, const ParagraphStyle& style, qreal width, TextMetrics& metrics)
{
    if (runs.empty())
        return {};
    const auto room = std::max(width - style.indent - style.first_indent, qreal(1));
    if (auto line = plain_line(runs, style, room, metrics))
        return {std::move(*line)};
    if (style.long_text == LongText::elide) {
        auto unbroken = style;
        unbroken.long_text = LongText::wrap;
        return lay_out(elided(runs, room, metrics), unbroken, width, metrics);
    }
    auto lines = Paragraph(runs, style, metrics).lines(width);
    keep_ends_together(lines);
    return lines;
}

qreal widest_word(const QString& text, const TextStyle& style, TextMetrics& metrics)
{
    QTextBoundaryFinder places(QTextBoundaryFinder::Line, text);
    qreal widest = 0;
    for (auto from = places.position(); places.toNextBoundary() > from; from = places.position())
        widest = std::max(widest, metrics.width(text.sliced(from, places.position() - from).trimmed(), style));
    return widest;
}

} // namespace kindrel::pages
