#include "output/directory.h"

#include "output/family_reader.h"
#include "pages/table.h"
#include "pages/text_metrics.h"

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

// Widths and heights in points; the shares divide what the gutters leave. Phone and fax fit on one line of contacts.
constexpr qreal names_share = 15;
constexpr qreal address_share = 15;
constexpr qreal contacts_share = 28;
constexpr qreal gutter = 12;
constexpr qreal entry_padding = 5;

const pages::TextStyle& surname_style(const pages::Writer& place)
{
    return place.type().headings[1];
}

QString joined(QStringView separator, std::initializer_list<QString> parts)
{
    QString text;
    for (const auto& part : parts) {
        if (!text.isEmpty() && !part.isEmpty())
            text += separator;
        text += part;
    }
    return text;
}

QString names_of(const people::DisclosedFamily& family, std::span<const people::Person* const> people,
                 QStringView separator)
{
    QString text;
    for (const auto* person : people) {
        if (!text.isEmpty())
            text += separator;
        text += family.name(*person);
    }
    return text;
}

void write_line(pages::Writer& place, const QString& text, const pages::TextStyle& style)
{
    if (!text.isEmpty())
        place.line(text, style);
}

void write_names(pages::Writer& place, const ListedFamily& listed)
{
    const auto& body = place.type().body;
    place.line(listed.family.family().surname, surname_style(place));
    write_line(place, names_of(listed.family, listed.household.adults, u" & "), body.bolder());
    write_line(place, names_of(listed.family, listed.household.children, u", "), body);
}

QString suburb_line(const people::DisclosedFamily& family)
{
    const auto& address = family.address();
    if (const auto* suburb = family.residential())
        return joined(u" ", {suburb->suburb, address.res_state, suburb->shown_postcode()});
    const auto street_known = !address.res_street.isEmpty() || !address.res_street2.isEmpty();
    return joined(u" ", {street_known ? u"Unknown Suburb"_s : QString(), address.res_state});
}

void write_address(pages::Writer& place, const people::DisclosedFamily& family)
{
    const auto& address = family.address();
    const auto& body = place.type().body;
    write_line(place, address.res_street, body);
    write_line(place, address.res_street2, body);
    write_line(place, suburb_line(family), body);
    write_line(place, address.res_country, body);
}

/// Contacts that would not fit beside each other stand beneath each other, so that no caption parts from its value.
void write_contact_line(pages::Writer& place, std::span<const pages::CaptionValue> pairs)
{
    qreal width = 0;
    for (const auto& pair : pairs) {
        width += place.metrics().width(pair.caption, place.type().caption);
        width += place.metrics().width(pair.value, place.type().body);
    }
    if (width <= place.width())
        return place.captions(pairs);
    for (const auto& pair : pairs)
        place.captions({&pair, 1});
}

void write_contacts(pages::Writer& place, const DirectoryLayout& layout, const people::Address& address)
{
    for (const auto& line : layout.contacts) {
        std::vector<pages::CaptionValue> pairs;
        pairs.reserve(line.size());
        for (const auto& contact : line) {
            if (const auto& value = address.*contact.value; !value.isEmpty())
                pairs.push_back({QStringView(contact.caption).toString(), value});
        }
        if (!pairs.empty())
            write_contact_line(place, pairs);
    }
}

pages::TableStyle entry_style()
{
    pages::TableStyle style;
    style.padding = 0;
    style.vertical_padding = entry_padding;
    return style;
}

/// Brings the first line of a cell down to the baseline of the surname beside it.
void align_with_surname(pages::Writer& place)
{
    auto& metrics = place.metrics();
    place.space(metrics.ascent(surname_style(place)) - metrics.ascent(place.type().body));
}

bool write_side_by_side(const ReportInput& input, const DirectoryLayout& layout, core::Progress& progress,
                        pages::Flow& flow)
{
    pages::Table entries(flow,
                         {{.share = names_share},
                          {.width = gutter},
                          {.share = address_share},
                          {.width = gutter},
                          {.share = contacts_share}},
                         entry_style());
    const QString gap;
    const auto write = [&](const ListedFamily& listed) {
        if (layout.bands == LetterBands::on)
            flow.separator(listed.family.family().surname);
        const auto names = [&listed](pages::Writer& cell) {
            write_names(cell, listed);
        };
        const auto address = [&listed](pages::Writer& cell) {
            align_with_surname(cell);
            write_address(cell, listed.family);
        };
        const auto contacts = [&listed, &layout](pages::Writer& cell) {
            align_with_surname(cell);
            write_contacts(cell, layout, listed.family.address());
        };
        entries.row({pages::Cell::of(names), gap, pages::Cell::of(address), gap, pages::Cell::of(contacts)});
    };
    return for_each_family(input, progress, write, people::Extent::names_and_address);
}

bool write_stacked(const ReportInput& input, const DirectoryLayout& layout, core::Progress& progress, pages::Flow& flow)
{
    const auto write = [&](const ListedFamily& listed) {
        if (layout.bands == LetterBands::on)
            flow.separator(listed.family.family().surname);
        const pages::Keep together(flow);
        write_names(flow, listed);
        write_address(flow, listed.family);
        write_contacts(flow, layout, listed.family.address());
        flow.space(2 * entry_padding);
    };
    return for_each_family(input, progress, write, people::Extent::names_and_address);
}

} // namespace

bool write_directory(const ReportInput& input, const void* layout, core::Progress& progress, pages::Flow& flow)
{
    const auto& directory = *static_cast<const DirectoryLayout*>(layout);
    const auto write = directory.shape == EntryShape::stacked ? write_stacked : write_side_by_side;
    return write(input, directory, progress, flow);
}

} // namespace kindrel::output
