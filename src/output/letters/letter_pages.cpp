#include "output/letters/letter_pages.h"

#include <algorithm>

namespace kindrel::output {

namespace {

qreal body_height(const pages::PageSetup& setup)
{
    return setup.size().height() - setup.margins.top() - setup.margins.bottom();
}

/// A line that hangs out has a tab stop where the others begin.
pages::ParagraphStyle style_of(const LetterShape& shape)
{
    pages::ParagraphStyle style{
        .align = shape.align, .indent = shape.indent, .first_indent = shape.first_indent, .tabs = shape.tabs};
    if (shape.first_indent < 0)
        style.tabs.insert(std::ranges::lower_bound(style.tabs, shape.indent), shape.indent);
    return style;
}

} // namespace

LetterPages::LetterPages(const LetterForm& letter, pages::Flow& flow, int text_percent)
    : m_letter(letter), m_flow(flow), m_scale(text_percent / 100.0), m_fixed(letter.parts().size())
{
    lay_out_fixed_parts();
}

void LetterPages::lay_out_fixed_parts()
{
    const auto metrics = std::make_shared<pages::TextMetrics>();
    for (std::size_t i = 0; i < m_fixed.size(); ++i) {
        const auto& part = m_letter.parts()[i];
        if (!part.fixed)
            continue;
        pages::Box box(metrics, m_flow.type(), m_flow.width(), body_height(m_flow.setup()));
        const auto same_for_all = merged(part, {});
        for (const auto& paragraph : same_for_all.paragraphs)
            write_paragraph(box, paragraph);
        m_fixed[i] = box.take();
    }
}

void LetterPages::write(const LetterValues& values)
{
    if (m_begun)
        m_flow.next_page();
    m_begun = m_at_top = true;
    m_page_due = false;
    for (std::size_t i = 0; i < m_fixed.size(); ++i) {
        const auto& part = m_letter.parts()[i];
        if (part.fixed) {
            begin_paragraph(part.pieces.back().shape);
            for (const auto& block : m_fixed[i])
                m_flow.write(block);
            continue;
        }
        const auto own = merged(part, values);
        for (const auto& paragraph : own.paragraphs) {
            begin_paragraph(paragraph.shape);
            write_paragraph(m_flow, paragraph);
        }
        m_page_due |= own.page_due;
    }
}

void LetterPages::begin_paragraph(const LetterShape& shape)
{
    const bool page_due = std::exchange(m_page_due, false);
    if ((shape.new_page || page_due) && !m_at_top)
        m_flow.next_page();
    m_at_top = false;
}

/// Pictures stand on lines of their own between the texts of a paragraph.
void LetterPages::write_paragraph(pages::Writer& place, const LetterParagraph& paragraph)
{
    const auto is_picture = [](const LetterRun& run) {
        return !run.picture.empty();
    };
    place.space(paragraph.shape.before);
    for (auto run = paragraph.runs.begin(); run != paragraph.runs.end();) {
        if (is_picture(*run)) {
            write_picture(place, (run++)->picture, paragraph.shape);
            continue;
        }
        const auto end = std::find_if(run, paragraph.runs.end(), is_picture);
        write_runs(place, {run, end}, paragraph.shape);
        run = end;
    }
    place.space(paragraph.shape.after);
}

void LetterPages::write_runs(pages::Writer& place, std::span<const LetterRun> runs, const LetterShape& shape)
{
    std::vector<pages::Run> scaled;
    scaled.reserve(runs.size());
    for (const auto& run : runs)
        scaled.push_back({run.text, run.style.sized(run.style.size * m_scale)});
    place.paragraph(scaled, style_of(shape));
}

void LetterPages::write_picture(pages::Writer& place, const LetterPicture& picture, const LetterShape& shape)
{
    auto& read = m_pictures[picture.bytes.constData()];
    if (read.empty())
        read = pages::Picture::from_bytes(picture.bytes, picture.size);
    const pages::Indent indented(place, shape.indent);
    place.picture(read, picture.size, shape.align);
}

} // namespace kindrel::output
