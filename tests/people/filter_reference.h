#pragma once

#include "people/fusion.h"
#include "people/records.h"
#include "people/working_list.h"

#include <QDate>

namespace kindrel::test {

/// Everybody whom a filter means, in order, decided by looking at each person's file. Knows no database: this is what
/// the statements are measured by.
[[nodiscard]] std::vector<people::Member> meant(const std::vector<people::FamilyFile>& church,
                                                const people::Filter& filter,
                                                const std::vector<people::Fusion>& fusions, const QDate& today);

} // namespace kindrel::test
