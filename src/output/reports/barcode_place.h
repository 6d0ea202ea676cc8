#pragma once

#include "pages/writer.h"

namespace kindrel::output {

/// A module of these bars is wide enough for plain hand scanners also off an office printer.
inline constexpr qreal barcode_module = 0.75;

/// What the bars of a person hold: the key and the sign that ends it.
[[nodiscard]] QString barcode_content(int person_id);

/// The width of the bars with their quiet zones.
[[nodiscard]] qreal barcode_width(const QString& content, qreal module = barcode_module);

/// Bars of `height` whose quiet zone begins at the writer's edge; narrower modules only where there is no room.
void write_barcode(pages::Writer& place, int person_id, qreal height, pages::Align align = pages::Align::left);

} // namespace kindrel::output
