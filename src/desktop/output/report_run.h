#pragma once

#include "desktop/shell/desk.h"
#include "output/report_choices.h"

namespace kindrel::desktop {

/// Shows the report of the list in a preview. What refuses it is told without one.
void open_report(Desk& desk, const output::ReportChoice& report, const people::WorkingList& list,
                 const output::RunOptions& options);

} // namespace kindrel::desktop
