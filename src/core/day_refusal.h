#pragma once

#include "core/date.h"
#include "core/dialogue.h"

namespace kindrel::core {

/// What is said to a date whose year is not known, where it must be.
inline const QString year_missing = QStringLiteral("Please enter the year too.");

/// Answers what was typed and is no day of a known year: a day and month alone lack the year, anything else cannot be
/// read.
[[nodiscard]] Message day_refusal(const QString& typed, DayOrder order);

} // namespace kindrel::core
