#pragma once

#include "core/session.h"

#include <QDate>

namespace kindrel::sample {

/// Writes projects for roll and giving, and a weekly project with two years of Sundays up to the day.
void write_registers(core::Session& session, const QDate& today, quint32 seed);

} // namespace kindrel::sample
