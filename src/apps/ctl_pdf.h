#pragma once

#include "apps/ctl_command.h"
#include "pages/page_setup.h"
#include "pages/spool.h"

namespace kindrel::apps {

/// Where a report goes, and on what paper.
struct PdfOrder
{
    QString file;
    pages::Paper paper = pages::Paper::a4;
};

/// Of --pdf and --paper. Nullopt, after saying why, when they cannot be understood.
[[nodiscard]] std::optional<PdfOrder> pdf_order(Context& context);
/// The finished document as a PDF file, and a line about it.
[[nodiscard]] Status write_document(Context& context, pages::PageSpool& spool, const PdfOrder& order,
                                    const QString& title);

} // namespace kindrel::apps
