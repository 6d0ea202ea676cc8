#pragma once

#include "people/filter.h"

#include <QByteArray>

namespace kindrel::people {

/// A filter as it is kept.
[[nodiscard]] QByteArray to_json(const Filter& filter);

enum class FilterFault {
    newer,     ///< Kept by a later version of the program.
    unreadable ///< Not a filter, or a part of one that does not exist.
};
struct ReadFilter
{
    Filter filter;
    std::optional<FilterFault> fault;
};
[[nodiscard]] ReadFilter filter_from_json(const QByteArray& json);

} // namespace kindrel::people
