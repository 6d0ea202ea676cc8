#include "output/decoration.h"

#include "pages/table.h"
#include "pages/text_layout.h"

#include <QStringList>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

// Points.
constexpr qreal beside_logo = 12;
constexpr qreal date_width = 130;
constexpr qreal thin_line = 0.75;
constexpr qreal thick_line = 2;
constexpr qreal above_filters = 2;
constexpr qreal below_header = 8;
constexpr std::size_t filter_lines = 3; ///< At most.

/// A vision statement as the church prints it.
struct Statement
{
    QString text;
    pages::TextStyle style;
    pages::Align align = pages::Align::left;
    qreal line = 0; ///< Beneath it; 0 for none.
};

struct Header
{
    QString title, church, date, filters;
    pages::Picture logo;
    Statement vision;
};

struct Footer
{
    QString name; ///< Of the layout.
    Statement vision;
    qreal line = 0; ///< Above everything; 0 for none.
};

pages::Align alignment_of(int stored)
{
    constexpr std::array alignments{pages::Align::left, pages::Align::centre, pages::Align::right};
    return stored >= 0 && stored < int(alignments.size()) ? alignments[std::size_t(stored)] : pages::Align::left;
}

/// Bits of `vision_format`.
constexpr int bold_bit = 1;
constexpr int italic_bit = 2;

Statement statement(const core::Settings& settings, const QString& text, const pages::TextStyle& body)
{
    auto style = body.bolder(settings.vision_format & bold_bit).slanted(settings.vision_format & italic_bit);
    if (!settings.vision_font.isEmpty())
        style.family = settings.vision_font;
    if (settings.vision_font_size > 0)
        style.size = settings.vision_font_size;
    return {text, style, alignment_of(settings.vision_alignment)};
}

/// The words of the text that the lines of a page's head hold, with an ellipsis where there are more.
QString limited(const QString& text, pages::Flow& flow)
{
    const auto fits = [&](const QString& words) {
        const pages::Run run{words, flow.type().small};
        return pages::lay_out(std::span(&run, 1), {}, flow.setup().body_width(), flow.metrics()).size() <= filter_lines;
    };
    if (fits(text))
        return text;
    const auto shortened = [&](qsizetype length) {
        return text.first(std::max(text.lastIndexOf(u' ', length), qsizetype(0))) + u" \u2026"_s;
    };
    qsizetype held = 0, too_long = text.size();
    while (too_long - held > 1) {
        const auto middle = (held + too_long) / 2;
        (fits(shortened(middle)) ? held : too_long) = middle;
    }
    return shortened(held);
}

Header header_of(const ReportInput& input, const QString& title, pages::Flow& flow,
                 const std::optional<pages::Picture>& logo)
{
    const auto& office = input.office;
    const auto& settings = office.settings;
    const auto parts = input.options.head.value_or(HeadParts::of(settings));
    Header header;
    header.title = title;
    if (parts.church)
        header.church = office.church_name;
    if (parts.logo && !office.logo.isEmpty())
        header.logo = logo ? *logo : pages::Picture::from_file(office.logo, logo_room);
    if (parts.date)
        header.date = u"Report Date - "_s + core::Date::from(office.clock.today()).shown(office.day_order());
    if (parts.filters && !input.list.criteria.isEmpty())
        header.filters = limited(u"Filters in Use = "_s + input.list.criteria, flow);
    if (settings.Include_vision_reports)
        header.vision = statement(settings, settings.church_vision.isEmpty() ? settings.vision : settings.church_vision,
                                  flow.type().body);
    if (settings.vision_line || settings.vision_thick_line)
        header.vision.line = settings.vision_thick_line ? thick_line : thin_line;
    return header;
}

Footer footer_of(const ReportInput& input, const QString& name, const pages::TypeScale& type)
{
    const auto& settings = input.office.settings;
    QStringList lines;
    if (settings.include_vision_footer)
        lines = {settings.footer_vision, settings.footer_vision_line2};
    lines.removeAll(QString());
    return {name, statement(settings, lines.join(u'\n'), type.small), settings.footer_line ? thin_line : 0};
}

void write_title(pages::Writer& place, const Header& header)
{
    place.line(header.title, place.type().headings[0]);
    if (!header.church.isEmpty())
        place.line(header.church, place.type().headings[2].bolder(false));
}

qreal logo_width(const pages::Picture& logo)
{
    return QSizeF(logo.pixels()).scaled(logo_room, Qt::KeepAspectRatio).width();
}

/// The logo, if there is one, at the left, title and church beside it, the date at the right.
void write_masthead(pages::Writer& band, const Header& header)
{
    std::vector<pages::TableColumn> columns{{.share = 1}};
    std::vector<pages::Cell> cells{pages::Cell::of([&](pages::Writer& cell) { write_title(cell, header); })};
    if (!header.date.isEmpty()) {
        columns.push_back({.width = date_width, .align = pages::Align::right});
        cells.push_back({header.date, band.type().small});
    }
    if (!header.logo.empty()) {
        columns.insert(columns.begin(), {.width = logo_width(header.logo) + beside_logo});
        cells.insert(cells.begin(),
                     pages::Cell::of([&](pages::Writer& cell) { cell.picture(header.logo, logo_room); }));
    }
    pages::TableStyle style;
    style.lines = pages::TableLines::none;
    style.padding = style.vertical_padding = 0;
    style.vertical_align = pages::VerticalAlign::bottom;
    pages::Table table(band, std::move(columns), style);
    table.row(cells);
}

void write_vision(pages::Writer& band, const Statement& vision)
{
    if (vision.text.isEmpty())
        return;
    band.line(vision.text, vision.style, vision.align);
    if (vision.line > 0)
        band.rule({.thickness = vision.line, .colour = pages::ink::black, .before = 3, .after = 0});
}

void write_header(pages::Writer& band, const Header& header)
{
    write_masthead(band, header);
    if (!header.filters.isEmpty()) {
        band.space(above_filters);
        band.line(header.filters, band.type().small);
    }
    band.rule({.thickness = thin_line, .colour = pages::ink::hairline, .before = 4, .after = 4});
    write_vision(band, header.vision);
    band.space(below_header);
}

void write_footer(pages::Writer& band, const Footer& footer, int number)
{
    band.space(below_header);
    if (footer.line > 0)
        band.rule({.thickness = footer.line, .colour = pages::ink::black, .before = 0, .after = 3});
    write_vision(band, footer.vision);
    band.spread(footer.name, {}, u"Page: %1 of "_s.arg(number) + pages::page_total_mark, band.type().small);
}

} // namespace

void decorate(pages::Flow& flow, const QString& title, const ReportInput& input, const OwnBands& own)
{
    flow.set_header(
        [header = header_of(input, title, flow, own.logo), own = own.header](pages::Writer& band, int number) {
            write_header(band, header);
            if (own)
                own(band, number);
        });
    const auto footer = footer_of(input, own.layout.isEmpty() ? title : own.layout, flow.type());
    flow.set_footer([footer, own = own.footer](pages::Writer& band, int number) {
        if (own)
            own(band, number);
        write_footer(band, footer, number);
    });
}

} // namespace kindrel::output
