#pragma once

#include "output/catalogue.h"

namespace kindrel::output {

/// Each family with everything that its file holds and the reader may see. The layout is a ReportLayout.
[[nodiscard]] bool write_all_information(const ReportInput& input, const void* layout, core::Progress& progress,
                                         pages::Flow& flow);

} // namespace kindrel::output
