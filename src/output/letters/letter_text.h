#pragma once

#include "pages/style.h"

#include <QByteArray>
#include <QSizeF>
#include <QString>

#include <vector>

namespace kindrel::output {

/// A PNG or JPEG file's bytes and the size in points at which it stands.
struct LetterPicture
{
    QByteArray bytes = {};
    QSizeF size = {};

    [[nodiscard]] bool empty() const { return bytes.isEmpty(); }
    friend bool operator==(const LetterPicture&, const LetterPicture&) = default;
};

/// Text of one look, or a picture. Tabs and line breaks (`\n`) are part of the text.
struct LetterRun
{
    QString text;
    pages::TextStyle style;
    LetterPicture picture = {};

    friend bool operator==(const LetterRun&, const LetterRun&) = default;
};

/// Where a paragraph stands; measures in points, kept to the twentieth.
struct LetterShape
{
    pages::Align align = pages::Align::left;
    qreal indent = 0;
    qreal first_indent = 0; ///< Of the first line, added to `indent`.
    qreal before = 0;
    qreal after = 0;
    std::vector<qreal> tabs = {};
    bool new_page = false; ///< Begins on a page of its own.

    friend bool operator==(const LetterShape&, const LetterShape&) = default;
};

/// Never without a run: that of an empty paragraph holds its look. Neighbouring runs differ in their looks.
struct LetterParagraph
{
    std::vector<LetterRun> runs;
    LetterShape shape = {};

    friend bool operator==(const LetterParagraph&, const LetterParagraph&) = default;
};

/// What stands in a letter file. Never without a paragraph.
struct LetterText
{
    std::vector<LetterParagraph> paragraphs;

    friend bool operator==(const LetterText&, const LetterText&) = default;
};

/// The most characters in a letter, ends of paragraphs among them.
inline constexpr qsizetype most_letter_text = 32 * 1024;

/// The look of a new letter's text, and of text in a file that names none.
[[nodiscard]] pages::TextStyle letter_style();
[[nodiscard]] qsizetype length_of(const LetterText& letter);
/// The text without its looks, paragraphs ending in line breaks, without pictures.
[[nodiscard]] QString plain_text(const LetterText& letter);

/// Puts text at the end of a paragraph, into its last run where that has the same look.
void add_text(LetterParagraph& paragraph, const QString& text, const pages::TextStyle& style);
/// Gives a paragraph without runs its empty one.
void close(LetterParagraph& paragraph, const pages::TextStyle& style);

} // namespace kindrel::output
