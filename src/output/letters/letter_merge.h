#pragma once

#include "core/dialogue.h"
#include "output/letters/letter_fields.h"
#include "output/letters/letter_text.h"

#include <optional>
#include <span>
#include <vector>

namespace kindrel::output {

/// A step of a letter. Where a field or a marker changes its look inside, its first character's look holds.
struct LetterPiece
{
    enum class Kind : quint8 { text, picture, field, filter, line_end, paragraph_end };
    Kind kind = Kind::text;
    LetterRun run = {};     ///< Of all but text and pictures the look alone.
    std::size_t field = 0;  ///< Its place among letter_fields().
    LetterShape shape = {}; ///< Of a paragraph's end.
};

/// Some paragraphs of a letter that are merged together: those that a removal filter runs across.
struct LetterPart
{
    std::vector<LetterPiece> pieces;
    bool fixed = true; ///< The same for every family.
};

/// The values of letter_fields(), by their places.
using LetterValues = std::vector<QString>;

/// A letter taken to pieces, to be merged for one family after another. What stands in brackets and is no field stays.
class LetterForm
{
public:
    explicit LetterForm(const LetterText& letter);

    /// What keeps the letter from being merged: removal filters without a partner or without anything between them.
    [[nodiscard]] std::optional<core::Message> fault() const;
    [[nodiscard]] std::span<const LetterPart> parts() const { return m_parts; }
    /// What its fields ask the register for.
    [[nodiscard]] people::Extent extent() const;
    /// Of the fields that the letter has; the others stay empty.
    [[nodiscard]] LetterValues values(const LetterFamily& family) const;
    [[nodiscard]] LetterText merged(const LetterValues& values) const;

private:
    void add_paragraph(const LetterParagraph& paragraph);
    void add(LetterPiece piece);

    std::vector<LetterPart> m_parts;
    std::vector<bool> m_used = std::vector<bool>(letter_fields().size());
    bool m_part_open = false;
    bool m_filter_open = false;
};

/// What a part comes to for one family.
struct MergedPart
{
    std::vector<LetterParagraph> paragraphs;
    bool page_due = false; ///< Whatever follows begins a page: the paragraph that was to begin it has gone.
};

/// The part with every field replaced and without its markers. A pair of markers whose fields are all empty goes with
/// everything between them, and so does the line that is blank without it. The page that something began which goes is
/// begun by what follows.
[[nodiscard]] MergedPart merged(const LetterPart& part, const LetterValues& values);

} // namespace kindrel::output
