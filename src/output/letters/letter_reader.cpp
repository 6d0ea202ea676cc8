#include "core/windows1252.h"
#include "output/letters/letter_file.h"
#include "output/letters/rtf_picture.h"
#include "output/letters/rtf_tokens.h"

#include <QHash>

#include <algorithm>
#include <string_view>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

constexpr qreal widest_indent = 300;
constexpr qreal largest_text = 400;
constexpr std::size_t most_tabs = 64;
constexpr std::size_t deepest = 200;
constexpr int most_pictures = 100;

constexpr auto cut_short = u"It is damaged: its end is missing.";
constexpr auto goes_on = u"It is damaged: it goes on behind its end.";
constexpr auto unreadable = u"It is damaged.";
constexpr auto too_deep = u"It is damaged: its parts lie too deeply inside each other.";
constexpr auto foreign = u"It does not begin as a letter does.";
constexpr auto too_long = u"It holds more than 32K characters of text, the most that a letter can have.";
constexpr auto many_pictures = u"It holds more than 100 pictures, the most that a letter can have.";
constexpr auto bad_picture = u"A picture in it is damaged.";

/// What the content of a group is.
enum class Content : quint8 { text, fonts, colours, picture, ignored };

/// What holds to the end of a group.
struct Group
{
    Content content = Content::text;
    int font = -1; ///< -1: the file's usual one.
    int colour = 0;
    int unicode_twins = 1; ///< Characters behind each \u for readers that know none.
    bool hidden = false;
    pages::TextStyle style = letter_style(); ///< But for font and colour.
    LetterShape shape = {};
};

bool is_dropped(QChar c)
{
    constexpr char16_t object = 0xFFFC, page_total = 0xE1F7; // Both stand for something else on a page.
    return (c < u' ' && c != u'\t' && c != u'\n') || c == object || c == page_total;
}

QString cleaned(QString text)
{
    text.replace(QChar(QChar::LineSeparator), u'\n').replace(QChar(QChar::ParagraphSeparator), u'\n');
    text.removeIf(is_dropped);
    return text;
}

qreal points(int twips, qreal least, qreal most)
{
    return std::clamp(twips / twips_per_point, least, most);
}

/// Reads one file; the state of the groups around the present place lies on a stack.
class Reader
{
public:
    explicit Reader(QByteArrayView bytes) : m_tokens(bytes) {}
    [[nodiscard]] ReadLetter read();

private:
    using Act = void (Reader::*)(const RtfToken& token, int value);
    struct Word
    {
        std::string_view name;
        Act act;
        int value = 0;
    };
    struct Words;

    [[nodiscard]] bool take(const RtfToken& token);
    void take_text(QByteArrayView bytes);
    void take_word(const RtfToken& token);
    void take_symbol(char symbol);
    void open();
    void close_group();
    void end_file();
    void fail(const char16_t* why) { m_fault = m_fault.isEmpty() ? QString::fromUtf16(why) : m_fault; }
    Group& group() { return m_groups.back(); }

    void put(const QString& text);
    void put_picture();
    void name_font(const QString& text);
    void end_paragraph();
    [[nodiscard]] pages::TextStyle style();
    [[nodiscard]] LetterShape shape();

    void character(const RtfToken&, int code) { put(QString(QChar(char16_t(code)))); }
    void paragraph(const RtfToken&, int) { end_paragraph(); }
    void page(const RtfToken&, int);
    void page_before(const RtfToken& token, int) { group().shape.new_page = !token.numbered || token.number != 0; }
    void content(const RtfToken&, int kind) { group().content = Content(kind); }
    void unicode(const RtfToken& token, int);
    void unicode_twins(const RtfToken& token, int) { group().unicode_twins = std::clamp(token.number, 0, 16); }
    void usual_font(const RtfToken& token, int) { m_usual_font = token.number; }
    void font(const RtfToken& token, int);
    void plain(const RtfToken&, int);
    void bold(const RtfToken& token, int on) { group().style.bold = flag(token, on); }
    void italic(const RtfToken& token, int on) { group().style.italic = flag(token, on); }
    void underline(const RtfToken& token, int on) { group().style.underline = flag(token, on); }
    void hide(const RtfToken& token, int on) { group().hidden = flag(token, on); }
    void size(const RtfToken& token, int);
    void colour(const RtfToken& token, int) { group().colour = token.number; }
    void colour_part(const RtfToken& token, int shift);
    void plain_shape(const RtfToken&, int) { group().shape = {}; }
    void align(const RtfToken&, int align) { group().shape.align = pages::Align(align); }
    void indent(const RtfToken& token, int) { group().shape.indent = points(token.number, 0, widest_indent); }
    void first_indent(const RtfToken& token, int);
    void before(const RtfToken& token, int) { group().shape.before = points(token.number, 0, widest_on_page); }
    void after(const RtfToken& token, int) { group().shape.after = points(token.number, 0, widest_on_page); }
    void tab_stop(const RtfToken& token, int);
    void picture_kind(const RtfToken&, int) { m_picture.known_kind = true; }
    void picture_width(const RtfToken& token, int) { m_picture.width = token.number; }
    void picture_height(const RtfToken& token, int) { m_picture.height = token.number; }
    void picture_width_percent(const RtfToken& token, int) { m_picture.width_percent = token.number; }
    void picture_height_percent(const RtfToken& token, int) { m_picture.height_percent = token.number; }

    [[nodiscard]] static bool flag(const RtfToken& token, int on)
    {
        return on != 0 && (!token.numbered || token.number != 0);
    }

    RtfTokens m_tokens;
    std::vector<Group> m_groups = {};
    bool m_ended = false;   ///< The outermost group is closed.
    bool m_starred = false; ///< The next word begins a group that a reader may pass over.
    int m_twins_left = 0;
    QString m_fault = {};

    QHash<int, QString> m_fonts = {};
    int m_usual_font = 0;
    QString m_font_name = {};
    std::vector<QRgb> m_colours = {};
    QRgb m_colour = pages::ink::black;
    RtfPicture m_picture = {};
    int m_pictures = 0;

    LetterText m_letter = {};
    LetterParagraph m_paragraph = {};
    bool m_page_before = false;
    qsizetype m_length = 0;
};

/// The words that letters know, in the order of their names.
struct Reader::Words
{
    static constexpr int passed_over = int(Content::ignored);
    static constexpr Word all[]{
        {"b", &Reader::bold, 1},
        {"blue", &Reader::colour_part, 0},
        {"bullet", &Reader::character, 0x2022},
        {"cell", &Reader::character, '\t'},
        {"cf", &Reader::colour},
        {"colortbl", &Reader::content, int(Content::colours)},
        {"deff", &Reader::usual_font},
        {"emdash", &Reader::character, 0x2014},
        {"emspace", &Reader::character, 0x2003},
        {"endash", &Reader::character, 0x2013},
        {"enspace", &Reader::character, 0x2002},
        {"f", &Reader::font},
        {"fi", &Reader::first_indent},
        {"fldinst", &Reader::content, passed_over},
        {"fonttbl", &Reader::content, int(Content::fonts)},
        {"footer", &Reader::content, passed_over},
        {"footerf", &Reader::content, passed_over},
        {"footerl", &Reader::content, passed_over},
        {"footerr", &Reader::content, passed_over},
        {"footnote", &Reader::content, passed_over},
        {"fs", &Reader::size},
        {"green", &Reader::colour_part, 8},
        {"header", &Reader::content, passed_over},
        {"headerf", &Reader::content, passed_over},
        {"headerl", &Reader::content, passed_over},
        {"headerr", &Reader::content, passed_over},
        {"i", &Reader::italic, 1},
        {"info", &Reader::content, passed_over},
        {"jpegblip", &Reader::picture_kind},
        {"ldblquote", &Reader::character, 0x201C},
        {"li", &Reader::indent},
        {"line", &Reader::character, '\n'},
        {"lquote", &Reader::character, 0x2018},
        {"nonshppict", &Reader::content, passed_over},
        {"object", &Reader::content, passed_over},
        {"page", &Reader::page},
        {"pagebb", &Reader::page_before},
        {"par", &Reader::paragraph},
        {"pard", &Reader::plain_shape},
        {"pichgoal", &Reader::picture_height},
        {"picscalex", &Reader::picture_width_percent},
        {"picscaley", &Reader::picture_height_percent},
        {"pict", &Reader::content, int(Content::picture)},
        {"picwgoal", &Reader::picture_width},
        {"plain", &Reader::plain},
        {"pngblip", &Reader::picture_kind},
        {"qc", &Reader::align, int(pages::Align::centre)},
        {"qj", &Reader::align, int(pages::Align::justified)},
        {"ql", &Reader::align, int(pages::Align::left)},
        {"qr", &Reader::align, int(pages::Align::right)},
        {"rdblquote", &Reader::character, 0x201D},
        {"red", &Reader::colour_part, 16},
        {"row", &Reader::paragraph},
        {"rquote", &Reader::character, 0x2019},
        {"sa", &Reader::after},
        {"sb", &Reader::before},
        {"sect", &Reader::paragraph},
        {"shp", &Reader::content, passed_over},
        {"stylesheet", &Reader::content, passed_over},
        {"tab", &Reader::character, '\t'},
        {"tc", &Reader::content, passed_over},
        {"tx", &Reader::tab_stop},
        {"u", &Reader::unicode},
        {"uc", &Reader::unicode_twins},
        {"ul", &Reader::underline, 1},
        {"uld", &Reader::underline, 1},
        {"uldash", &Reader::underline, 1},
        {"uldb", &Reader::underline, 1},
        {"ulnone", &Reader::underline, 0},
        {"ulth", &Reader::underline, 1},
        {"ulw", &Reader::underline, 1},
        {"ulwave", &Reader::underline, 1},
        {"v", &Reader::hide, 1},
        {"xe", &Reader::content, passed_over},
    };
    static_assert(std::ranges::is_sorted(all, {}, &Word::name));
};

ReadLetter Reader::read()
{
    for (auto token = m_tokens.next(); token.kind != RtfToken::Kind::end; token = m_tokens.next()) {
        if (!take(token))
            return {{}, m_fault};
    }
    if (!m_ended)
        return {{}, QString::fromUtf16(cut_short)};
    return {std::move(m_letter)};
}

bool Reader::take(const RtfToken& token)
{
    using Kind = RtfToken::Kind;
    if (m_ended)
        fail(goes_on);
    else if (token.kind == Kind::open)
        open();
    else if (token.kind == Kind::fault || m_groups.empty())
        fail(unreadable);
    else if (token.kind == Kind::close)
        close_group();
    else if (token.kind == Kind::text)
        take_text(token.bytes);
    else if (m_twins_left > 0)
        --m_twins_left;
    else if (token.kind == Kind::word)
        take_word(token);
    else if (token.kind == Kind::symbol)
        take_symbol(token.bytes.front());
    else if (token.kind == Kind::hex)
        put(core::from_windows1252(QByteArray(1, char(token.number))));
    else if (token.kind == Kind::binary && group().content == Content::picture)
        m_picture.bytes = token.bytes.toByteArray();
    return m_fault.isEmpty();
}

void Reader::open()
{
    m_twins_left = 0;
    m_starred = false;
    if (m_groups.size() == deepest)
        return fail(too_deep);
    m_groups.push_back(m_groups.empty() ? Group{} : m_groups.back());
}

void Reader::close_group()
{
    m_twins_left = 0;
    m_starred = false;
    if (m_groups.size() == 1)
        return end_file();
    const auto content = group().content;
    m_groups.pop_back();
    if (content == Content::picture && group().content != Content::picture)
        put_picture();
    if (content == Content::fonts && group().content != Content::fonts)
        m_font_name.clear();
}

void Reader::end_file()
{
    group().content = Content::text;
    if (!m_paragraph.runs.empty() || m_letter.paragraphs.empty())
        end_paragraph();
    m_ended = true;
}

void Reader::take_text(QByteArrayView bytes)
{
    const auto twins = std::min<qsizetype>(m_twins_left, bytes.size());
    m_twins_left -= int(twins);
    bytes = bytes.sliced(twins);
    if (bytes.isEmpty())
        return;
    if (group().content == Content::picture)
        m_picture.hex += bytes;
    else
        put(core::from_windows1252(bytes));
}

void Reader::take_word(const RtfToken& token)
{
    const std::string_view name(token.bytes.data(), std::size_t(token.bytes.size()));
    const bool may_be_passed_over = std::exchange(m_starred, false);
    if (may_be_passed_over && name != "shppict")
        group().content = Content::ignored;
    if (group().content == Content::ignored)
        return;
    const auto* const known = std::ranges::lower_bound(Words::all, name, {}, &Word::name);
    if (known != std::end(Words::all) && known->name == name)
        (this->*known->act)(token, known->value);
}

void Reader::take_symbol(char symbol)
{
    switch (symbol) {
    case '*':
        m_starred = true;
        return;
    case '~':
        return put(QString(QChar(QChar::Nbsp)));
    case '-':
        return put(QString(QChar(QChar::SoftHyphen)));
    case '_':
        return put(QString(QChar(0x2011)));
    case '\r':
    case '\n':
        return end_paragraph();
    case '\\':
    case '{':
    case '}':
        return put(QString(QLatin1Char(symbol)));
    default:
        return;
    }
}

void Reader::put(const QString& text)
{
    switch (group().content) {
    case Content::fonts:
        return name_font(text);
    case Content::colours:
        if (text.contains(u';'))
            m_colours.push_back(std::exchange(m_colour, pages::ink::black));
        return;
    case Content::picture:
    case Content::ignored:
        return;
    case Content::text:
        break;
    }
    if (group().hidden)
        return;
    const auto kept = cleaned(text);
    m_length += kept.size();
    if (m_length > most_letter_text)
        return fail(too_long);
    add_text(m_paragraph, kept, style());
}

void Reader::name_font(const QString& text)
{
    m_font_name += cleaned(text);
    const auto end = m_font_name.indexOf(u';');
    if (end < 0)
        return;
    m_fonts.insert(group().font, m_font_name.first(end).simplified());
    m_font_name.clear();
}

void Reader::put_picture()
{
    const auto picture = std::exchange(m_picture, {});
    if (!picture.known_kind || group().hidden || group().content != Content::text)
        return;
    if (++m_pictures > most_pictures)
        return fail(many_pictures);
    auto read = picture_from(picture);
    if (read.empty())
        return fail(bad_picture);
    m_paragraph.runs.push_back({{}, style(), std::move(read)});
}

void Reader::end_paragraph()
{
    if (group().content != Content::text)
        return;
    if (!m_letter.paragraphs.empty() && ++m_length > most_letter_text)
        return fail(too_long);
    close(m_paragraph, style());
    m_paragraph.shape = shape();
    m_letter.paragraphs.push_back(std::exchange(m_paragraph, {}));
}

pages::TextStyle Reader::style()
{
    auto style = group().style;
    const auto font = m_fonts.value(group().font < 0 ? m_usual_font : group().font);
    if (!font.isEmpty())
        style.family = font;
    if (group().colour > 0 && std::size_t(group().colour) < m_colours.size())
        style.colour = m_colours[std::size_t(group().colour)];
    return style;
}

LetterShape Reader::shape()
{
    auto shape = group().shape;
    shape.first_indent = std::clamp(shape.first_indent, -shape.indent, widest_indent - shape.indent);
    std::ranges::sort(shape.tabs);
    const auto same = std::ranges::unique(shape.tabs);
    shape.tabs.erase(same.begin(), same.end());
    shape.new_page = std::exchange(m_page_before, false) || shape.new_page;
    return shape;
}

void Reader::page(const RtfToken&, int)
{
    if (group().content != Content::text)
        return;
    if (!m_paragraph.runs.empty())
        end_paragraph();
    m_page_before = true;
}

void Reader::unicode(const RtfToken& token, int)
{
    put(QString(QChar(char16_t(token.number & 0xFFFF))));
    m_twins_left = group().unicode_twins;
}

void Reader::font(const RtfToken& token, int)
{
    group().font = std::max(token.number, 0);
}

void Reader::plain(const RtfToken&, int)
{
    const auto before = group();
    group() = {.content = before.content, .unicode_twins = before.unicode_twins, .shape = before.shape};
}

void Reader::size(const RtfToken& token, int)
{
    if (token.numbered)
        group().style.size = std::clamp(token.number / 2.0, 1.0, largest_text);
}

void Reader::colour_part(const RtfToken& token, int shift)
{
    m_colour = (m_colour & ~(QRgb(0xFF) << shift)) | (QRgb(std::clamp(token.number, 0, 255)) << shift);
}

void Reader::first_indent(const RtfToken& token, int)
{
    group().shape.first_indent = points(token.number, -widest_indent, widest_indent);
}

void Reader::tab_stop(const RtfToken& token, int)
{
    if (token.number > 0 && group().shape.tabs.size() < most_tabs)
        group().shape.tabs.push_back(points(token.number, 0, widest_on_page));
}

} // namespace

ReadLetter read_letter(QByteArrayView bytes)
{
    if (!bytes.startsWith("{\\rtf"))
        return {{}, QString::fromUtf16(foreign)};
    return Reader(bytes).read();
}

} // namespace kindrel::output
