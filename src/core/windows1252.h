#pragma once

#include <QByteArray>
#include <QString>

#include <optional>

namespace kindrel::core {

/// Nullopt when a character has no place among the 256; accents written apart are joined to their letters first.
[[nodiscard]] std::optional<QByteArray> to_windows1252(const QString& text);
[[nodiscard]] QString from_windows1252(QByteArrayView bytes);

} // namespace kindrel::core
