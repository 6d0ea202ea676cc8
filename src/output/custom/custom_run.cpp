#include "output/custom/custom_run.h"

#include "output/custom/custom_groups.h"
#include "output/decoration.h"

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

void add_extent(people::Extent& extent, const LayoutField& field)
{
    if (const auto* known = find_custom_field(field.name))
        extent |= known->extent;
}

void add_extent(people::Extent& extent, const LayoutParts& parts)
{
    for (const auto& part : parts) {
        if (part.kind == LayoutPart::Kind::field)
            add_extent(extent, part.field);
    }
}

/// Writes one report from its start to its end.
class CustomRun
{
public:
    CustomRun(const CustomLayout& layout, const ReportInput& input, pages::Flow& flow, CustomPages& pages,
              const RunFacts& facts)
        : m_layout(layout), m_input(input), m_flow(flow), m_pages(pages), m_facts(facts),
          m_listed(sorted_people(input.list))
    {
    }

    bool write(core::Progress& progress)
    {
        m_pages.write(m_flow, LayoutPlace::start, {m_facts});
        if (!(m_layout.kind == LayoutKind::families ? write_families(progress) : write_people(progress)))
            return false;
        end_group();
        m_all.show_in(m_facts);
        m_pages.write(m_flow, LayoutPlace::end, {m_facts});
        m_pages.close_table();
        return true;
    }

private:
    bool write_families(core::Progress& progress)
    {
        const auto extent = extent_of(m_layout);
        if (!m_layout.grouping) {
            const auto write = [&](const ListedFamily& listed) {
                write_family(listed);
            };
            return for_each_family(m_input, progress, write, extent);
        }
        const auto groups = groups_of_families(m_layout, m_input, m_facts, progress);
        if (!groups)
            return false;
        const auto write = [&](const ListedFamily& listed, std::size_t place) {
            enter(groups->groups[place], groups->headings);
            write_family(listed);
        };
        return for_each_family_of(m_input, groups->keys, progress, write, extent);
    }

    bool write_people(core::Progress& progress)
    {
        const auto extent = extent_of(m_layout);
        if (!m_layout.grouping) {
            const auto write = [&](const ListedMember& listed) {
                write_person(listed);
            };
            return for_each_person(m_input, progress, write, extent);
        }
        const auto groups = groups_of_people(m_layout, m_input, m_facts, progress);
        if (!groups)
            return false;
        const auto write = [&](const ListedMember& listed, std::size_t place) {
            enter(groups->groups[place], groups->headings);
            write_person(listed);
        };
        return for_each_person_of(m_input, groups->keys, progress, write, extent);
    }

    void write_family(const ListedFamily& listed)
    {
        begin_entry();
        const pages::Keep together(m_flow);
        const int key = listed.family.family().Surname_ID;
        m_pages.write(m_flow, LayoutPlace::family, {m_facts, &listed.family, &listed.household});
        for (const auto* person : listed.people()) {
            m_pages.write(m_flow, LayoutPlace::person, {m_facts, &listed.family, &listed.household, person});
            count(key, person->person_id);
        }
    }

    void write_person(const ListedMember& listed)
    {
        begin_entry();
        const pages::Keep together(m_flow);
        const auto household = listed_household(listed.family, m_listed);
        m_pages.write(m_flow, LayoutPlace::person, {m_facts, &listed.family, &household, &listed.person});
        count(listed.family.family().Surname_ID, listed.person.person_id);
    }

    void begin_entry()
    {
        if (m_layout.one_to_a_page && m_entries > 0 && m_facts.number > 0) {
            m_pages.close_table();
            m_flow.next_page();
        }
        ++m_entries;
        ++m_facts.number;
    }

    /// Turns to the group of the next entry.
    void enter(int group, const QStringList& headings)
    {
        if (group == m_group_place)
            return;
        end_group();
        if (m_entries > 0 && (m_layout.grouping->new_page || m_layout.one_to_a_page))
            m_flow.next_page();
        m_pages.close_table();
        constexpr int heading_level = 2;
        m_group_place = group;
        m_facts.group = headings[group];
        m_facts.number = 0;
        m_in_group = {};
        m_group.emplace(m_flow, headings[group], heading_level);
    }

    void end_group()
    {
        if (m_group) {
            m_in_group.show_in(m_facts);
            m_pages.write(m_flow, LayoutPlace::end_of_group, {m_facts});
        }
        m_pages.close_table();
        m_group.reset();
    }

    void count(int family, int person)
    {
        m_in_group.add(family, person);
        m_all.add(family, person);
    }

    const CustomLayout& m_layout;
    const ReportInput& m_input;
    pages::Flow& m_flow;
    CustomPages& m_pages;
    RunFacts m_facts;
    std::vector<int> m_listed; ///< Everybody on the list.
    std::optional<pages::Group> m_group;
    int m_group_place = -1;
    int m_entries = 0;
    PrintedCounts m_in_group, m_all;
};

} // namespace

people::Extent extent_of(const CustomLayout& layout)
{
    people::Extent extent;
    for (const auto& section : layout.sections) {
        for (const auto& element : section) {
            add_extent(extent, element.parts);
            for (const auto& cell : element.cells)
                add_extent(extent, cell);
            if (element.condition)
                add_extent(extent, element.condition->field);
        }
    }
    return extent;
}

RunFacts facts_of(const ReportInput& input, const CustomLayout& layout)
{
    const auto& office = input.office;
    const auto today = office.clock.today();
    return {.today = today,
            .shown_today = core::Date::from(today).shown(office.day_order()),
            .church_name = office.church_name,
            .title = input.options.title.isEmpty() ? layout.title : input.options.title,
            .filters = input.list.criteria};
}

pages::PageSetup page_of(const CustomLayout& layout, const RunOptions& options)
{
    auto setup = layout.page;
    setup.paper = options.paper;
    return setup;
}

void set_bands(pages::Flow& flow, const CustomLayout& layout, CustomPages& pages, const RunFacts& facts,
               const ReportInput& input)
{
    const auto band = [&](LayoutPlace place) -> pages::BandWriter {
        if (layout.section(place).empty())
            return {};
        return [&pages, facts, place](pages::Writer& writer, int number) {
            auto here = facts;
            here.page = number;
            pages.write(writer, place, {here});
        };
    };
    if (layout.decorated) {
        decorate(flow, facts.title, input, {band(LayoutPlace::page_header), band(LayoutPlace::page_footer)});
        return;
    }
    flow.set_header(band(LayoutPlace::page_header));
    flow.set_footer(band(LayoutPlace::page_footer));
}

bool write_custom_report(const CustomLayout& layout, const ReportInput& input, core::Progress& progress,
                         pages::PageSpool& spool)
{
    const CustomLooks looks(layout, input.options.text_percent);
    const auto facts = facts_of(input, layout);
    pages::Flow flow(spool, page_of(layout, input.options), looks.type());
    CustomPages pages(layout, looks, input.office.paths);
    set_bands(flow, layout, pages, facts, input);
    if (!CustomRun(layout, input, flow, pages, facts).write(progress))
        return false;
    flow.finish();
    return true;
}

} // namespace kindrel::output
