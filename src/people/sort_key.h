#pragma once

#include <QString>

namespace kindrel::people {

/// The text without accents and case, by which lists are ordered and letter ranges are cut: "Žižek" becomes "ZIZEK".
[[nodiscard]] QString sort_key(const QString& text);

} // namespace kindrel::people
