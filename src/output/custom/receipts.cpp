#include "output/custom/receipts.h"

#include "core/entry.h"
#include "output/custom/custom_run.h"

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

bool write_receipts(const CustomLayout& layout, std::span<const ReceiptGiver> givers, const ReportInput& input,
                    core::Progress& progress, pages::PageSpool& spool)
{
    const CustomLooks looks(layout, input.options.text_percent);
    auto facts = facts_of(input, layout);
    pages::Flow flow(spool, page_of(layout, input.options), looks.type());
    CustomPages pages(layout, looks, input.office.paths);
    set_bands(flow, layout, pages, facts, input);
    pages.write(flow, LayoutPlace::start, {facts});
    PrintedCounts printed;
    const auto write = [&](const ListedMember& listed, std::size_t place) {
        if (layout.one_to_a_page && facts.number > 0)
            flow.next_page();
        ++facts.number;
        printed.add(listed.family.family().Surname_ID, listed.person.person_id);
        const pages::Keep together(flow);
        const auto household = people::living_household(listed.family.people());
        pages.write(flow, LayoutPlace::giver,
                    {facts, &listed.family, &household, &listed.person, &givers[place].facts});
        if (layout.one_to_a_page)
            pages.close_table();
    };
    const bool whole = for_each_person_of(input, input.list.members, progress, write, extent_of(layout));
    if (whole) {
        printed.show_in(facts);
        pages.write(flow, LayoutPlace::end, {facts});
    }
    pages.close_table();
    if (whole)
        flow.finish();
    return whole;
}

} // namespace

bool run_receipts(core::Office& office, const CustomReport& receipt, std::span<const ReceiptGiver> givers,
                  const RunOptions& options, core::Progress& progress, pages::PageSpool& spool)
{
    if (!core::permitted(office, core::Area::report_outputs))
        return false;
    if (givers.empty()) {
        office.dialogue.show({u"No people found for creating a report"_s});
        return false;
    }
    auto layout = usable_layout(office.dialogue, receipt.file);
    if (!layout)
        return false;
    if (layout->kind != LayoutKind::receipts) {
        office.dialogue.show({u"\"%1\" is a report and no receipt."_s.arg(receipt.title)});
        return false;
    }
    people::WorkingList list;
    for (const auto& one : givers)
        list.members.push_back(one.giver);
    return write_receipts(titled(std::move(*layout), receipt), givers, {office, list, options}, progress, spool);
}

} // namespace kindrel::output
