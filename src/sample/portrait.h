#pragma once

#include "sample/made_family.h"

#include <span>

class QImage;

namespace kindrel::sample {

/// A drawn face, 300 by 400. Needs no display.
[[nodiscard]] QImage portrait_of(const Figure& figure);
/// The same faces side by side, 400 by 300; the first six of them.
[[nodiscard]] QImage family_photo_of(std::span<const Figure> figures);
/// Writes the photographs that a third of the people and a ninth of the families have: `<person_id>.jpg` and
/// `F<surname_id>.jpg`. Throws core::FileError.
void write_photographs(const MadeFamily& family, const QString& folder);

} // namespace kindrel::sample
