#pragma once

#include "output/labels/label_setup.h"

#include <span>

namespace kindrel::output {

/// A sheet of labels or name tags as it is sold.
struct LabelStock
{
    const char* name;
    LabelGrid grid;
};

/// A4 sheets, then Letter sheets.
[[nodiscard]] std::span<const LabelStock> label_stocks();
/// The stock whose measures these are, whatever label printing starts at; null for a sheet of one's own.
[[nodiscard]] const LabelStock* stock_of(const LabelGrid& grid);

} // namespace kindrel::output
