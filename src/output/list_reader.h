#pragma once

#include "output/catalogue.h"
#include "people/disclosed.h"
#include "people/family_store.h"
#include "people/names.h"

#include <functional>

namespace kindrel::output {

/// A family of the working list. The household holds those of its people alone who are on the list; its primary is
/// null when the primary adult is not.
struct ListedFamily
{
    const people::DisclosedFamily& family;
    people::Household household;

    /// The people of the household: adults, then children.
    [[nodiscard]] std::vector<const people::Person*> people() const;
};

/// The numbers of those on the list, in rising order.
[[nodiscard]] std::vector<int> sorted_people(const people::WorkingList& list);
/// The household of those of the family who are among the `listed`, which are sorted.
[[nodiscard]] people::Household listed_household(const people::DisclosedFamily& family, std::span<const int> listed);

/// Reads the working list's families in its order, some hundreds at a time, and hands each to `write`, as far as
/// `extent` goes. False when cancelled. Throws core::DatabaseError.
[[nodiscard]] bool for_each_family(const ReportInput& input, core::Progress& progress,
                                   const std::function<void(const ListedFamily&)>& write, people::Extent extent);

/// The same for families in an order of the report's own, in which one may come several times; `place` counts the keys
/// from 0.
[[nodiscard]] bool for_each_family_of(const ReportInput& input, std::span<const int> keys, core::Progress& progress,
                                      const std::function<void(const ListedFamily&, std::size_t place)>& write,
                                      people::Extent extent);

/// A person of the working list and their family.
struct ListedMember
{
    const people::DisclosedFamily& family;
    const people::Person& person;

    [[nodiscard]] QString name() const { return family.name(person); }
    /// Their own where it differs from the family's and is not hidden.
    [[nodiscard]] const QString& surname() const
    {
        return person.other_surname.isEmpty() ? family.family().surname : person.other_surname;
    }
    /// "Naismith, Ann".
    [[nodiscard]] QString listed_name() const;
};

/// Reads the working list's people in its order, one by one, whatever their families; their own surnames always, under
/// which they are listed.
[[nodiscard]] bool for_each_person(const ReportInput& input, core::Progress& progress,
                                   const std::function<void(const ListedMember&)>& write, people::Extent extent);

/// The same for people in an order of the report's own, in which one may come several times; `place` counts the
/// members from 0. A member who is gone is passed over.
[[nodiscard]] bool for_each_person_of(const ReportInput& input, std::span<const people::Member> members,
                                      core::Progress& progress,
                                      const std::function<void(const ListedMember&, std::size_t place)>& write,
                                      people::Extent extent);

} // namespace kindrel::output
