#include "output/reports/all_information.h"

#include "output/family_lines.h"
#include "pages/table.h"
#include "people/family_roles.h"
#include "people/field_labels.h"

#include <algorithm>
#include <array>

namespace kindrel::output {

using namespace Qt::StringLiterals;
using people::label_of;

namespace {

// Points.
constexpr qreal caption_width = 120;
constexpr qreal row_padding = 1;
constexpr qreal person_indent = 10;
constexpr qreal column_gap = 12;
constexpr qreal family_gap = 14;

/// Captions at the left, values at the right; a value without words leaves its caption out.
class ValueRows
{
public:
    explicit ValueRows(pages::Writer& place)
        : m_table(place, {{.width = caption_width}, {.share = 1}}, style()), m_look(place.type().caption)
    {
    }
    void add(const QString& caption, const QString& value)
    {
        if (!value.isEmpty())
            m_table.row({pages::Cell(caption, m_look), value});
    }
    void add(const QString& caption, const QStringList& values) { add(caption, values.join(u'\n')); }

private:
    static pages::TableStyle style()
    {
        pages::TableStyle style;
        style.lines = pages::TableLines::none;
        style.padding = 0;
        style.vertical_padding = row_padding;
        return style;
    }

    pages::Table m_table;
    pages::TextStyle m_look;
};

/// What an item's row says: its text, then its date or value and whether it is tagged.
QString item_text(const people::DisclosedFamily& family, const people::LinkRow& row)
{
    const auto text = joined(u": ", {row.text, row.date ? shown(family, row.date) : row.field});
    return row.tagged ? text + u" (Tagged)"_s : text;
}

template <class Chosen>
QStringList item_texts(const people::DisclosedFamily& family, const std::vector<people::LinkRow>& rows,
                       const Chosen& chosen)
{
    QStringList texts;
    for (const auto& row : rows) {
        if (chosen(row))
            texts += item_text(family, row);
    }
    return texts;
}

QStringList item_texts(const people::DisclosedFamily& family, const std::vector<people::LinkRow>& rows)
{
    return item_texts(family, rows, [](const auto&) { return true; });
}

QString status_word(people::FileStatus status)
{
    constexpr std::array words{"Active", "Privacy", "Prospect", "archive"};
    return label_of(words[static_cast<std::size_t>(status)]);
}

void write_file_state(pages::Writer& place, const people::DisclosedFamily& family)
{
    const auto& file = family.family();
    place.captions({{label_of("condition") + u": "_s, status_word(file.Condition)},
                    {u"   "_s + label_of("created") + u": "_s, shown(family, file.created)},
                    {u"   "_s + label_of("last_edit") + u": "_s, shown(family, file.last_edit)}});
    if (file.booked_out) {
        place.captions({{label_of("booked_out_person") + u": "_s, file.booked_out_person},
                        {u"   "_s + label_of("booked_out_date") + u": "_s, shown(family, file.booked_out_date)}});
    }
}

/// Both addresses and the family's contacts beside each other; what is empty leaves its place to the others.
void write_addresses(pages::Writer& place, const people::DisclosedFamily& family)
{
    std::vector<pages::TableColumn> columns;
    std::vector<pages::Cell> cells;
    const auto add = [&](qreal share, const std::function<void(pages::Writer&)>& write) {
        columns.insert(columns.end(), {{.share = share}, {.width = column_gap}});
        cells.insert(cells.end(), {pages::Cell::of(write), pages::Cell()});
    };
    const auto add_address = [&](const QString& caption, people::SuburbType type) {
        const auto lines = address_lines(family, type);
        if (lines.isEmpty())
            return;
        add(2, [caption, lines](pages::Writer& cell) {
            cell.line(caption, cell.type().caption);
            write_lines(cell, lines, cell.type().body);
        });
    };
    add_address(u"Residential address"_s, people::SuburbType::residential);
    add_address(u"Postal address"_s, people::SuburbType::postal);
    if (const auto contacts = family_contacts(family); !contacts.empty())
        add(3, [contacts](pages::Writer& cell) { write_contacts(cell, contacts); });
    if (cells.empty())
        return;
    pages::TableStyle style;
    style.lines = pages::TableLines::none;
    style.padding = 0;
    pages::Table table(place, std::move(columns), style);
    table.row(cells);
}

QStringList other_contacts(const people::DisclosedFamily& family)
{
    QStringList lines;
    for (const auto& [contact, phone] : family.file().other_contacts)
        lines += joined(u": ", {contact, phone});
    return lines;
}

QStringList events(const people::DisclosedFamily& family)
{
    QStringList lines;
    for (const auto& [date, event] : family.file().events)
        lines += joined(u"  ", {shown(family, date), event});
    return lines;
}

QStringList visits(const people::DisclosedFamily& family)
{
    QStringList lines;
    for (const auto& [date, visitor, comments] : family.file().visits)
        lines += joined(u"  ", {shown(family, date), visitor, comments});
    return lines;
}

void write_family_rows(pages::Writer& place, const people::DisclosedFamily& family)
{
    const auto& file = family.file();
    ValueRows rows(place);
    rows.add(label_of("family_email_description"), family.address().family_email_description);
    rows.add(label_of("other_contacts"), other_contacts(family));
    rows.add(label_of("tbl_family_group"), item_texts(family, file.family_groups).join(u", "_s));
    rows.add(label_of("tbl_family_date"), item_texts(family, file.family_dates));
    rows.add(label_of("events"), events(family));
    rows.add(label_of("visits"), visits(family));
}

/// Names beside the one that the person is listed under.
void add_other_names(ValueRows& rows, const people::DisclosedFamily& family, const people::Person& person)
{
    const auto listed = family.name(person);
    if (listed != person.Name)
        rows.add(label_of("Name"), person.Name);
    if (listed != person.preferred_name)
        rows.add(label_of("preferred_name"), person.preferred_name);
}

void add_items(ValueRows& rows, const people::DisclosedFamily& family, const people::Person& person)
{
    const auto ministries = [&](people::MinistryState state) {
        return item_texts(family, person.ministries,
                          [state](const auto& row) { return row.type == static_cast<int>(state); });
    };
    rows.add(label_of("tbl_occupation"), item_texts(family, person.occupations).join(u", "_s));
    rows.add(label_of("tbl_status"), item_texts(family, person.status).join(u", "_s));
    rows.add(label_of("tbl_group"), item_texts(family, person.groups).join(u", "_s));
    rows.add(u"Active ministries"_s, ministries(people::MinistryState::active).join(u", "_s));
    rows.add(u"Potential ministries"_s, ministries(people::MinistryState::potential).join(u", "_s));
    rows.add(label_of("tbl_individual_date"), item_texts(family, person.dates));
    rows.add(label_of("tbl_flexi"), item_texts(family, person.flexi));
    rows.add(label_of("personal_pin"), person.personal_pin);
}

void write_person(pages::Writer& place, const people::DisclosedFamily& family, const people::Person& person)
{
    const auto title = joined(u" ", {person.Title, family.name(person)});
    const pages::Group section(place, title + people::markers(person, people::Markers::full), 3);
    const pages::Indent indent(place, person_indent);
    write_line(place, people::marital_word(person.Marital), place.type().small);
    write_contacts(place, personal_contacts(family, person));
    ValueRows rows(place);
    add_other_names(rows, family, person);
    add_items(rows, family, person);
}

void write_family(pages::Flow& flow, const ListedFamily& listed)
{
    const pages::Group section(flow, listed.family.family().surname, 1);
    flow.rule({.before = 0});
    write_file_state(flow, listed.family);
    write_addresses(flow, listed.family);
    write_family_rows(flow, listed.family);
    for (const auto* person : listed.people())
        write_person(flow, listed.family, *person);
    flow.space(family_gap);
}

} // namespace

bool write_all_information(const ReportInput& input, const void*, core::Progress& progress, pages::Flow& flow)
{
    return for_each_family(
        input, progress, [&](const ListedFamily& listed) { write_family(flow, listed); }, people::whole_family);
}

} // namespace kindrel::output
