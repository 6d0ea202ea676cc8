#pragma once

#include "registers/dated_register.h"

namespace kindrel::desktop {

/// Asks for another day for the open date until it is one that the date can have. Nullopt: it keeps its own.
[[nodiscard]] std::optional<core::Date> ask_new_day(core::Office& office, registers::DatedRegister& dated);

} // namespace kindrel::desktop
