#include "output/letters/letter_merge.h"

#include <algorithm>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

using Kind = LetterPiece::Kind;
using Pieces = std::span<const LetterPiece>;

constexpr auto uneven_filters =
    u"You have incorrectly used the removal filter, an uneven amount are on this letter, as a removal filter must have "
    "one before an object and after an object, so an even amount must exist on the letter.";
constexpr auto fix_before = u"Please fix this up before continuing.";
constexpr auto empty_filter = u"A removal filter exists on this letter that does not have an object between it";

/// Stands for a picture among a paragraph's characters.
constexpr QChar picture_mark{0xFFFC};

/// A paragraph's characters and the runs that they belong to.
struct Characters
{
    QString text;
    std::vector<const LetterRun*> runs;

    explicit Characters(const LetterParagraph& paragraph)
    {
        for (const auto& run : paragraph.runs) {
            text += run.picture.empty() ? run.text : QString(picture_mark);
            runs.resize(std::size_t(text.size()), &run);
        }
    }
    /// The end of the text from `start` on that has one look and neither lines, pictures nor brackets behind its start.
    [[nodiscard]] qsizetype end_of_text(qsizetype start) const
    {
        auto end = start + 1;
        while (end < text.size() && runs[std::size_t(end)] == runs[std::size_t(start)] && text[end] != u'[' &&
               text[end] != u'\n')
            ++end;
        return end;
    }
    [[nodiscard]] bool is_picture(qsizetype at) const { return !runs[std::size_t(at)]->picture.empty(); }
};

bool is_blank(Pieces pieces)
{
    return std::ranges::all_of(pieces, [](const auto& piece) {
        return piece.kind == Kind::line_end || piece.kind == Kind::paragraph_end ||
               (piece.kind == Kind::text && piece.run.text.trimmed().isEmpty());
    });
}

/// The end of the stretch that the marker in front of `pieces` begins.
std::size_t length_to_filter(Pieces pieces)
{
    return std::size_t(std::ranges::find(pieces, Kind::filter, &LetterPiece::kind) - pieces.begin());
}

/// Puts the lines of a part together, leaving out those that a removal filter emptied.
class Merging
{
public:
    explicit Merging(const LetterValues& values) : m_values(values) {}

    [[nodiscard]] MergedPart merge(Pieces pieces)
    {
        bool inside = false;
        for (std::size_t i = 0; i < pieces.size(); ++i) {
            if (pieces[i].kind != Kind::filter) {
                take(pieces[i]);
                continue;
            }
            const auto stretch = pieces.subspan(i + 1);
            const auto length = length_to_filter(stretch);
            if (!inside && merges_empty(stretch.first(length))) {
                remove(stretch.first(length));
                i += length + 1;
            } else {
                inside = !inside;
            }
        }
        return std::move(m_merged);
    }

private:
    [[nodiscard]] bool merges_empty(Pieces stretch) const
    {
        const auto is_field = [](const auto& piece) {
            return piece.kind == Kind::field;
        };
        const auto is_filled = [&](const auto& piece) {
            return is_field(piece) && !m_values[piece.field].isEmpty();
        };
        return std::ranges::any_of(stretch, is_field) && std::ranges::none_of(stretch, is_filled);
    }

    void remove(Pieces stretch)
    {
        m_removed = true;
        m_merged.page_due |= std::ranges::any_of(stretch, [](const auto& piece) { return piece.shape.new_page; });
    }

    void take(const LetterPiece& piece)
    {
        switch (piece.kind) {
        case Kind::text:
            return add_text(m_line, piece.run.text, piece.run.style);
        case Kind::field:
            return add_text(m_line, m_values[piece.field], piece.run.style);
        case Kind::picture:
            m_line.runs.push_back(piece.run);
            return;
        case Kind::line_end:
            return end_line(piece);
        case Kind::paragraph_end:
            return end_paragraph(piece);
        case Kind::filter:
            return;
        }
    }

    /// True for a line that stays; it stands at the end of the paragraph then.
    bool keep_line()
    {
        const auto line = std::exchange(m_line, {});
        const bool blank = std::ranges::all_of(
            line.runs, [](const auto& run) { return run.picture.empty() && run.text.trimmed().isEmpty(); });
        if (std::exchange(m_removed, false) && blank)
            return false;
        for (const auto& run : line.runs) {
            if (run.picture.empty())
                add_text(m_paragraph, run.text, run.style);
            else
                m_paragraph.runs.push_back(run);
        }
        return true;
    }

    void end_line(const LetterPiece& piece)
    {
        if (keep_line())
            add_text(m_paragraph, u"\n"_s, piece.run.style);
    }

    void end_paragraph(const LetterPiece& piece)
    {
        m_merged.page_due |= piece.shape.new_page;
        if (!keep_line()) {
            if (m_paragraph.runs.empty())
                return;
            drop_last_line_end();
        }
        close(m_paragraph, piece.run.style);
        m_paragraph.shape = piece.shape;
        m_paragraph.shape.new_page = std::exchange(m_merged.page_due, false);
        m_merged.paragraphs.push_back(std::exchange(m_paragraph, {}));
    }

    void drop_last_line_end()
    {
        auto& last = m_paragraph.runs.back();
        last.text.chop(1);
        if (last.text.isEmpty())
            m_paragraph.runs.pop_back();
    }

    const LetterValues& m_values;
    MergedPart m_merged;
    LetterParagraph m_paragraph, m_line;
    bool m_removed = false; ///< Something of the present line.
};

} // namespace

LetterForm::LetterForm(const LetterText& letter)
{
    for (const auto& paragraph : letter.paragraphs)
        add_paragraph(paragraph);
}

void LetterForm::add_paragraph(const LetterParagraph& paragraph)
{
    const Characters characters(paragraph);
    const auto& text = characters.text;
    for (qsizetype at = 0; at < text.size();) {
        const auto& run = *characters.runs[std::size_t(at)];
        const LetterRun look{{}, run.style};
        const auto rest = QStringView(text).sliced(at);
        if (characters.is_picture(at)) {
            add({Kind::picture, run});
            ++at;
        } else if (text[at] == u'\n') {
            add({Kind::line_end, look});
            ++at;
        } else if (rest.startsWith(removal_filter)) {
            add({Kind::filter, look});
            at += removal_filter.size();
        } else if (const auto found = field_at_start(rest)) {
            add({Kind::field, look, found->place});
            at += found->length;
        } else {
            const auto end = characters.end_of_text(at);
            add({Kind::text, {text.sliced(at, end - at), run.style}});
            at = end;
        }
    }
    add({Kind::paragraph_end, {{}, paragraph.runs.back().style}, 0, paragraph.shape});
}

void LetterForm::add(LetterPiece piece)
{
    if (!m_part_open)
        m_parts.emplace_back();
    if (piece.kind == Kind::filter)
        m_filter_open = !m_filter_open;
    if (piece.kind == Kind::field)
        m_used[piece.field] = true;
    if (piece.kind == Kind::filter || piece.kind == Kind::field)
        m_parts.back().fixed = false;
    m_part_open = piece.kind != Kind::paragraph_end || m_filter_open;
    m_parts.back().pieces.push_back(std::move(piece));
}

std::optional<core::Message> LetterForm::fault() const
{
    if (m_filter_open)
        return core::Message{QString::fromUtf16(uneven_filters), QString::fromUtf16(fix_before)};
    for (const auto& part : m_parts) {
        auto rest = Pieces(part.pieces);
        for (bool inside = false; !rest.empty(); inside = !inside) {
            const auto length = length_to_filter(rest);
            if (inside && is_blank(rest.first(length)))
                return core::Message{QString::fromUtf16(empty_filter)};
            rest = rest.subspan(std::min(length + 1, rest.size()));
        }
    }
    return std::nullopt;
}

people::Extent LetterForm::extent() const
{
    people::Extent all;
    for (std::size_t place = 0; place < m_used.size(); ++place) {
        if (m_used[place])
            all |= letter_fields()[place].extent;
    }
    return all;
}

LetterValues LetterForm::values(const LetterFamily& family) const
{
    LetterValues values(m_used.size());
    for (std::size_t place = 0; place < m_used.size(); ++place) {
        if (m_used[place])
            values[place] = letter_fields()[place].value(family);
    }
    return values;
}

LetterText LetterForm::merged(const LetterValues& values) const
{
    LetterText letter;
    bool page_due = false;
    for (const auto& part : m_parts) {
        auto merged = output::merged(part, values);
        if (!merged.paragraphs.empty())
            merged.paragraphs.front().shape.new_page |= std::exchange(page_due, false);
        page_due |= merged.page_due;
        std::ranges::move(merged.paragraphs, std::back_inserter(letter.paragraphs));
    }
    if (letter.paragraphs.empty())
        letter.paragraphs.push_back({{{{}, letter_style()}}});
    return letter;
}

MergedPart merged(const LetterPart& part, const LetterValues& values)
{
    return Merging(values).merge(part.pieces);
}

} // namespace kindrel::output
