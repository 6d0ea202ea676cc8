#include "output/reports/group_history_reports.h"

#include "output/family_lines.h"
#include "output/report_layout.h"
#include "output/reports/group_history_lines.h"
#include "pages/table.h"

#include <array>
#include <optional>
#include <type_traits>
#include <utility>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

struct HistoryLayout
{
    ReportLayout report;
    HistoryOrder order;
};
static_assert(std::is_standard_layout_v<HistoryLayout>);

constexpr std::array layouts{
    HistoryLayout{{.title = "History Report Ordered by People"}, HistoryOrder::people},
    HistoryLayout{{.title = "History Report Ordered by Group"}, HistoryOrder::groups},
};

std::vector<people::Member> members_of(std::span<const HistoryLine> entries)
{
    std::vector<people::Member> members;
    for (const auto& entry : entries)
        members.push_back(entry.member);
    return members;
}

pages::TableStyle table_style()
{
    pages::TableStyle style;
    style.heading_shade = pages::ink::shade;
    return style;
}

std::vector<pages::TableColumn> history_columns(const char* first, const char* second)
{
    return {{.share = 22, .heading = QString::fromUtf8(first)},
            {.share = 34, .heading = QString::fromUtf8(second)},
            {.width = 80, .heading = u"Date In"_s},
            {.width = 80, .heading = u"Date Out"_s}};
}

/// One table: surname and name stand with each person's first entry.
class PeopleWriter
{
public:
    explicit PeopleWriter(pages::Flow& flow) : m_flow(flow) {}

    void write(const ListedMember& listed, const HistoryLine& entry)
    {
        if (!m_table)
            m_table.emplace(m_flow, history_columns("Name", "Group"), table_style());
        const bool first = std::exchange(m_person, entry.member.person_id) != entry.member.person_id;
        if (first) {
            m_together.reset();
            m_together.emplace(m_flow);
        }
        const auto name = first ? listed.listed_name() : QString();
        m_table->row({pages::Cell(name, m_flow.type().body.bolder()), entry.group, shown(listed.family, entry.date_in),
                      shown(listed.family, entry.date_out)});
    }

private:
    pages::Flow& m_flow;
    std::optional<pages::Table> m_table;
    std::optional<pages::Keep> m_together; ///< The entries of one person.
    int m_person = 0;
};

/// A section with a table of its own for each group.
class GroupWriter
{
public:
    explicit GroupWriter(pages::Flow& flow) : m_flow(flow) {}

    void write(const ListedMember& listed, const HistoryLine& entry)
    {
        if (!m_table || m_group != entry.group_id)
            begin(entry);
        m_table->row({pages::Cell(listed.surname(), m_flow.type().body.bolder()), listed.name(),
                      shown(listed.family, entry.date_in), shown(listed.family, entry.date_out)});
    }

private:
    void begin(const HistoryLine& entry)
    {
        m_table.reset();
        m_heading.reset();
        m_group = entry.group_id;
        m_heading.emplace(m_flow, entry.group, 2);
        m_table.emplace(m_flow, history_columns("Surname", "Name"), table_style());
    }

    pages::Flow& m_flow;
    std::optional<pages::Group> m_heading;
    std::optional<pages::Table> m_table;
    int m_group = 0;
};

template <class Writer>
bool write_entries(const ReportInput& input, std::span<const HistoryLine> entries, core::Progress& progress,
                   pages::Flow& flow)
{
    Writer writer(flow);
    return for_each_person_of(
        input, members_of(entries), progress,
        [&](const ListedMember& listed, std::size_t place) { writer.write(listed, entries[place]); }, {});
}

bool write_history(const ReportInput& input, const void* row, core::Progress& progress, pages::Flow& flow)
{
    const auto order = static_cast<const HistoryLayout*>(row)->order;
    const auto entries = read_history_lines(*input.office.session, input.list, order);
    if (entries.empty())
        flow.line(u"There is no group history of these people"_s);
    const auto write = order == HistoryOrder::people ? write_entries<PeopleWriter> : write_entries<GroupWriter>;
    return write(input, entries, progress, flow);
}

constexpr ReportDefinition definition(const char* key, const HistoryLayout& layout, const char* description)
{
    return {key,         "Individual Group History", layout.report.title,
            description, core::Area::report_outputs, write_history,
            &layout};
}

constexpr std::array reports{
    definition("k110", layouts[0], "The groups that each person entered and left. People without any are left out"),
    definition("k111", layouts[1], "The people who entered and left each group. Groups without any are left out"),
};

} // namespace

std::span<const ReportDefinition> group_history_reports()
{
    return reports;
}

} // namespace kindrel::output
