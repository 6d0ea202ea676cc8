#pragma once

#include "output/run_options.h"
#include "people/working_list.h"

namespace kindrel::desktop {

/// The list that stands in Tagging, and how its steps have a report print it.
struct ChosenPeople
{
    people::WorkingList list;
    output::RunOptions options;
};

} // namespace kindrel::desktop
