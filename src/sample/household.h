#pragma once

#include "sample/made_family.h"

#include <span>

namespace kindrel::sample {

/// One kind of household by the code that its adults carry.
struct HouseholdPlan
{
    int marital;
    int share; ///< Of a hundred households.
    bool couple;
    bool children;
    bool widowed;
    bool lost_child;
    int youngest, oldest; ///< Age of the primary adult.
};

[[nodiscard]] std::span<const HouseholdPlan> household_plans();
/// A kind as often as its share says.
[[nodiscard]] const HouseholdPlan& any_plan(Chance& chance);

/// The people of a new family with names, codes, titles, birth dates and school years.
[[nodiscard]] MadeFamily make_household(const HouseholdPlan& plan, const Surname& surname, const Stock& stock,
                                        Chance& chance);
/// One more person at the end of the family.
people::Person& add_person(MadeFamily& family, int marital, bool female, int age, const Stock& stock, Chance& chance);
/// A child, whose code and school year follow from the age.
people::Person& add_child(MadeFamily& family, int age, const Stock& stock, Chance& chance);

} // namespace kindrel::sample
