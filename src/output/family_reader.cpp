#include "output/family_reader.h"

#include <algorithm>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

/// Few enough that the first page comes at once and memory stays flat, many enough that a statement costs nothing.
constexpr std::size_t families_at_once = 500;

std::vector<int> sorted_people(const people::WorkingList& list)
{
    std::vector<int> people;
    people.reserve(list.members.size());
    for (const auto& member : list.members)
        people.push_back(member.person_id);
    std::ranges::sort(people);
    return people;
}

/// `listed` is sorted.
people::Household listed_household(const people::DisclosedFamily& family, std::span<const int> listed)
{
    const auto is_absent = [&](const people::Person* person) {
        return !person || !std::ranges::binary_search(listed, person->person_id);
    };
    auto household = people::household_of(family.people());
    std::erase_if(household.adults, is_absent);
    std::erase_if(household.children, is_absent);
    if (is_absent(household.primary))
        household.primary = nullptr;
    if (is_absent(household.spouse))
        household.spouse = nullptr;
    return household;
}

/// Ends the progress however the run ends.
class ReportRun
{
public:
    ReportRun(core::Progress& progress, int steps) : m_progress(progress)
    {
        m_progress.begin(u"Creating report"_s, steps, u"Are you sure that you wish to cancel this report?"_s);
    }
    ~ReportRun() { m_progress.end(); }
    ReportRun(const ReportRun&) = delete;
    ReportRun& operator=(const ReportRun&) = delete;

private:
    core::Progress& m_progress;
};

} // namespace

bool for_each_family(const ReportInput& input, core::Progress& progress,
                     const std::function<void(const ListedFamily&)>& write, people::Extent extent)
{
    const auto keys = input.list.families();
    const auto listed = sorted_people(input.list);
    auto disclosure = people::Disclosure::of(input.office);
    disclosure.withheld = input.options.withheld;
    const ReportRun run(progress, static_cast<int>((keys.size() + families_at_once - 1) / families_at_once));

    for (std::size_t first = 0; first < keys.size(); first += families_at_once) {
        const auto chunk = std::span(keys).subspan(first, std::min(families_at_once, keys.size() - first));
        for (auto& file : people::load_families(*input.office.session, chunk, extent)) {
            const auto family = people::disclose(std::move(file), disclosure);
            write({family, listed_household(family, listed)});
        }
        if (!progress.step())
            return false;
    }
    return true;
}

} // namespace kindrel::output
