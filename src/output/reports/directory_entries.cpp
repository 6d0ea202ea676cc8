#include "output/reports/directory_entries.h"

#include "output/family_lines.h"
#include "pages/table.h"
#include "pages/text_metrics.h"

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

// Points; the shares divide what the gutters leave. Phone and fax fit on one line of contacts.
constexpr qreal names_share = 15;
constexpr qreal address_share = 15;
constexpr qreal contacts_share = 28;
constexpr qreal family_share = 4;
constexpr qreal people_share = 5;
constexpr qreal gutter = 12;
constexpr qreal entry_padding = 5;
constexpr qreal person_gap = 3;
constexpr qreal detail_indent = 10;

const pages::TextStyle& surname_style(const pages::Writer& place)
{
    return place.type().headings[1];
}

void write_names(pages::Writer& place, const ListedFamily& listed)
{
    const auto& body = place.type().body;
    place.line(listed.family.family().surname, surname_style(place));
    write_line(place, names_of(listed.family, listed.household.adults, u" & "), body.bolder());
    write_line(place, names_of(listed.family, listed.household.children, u", "), body);
}

void write_address(pages::Writer& place, const people::DisclosedFamily& family)
{
    write_lines(place, address_lines(family, people::SuburbType::residential), place.type().body);
}

void write_people(pages::Writer& place, const ListedFamily& listed)
{
    for (const auto* person : listed.people()) {
        place.line(listed.family.name(*person), place.type().body.bolder());
        const pages::Indent indent(place, detail_indent);
        write_contacts(place, personal_contacts(listed.family, *person));
        place.space(person_gap);
    }
}

void write_phones(pages::Writer& place, const ListedFamily& listed)
{
    const auto& address = listed.family.address();
    place.caption(u"Family Ph: "_s, address.phone);
    place.caption(u"Family Mobile: "_s, address.family_mobile);
    for (const auto* person : listed.people()) {
        const auto name = listed.family.name(*person);
        place.caption(name + u"  Mobile: "_s, person->mobile_phone);
        place.caption(name + u"  Business Phone: "_s, person->business_phone);
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

/// Two cells beside each other, the first of which begins with the surname.
void write_beside(pages::Flow& flow, const std::function<void(pages::Writer&)>& first,
                  const std::function<void(pages::Writer&)>& second)
{
    pages::Table entry(flow, {{.share = family_share}, {.width = gutter}, {.share = people_share}}, entry_style());
    entry.row({pages::Cell::of(first), QString(), pages::Cell::of(second)});
}

} // namespace

void write_side_by_side(pages::Flow& flow, const ListedFamily& listed)
{
    pages::Table entry(flow,
                       {{.share = names_share},
                        {.width = gutter},
                        {.share = address_share},
                        {.width = gutter},
                        {.share = contacts_share}},
                       entry_style());
    const auto names = [&](pages::Writer& cell) {
        write_names(cell, listed);
    };
    const auto address = [&](pages::Writer& cell) {
        align_with_surname(cell);
        write_address(cell, listed.family);
    };
    const auto contacts = [&](pages::Writer& cell) {
        align_with_surname(cell);
        write_contacts(cell, family_contacts(listed.family));
    };
    entry.row({pages::Cell::of(names), QString(), pages::Cell::of(address), QString(), pages::Cell::of(contacts)});
}

void write_stacked(pages::Flow& flow, const ListedFamily& listed)
{
    const pages::Keep together(flow);
    write_names(flow, listed);
    write_address(flow, listed.family);
    write_contacts(flow, family_contacts(listed.family));
    flow.space(2 * entry_padding);
}

void write_with_phones(pages::Flow& flow, const ListedFamily& listed)
{
    const auto names = [&](pages::Writer& cell) {
        write_names(cell, listed);
        write_address(cell, listed.family);
    };
    const auto phones = [&](pages::Writer& cell) {
        align_with_surname(cell);
        write_phones(cell, listed);
    };
    write_beside(flow, names, phones);
}

void write_with_details(pages::Flow& flow, const ListedFamily& listed)
{
    const auto family = [&](pages::Writer& cell) {
        cell.line(listed.family.family().surname, surname_style(cell));
        write_address(cell, listed.family);
        write_contacts(cell, family_contacts(listed.family));
    };
    const auto members = [&](pages::Writer& cell) {
        align_with_surname(cell);
        write_people(cell, listed);
    };
    write_beside(flow, family, members);
}

void write_details_stacked(pages::Flow& flow, const ListedFamily& listed)
{
    const pages::Keep together(flow);
    const pages::Group entry(flow, listed.family.family().surname, 2);
    write_address(flow, listed.family);
    write_contacts(flow, family_contacts(listed.family));
    flow.space(person_gap);
    write_people(flow, listed);
    flow.space(entry_padding);
}

} // namespace kindrel::output
