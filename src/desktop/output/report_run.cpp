#include "desktop/output/report_run.h"

#include "desktop/output/preview_window.h"

namespace kindrel::desktop {

namespace {

/// Has the report say why it cannot be run.
void tell_refusal(Desk& desk, const output::ReportChoice& report, const people::WorkingList& list)
{
    core::SilentProgress progress;
    pages::PageSpool spool;
    static_cast<void>(report.run({desk.office, list}, progress, spool));
}

} // namespace

void open_report(Desk& desk, const output::ReportChoice& report, const people::WorkingList& list,
                 const output::RunOptions& options)
{
    if (list.members.empty() || !report.ready(desk.office))
        return tell_refusal(desk, report, list);
    open_preview(
        desk, options.title.isEmpty() ? report.leaf : options.title,
        [run = report.run, &office = desk.office, list, options](core::Progress& progress, pages::PageSpool& spool) {
            return run({office, list, options}, progress, spool);
        },
        report.printed);
}

} // namespace kindrel::desktop
