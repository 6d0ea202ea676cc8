#pragma once

#include <QRgb>
#include <QString>

#include <array>
#include <vector>

namespace kindrel::pages {

enum class Align : quint8 { left, centre, right, justified };
enum class VerticalAlign : quint8 { top, middle, bottom };
/// What becomes of text wider than its place: further lines, or an ellipsis at the end of the first.
enum class LongText : quint8 { wrap, elide };

namespace ink {
constexpr QRgb black = 0xff000000;
constexpr QRgb grey = 0xff5a5a5a;
constexpr QRgb hairline = 0xffa8a8a8;
constexpr QRgb shade = 0xffeeeeee;
constexpr QRgb none = 0x00000000; ///< Draws nothing.
} // namespace ink

/// How a piece of text looks. Arial and Arial Narrow print in the Liberation faces of the same measures.
struct TextStyle
{
    QString family = QStringLiteral("Liberation Sans");
    qreal size = 9; ///< In points, kept to the sixteenth.
    bool bold = false;
    bool italic = false;
    bool underline = false;
    QRgb colour = ink::black;

    [[nodiscard]] TextStyle bolder(bool on = true) const;
    [[nodiscard]] TextStyle slanted(bool on = true) const;
    [[nodiscard]] TextStyle sized(qreal points) const;
    [[nodiscard]] TextStyle coloured(QRgb ink) const;

    bool operator==(const TextStyle&) const = default;
};

/// The looks that a report takes its text from, so that all reports agree.
struct TypeScale
{
    std::array<TextStyle, 3> headings; ///< Level 1 is the first.
    TextStyle body, caption, small, separator;

    /// The house's scale around a body text: headings 1.55, 1.25 and 1.1 times its size.
    [[nodiscard]] static TypeScale around(const TextStyle& body);
};

/// Text of one look inside a paragraph. Line breaks and tabs in it hold.
struct Run
{
    QString text;
    TextStyle style;
};

struct ParagraphStyle
{
    Align align = Align::left;
    LongText long_text = LongText::wrap;
    qreal indent = 0;             ///< Of every line, from the left.
    qreal first_indent = 0;       ///< Of the first line, added to `indent`; negative hangs it out.
    qreal before = 0;             ///< Space above, dropped at the top of a column.
    qreal after = 0;              ///< Space below.
    qreal line_spacing = 1.0;     ///< Times the natural line height.
    std::vector<qreal> tabs = {}; ///< Left-aligned tab stops from the paragraph's left edge, ascending.
};

} // namespace kindrel::pages
