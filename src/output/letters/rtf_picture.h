#pragma once

#include "output/letters/letter_text.h"

namespace kindrel::output {

/// What a file tells of a picture while it is read.
struct RtfPicture
{
    bool known_kind = false;         ///< PNG or JPEG; others are passed over.
    QByteArray hex = {}, bytes = {}; ///< Files hold one or the other.
    int width = 0, height = 0;       ///< Twips; 0: as many as it has pixels, 96 to the inch.
    int width_percent = 100, height_percent = 100;
};

/// The most points that anything on a page measures.
inline constexpr qreal widest_on_page = 1440;
inline constexpr qreal twips_per_point = 20;

/// Empty when its bytes are not what they are said to be.
[[nodiscard]] LetterPicture picture_from(const RtfPicture& picture);

[[nodiscard]] bool is_png(const QByteArray& bytes);

} // namespace kindrel::output
