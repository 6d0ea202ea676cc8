#pragma once

#include "core/paths.h"

#include <QDate>

namespace kindrel::core {

/// Renews the four system backups in the church's `Backup1` when the newest is missing or more than 30 days old. Left
/// alone are the training and booked-out data, a church without a database, and one that is busy. Throws DatabaseError
/// or FileError with the set as it was.
void rotate_system_backups(const Paths& paths, int church, const QDate& today);

} // namespace kindrel::core
