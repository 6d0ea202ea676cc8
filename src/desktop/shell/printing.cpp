#include "desktop/shell/printing.h"

#include "core/files.h"
#include "pages/pdf.h"

#include <QPrintDialog>
#include <QPrinter>

namespace kindrel::desktop {

namespace {

/// The pages that the dialog's choice means.
pages::PageRange chosen_range(const QPrinter& printer, const PrintJob& job)
{
    switch (printer.printRange()) {
    case QPrinter::PageRange:
        return {printer.fromPage(), printer.toPage()};
    case QPrinter::CurrentPage:
        return {job.current_page, job.current_page};
    default:
        return {};
    }
}

/// How often the document itself must be drawn: once where the printer makes the copies.
int rounds(const QPrinter& printer)
{
    return printer.supportsMultipleCopies() ? 1 : printer.copyCount();
}

} // namespace

bool print_on(QPrinter& printer, const PrintJob& job, core::Dialogue& dialogue, core::Progress& progress)
{
    printer.setDocName(job.title);
    try {
        for (int round = 0; round < rounds(printer); ++round)
            if (!pages::draw_pages(job.spool, printer, chosen_range(printer, job), &progress))
                return false;
        return true;
    } catch (const core::FileError& error) {
        dialogue.show({error.text()});
        return false;
    }
}

bool QtPrinting::print(const PrintJob& job, QWidget& parent)
{
    QPrinter printer(QPrinter::HighResolution);
    QPrintDialog question(&printer, &parent);
    question.setOptions(QAbstractPrintDialog::PrintPageRange | QAbstractPrintDialog::PrintCurrentPage |
                        QAbstractPrintDialog::PrintCollateCopies | QAbstractPrintDialog::PrintToFile);
    question.setMinMax(1, job.spool.page_count());
    return question.exec() == QDialog::Accepted && print_on(printer, job, m_dialogue, m_progress);
}

} // namespace kindrel::desktop
