#include "apps/ctl_pdf.h"

#include "pages/pdf.h"

namespace kindrel::apps {

using namespace Qt::StringLiterals;

std::optional<PdfOrder> pdf_order(Context& context)
{
    const auto file = context.arguments.value(u"pdf"_s);
    const auto paper = context.arguments.value(u"paper"_s, u"a4"_s);
    if (!file.isEmpty() && (paper == "a4"_L1 || paper == "letter"_L1))
        return PdfOrder{file, paper == "a4"_L1 ? pages::Paper::a4 : pages::Paper::letter};
    context.dialogue.show({file.isEmpty() ? u"--pdf names the file to write."_s : u"--paper is a4 or letter."_s});
    return std::nullopt;
}

Status write_document(Context& context, pages::PageSpool& spool, const PdfOrder& order, const QString& title)
{
    const pages::PdfProperties properties{title, context.office->church_name};
    if (!pages::write_pdf(spool, order.file, properties))
        return Status::refused;
    context.out << u"%1: %2 pages in %3\n"_s.arg(properties.title).arg(spool.page_count()).arg(order.file);
    return Status::done;
}

} // namespace kindrel::apps
