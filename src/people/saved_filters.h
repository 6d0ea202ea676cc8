#pragma once

#include "core/office.h"
#include "people/filter.h"

namespace kindrel::people {

/// Its key alone does not tell it from others: that of one that was removed may be given to another.
struct SavedFilter
{
    int filter_id = 0;
    QString name;

    friend bool operator==(const SavedFilter&, const SavedFilter&) = default;
};

/// By name. Throws core::DatabaseError, as all here do.
[[nodiscard]] std::vector<SavedFilter> saved_filters(core::Session& session);

/// Keeps the filter under a name; asks before it replaces the one that bears it already. The key, or nullopt after
/// saying why nothing was saved.
[[nodiscard]] std::optional<int> save_filter(core::Office& office, const QString& name, const Filter& filter);
/// With the texts that its items have now. Nullopt, after saying why, when it is gone, cannot be understood, or
/// asks for birth dates or visits that the person may not see.
[[nodiscard]] std::optional<Filter> load_filter(core::Office& office, int filter_id);
/// Puts the filter in the place of the saved one, which keeps its name. False after saying why not.
[[nodiscard]] bool replace_filter(core::Office& office, const SavedFilter& saved, const Filter& filter);
[[nodiscard]] bool rename_filter(core::Office& office, const SavedFilter& saved, const QString& name);
/// Asks first. False when the answer is no, or after saying why it could not be removed.
[[nodiscard]] bool remove_filter(core::Office& office, const SavedFilter& saved);

} // namespace kindrel::people
