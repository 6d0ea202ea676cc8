#pragma once

#include "people/records.h"

#include <QJsonObject>

namespace kindrel::people {

/// Everything that a family file holds, under the stored names.
[[nodiscard]] QJsonObject to_json(const FamilyFile& file);
/// Nullopt when anything is missing or of another kind than to_json() writes.
[[nodiscard]] std::optional<FamilyFile> family_from_json(const QJsonObject& object);

} // namespace kindrel::people
