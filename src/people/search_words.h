#pragma once

#include <QStringList>

namespace kindrel::people {

/// The words of a text as they are sought: folded, each after a blank. An apostrophe parts two words and joins them
/// too: "O'Brien" is found by "bri" and by "obr".
[[nodiscard]] QString search_words(const QString& text);
/// What was typed as the words that must all occur in search_words(), in any order.
[[nodiscard]] QStringList wanted_words(const QString& typed);
[[nodiscard]] bool has_all(const QString& search_words, const QStringList& wanted);
/// Whether whatever has all of `after` is sure to have all of `before`.
[[nodiscard]] bool narrows(const QStringList& before, const QStringList& after);

} // namespace kindrel::people
