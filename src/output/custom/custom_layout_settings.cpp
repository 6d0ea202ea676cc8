#include "output/custom/custom_layout_parser.h"

#include <algorithm>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

// Points, but for the shares and the number of columns.
constexpr LayoutRange text_sizes{4, 36};
constexpr LayoutRange style_sizes{4, 72};
constexpr LayoutRange margin_range{0, 250};
constexpr LayoutRange gap_range{0, 100};
constexpr LayoutRange column_range{1, 4};
constexpr LayoutRange width_range{5, 800};
constexpr LayoutRange share_range{0.1, 100};
constexpr std::size_t most_table_columns = 30;
constexpr std::size_t most_tabs = 20;
constexpr std::size_t most_styles = 50;

void read_title(LayoutStatement& statement, CustomLayout& layout)
{
    layout.title = statement.text(u"title").simplified();
}

void read_page(LayoutStatement& statement, CustomLayout& layout)
{
    using pages::Orientation;
    constexpr std::array words{LayoutWord<Orientation>{u"portrait", Orientation::portrait},
                               LayoutWord<Orientation>{u"landscape", Orientation::landscape}};
    layout.page.orientation =
        statement.choice(u"page", std::span<const LayoutWord<Orientation>>(words), Orientation::portrait);
}

void read_columns(LayoutStatement& statement, CustomLayout& layout)
{
    layout.page.columns = int(statement.length(u"columns", column_range));
    if (statement.take(u"gap"))
        layout.page.column_gap = statement.length(u"gap", gap_range);
    if (statement.take(u"hairline"))
        layout.page.column_rule = pages::ColumnRule::hairline;
}

void read_margins(LayoutStatement& statement, CustomLayout& layout)
{
    std::array<double, 4> sides{};
    for (auto& side : sides)
        side = statement.length(u"margins", margin_range);
    layout.page.margins = {sides[0], sides[1], sides[2], sides[3]};
}

void read_text_size(LayoutStatement& statement, CustomLayout& layout)
{
    layout.text_size = statement.length(u"text", text_sizes);
}

void read_font(LayoutStatement& statement, CustomLayout& layout)
{
    layout.font = statement.text(u"font").simplified();
}

void read_tabs(LayoutStatement& statement, CustomLayout& layout)
{
    do {
        layout.tabs.push_back(statement.length(u"tabs", width_range));
    } while (!statement.at_end() && layout.tabs.size() < most_tabs);
    if (!std::ranges::is_sorted(layout.tabs))
        statement.fault(u"the tabs must stand in rising order"_s);
}

void read_decoration(LayoutStatement& statement, CustomLayout& layout)
{
    constexpr std::array words{LayoutWord<bool>{u"yes", true}, LayoutWord<bool>{u"no", false}};
    layout.decorated = statement.choice(u"decoration", std::span<const LayoutWord<bool>>(words), true);
}

/// "one to a page" and "many to a page"; the first word is passed already.
void read_to_a_page(LayoutStatement& statement, const QString& word, CustomLayout& layout)
{
    if (!statement.take(u"to") || !statement.take(u"a") || !statement.take(u"page"))
        statement.fault(u"\"%1\" goes on as \"%1 to a page\""_s.arg(word));
    layout.one_to_a_page = word == u"one";
}

void read_one(LayoutStatement& statement, CustomLayout& layout)
{
    read_to_a_page(statement, u"one"_s, layout);
}

void read_many(LayoutStatement& statement, CustomLayout& layout)
{
    read_to_a_page(statement, u"many"_s, layout);
}

QStringList style_options()
{
    return QStringList{u"font"_s, u"size"_s, u"plain"_s, u"bold"_s, u"italic"_s, u"underline"_s, u"colour"_s} +
           all_of(layout_align_words());
}

/// A colour by its name or as "#rrggbb".
std::optional<QRgb> colour_of(const QString& word)
{
    if (const auto named = value_of(layout_colour_words(), word))
        return named;
    bool fine = false;
    const auto number = word.sliced(word.isEmpty() ? 0 : 1).toUInt(&fine, 16);
    if (!fine || word.size() != 7 || word.front() != u'#')
        return std::nullopt;
    return QRgb(0xff000000u | number);
}

void read_colour(LayoutStatement& statement, LayoutStyle& style)
{
    style.colour = colour_of(statement.word_here());
    if (!style.colour)
        statement.fault(u"\"colour\" can be %1, or a value such as #1f4e8c%2"_s.arg(
            all_of(layout_colour_words()).join(u", "), statement.instead()));
    statement.pass();
}

struct Look
{
    QStringView word;
    bool LayoutStyle::*on;
};
constexpr std::array looks{Look{u"plain", &LayoutStyle::plain}, Look{u"bold", &LayoutStyle::bold},
                           Look{u"italic", &LayoutStyle::italic}, Look{u"underline", &LayoutStyle::underline}};

/// False for what is no property of a style.
bool read_property(LayoutStatement& statement, LayoutStyle& style)
{
    const auto word = statement.word_here();
    const auto look = std::ranges::find(looks, QStringView(word), &Look::word);
    if (look != looks.end()) {
        style.*look->on = true;
        statement.pass();
        return true;
    }
    if (const auto align = value_of(layout_align_words(), word)) {
        style.align = align;
        statement.pass();
    } else if (statement.take(u"font")) {
        style.font = statement.text(u"font").simplified();
    } else if (statement.take(u"size")) {
        style.size = statement.length(u"size", style_sizes);
    } else if (statement.take(u"colour")) {
        read_colour(statement, style);
    } else {
        statement.fault(u"a style has no property \"%1\"%2"_s.arg(word, did_you_mean(word, style_options())));
        return false;
    }
    return true;
}

bool is_style_name(const QString& word)
{
    const auto fits = [](QChar c) {
        return c.isLetterOrNumber() || c == u'-' || c == u'_';
    };
    const QStringList taken{u"always"_s, u"tab"_s};
    return !word.isEmpty() && std::ranges::all_of(word, fits) && !taken.contains(word);
}

void read_style(LayoutStatement& statement, CustomLayout& layout)
{
    LayoutStyle style{statement.word_here()};
    if (!is_style_name(style.name)) {
        statement.fault(u"\"style\" needs a name of letters and digits, other than \"always\" and \"tab\"%1"_s.arg(
            statement.instead()));
        while (!statement.at_end())
            statement.pass();
        return;
    }
    statement.pass();
    while (!statement.at_end()) {
        if (!read_property(statement, style))
            statement.pass();
    }
    if (std::ranges::find(layout.styles, style.name, &LayoutStyle::name) != layout.styles.end())
        statement.fault(u"there is a style \"%1\" already"_s.arg(style.name));
    else if (layout.styles.size() == most_styles)
        statement.fault(u"a layout can have %1 styles"_s.arg(most_styles));
    else
        layout.styles.push_back(style);
}

void read_table(LayoutStatement& statement, CustomLayout& layout)
{
    if (!statement.at_end() && statement.word_here() != u"striped")
        layout.table.lines = statement.choice(u"table", layout_line_words(), LayoutLines::rows);
    layout.table.striped = statement.take(u"striped");
}

void read_column(LayoutStatement& statement, CustomLayout& layout)
{
    LayoutColumn column{statement.text(u"column")};
    if (statement.take(u"width"))
        column.width = statement.length(u"width", width_range);
    else if (statement.take(u"share"))
        column.share = statement.length(u"share", share_range);
    if (const auto align = value_of(layout_align_words(), statement.word_here())) {
        column.align = *align;
        statement.pass();
    }
    if (layout.table.columns.size() == most_table_columns)
        statement.fault(u"a table can have %1 columns"_s.arg(most_table_columns));
    else
        layout.table.columns.push_back(column);
}

void read_grouping(LayoutStatement& statement, CustomLayout& layout)
{
    if (layout.kind == LayoutKind::receipts)
        statement.fault(u"receipts have no groups"_s);
    const bool by = statement.take(u"by");
    auto field = statement.take_field();
    if (!by || !field) {
        statement.fault(u"\"group\" goes on with a field, as in \"group by [suburb]\"%1"_s.arg(statement.instead()));
        return;
    }
    check_field(statement, *field, layout.kind == LayoutKind::families ? LayoutPlace::family : LayoutPlace::person);
    layout.grouping = {.field = *field};
    if (statement.take(u"new")) {
        layout.grouping->new_page = true;
        if (!statement.take(u"page"))
            statement.fault(u"\"new\" goes on as \"new page\""_s);
    }
    if (statement.take(u"leave")) {
        layout.grouping->leave_out_others = true;
        if (!statement.take(u"out") || !statement.take(u"others"))
            statement.fault(u"\"leave\" goes on as \"leave out others\""_s);
    }
}

/// How often a setting may stand in a layout.
enum class Times { once, often };

struct Setting
{
    QStringView word;
    void (*read)(LayoutStatement&, CustomLayout&);
    Times times = Times::once;
    QStringView as = {}; ///< Under which it counts, where two words set one thing.
};

constexpr std::array settings{
    Setting{u"title", read_title},
    Setting{u"page", read_page},
    Setting{u"columns", read_columns},
    Setting{u"margins", read_margins},
    Setting{u"text", read_text_size},
    Setting{u"font", read_font},
    Setting{u"tabs", read_tabs},
    Setting{u"decoration", read_decoration},
    Setting{u"one", read_one, Times::once, u"to a page"},
    Setting{u"many", read_many, Times::once, u"to a page"},
    Setting{u"style", read_style, Times::often},
    Setting{u"table", read_table},
    Setting{u"column", read_column, Times::often},
    Setting{u"group", read_grouping},
};

} // namespace

bool read_setting(LayoutStatement& statement, LayoutText& text)
{
    const auto word = statement.word_here();
    const auto setting = std::ranges::find(settings, QStringView(word), &Setting::word);
    if (setting == settings.end())
        return false;
    if (text.place)
        statement.fault(u"\"%1\" belongs above the first section"_s.arg(word));
    if (setting->times == Times::once)
        note_once(statement, text, (setting->as.isEmpty() ? setting->word : setting->as).toString());
    statement.pass();
    setting->read(statement, text.parsed.layout);
    return true;
}

QStringList setting_words()
{
    QStringList words;
    for (const auto& setting : settings)
        words += setting.word.toString();
    return words;
}

} // namespace kindrel::output
