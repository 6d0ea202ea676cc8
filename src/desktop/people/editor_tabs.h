#pragma once

#include "desktop/people/editor_tab.h"

namespace kindrel::desktop {

/// What a person carries: status, groups with their history, ministries and occupations; and the family's groups.
[[nodiscard]] EditorTab* make_groups_tab(EditorBench& bench);
/// Personal dates, flexi fields and the family's dates.
[[nodiscard]] EditorTab* make_dates_tab(EditorBench& bench);
/// The family's events, further contacts and visits.
[[nodiscard]] EditorTab* make_events_tab(EditorBench& bench);
/// The notebook pages of the family and of the chosen person.
[[nodiscard]] EditorTab* make_notes_tab(EditorBench& bench);

} // namespace kindrel::desktop
