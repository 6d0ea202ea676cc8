#pragma once

#include "core/session.h"
#include "people/records.h"

#include <initializer_list>

namespace kindrel::test {

/// Puts three items into each setup list, with keys 1 to 3 and texts such as "group 2".
void add_setup_items(core::Session& session);

[[nodiscard]] people::Person person(const QString& name, int marital = 0);
/// A family with these given names: the first is the primary adult, married where there are more.
[[nodiscard]] people::FamilyFile family(const QString& surname, std::initializer_list<QString> names);
/// A family with every field filled, every kind of item carried, and every hidden switch set where asked. Needs the
/// setup items.
[[nodiscard]] people::FamilyFile full_family(bool hidden);

} // namespace kindrel::test
