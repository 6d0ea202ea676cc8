#pragma once

#include <QString>

namespace kindrel::core {

/// Lays down the data folder under `data_drive`: `Kindrel_10_Data` with its shared folders, `church1` to `church7`,
/// `Global`, `Local_settings`, `Training` with the training church of the program folder, and `booked out`. What
/// exists already is left as it is, so that it may be run again.
void install(const QString& program_folder, const QString& data_drive);

} // namespace kindrel::core
