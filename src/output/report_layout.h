#pragma once

#include "pages/page_setup.h"

namespace kindrel::output {

/// What the layout of every report begins with: all that a run must know before the first line is written. Rows of a
/// report family's layout table hold it as their first member.
struct ReportLayout
{
    const char* title; ///< Heads every page.
    pages::PageSetup page = {};
    double text_size = 9.5; ///< Of the body, in points; headings follow it.
    bool decorated = true;  ///< Whether pages carry header and footer; sheets of labels do not.
};

} // namespace kindrel::output
