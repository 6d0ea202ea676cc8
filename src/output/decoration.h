#pragma once

#include "output/catalogue.h"

namespace kindrel::output {

/// What a report adds to every page by itself: beneath the header and above the footer.
struct OwnBands
{
    pages::BandWriter header, footer;
};

/// Gives every page of the flow its header and footer, as the church or the run has set them up: title, church and
/// logo, date, filters and vision statement above; the footer's vision lines and the page number below.
void decorate(pages::Flow& flow, const QString& title, const ReportInput& input, const OwnBands& own = {});

} // namespace kindrel::output
