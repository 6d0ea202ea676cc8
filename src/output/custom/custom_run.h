#pragma once

#include "output/custom/custom_pages.h"

#include <QSet>

namespace kindrel::output {

/// The families and people that were printed, each counted once.
class PrintedCounts
{
public:
    void add(int family, int person)
    {
        m_families.insert(family);
        m_people.insert(person);
    }
    void show_in(RunFacts& facts) const
    {
        facts.family_count = int(m_families.size());
        facts.person_count = int(m_people.size());
    }

private:
    QSet<int> m_families, m_people;
};

/// What all that the layout prints asks the register for, and no more.
[[nodiscard]] people::Extent extent_of(const CustomLayout& layout);
[[nodiscard]] RunFacts facts_of(const ReportInput& input, const CustomLayout& layout);
[[nodiscard]] pages::PageSetup page_of(const CustomLayout& layout, const RunOptions& options);
/// Heads and foots the pages as the layout has it. The layout and the pages must live until the flow is finished.
void set_bands(pages::Flow& flow, const CustomLayout& layout, CustomPages& pages, const RunFacts& facts,
               const ReportInput& input);

/// Writes the report of the input's list. False when cancelled.
[[nodiscard]] bool write_custom_report(const CustomLayout& layout, const ReportInput& input, core::Progress& progress,
                                       pages::PageSpool& spool);

} // namespace kindrel::output
