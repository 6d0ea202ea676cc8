#include "output/reports/family_data_reports.h"

#include "output/report_layout.h"
#include "output/reports/family_data_rows.h"
#include "pages/table.h"
#include "people/data_search.h"

#include <algorithm>
#include <array>
#include <optional>
#include <type_traits>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

using people::Part;

/// A column without a heading is not there. The shares are of the room beside the family's.
struct DataColumn
{
    const char* heading = nullptr;
    qreal share = 0;
};

/// One kind of data.
struct FamilyDataLayout
{
    ReportLayout report;
    const char* none; ///< Stands alone on the page when nobody has any.
    people::Extent extent;
    std::array<DataColumn, 4> columns; ///< Of a row's `who` and its values.
    DataRows (*rows)(const ListedFamily&);
    /// The part of the record without which a family is left out, unread; null where most families have it.
    const char* part = nullptr;
};
static_assert(std::is_standard_layout_v<FamilyDataLayout>);

constexpr qreal family_share = 24;
// Points.
constexpr qreal padding = 4;    ///< Left and right in a cell.
constexpr qreal family_gap = 3; ///< Above and below the line between families.
constexpr qreal row_gap = 2;

constexpr DataColumn name{"Name", 24};
constexpr DataColumn people_of_family{"People", 34};
constexpr DataColumn tagged{"Tagged", 10};

constexpr std::array layouts{
    FamilyDataLayout{{.title = "Birth Date Report"},
                     "There are no birth dates among these people",
                     Part::details,
                     {name, {"Birth Date", 52}},
                     birth_date_rows},
    FamilyDataLayout{{.title = "Occupation Report"},
                     "There are no occupations among these people",
                     Part::occupations,
                     {name, {"Occupations", 52}},
                     occupation_rows,
                     "Occupation"},
    FamilyDataLayout{{.title = "Status Report"},
                     "There are no statuses among these people",
                     Part::status,
                     {name, {"Status", 52}},
                     status_rows},
    FamilyDataLayout{{.title = "Group Report"},
                     "There are no groups among these people",
                     Part::groups,
                     {name, {"Groups", 52}},
                     group_rows,
                     "Groups"},
    FamilyDataLayout{{.title = "Ministry Report"},
                     "There are no ministries among these people",
                     Part::ministries,
                     {name, {"Active Ministries", 26}, {"Potential Ministries", 26}},
                     ministry_rows,
                     "Ministries"},
    FamilyDataLayout{{.title = "Individual Date Report"},
                     "There are no individual dates among these people",
                     Part::dates,
                     {name, {"Description", 26}, {"Date", 16}, tagged},
                     individual_date_rows},
    FamilyDataLayout{{.title = "Flexi Report"},
                     "There are no flexi fields among these people",
                     Part::flexi,
                     {name, {"Flexi Field", 18}, {"Value", 24}, tagged},
                     flexi_rows,
                     "Flexi Fields"},
    FamilyDataLayout{{.title = "Other Contact Report"},
                     "There are no other contacts among these families",
                     Part::other_contacts,
                     {people_of_family, {"Contact", 22}, {"Phone", 20}},
                     other_contact_rows,
                     "Other Contacts"},
    FamilyDataLayout{{.title = "Family Group Report"},
                     "There are no family groups among these families",
                     Part::family_groups,
                     {people_of_family, {"Family Groups", 42}},
                     family_group_rows,
                     "Family Groups"},
    FamilyDataLayout{{.title = "Family Events Report"},
                     "There are no events among these families",
                     Part::events,
                     {{{"People", 26}, {"Date", 14}, {"Event", 36}}},
                     event_rows,
                     "Events"},
    FamilyDataLayout{{.title = "Family Date Report"},
                     "There are no family dates among these families",
                     Part::family_dates,
                     {{{"People", 26}, {"Description", 24}, {"Date", 16}, tagged}},
                     family_date_rows,
                     "Family Dates"},
    FamilyDataLayout{{.title = "Visitation Report"},
                     "There are no visits among these families",
                     Part::visits,
                     {{{"People", 18}, {"Date", 13}, {"Visitor", 20}, {"Comments", 34}}},
                     visit_rows,
                     "Visitation"},
    FamilyDataLayout{{.title = "Email Report"},
                     "There are no e-mail addresses among these people",
                     Part::address | Part::details,
                     {{{"Name", 18}, {"Address", 40}, {"Kind", 18}}},
                     email_rows},
    FamilyDataLayout{{.title = "Family Edited & Created Report"},
                     "There are no dates of editing among these families",
                     {},
                     {people_of_family, {"Created", 21}, {"Last Edited", 21}},
                     edited_and_created_rows},
    FamilyDataLayout{{.title = "Individual Preferred Name Report"},
                     "There are no preferred names among these people",
                     {},
                     {name, {"Preferred Name", 52}},
                     preferred_name_rows,
                     "Preferred Given Name"},
    FamilyDataLayout{{.title = "School Year Report"},
                     "There are no school years among these people",
                     Part::details,
                     {name, {"School Year", 52}},
                     school_year_rows,
                     "School Year"},
};

/// The columns side by side and one inside the other: a family's cell holds a row for each `who`, whose cell holds
/// their rows of values, so that a long text pushes down only what stands below it.
class DataTable
{
public:
    DataTable(pages::Flow& flow, const FamilyDataLayout& layout) : m_flow(flow), m_layout(layout)
    {
        qreal shares = family_share;
        for (const auto& column : layout.columns)
            shares += column.share;
        for (const auto& column : layout.columns) {
            if (column.heading)
                m_widths.push_back(flow.width() * column.share / shares);
        }
    }

    /// The first one writes the headings, so that nothing stands on the page before.
    void write(const QString& surname, std::span<const DataRow> rows)
    {
        if (!m_table)
            m_table.emplace(m_flow, columns(), style());
        auto content = pages::Cell::of([&](pages::Writer& cell) { write_family(cell, rows); });
        content.columns = static_cast<int>(m_widths.size());
        m_table->row({pages::Cell(surname, m_flow.type().body.bolder()), content});
    }
    [[nodiscard]] bool empty() const { return !m_table; }

private:
    void write_family(pages::Writer& cell, std::span<const DataRow> rows) const
    {
        pages::Table table(cell, {{.width = m_widths[0] - 2 * padding}, {.width = 2 * padding}, {}}, inner_style());
        while (!rows.empty()) {
            const auto next = std::find_if(rows.begin() + 1, rows.end(), [](const auto& row) { return row.begins; });
            const auto block = rows.first(static_cast<std::size_t>(next - rows.begin()));
            rows = rows.subspan(block.size());
            table.row({block.front().who, QString(),
                       pages::Cell::of([&](pages::Writer& inner) { write_values(inner, block); })});
            if (!rows.empty())
                cell.space(row_gap);
        }
    }
    void write_values(pages::Writer& cell, std::span<const DataRow> rows) const
    {
        pages::Table table(cell, value_columns(), inner_style());
        for (const auto& row : rows) {
            QStringList texts;
            for (const auto& value : row.values)
                texts << value << QString();
            table.row(texts);
            if (&row != &rows.back())
                cell.space(row_gap);
        }
    }

    [[nodiscard]] std::vector<pages::TableColumn> columns() const
    {
        std::vector<pages::TableColumn> all{{.heading = u"Family"_s}};
        for (std::size_t place = 0; place < m_widths.size(); ++place)
            all.push_back({.width = m_widths[place], .heading = QString::fromUtf8(m_layout.columns[place].heading)});
        return all;
    }
    /// Under the headings, with gaps for the padding between them.
    [[nodiscard]] std::vector<pages::TableColumn> value_columns() const
    {
        std::vector<pages::TableColumn> inner;
        for (const auto width : std::span(m_widths).subspan(1)) {
            inner.push_back({.width = width - 2 * padding});
            inner.push_back({.width = 2 * padding});
        }
        inner.pop_back();
        return inner;
    }
    [[nodiscard]] static pages::TableStyle style()
    {
        pages::TableStyle style;
        style.padding = padding;
        style.vertical_padding = family_gap;
        style.heading_shade = pages::ink::shade;
        return style;
    }
    [[nodiscard]] static pages::TableStyle inner_style()
    {
        pages::TableStyle style;
        style.lines = pages::TableLines::none;
        style.padding = style.vertical_padding = 0;
        return style;
    }

    pages::Flow& m_flow;
    const FamilyDataLayout& m_layout;
    std::vector<qreal> m_widths; ///< Of the columns beside the family's, in points.
    std::optional<pages::Table> m_table;
};

/// Those of the list that the report is about, in its order.
std::vector<int> families_of(const ReportInput& input, const FamilyDataLayout& layout)
{
    auto families = input.list.families();
    if (layout.part) {
        const auto with = people::families_with(*input.office.session, layout.part);
        std::erase_if(families, [&](int family) { return !with.contains(family); });
    }
    return families;
}

bool write_family_data(const ReportInput& input, const void* row, core::Progress& progress, pages::Flow& flow)
{
    const auto& layout = *static_cast<const FamilyDataLayout*>(row);
    DataTable table(flow, layout);
    const auto write = [&](const ListedFamily& listed, std::size_t) {
        if (const auto rows = layout.rows(listed); !rows.empty())
            table.write(listed.family.family().surname, rows);
    };
    if (!for_each_family_of(input, families_of(input, layout), progress, write, layout.extent))
        return false;
    if (table.empty())
        flow.line(QString::fromUtf8(layout.none));
    return true;
}

constexpr ReportDefinition definition(const char* key, const FamilyDataLayout& layout, const char* description,
                                      std::optional<core::Area> also = {})
{
    return {.key = key,
            .family = "Family Data Reports",
            .leaf = layout.report.title,
            .description = description,
            .area = core::Area::report_outputs,
            .write = write_family_data,
            .layout = &layout,
            .also = also};
}

constexpr std::array reports{
    definition("k70", layouts[0], "Birth dates, family by family. People without one are left out",
               core::Area::birth_dates),
    definition("k71", layouts[1], "Occupations, family by family. People without one are left out"),
    definition("k72", layouts[2], "Statuses, family by family. People without one are left out"),
    definition("k73", layouts[3], "Groups, family by family. People without one are left out"),
    definition("k74", layouts[4], "Active and potential ministries, family by family. People without one are left out"),
    definition("k75", layouts[5], "People's dates, family by family. People without one are left out"),
    definition("k76", layouts[6], "Flexi fields, family by family. People without one are left out"),
    definition("k77", layouts[7], "Other contacts of families. Families without one are left out"),
    definition("k78", layouts[8], "Family groups of families. Families without one are left out"),
    definition("k79", layouts[9], "Events of families. Families without one are left out"),
    definition("k80", layouts[10], "Dates of families. Families without one are left out"),
    definition("k81", layouts[11], "Visits to families. Families without one are left out", core::Area::visitation_tab),
    definition("k82", layouts[12], "E-mail addresses, family by family. People without one are left out"),
    definition("k83", layouts[13], "When each family's file was created and last edited"),
    definition("k84", layouts[14], "Preferred names, family by family. People without one are left out"),
    definition("k85", layouts[15], "School years, family by family. People without one are left out"),
};

} // namespace

std::span<const ReportDefinition> family_data_reports()
{
    return reports;
}

} // namespace kindrel::output
