#pragma once

#include "output/catalogue.h"

namespace kindrel::output {

/// Gives every page of the flow its header and footer, as the church or the run has set them up: title, church and
/// logo, date, filters and vision statement above; the footer's vision lines and the page number below.
void decorate(pages::Flow& flow, const QString& title, const ReportInput& input);

} // namespace kindrel::output
