#include "core/windows1252.h"
#include "output/letters/letter_file.h"
#include "output/letters/rtf_picture.h"

#include <QStringList>

#include <algorithm>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

QByteArray number(qreal value)
{
    return QByteArray::number(qRound(value));
}

/// A character that plain letters cannot say, with its nearest byte for readers that know none but bytes.
QByteArray beyond_ascii(QChar c)
{
    const auto byte = core::to_windows1252(QString(c));
    const auto twin = byte && byte->size() == 1 ? "\\'" + byte->toHex() : QByteArray("?");
    return "\\u" + QByteArray::number(qint16(c.unicode())) + twin;
}

QByteArray escaped(const QString& text)
{
    constexpr char16_t last_ascii = 0x7E;
    QByteArray bytes;
    for (const QChar c : text) {
        if (c == u'\t')
            bytes += "\\tab ";
        else if (c == u'\n')
            bytes += "\\line ";
        else if (c == u'\\' || c == u'{' || c == u'}')
            bytes.append('\\').append(char(c.unicode()));
        else if (c >= u' ' && c.unicode() <= last_ascii)
            bytes += char(c.unicode());
        else
            bytes += beyond_ascii(c);
    }
    return bytes;
}

/// The fonts and colours of a letter; runs name them by their places.
class Tables
{
public:
    explicit Tables(const LetterText& letter)
    {
        add(letter_style());
        for (const auto& paragraph : letter.paragraphs) {
            for (const auto& run : paragraph.runs)
                add(run.style);
        }
    }

    [[nodiscard]] QByteArray bytes() const
    {
        QByteArray all = "{\\fonttbl";
        for (qsizetype i = 0; i < m_fonts.size(); ++i)
            all += "{\\f" + QByteArray::number(i) + "\\fnil " + escaped(m_fonts[i]) + ";}";
        all += "}\r\n{\\colortbl;";
        for (const QRgb colour : m_colours)
            all += "\\red" + QByteArray::number(qRed(colour)) + "\\green" + QByteArray::number(qGreen(colour)) +
                   "\\blue" + QByteArray::number(qBlue(colour)) + ';';
        return all + "}\r\n";
    }

    [[nodiscard]] QByteArray words_of(const pages::TextStyle& style) const
    {
        QByteArray words = "\\plain\\f" + QByteArray::number(m_fonts.indexOf(style.family));
        words += "\\fs" + number(style.size * 2);
        if (style.colour != pages::ink::black)
            words += "\\cf" + QByteArray::number(m_colours.indexOf(style.colour) + 1);
        for (const auto& [set, word] : {std::pair{style.bold, "\\b"}, {style.italic, "\\i"}, {style.underline, "\\ul"}})
            words += set ? word : "";
        return words;
    }

private:
    void add(const pages::TextStyle& style)
    {
        if (!m_fonts.contains(style.family))
            m_fonts += style.family;
        if (style.colour != pages::ink::black && !m_colours.contains(style.colour))
            m_colours += style.colour;
    }

    QStringList m_fonts;
    QList<QRgb> m_colours;
};

QByteArray bytes_of(const LetterPicture& picture)
{
    constexpr qsizetype bytes_to_a_line = 64;
    QByteArray bytes = "{\\pict";
    bytes += is_png(picture.bytes) ? "\\pngblip" : "\\jpegblip";
    bytes += "\\picwgoal" + number(picture.size.width() * twips_per_point);
    bytes += "\\pichgoal" + number(picture.size.height() * twips_per_point);
    for (qsizetype at = 0; at < picture.bytes.size(); at += bytes_to_a_line)
        bytes += "\r\n" + picture.bytes.mid(at, bytes_to_a_line).toHex();
    return bytes + "}";
}

QByteArray words_of(const LetterShape& shape)
{
    static constexpr auto alignments = {
        std::pair{pages::Align::centre, "\\qc"}, {pages::Align::right, "\\qr"}, {pages::Align::justified, "\\qj"}};
    QByteArray words = "\\pard";
    for (const auto& [align, word] : alignments)
        words += shape.align == align ? word : "";
    for (const auto& [points, word] :
         {std::pair{shape.indent, "\\li"}, {shape.first_indent, "\\fi"}, {shape.before, "\\sb"}, {shape.after, "\\sa"}})
        words += points != 0 ? word + number(points * twips_per_point) : QByteArray();
    for (const auto tab : shape.tabs)
        words += "\\tx" + number(tab * twips_per_point);
    return words + (shape.new_page ? "\\pagebb" : "");
}

} // namespace

QByteArray letter_bytes(const LetterText& letter)
{
    const Tables tables(letter);
    QByteArray bytes = "{\\rtf1\\ansi\\ansicpg1252\\deff0\\uc1\r\n" + tables.bytes();
    for (const auto& paragraph : letter.paragraphs) {
        bytes += words_of(paragraph.shape);
        for (const auto& run : paragraph.runs) {
            bytes += tables.words_of(run.style) + ' ';
            bytes += run.picture.empty() ? escaped(run.text) : bytes_of(run.picture);
        }
        bytes += "\\par\r\n";
    }
    return bytes + "}\r\n";
}

} // namespace kindrel::output
