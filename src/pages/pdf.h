#pragma once

#include "core/progress.h"
#include "pages/spool.h"

#include <QPagedPaintDevice>

namespace kindrel::pages {

struct PdfProperties
{
    QString title;
    QString creator; ///< Shown as the program that made the document.
};

struct PageRange
{
    int first = 1;
    int last = 0; ///< 0: to the end.
};

/// Draws the pages on a printer or PDF device, a sheet each, turning the paper as the pages ask. False when cancelled.
/// Throws core::FileError when the device cannot be drawn on.
[[nodiscard]] bool draw_pages(const PageSpool& spool, QPagedPaintDevice& device, PageRange range = {},
                              core::Progress* progress = nullptr);

/// Writes all pages as a PDF whose text can be searched and copied. A failed or cancelled run leaves a file that stood
/// there untouched. False when cancelled; throws core::FileError when the file cannot be written.
[[nodiscard]] bool write_pdf(const PageSpool& spool, const QString& file, const PdfProperties& properties = {},
                             core::Progress* progress = nullptr);

} // namespace kindrel::pages
