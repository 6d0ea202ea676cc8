#include "output/list_reader.h"

#include "core/progress_run.h"

#include <QHash>

#include <algorithm>
#include <iterator>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

/// The first chunk is small, so that the first page comes at once; the later ones grow, so that a long list takes few
/// statements, up to what memory can hold with ease.
constexpr std::size_t first_chunk = 200;
constexpr std::size_t growth = 4;
constexpr std::size_t largest_chunk = 3200;

/// Hands the keys chunk by chunk to `read` and then each place to `write`, which gets what was read of its chunk. False
/// when cancelled.
template <class Key, class Read, class Write>
bool in_chunks(std::span<const Key> keys, core::Progress& progress, const Read& read, const Write& write)
{
    const core::ProgressRun run(progress, u"Creating report"_s, static_cast<int>(keys.size()),
                                u"Are you sure that you wish to cancel this report?"_s);
    std::size_t size = first_chunk;
    for (std::size_t first = 0; first < keys.size(); first += size, size = std::min(size * growth, largest_chunk)) {
        size = std::min(size, keys.size() - first);
        const auto families = read(keys.subspan(first, size));
        for (std::size_t place = first; place < first + size; ++place) {
            write(families, keys[place], place);
            if (!progress.step())
                return false;
        }
    }
    return true;
}

people::Disclosure disclosure_of(const ReportInput& input)
{
    auto disclosure = people::Disclosure::of(input.office);
    disclosure.withheld = input.options.withheld;
    return disclosure;
}

using Families = QHash<int, people::DisclosedFamily>;

Families read_families(const ReportInput& input, std::span<const int> keys, const people::Disclosure& disclosure,
                       people::Extent extent)
{
    Families families;
    for (auto& file : people::load_families(*input.office.session, keys, extent)) {
        const int key = file.family.Surname_ID;
        families.insert(key, people::disclose(std::move(file), disclosure));
    }
    return families;
}

} // namespace

std::vector<int> sorted_people(const people::WorkingList& list)
{
    std::vector<int> people;
    people.reserve(list.members.size());
    for (const auto& member : list.members)
        people.push_back(member.person_id);
    std::ranges::sort(people);
    return people;
}

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

std::vector<const people::Person*> ListedFamily::people() const
{
    auto all = household.adults;
    std::ranges::copy(household.children, std::back_inserter(all));
    return all;
}

QString ListedMember::listed_name() const
{
    const auto given = name();
    return surname().isEmpty() || given.isEmpty() ? surname() + given : surname() + u", "_s + given;
}

bool for_each_family_of(const ReportInput& input, std::span<const int> keys, core::Progress& progress,
                        const std::function<void(const ListedFamily&, std::size_t)>& write, people::Extent extent)
{
    const auto listed = sorted_people(input.list);
    const auto disclosure = disclosure_of(input);
    const auto read = [&](std::span<const int> chunk) {
        return read_families(input, chunk, disclosure, extent);
    };
    return in_chunks(keys, progress, read, [&](const Families& families, int key, std::size_t place) {
        if (const auto family = families.constFind(key); family != families.constEnd())
            write({*family, listed_household(*family, listed)}, place);
    });
}

bool for_each_family(const ReportInput& input, core::Progress& progress,
                     const std::function<void(const ListedFamily&)>& write, people::Extent extent)
{
    const auto keys = input.list.families();
    return for_each_family_of(
        input, keys, progress, [&](const ListedFamily& listed, std::size_t) { write(listed); }, extent);
}

bool for_each_person_of(const ReportInput& input, std::span<const people::Member> members, core::Progress& progress,
                        const std::function<void(const ListedMember&, std::size_t)>& write, people::Extent extent)
{
    const auto disclosure = disclosure_of(input);
    const auto read = [&](std::span<const people::Member> chunk) {
        const people::WorkingList list{{chunk.begin(), chunk.end()}, {}};
        return read_families(input, list.families(), disclosure, extent | people::Part::own_surnames);
    };
    return in_chunks(members, progress, read,
                     [&](const Families& families, const people::Member& member, std::size_t place) {
                         const auto family = families.constFind(member.surname_id);
                         if (family == families.constEnd())
                             return;
                         const auto& people = family->people();
                         const auto person = std::ranges::find(people, member.person_id, &people::Person::person_id);
                         if (person != people.end())
                             write({*family, *person}, place);
                     });
}

bool for_each_person(const ReportInput& input, core::Progress& progress,
                     const std::function<void(const ListedMember&)>& write, people::Extent extent)
{
    return for_each_person_of(
        input, input.list.members, progress, [&](const ListedMember& listed, std::size_t) { write(listed); }, extent);
}

} // namespace kindrel::output
