#pragma once

#include "apps/ctl_command.h"

#include "people/sorting.h"

namespace kindrel::apps {

/// Whom to list, and in which order.
struct Criteria
{
    people::Filter filter;
    people::SortOrder sort;
};

/// Reads the criteria of the command line. What cannot be understood, is not in the church or is not granted is told,
/// and then `fault` is set.
[[nodiscard]] Criteria read_criteria(Context& context, std::optional<Status>& fault);

} // namespace kindrel::apps
