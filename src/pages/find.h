#pragma once

#include "pages/spool.h"

#include <QRectF>

#include <vector>

namespace kindrel::pages {

struct Found
{
    int page = 0;
    QRectF where; ///< In points of the page.
};

/// Every place of `text` on a page, without regard to case; neighbouring texts of one line count as one text.
[[nodiscard]] std::vector<Found> find(const Page& page, const QString& text);
/// The same over all pages stored so far.
[[nodiscard]] std::vector<Found> find(const PageSpool& spool, const QString& text);

} // namespace kindrel::pages
