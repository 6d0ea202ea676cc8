#pragma once

#include "people/records.h"

#include <QStringView>

#include <span>

namespace kindrel::people {

/// The codes of `Marital`. Adults carry 1 to 4 and 8 to 15, children 5 to 7.
namespace marital {
inline constexpr int single_adult = 1, single_parent = 2, married = 3, married_with_children = 4;
inline constexpr int before_school = 5, at_school = 6, after_school = 7;
inline constexpr int codes = 15;
} // namespace marital

/// The words of the codes 1 to 15, in their order.
[[nodiscard]] std::span<const QStringView> marital_words();
/// Empty for a code outside 1 to 15.
[[nodiscard]] QString marital_word(int code);

/// The code of an adult who was `code` once a child is in the family: a single adult becomes a single parent. Codes
/// that have no such counterpart stay.
[[nodiscard]] int with_child(int code);
/// The code of a primary adult who was `code` once a spouse is in the family.
[[nodiscard]] int with_spouse(int code);

} // namespace kindrel::people
