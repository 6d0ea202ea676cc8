#include "output/custom/custom_layout_words.h"

#include <QLocale>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

QString quoted(QString text)
{
    for (auto& c : text) {
        if (c == u'\n' || c == u'\r')
            c = u' ';
    }
    return u'"' + text.replace(u'"', u"\"\""_s) + u'"';
}

QString number(double value)
{
    return QString::number(value, 'g', QLocale::FloatingPointShortest);
}

/// The words of a line, with single blanks; empty ones are none.
class Words
{
public:
    Words& operator<<(const QString& word)
    {
        if (!word.isEmpty())
            m_words += word;
        return *this;
    }
    Words& when(bool said, const QString& word) { return said ? *this << word : *this; }
    [[nodiscard]] QString line() const { return m_words.join(u' ') + u'\n'; }
    [[nodiscard]] QString text() const { return m_words.join(u' '); }

private:
    QStringList m_words;
};

QString text_of(const LayoutField& field)
{
    Words words;
    words << field.name;
    words.when(!field.item.isEmpty(), quoted(field.item));
    if (field.joint == u"\n")
        words << u"lines"_s;
    else if (field.joint)
        words << u"joined"_s << quoted(*field.joint);
    return u'[' + words.text() + u']';
}

QString text_of(const LayoutPart& part)
{
    switch (part.kind) {
    case LayoutPart::Kind::text:
        return quoted(part.text);
    case LayoutPart::Kind::field:
        return text_of(part.field);
    case LayoutPart::Kind::style:
        return part.text;
    case LayoutPart::Kind::tab:
        return u"tab"_s;
    case LayoutPart::Kind::open:
        return u"{"_s;
    case LayoutPart::Kind::close:
        return u"}"_s;
    }
    return {};
}

QString text_of(const LayoutParts& parts)
{
    Words words;
    for (const auto& part : parts)
        words << text_of(part);
    return words.text();
}

QString align_word(pages::Align align)
{
    return align == pages::Align::left ? QString() : word_of(layout_align_words(), align);
}

QString sized(const QString& word, const LayoutElement& element)
{
    return (Words() << word << number(element.width) << u"by"_s << number(element.height) << align_word(element.align))
        .text();
}

QString body_of(const LayoutElement& element)
{
    using Kind = LayoutElement::Kind;
    const auto always = element.always ? u"always"_s : QString();
    switch (element.kind) {
    case Kind::line:
        return (Words() << u"line"_s << always << text_of(element.parts)).text();
    case Kind::row: {
        QStringList cells;
        for (const auto& cell : element.cells)
            cells += text_of(cell);
        return (Words() << u"row"_s << always << cells.join(u" | ")).text();
    }
    case Kind::rule:
        return u"rule "_s + number(element.height);
    case Kind::space:
        return u"space "_s + number(element.height);
    case Kind::portrait:
        return sized(u"portrait"_s, element);
    case Kind::barcode:
        return sized(u"barcode"_s, element);
    case Kind::note:
        break;
    }
    return u"# "_s + element.text;
}

QString line_of(const LayoutElement& element)
{
    Words words;
    if (element.condition && element.kind != LayoutElement::Kind::note)
        words << (element.condition->unless ? u"unless"_s : u"if"_s) << text_of(element.condition->field);
    return u"    "_s + (words << body_of(element)).line();
}

QString line_of(const LayoutStyle& style)
{
    Words words;
    words << u"style"_s << style.name;
    words.when(!style.font.isEmpty(), u"font "_s + quoted(style.font));
    if (style.size)
        words << u"size"_s << number(*style.size);
    words.when(style.plain, u"plain"_s).when(style.bold, u"bold"_s).when(style.italic, u"italic"_s);
    words.when(style.underline, u"underline"_s);
    if (style.colour) {
        const auto named = word_of(layout_colour_words(), *style.colour);
        words << u"colour"_s
              << (named.isEmpty() ? u"#%1"_s.arg(*style.colour & 0xffffff, 6, 16, QLatin1Char('0')) : named);
    }
    if (style.align)
        words << word_of(layout_align_words(), *style.align);
    return words.line();
}

QString lines_of(const LayoutTable& table)
{
    if (table == LayoutTable())
        return {};
    auto text =
        (Words() << u"table"_s << word_of(layout_line_words(), table.lines)).when(table.striped, u"striped"_s).line();
    for (const auto& column : table.columns) {
        Words words;
        words << u"column"_s << quoted(column.heading);
        if (column.width > 0)
            words << u"width"_s << number(column.width);
        else
            words << u"share"_s << number(column.share);
        text += (words << align_word(column.align)).line();
    }
    return text;
}

QString lines_of(const pages::PageSetup& page)
{
    auto text =
        u"page "_s + (page.orientation == pages::Orientation::portrait ? u"portrait"_s : u"landscape"_s) + u'\n';
    text += (Words() << u"columns"_s << number(page.columns) << u"gap"_s << number(page.column_gap))
                .when(page.column_rule == pages::ColumnRule::hairline, u"hairline"_s)
                .line();
    const auto& margins = page.margins;
    return text + (Words() << u"margins"_s << number(margins.left()) << number(margins.top()) << number(margins.right())
                           << number(margins.bottom()))
                      .line();
}

QString line_of(const LayoutGrouping& grouping)
{
    return (Words() << u"group by"_s << text_of(grouping.field))
        .when(grouping.new_page, u"new page"_s)
        .when(grouping.leave_out_others, u"leave out others"_s)
        .line();
}

QString settings_of(const CustomLayout& layout)
{
    QString text;
    for (const auto& note : layout.notes)
        text += u"# "_s + note + u'\n';
    text += word_of(layout_kind_words(), layout.kind) + u'\n';
    text += u"title "_s + quoted(layout.title) + u'\n' + lines_of(layout.page);
    text += u"text "_s + number(layout.text_size) + u'\n';
    if (!layout.font.isEmpty())
        text += u"font "_s + quoted(layout.font) + u'\n';
    if (!layout.tabs.empty()) {
        Words words;
        words << u"tabs"_s;
        for (const auto tab : layout.tabs)
            words << number(tab);
        text += words.line();
    }
    text += layout.decorated ? u"decoration yes\n"_s : u"decoration no\n"_s;
    text += layout.one_to_a_page ? u"one to a page\n"_s : u"many to a page\n"_s;
    for (const auto& style : layout.styles)
        text += line_of(style);
    text += lines_of(layout.table);
    if (layout.grouping)
        text += line_of(*layout.grouping);
    return text;
}

} // namespace

QString to_text(const CustomLayout& layout)
{
    auto text = settings_of(layout);
    for (const auto& [word, place] : layout_place_words()) {
        if (layout.section(place).empty())
            continue;
        text += u'\n' + word.toString() + u'\n';
        for (const auto& element : layout.section(place))
            text += line_of(element);
    }
    return text;
}

} // namespace kindrel::output
