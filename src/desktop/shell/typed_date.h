#pragma once

#include "core/office.h"

namespace kindrel::desktop {

/// A date as a person types it: in full, with XXXX for an unknown year, "t" for today, "+7" and "-7" for so many days
/// from today. Nullopt for anything else, nothing typed included.
[[nodiscard]] std::optional<core::Date> typed_date(const core::Office& office, const QString& typed);
/// "DD/MM/YYYY" or "MM/DD/YYYY", for an empty field.
[[nodiscard]] QString date_pattern(core::DayOrder order);

} // namespace kindrel::desktop
