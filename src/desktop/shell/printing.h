#pragma once

#include "core/dialogue.h"
#include "core/progress.h"
#include "pages/spool.h"

class QPrinter;
class QWidget;

namespace kindrel::desktop {

/// A document as it goes to paper.
struct PrintJob
{
    const pages::PageSpool& spool;
    QString title;
    int current_page = 1;
};

/// Prints the pages and copies that the printer is set to. False when cancelled or, after saying why, when it failed.
[[nodiscard]] bool print_on(QPrinter& printer, const PrintJob& job, core::Dialogue& dialogue, core::Progress& progress);

/// The way to a printer; tests put their own in its place.
class Printing
{
public:
    virtual ~Printing() = default;
    /// Asks for printer, pages and copies and prints. False when the person turned away or cancelled.
    [[nodiscard]] virtual bool print(const PrintJob& job, QWidget& parent) = 0;
};

/// Prints through the desktop's own print dialog.
class QtPrinting : public Printing
{
public:
    QtPrinting(core::Dialogue& dialogue, core::Progress& progress) : m_dialogue(dialogue), m_progress(progress) {}
    [[nodiscard]] bool print(const PrintJob& job, QWidget& parent) override;

private:
    core::Dialogue& m_dialogue;
    core::Progress& m_progress;
};

} // namespace kindrel::desktop
