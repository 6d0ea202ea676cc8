#pragma once

#include "pages/page.h"

#include <QString>

#include <vector>

namespace kindrel::pages {

/// Modules left white on each side of the bars so that a reader finds their ends.
inline constexpr int quiet_modules = 10;

/// The bars of Code 128 from left to right, true for a dark module, without quiet zones. Throws std::invalid_argument
/// for text that the code cannot hold.
[[nodiscard]] std::vector<bool> code128(const QString& content);

/// Bars as wide as `size` with both quiet zones inside it.
[[nodiscard]] Drawing barcode(const QString& content, QSizeF size);

} // namespace kindrel::pages
