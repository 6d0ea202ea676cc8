#include "output/family_lines.h"
#include "output/report_layout.h"
#include "output/reports/group_heads.h"
#include "output/reports/group_reports.h"
#include "output/reports/item_sections.h"
#include "pages/table.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <memory>
#include <optional>
#include <type_traits>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

enum class MemberShape { table, cards };
/// Phone, mobile, e-mail and birth date, or all that a person's contacts hold.
enum class MemberDetails { main, personal };

struct GroupLayout
{
    ReportLayout report;
    GroupHead head;
    MemberShape shape;
    MemberDetails details;
};
static_assert(std::is_standard_layout_v<GroupLayout>);

constexpr pages::PageSetup landscape{.orientation = pages::Orientation::landscape};
constexpr qreal below_head = 8;
constexpr qreal card_padding = 7;
constexpr std::size_t cards_beside = 2;

constexpr std::array layouts{
    GroupLayout{{.title = "Group Report with leader design 1", .page = landscape, .text_size = 9},
                GroupHead::leader,
                MemberShape::table,
                MemberDetails::main},
    GroupLayout{
        {.title = "Group Report with leader design 2"}, GroupHead::leader, MemberShape::cards, MemberDetails::main},
    GroupLayout{{.title = "Group Report with All Group Details", .page = landscape, .text_size = 9},
                GroupHead::everything,
                MemberShape::table,
                MemberDetails::main},
    GroupLayout{{.title = "Group Report with Personal Details design 1"},
                GroupHead::meeting,
                MemberShape::table,
                MemberDetails::personal},
    GroupLayout{{.title = "Group Report with Personal Details design 2"},
                GroupHead::meeting,
                MemberShape::cards,
                MemberDetails::personal},
};

/// A member as the pages need them once their family is out of reach.
struct Card
{
    QString name;
    QStringList address;
    CaptionLines contacts;
};

/// Phone, mobile, e-mail and birth date in the order of the table's columns; a value may be empty.
std::array<pages::CaptionValue, 4> main_contacts(const ListedMember& listed)
{
    const auto& person = listed.person;
    return {{{u"Family Ph: "_s, listed.family.address().phone},
             {u"Mobile: "_s, person.mobile_phone},
             {u"Email: "_s, person.Personal_email},
             {u"Birth Date: "_s, shown(listed.family, person.birthdate)}}};
}

CaptionLines contacts_of(const ListedMember& listed, MemberDetails details)
{
    const auto main = main_contacts(listed);
    const auto shared = details == MemberDetails::personal ? std::span(main).first(1) : std::span(main);
    CaptionLines lines;
    for (const auto& pair : shared) {
        if (!pair.value.isEmpty())
            lines.push_back({pair});
    }
    if (details == MemberDetails::personal)
        std::ranges::move(personal_contacts(listed), std::back_inserter(lines));
    return lines;
}

QStringList address_of(const ListedMember& listed)
{
    return address_lines(listed.family, people::SuburbType::residential);
}

/// The members of one group in one shape.
class MemberWriter
{
public:
    virtual ~MemberWriter() = default;
    virtual void write(const ListedMember& listed) = 0;
};

/// A line for each: a column for each contact, or all contacts in one.
class TableWriter final : public MemberWriter
{
public:
    TableWriter(pages::Flow& flow, MemberDetails details)
        : m_details(details), m_name_style(flow.type().body.bolder()), m_table(flow, columns(details), style())
    {
    }

    void write(const ListedMember& listed) override
    {
        const pages::Cell name(listed.listed_name(), m_name_style);
        const auto address = address_of(listed);
        if (m_details == MemberDetails::personal) {
            m_table.row({name, address.join(u'\n'), pages::Cell::of([&](pages::Writer& cell) {
                             write_contacts(cell, contacts_of(listed, m_details));
                         })});
            return;
        }
        const auto contacts = main_contacts(listed);
        m_table.row(
            {name, address.join(u", "_s), contacts[0].value, contacts[1].value, contacts[2].value, contacts[3].value});
    }

private:
    [[nodiscard]] static std::vector<pages::TableColumn> columns(MemberDetails details)
    {
        if (details == MemberDetails::personal)
            return {{.share = 20, .heading = u"Name"_s},
                    {.share = 26, .heading = u"Address"_s},
                    {.share = 46, .heading = u"Contacts"_s}};
        return {{.share = 17, .heading = u"Name"_s},  {.share = 29, .heading = u"Address"_s},
                {.share = 11, .heading = u"Phone"_s}, {.share = 11, .heading = u"Mobile"_s},
                {.share = 28, .heading = u"Email"_s}, {.width = 62, .heading = u"Birth Date"_s}};
    }
    [[nodiscard]] static pages::TableStyle style()
    {
        pages::TableStyle style;
        style.heading_shade = pages::ink::shade;
        style.vertical_padding = 3;
        return style;
    }

    MemberDetails m_details;
    pages::TextStyle m_name_style;
    pages::Table m_table;
};

/// Framed cards beside each other.
class CardWriter final : public MemberWriter
{
public:
    CardWriter(pages::Flow& flow, MemberDetails details)
        : m_details(details), m_table(flow, std::vector<pages::TableColumn>(cards_beside), style())
    {
    }
    ~CardWriter() override
    {
        if (!m_cards.empty())
            write_cards();
    }

    void write(const ListedMember& listed) override
    {
        m_cards.push_back({listed.listed_name(), address_of(listed), contacts_of(listed, m_details)});
        if (m_cards.size() == cards_beside)
            write_cards();
    }

private:
    [[nodiscard]] static pages::TableStyle style()
    {
        pages::TableStyle style;
        style.lines = pages::TableLines::grid;
        style.padding = style.vertical_padding = card_padding;
        return style;
    }
    void write_cards()
    {
        std::vector<pages::Cell> cells;
        for (const auto& card : m_cards) {
            cells.push_back(pages::Cell::of([&card](pages::Writer& cell) {
                cell.line(card.name, cell.type().headings[2]);
                write_lines(cell, card.address, cell.type().body);
                write_contacts(cell, card.contacts);
            }));
        }
        m_table.row(cells);
        m_cards.clear();
    }

    MemberDetails m_details;
    pages::Table m_table;
    std::vector<Card> m_cards; ///< Those of the row that is not full yet.
};

/// A new page for each group, with its name, which long groups repeat, its own details and its members.
class GroupPages
{
public:
    GroupPages(const ReportInput& input, pages::Flow& flow, const GroupLayout& layout,
               std::span<const ItemSection> sections)
        : m_input(input), m_flow(flow), m_layout(layout), m_details(read_group_details(*input.office.session)),
          m_cursor(sections)
    {
    }

    void write(const ListedMember& listed, std::size_t place)
    {
        const auto& section = m_cursor.at(place);
        if (m_cursor.moved_on())
            begin(section);
        m_members->write(listed);
    }

private:
    void begin(const ItemSection& section)
    {
        if (m_members) {
            m_members.reset();
            m_heading.reset();
            m_flow.next_page();
        }
        m_heading.emplace(m_flow, title_of(section), 1);
        write_contacts(m_flow, head_lines(m_details.value(section.item.key), m_layout.head, m_input.options.withheld));
        m_flow.space(below_head);
        if (m_layout.shape == MemberShape::cards)
            m_members = std::make_unique<CardWriter>(m_flow, m_layout.details);
        else
            m_members = std::make_unique<TableWriter>(m_flow, m_layout.details);
    }

    const ReportInput& m_input;
    pages::Flow& m_flow;
    const GroupLayout& m_layout;
    QHash<int, people::GroupDetails> m_details;
    SectionCursor m_cursor;
    std::optional<pages::Group> m_heading;
    std::unique_ptr<MemberWriter> m_members;
};

bool write_groups(const ReportInput& input, const void* row, core::Progress& progress, pages::Flow& flow)
{
    const auto& layout = *static_cast<const GroupLayout*>(row);
    auto sections = read_item_sections(*input.office.session, input.list, people::SetupKind::groups);
    std::erase_if(sections, [](const ItemSection& section) { return section.item.not_active; });
    if (sections.empty())
        flow.line(u"There are no groups among these people"_s);
    GroupPages pages(input, flow, layout, sections);
    return for_each_person_of(
        input, members_of(sections), progress,
        [&](const ListedMember& listed, std::size_t place) { pages.write(listed, place); },
        people::Part::address | people::Part::details);
}

constexpr ReportDefinition definition(const char* key, const GroupLayout& layout, const char* description)
{
    return {key,         "Individual Group Reports", layout.report.title,
            description, core::Area::report_outputs, write_groups,
            &layout};
}

constexpr std::array reports{
    definition("k100", layouts[0], "A page for each group: its leader and a table of its members (landscape)"),
    definition("k101", layouts[1], "A page for each group: its leader and a card for each member"),
    definition("k102", layouts[2], "A page for each group: all its details and a table of its members (landscape)"),
    definition("k103", layouts[3], "A page for each group: when it meets and its members' personal details in a table"),
    definition("k104", layouts[4], "A page for each group: when it meets and a card of each member's personal details"),
};

} // namespace

std::span<const ReportDefinition> individual_group_reports()
{
    return reports;
}

} // namespace kindrel::output
