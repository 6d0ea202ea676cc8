#pragma once

#include "core/office.h"
#include "people/filter.h"
#include "people/listed_people.h"
#include "people/sorting.h"

namespace kindrel::people {

/// A part of a list: surnames from one letter to another, and people from one place to another. What is not given is
/// open; both ends are included.
struct ListRange
{
    QString first_letter = {}, last_letter = {};
    std::optional<int> first = {}, last = {}; ///< Places from 1 among those whose surnames fit.

    friend bool operator==(const ListRange&, const ListRange&) = default;
};

/// "surnames from A to M, people 1 to 100"; empty for a whole list.
[[nodiscard]] QString range_words(const ListRange& range);
/// Letters are those of the surname by which the order goes: a person's own in the order of individuals.
[[nodiscard]] std::vector<ListedPerson> within(const ListRange& range, SortBy by, std::vector<ListedPerson> people);

/// What a working list is made from, step by step.
struct ListPlan
{
    Filter filter;
    SortOrder sort;
    ListRange range;
    Needs needs;
    std::optional<WorkingList> found = {}; ///< Elsewhere, in place of the filter's people; who has died is left out.
    std::vector<Member> added = {};        ///< By hand.
    std::vector<int> struck = {};          ///< By hand: keys of people.
};

struct MadeList
{
    WorkingList list; ///< Its criteria are sentence_of() the plan.
    std::vector<ListedPerson> people;
};

/// Finds, orders and narrows. People added by hand stand where the order puts them; those that another step leaves out
/// come last. The filter must name its families and the order must be complete. Throws core::DatabaseError.
[[nodiscard]] MadeList make_list(core::Office& office, const ListPlan& plan);
/// The whole plan in plain English.
[[nodiscard]] QString sentence_of(core::Office& office, const ListPlan& plan);

/// People are put on the list or off it by hand, whatever was done with them before.
void add_by_hand(ListPlan& plan, const std::vector<Member>& members);
void strike_by_hand(ListPlan& plan, const std::vector<int>& people);

} // namespace kindrel::people
