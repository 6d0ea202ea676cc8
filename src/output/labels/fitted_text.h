#pragma once

#include "pages/page.h"
#include "pages/text_metrics.h"

#include <span>

namespace kindrel::output {

/// One piece of a label's text in the look it has where there is room.
struct LabelText
{
    QString text;
    pages::TextStyle style;
};

/// The texts beneath each other, wrapped into `room` and in smaller letters where they would not fit, so that nothing
/// is cut off and no word broken. The drawing is as wide as `room` and as high as the text.
[[nodiscard]] pages::Drawing fitted(std::span<const LabelText> texts, QSizeF room, pages::Align align,
                                    pages::TextMetrics& metrics);

} // namespace kindrel::output
