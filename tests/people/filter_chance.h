#pragma once

#include "people/fusion.h"
#include "people/records.h"

#include <random>

namespace kindrel::test {

/// Draws churches, filters and fusions from a seed, the same ones every time.
class Chance
{
public:
    explicit Chance(unsigned seed) : m_engine(seed) {}

    /// New families of every make: with and without items, dates, unknown years and states. Needs the setup items.
    [[nodiscard]] std::vector<people::FamilyFile> church(int families);
    /// A few criteria at a time, so that a good part of the filters finds somebody.
    [[nodiscard]] people::Filter filter(int fusions);
    /// Some of the entries ask for items that no list has.
    [[nodiscard]] people::Fusion fusion(int number);

private:
    /// Below `end`. Written out, as the library's distributions differ from one to the next.
    int below(int end) { return static_cast<int>(m_engine() % static_cast<unsigned>(end)); }
    bool percent(int chance) { return below(100) < chance; }
    template <class List>
    const auto& one_of(const List& list)
    {
        return list[static_cast<std::size_t>(below(static_cast<int>(std::size(list))))];
    }
    std::optional<core::Date> date();
    core::Date day();
    std::vector<people::LinkRow> links(people::FilterKind kind);
    people::Person person(int place);
    people::FamilyFile family();
    people::FilterItem item();
    people::DateCriterion date_criterion();
    void add_ranges(people::Filter& filter);

    std::mt19937 m_engine;
};

} // namespace kindrel::test
