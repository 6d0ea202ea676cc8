#pragma once

#include "output/catalogue.h"

namespace kindrel::output {

/// The portraits of the list's people, each person with the same room, so many to a page.
[[nodiscard]] std::span<const ReportDefinition> photo_album_reports();

} // namespace kindrel::output
