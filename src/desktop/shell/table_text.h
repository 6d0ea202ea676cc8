#pragma once

#include "core/dialogue.h"

#include <QAbstractItemModel>

class QAbstractItemView;

namespace kindrel::desktop {

/// All rows under their headings as comma-separated text: UTF-8 with a byte-order mark, lines ended by CR LF.
[[nodiscard]] QByteArray csv_of(const QAbstractItemModel& model);
/// The chosen rows of a list with tabs between the columns, as a spreadsheet takes it from the clipboard.
[[nodiscard]] QString tabbed_text(const QAbstractItemView& view);
/// Asks where and writes; a failure is told.
void save_as_csv(const QAbstractItemModel& model, const QString& suggested, core::Dialogue& dialogue);
/// Ctrl+C copies the chosen rows.
void enable_copy(QAbstractItemView& view);

} // namespace kindrel::desktop
