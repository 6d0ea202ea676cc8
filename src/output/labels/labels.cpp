#include "output/labels/labels.h"

#include "core/entry.h"
#include "output/family_lines.h"
#include "output/labels/fitted_text.h"
#include "output/labels/label_sheets.h"
#include "output/reports/barcode_place.h"
#include "pages/barcode.h"

#include <array>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

// Points.
constexpr QSizeF label_padding(9, 5);
constexpr QSizeF tag_padding(9, 7);
constexpr qreal between = 4; ///< The parts of a tag.
constexpr qreal tag_module = 1;
constexpr qreal highest_bars = 34;
constexpr qreal bars_share = 0.35; ///< Of the tag's height, at most.
constexpr qreal church_share = 0.25;
constexpr qreal number_size = 9;

QRectF padded(QSizeF label, QSizeF padding)
{
    return QRectF({}, label)
        .adjusted(padding.width(), padding.height(), -padding.width(), -padding.height())
        .normalized();
}

pages::TextStyle look(const LabelFont& font, const ReportInput& input)
{
    const auto style = font.style();
    return style.sized(style.size * input.options.text_percent / 100);
}

void add_at(std::vector<pages::Item>& items, const pages::Drawing& drawing, QPointF at)
{
    for (const auto& item : drawing.items)
        items.push_back(pages::moved(item, at));
}

/// In the middle of the room's height.
void add_centred(std::vector<pages::Item>& items, const pages::Drawing& drawing, const QRectF& room)
{
    add_at(items, drawing, {room.left(), room.top() + (room.height() - drawing.size.height()) / 2});
}

/// Whether the stored sheet can be printed; otherwise says why not.
bool is_printable(const ReportInput& input, const LabelGrid& grid)
{
    const auto fault = fault_of(grid);
    if (fault)
        input.office.dialogue.show({fault.text});
    return !fault;
}

std::vector<LabelText> label_texts(const ListedFamily& listed, const LabelSheet& sheet, const ReportInput& input)
{
    std::vector<LabelText> texts{{addressee_of(listed), look(sheet.name, input)}};
    for (const auto& line : mailing_lines(listed.family))
        texts.push_back({line, look(sheet.address, input)});
    return texts;
}

/// Draws the tags of one run.
class TagPainter
{
public:
    TagPainter(const ReportInput& input, const TagSheet& tags, TagBars bars, pages::TextMetrics& metrics)
        : m_input(input), m_tags(tags), m_bars(bars), m_metrics(metrics)
    {
    }

    [[nodiscard]] std::vector<pages::Item> tag(const ListedMember& listed, QSizeF size) const
    {
        std::vector<pages::Item> items;
        if (m_tags.shows_border)
            items.push_back(pages::RectsItem{.rects = {{{}, size}}, .outline = pages::ink::grey});
        auto room = padded(size, tag_padding);
        if (m_tags.shows_church)
            add_church(items, room);
        if (m_bars != TagBars::none)
            add_bars(items, room, listed.person.person_id);
        const std::array names{LabelText{listed.name(), look(m_tags.given_name, m_input)},
                               LabelText{listed.surname(), look(m_tags.surname, m_input)}};
        add_centred(items, fitted(names, room.size(), pages::Align::centre, m_metrics), room);
        return items;
    }

private:
    /// Takes its room from the top.
    void add_church(std::vector<pages::Item>& items, QRectF& room) const
    {
        const LabelText text{m_input.office.church_name, look(m_tags.church, m_input)};
        const auto church =
            fitted(std::span(&text, 1), {room.width(), room.height() * church_share}, pages::Align::centre, m_metrics);
        add_at(items, church, room.topLeft());
        room.setTop(room.top() + church.size.height() + between);
    }

    /// Takes their room from the bottom.
    void add_bars(std::vector<pages::Item>& items, QRectF& room, int person_id) const
    {
        auto high = std::min(highest_bars, room.height() * bars_share);
        if (m_bars == TagBars::bars_and_number) {
            const LabelText text{QString::number(person_id), {.size = number_size}};
            const auto number =
                fitted(std::span(&text, 1), {room.width(), number_size * 1.5}, pages::Align::centre, m_metrics);
            room.setBottom(room.bottom() - number.size.height());
            add_at(items, number, room.bottomLeft());
        }
        const auto content = barcode_content(person_id);
        const auto wide = std::min(barcode_width(content, tag_module), room.width());
        room.setBottom(room.bottom() - high);
        add_at(items, pages::barcode(content, {wide, high}), {room.left() + (room.width() - wide) / 2, room.bottom()});
        room.setBottom(room.bottom() - between);
    }

    const ReportInput& m_input;
    const TagSheet& m_tags;
    TagBars m_bars;
    pages::TextMetrics& m_metrics;
};

/// How a run came out. What was refused has been told; that there is nobody to print has not.
enum class Outcome { whole, cancelled_or_refused, nobody };

Outcome finished(LabelSheets& sheets)
{
    return sheets.finish() ? Outcome::whole : Outcome::nobody;
}

bool told(const ReportInput& input, Outcome outcome)
{
    if (outcome == Outcome::nobody)
        input.office.dialogue.show({u"No people found for creating a report"_s});
    return outcome == Outcome::whole;
}

Outcome write_labels(const ReportInput& input, const LabelSheet& sheet, core::Progress& progress, pages::Flow& flow)
{
    if (!is_printable(input, sheet.grid))
        return Outcome::cancelled_or_refused;
    LabelSheets sheets(flow, sheet.grid);
    const auto room = padded(sheets.label_size(), label_padding);
    const auto write = [&](const ListedFamily& listed) {
        if (listed.household.adults.empty() && listed.household.children.empty())
            return; // Those on the list have left the family.
        std::vector<pages::Item> items;
        const auto texts = label_texts(listed, sheet, input);
        add_centred(items, fitted(texts, room.size(), pages::Align::left, flow.metrics()), room);
        sheets.add(items);
    };
    if (!for_each_family(input, progress, write, people::Part::address))
        return Outcome::cancelled_or_refused;
    return finished(sheets);
}

Outcome write_tags(const ReportInput& input, const TagSheet& tags, TagBars bars, core::Progress& progress,
                   pages::Flow& flow)
{
    if (!is_printable(input, tags.grid))
        return Outcome::cancelled_or_refused;
    LabelSheets sheets(flow, tags.grid);
    const TagPainter painter(input, tags, bars, flow.metrics());
    const auto write = [&](const ListedMember& listed) {
        sheets.add(painter.tag(listed, sheets.label_size()));
    };
    if (!for_each_person(input, progress, write, {}))
        return Outcome::cancelled_or_refused;
    return finished(sheets);
}

constexpr auto family_name = "Labels";
constexpr ReportLayout mailing_labels{.title = "Mailing Labels", .decorated = false};
constexpr NameTagLayout name_tags{{.title = "Name Tag Labels", .decorated = false}, TagBars::none};

constexpr std::array reports{
    ReportDefinition{"k60",
                     family_name,
                     "Mailing Labels",
                     "Create mailing labels for mail outs",
                     core::Area::report_outputs,
                     write_mailing_labels,
                     &mailing_labels,
                     mailing_label_page,
                     {},
                     mailing_labels_printable},
    ReportDefinition{"k61",
                     family_name,
                     "Name Tag Labels",
                     "Create Personal Name Tags",
                     core::Area::report_outputs,
                     write_name_tags,
                     &name_tags,
                     name_tag_page,
                     {},
                     name_tags_printable},
};

using WriteSheets = std::function<Outcome(const ReportInput&, core::Progress&, pages::Flow&)>;

ReportChoice report_on(const LabelGrid& grid, const ReportDefinition& like, WriteSheets write)
{
    const auto run = [grid, write = std::move(write)](const ReportInput& input, core::Progress& progress,
                                                      pages::PageSpool& spool) {
        pages::Flow flow(spool, sheet_page(grid));
        if (!core::permitted(input.office, core::Area::report_outputs) ||
            write(input, progress, flow) != Outcome::whole)
            return false;
        flow.finish();
        return true;
    };
    const auto ready = [grid](const core::Office& office) {
        return office.may(core::Area::report_outputs) && !fault_of(grid);
    };
    return {QString::fromLatin1(like.key),
            QString::fromLatin1(like.family),
            QString::fromLatin1(like.leaf),
            QString::fromLatin1(like.description),
            run,
            ready};
}

} // namespace

bool write_mailing_labels(const ReportInput& input, const void*, core::Progress& progress, pages::Flow& flow)
{
    return told(input, write_labels(input, load_label_setup(input.office).labels, progress, flow));
}

bool write_name_tags(const ReportInput& input, const void* layout, core::Progress& progress, pages::Flow& flow)
{
    const auto bars = static_cast<const NameTagLayout*>(layout)->bars;
    return told(input, write_tags(input, load_label_setup(input.office).tags, bars, progress, flow));
}

ReportChoice mailing_labels_on(const LabelSheet& sheet)
{
    return report_on(sheet.grid, reports[0],
                     [sheet](const ReportInput& input, core::Progress& progress, pages::Flow& flow) {
                         return write_labels(input, sheet, progress, flow);
                     });
}

ReportChoice name_tags_on(const TagSheet& sheet, TagBars bars)
{
    return report_on(sheet.grid, reports[1],
                     [sheet, bars](const ReportInput& input, core::Progress& progress, pages::Flow& flow) {
                         return write_tags(input, sheet, bars, progress, flow);
                     });
}

ReportChoice::Write label_drawing(const ReportDefinition& report)
{
    const bool of_tags = report.write == write_name_tags;
    if (!of_tags && report.write != write_mailing_labels)
        return {};
    return
        [of_tags, layout = report.layout](const ReportInput& input, core::Progress& progress, pages::PageSpool& spool) {
            const auto setup = load_label_setup(input.office);
            const auto drawn = of_tags ? name_tags_on(setup.tags, static_cast<const NameTagLayout*>(layout)->bars)
                                       : mailing_labels_on(setup.labels);
            return drawn.ready(input.office) && drawn.run(input, progress, spool);
        };
}

pages::PageSetup mailing_label_page(const ReportInput& input)
{
    return sheet_page(load_label_setup(input.office).labels.grid);
}

pages::PageSetup name_tag_page(const ReportInput& input)
{
    return sheet_page(load_label_setup(input.office).tags.grid);
}

bool mailing_labels_printable(const core::Office& office)
{
    return !fault_of(load_label_setup(office).labels.grid);
}

bool name_tags_printable(const core::Office& office)
{
    return !fault_of(load_label_setup(office).tags.grid);
}

std::span<const ReportDefinition> label_reports()
{
    return reports;
}

} // namespace kindrel::output
