#pragma once

#include "pages/block.h"
#include "pages/style.h"
#include "pages/text_metrics.h"

#include <span>

namespace kindrel::pages {

/// Breaks the runs into lines of `width`, a block each; words too long for a line are broken inside. The first two
/// lines stay together, and so do the last two.
[[nodiscard]] Blocks lay_out(std::span<const Run> runs, const ParagraphStyle& style, qreal width, TextMetrics& metrics);
/// The width of the longest stretch that no line breaks into. Lines break at blanks and behind hyphens.
[[nodiscard]] qreal widest_word(const QString& text, const TextStyle& style, TextMetrics& metrics);

} // namespace kindrel::pages
