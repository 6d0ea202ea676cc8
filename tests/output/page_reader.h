#pragma once

#include "pages/page.h"

#include <QStringList>

#include <vector>

namespace kindrel::test {

/// The barcodes of a page with their quiet zones, in the order they were drawn.
[[nodiscard]] std::vector<QRectF> barcodes_of(const pages::Page& page);
/// What a scanner finds on this part of the page as an office printer prints it; empty unless it is one code.
[[nodiscard]] QString scanned(const pages::Page& page, const QRectF& part);
/// What it finds at all barcodes of the page, one by one.
[[nodiscard]] QStringList scanned(const pages::Page& page);

/// The text items of the page that read so.
[[nodiscard]] std::vector<pages::TextItem> texts_reading(const pages::Page& page, const QString& text);
/// The places across the page at which lines of a table run down, from left to right.
[[nodiscard]] std::vector<qreal> lines_down(const pages::Page& page);

} // namespace kindrel::test
