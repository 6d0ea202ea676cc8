#pragma once

#include "core/date.h"
#include "core/dialogue.h"

namespace kindrel::registers {

/// What is said to a date whose year is not known, where a register or a report must have it.
inline const QString year_missing = QStringLiteral("Please enter the year too.");

/// Answers what was typed and is no day of a known year: a day and month alone lack the year, anything else cannot be
/// read.
[[nodiscard]] core::Message day_refusal(const QString& typed, core::DayOrder order);

} // namespace kindrel::registers
