#pragma once

#include <QIcon>
#include <QString>

namespace kindrel::desktop {

/// One of the icons listed with the room, drawn in the shade that the program has at the moment of painting, and light
/// on a selection.
[[nodiscard]] QIcon icon(const QString& name);

} // namespace kindrel::desktop
