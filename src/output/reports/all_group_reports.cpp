#include "output/family_lines.h"
#include "output/report_layout.h"
#include "output/reports/group_reports.h"
#include "output/reports/item_sections.h"

#include <array>
#include <optional>
#include <type_traits>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

struct AllGroupLayout
{
    ReportLayout report;
    people::SetupKind kind;
    const char* none; ///< Stands alone on the page when nobody carries an item.
};
static_assert(std::is_standard_layout_v<AllGroupLayout>);

constexpr pages::PageSetup columns_of_people{.columns = 3, .column_rule = pages::ColumnRule::hairline};
constexpr pages::PageSetup columns_of_families{.columns = 2, .column_rule = pages::ColumnRule::hairline};

constexpr std::array layouts{
    AllGroupLayout{
        {.title = "All Status Report", .page = columns_of_people}, people::SetupKind::status, "Nobody has a status"},
    AllGroupLayout{{.title = "All Ministry Report", .page = columns_of_people},
                   people::SetupKind::ministries,
                   "Nobody has a ministry"},
    AllGroupLayout{{.title = "All Family Group Report", .page = columns_of_families},
                   people::SetupKind::family_groups,
                   "No family is in a family group"},
};

/// The sections' headings as their members come.
class SectionPages
{
public:
    SectionPages(pages::Flow& flow, std::span<const ItemSection> sections) : m_flow(flow), m_cursor(sections) {}

    void write(std::size_t place, const QString& surname, const QString& names)
    {
        const auto& section = m_cursor.at(place);
        if (m_cursor.moved_on()) {
            m_heading.reset();
            m_heading.emplace(m_flow, title_of(section), 2);
        }
        const auto& body = m_flow.type().body;
        m_flow.paragraph({{surname, body.bolder()}, {u"  "_s + names, body}}, {.indent = hang, .first_indent = -hang});
    }

private:
    static constexpr qreal hang = 10; ///< Points by which the further lines of a long entry stand in.

    pages::Flow& m_flow;
    SectionCursor m_cursor;
    std::optional<pages::Group> m_heading;
};

bool write_people(const ReportInput& input, std::span<const ItemSection> sections, core::Progress& progress,
                  pages::Flow& flow)
{
    SectionPages pages(flow, sections);
    return for_each_person_of(
        input, members_of(sections), progress,
        [&](const ListedMember& listed, std::size_t place) { pages.write(place, listed.surname(), listed.name()); },
        {});
}

bool write_families(const ReportInput& input, std::span<const ItemSection> sections, core::Progress& progress,
                    pages::Flow& flow)
{
    SectionPages pages(flow, sections);
    std::vector<int> families;
    for (const auto& member : members_of(sections))
        families.push_back(member.surname_id);
    const auto write = [&](const ListedFamily& listed, std::size_t place) {
        const auto& [primary, spouse, children, adults] = listed.household;
        const auto names =
            joined(u", ", {names_of(listed.family, adults, u" & "), names_of(listed.family, children, u", ")});
        pages.write(place, listed.family.family().surname, names);
    };
    return for_each_family_of(input, families, progress, write, {});
}

bool write_all_groups(const ReportInput& input, const void* row, core::Progress& progress, pages::Flow& flow)
{
    const auto& layout = *static_cast<const AllGroupLayout*>(row);
    const auto sections = read_item_sections(*input.office.session, input.list, layout.kind);
    if (sections.empty())
        flow.line(QString::fromUtf8(layout.none));
    const bool families = people::setup_list(layout.kind).of_families();
    return (families ? write_families : write_people)(input, sections, progress, flow);
}

constexpr ReportDefinition definition(const char* key, const AllGroupLayout& layout, const char* description)
{
    return {key,    "All Group Reports", layout.report.title, description, core::Area::report_outputs, write_all_groups,
            &layout};
}

constexpr std::array reports{
    definition("k90", layouts[0], "The people of every status. Statuses without people are left out"),
    definition("k91", layouts[1],
               "The people of every ministry, active and potential. Ministries without people are left out"),
    definition("k92", layouts[2], "The families of every family group. Family groups without families are left out"),
};

} // namespace

std::span<const ReportDefinition> all_group_reports()
{
    return reports;
}

} // namespace kindrel::output
