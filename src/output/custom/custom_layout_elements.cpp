#include "output/custom/custom_layout_parser.h"
#include "output/reports/barcode_place.h"

#include <algorithm>
#include <cmath>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

using Kind = LayoutElement::Kind;

// Points.
constexpr LayoutRange thickness_range{0.1, 10};
constexpr LayoutRange space_range{0.5, 500};
constexpr LayoutRange picture_range{8, 400};
constexpr LayoutRange barcode_heights{8, 200};
constexpr double usual_thickness = 0.5;

/// Wide enough for scanners whoever it is.
LayoutRange barcode_widths()
{
    constexpr qreal least_module = 0.7;
    constexpr int longest_id = 9999999;
    constexpr double most = 400;
    return {std::ceil(barcode_width(barcode_content(longest_id), least_module)), most};
}

/// Reads what one section's line holds.
class ElementReader
{
public:
    ElementReader(LayoutStatement& statement, const LayoutText& text)
        : m_statement(statement), m_layout(text.parsed.layout), m_place(text.place.value_or(LayoutPlace::start))
    {
    }

    void read_condition(LayoutElement& element)
    {
        const bool unless = m_statement.take(u"unless");
        if (!unless && !m_statement.take(u"if"))
            return;
        if (auto field = m_statement.take_field()) {
            check_field(m_statement, *field, m_place);
            element.condition = {*field, unless};
        } else {
            m_statement.fault(u"\"%1\" needs a field, as in \"%1 [phone]\"%2"_s.arg(unless ? u"unless"_s : u"if"_s,
                                                                                    m_statement.instead()));
        }
    }

    void read_line(LayoutElement& element)
    {
        element.always = m_statement.take(u"always");
        element.parts = parts();
        if (element.parts.empty() && !m_statement.faulty())
            m_statement.fault(u"\"line\" needs texts or fields; for an empty line write \"space\""_s);
    }

    void read_row(LayoutElement& element)
    {
        element.always = m_statement.take(u"always");
        element.cells.push_back(parts());
        while (m_statement.here() && m_statement.here()->kind == LayoutToken::Kind::bar) {
            m_statement.pass();
            element.cells.push_back(parts());
        }
        if (m_layout.table.columns.empty())
            m_statement.fault(u"a row needs a table: write \"table\" and its columns above the first section"_s);
        else if (element.cells.size() > m_layout.table.columns.size())
            m_statement.fault(u"this row has %1 cells, and the table has %2 columns"_s.arg(element.cells.size())
                                  .arg(m_layout.table.columns.size()));
        if (m_place == LayoutPlace::page_header || m_place == LayoutPlace::page_footer)
            m_statement.fault(u"a row cannot stand in \"%1\""_s.arg(words_of(m_place)));
    }

    void read_rule(LayoutElement& element)
    {
        element.height = m_statement.at_end() ? usual_thickness : m_statement.length(u"rule", thickness_range);
    }

    void read_space(LayoutElement& element) { element.height = m_statement.length(u"space", space_range); }

    void read_portrait(LayoutElement& element)
    {
        if (!is_entry() && m_place != LayoutPlace::family)
            m_statement.fault(u"a portrait cannot stand in \"%1\""_s.arg(words_of(m_place)));
        read_size(element, u"portrait", picture_range, picture_range);
    }

    void read_barcode(LayoutElement& element)
    {
        if (!is_entry())
            m_statement.fault(u"a barcode is a person's and cannot stand in \"%1\""_s.arg(words_of(m_place)));
        read_size(element, u"barcode", barcode_widths(), barcode_heights);
        if (const auto room = column_room(m_layout).width(); element.width > room)
            m_statement.fault(
                u"the barcode is wider than the columns, which have room for %1 points"_s.arg(std::floor(room)));
    }

private:
    [[nodiscard]] bool is_entry() const { return m_place == LayoutPlace::person || m_place == LayoutPlace::giver; }

    void read_size(LayoutElement& element, QStringView what, LayoutRange widths, LayoutRange heights)
    {
        element.width = m_statement.length(what, widths);
        if (!m_statement.take(u"by"))
            m_statement.fault(
                u"\"%1\" needs width and height, as in \"%1 80 by 100\"%2"_s.arg(what, m_statement.instead()));
        element.height = m_statement.length(what, heights);
        if (const auto align = value_of(layout_align_words(), m_statement.word_here())) {
            element.align = *align;
            m_statement.pass();
        }
    }

    /// Up to the end of the line or of the cell.
    LayoutParts parts()
    {
        LayoutParts all;
        bool open = false;
        for (; m_statement.here() && m_statement.here()->kind != LayoutToken::Kind::bar; m_statement.pass())
            add(*m_statement.here(), all, open);
        if (open) {
            m_statement.fault(u"a \"{\" has no closing \"}\""_s);
            all.push_back({.kind = LayoutPart::Kind::close});
        }
        return all;
    }

    void add(const LayoutToken& token, LayoutParts& all, bool& open)
    {
        switch (token.kind) {
        case LayoutToken::Kind::text:
            all.push_back({.kind = LayoutPart::Kind::text, .text = token.text});
            break;
        case LayoutToken::Kind::field:
            all.push_back({.kind = LayoutPart::Kind::field, .field = token.field});
            check_field(m_statement, all.back().field, m_place);
            break;
        case LayoutToken::Kind::word:
            add_word(token.text.toLower(), all);
            break;
        case LayoutToken::Kind::open:
            if (std::exchange(open, true))
                m_statement.fault(u"a \"{\" cannot stand within another"_s);
            else
                all.push_back({.kind = LayoutPart::Kind::open});
            break;
        case LayoutToken::Kind::close:
            if (std::exchange(open, false))
                all.push_back({.kind = LayoutPart::Kind::close});
            else
                m_statement.fault(u"a \"}\" stands here without its \"{\""_s);
            break;
        case LayoutToken::Kind::bar:
            break;
        }
    }

    void add_word(const QString& word, LayoutParts& all)
    {
        if (word == u"tab") {
            all.push_back({.kind = LayoutPart::Kind::tab});
            return;
        }
        auto known = all_of(built_in_styles());
        for (const auto& style : m_layout.styles)
            known += style.name;
        if (!known.contains(word))
            m_statement.fault(u"there is no style \"%1\"%2"_s.arg(word, did_you_mean(word, known)));
        all.push_back({.kind = LayoutPart::Kind::style, .text = word});
    }

    LayoutStatement& m_statement;
    const CustomLayout& m_layout;
    LayoutPlace m_place;
};

struct ElementWord
{
    QStringView word;
    Kind kind;
    void (ElementReader::*read)(LayoutElement&);
};

constexpr std::array words{
    ElementWord{u"line", Kind::line, &ElementReader::read_line},
    ElementWord{u"row", Kind::row, &ElementReader::read_row},
    ElementWord{u"rule", Kind::rule, &ElementReader::read_rule},
    ElementWord{u"space", Kind::space, &ElementReader::read_space},
    ElementWord{u"portrait", Kind::portrait, &ElementReader::read_portrait},
    ElementWord{u"barcode", Kind::barcode, &ElementReader::read_barcode},
};

} // namespace

bool read_element(LayoutStatement& statement, LayoutText& text)
{
    ElementReader reader(statement, text);
    LayoutElement element;
    const bool conditional = statement.word_here() == u"if" || statement.word_here() == u"unless";
    const auto first = statement.word_here();
    reader.read_condition(element);
    const auto word = statement.word_here();
    const auto found = std::ranges::find(words, QStringView(word), &ElementWord::word);
    if (found == words.end()) {
        if (conditional)
            statement.fault(
                u"\"%1\" goes on with what is printed, such as \"line\"%2"_s.arg(first, statement.instead()));
        while (conditional && !statement.at_end())
            statement.pass();
        return conditional;
    }
    if (!text.place)
        statement.fault(u"\"%1\" belongs into a section, such as \"each family\""_s.arg(word));
    statement.pass();
    element.kind = found->kind;
    (reader.*found->read)(element);
    if (text.place)
        text.parsed.layout.section(*text.place).push_back(std::move(element));
    return true;
}

QStringList element_words()
{
    QStringList all{u"if"_s, u"unless"_s};
    for (const auto& one : words)
        all += one.word.toString();
    return all;
}

} // namespace kindrel::output
