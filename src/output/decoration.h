#pragma once

#include "output/catalogue.h"
#include "pages/picture.h"

namespace kindrel::output {

/// The points that the logo has at the head of a page, at most.
inline constexpr QSizeF logo_room(110, 36);

/// What a report brings itself for every page: beneath the header and above the footer.
struct OwnBands
{
    pages::BandWriter header, footer;
    std::optional<pages::Picture> logo = {}; ///< The office's, read already.
    QString layout = {};                     ///< Its name, which the footer tells; empty for the title.
};

/// Gives every page of the flow its header and footer, as the church or the run has set them up: title, church and
/// logo, date, filters and vision statement above; the footer's vision lines and the page number below.
void decorate(pages::Flow& flow, const QString& title, const ReportInput& input, const OwnBands& own = {});

} // namespace kindrel::output
