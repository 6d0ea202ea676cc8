#pragma once

#include "core/office.h"
#include "people/records.h"

namespace kindrel::people {

/// A typed PIN as it is stored: digits without blanks around them and without leading zeros; what is no number comes
/// back empty.
[[nodiscard]] QString tidy_pin(const QString& typed);

/// Whether the person at the keyboard may see and change PINs; otherwise says so.
[[nodiscard]] bool pins_permitted(const core::Office& office);

/// A PIN that nobody has, neither in the register nor in the file: searched upwards from the church's
/// `pin_auto_number_start`, which is moved behind it at once. Asks first when the person at `index` has one. The file
/// is left as it is. Nullopt after a refusal or a No.
[[nodiscard]] std::optional<QString> allocate_pin(core::Office& office, const FamilyFile& file, int index);

/// Says whether anybody but the person at `index` has that person's PIN.
void check_pin(core::Office& office, const FamilyFile& file, int index);

/// The refusal of a file that gives a person a PIN which somebody else has; nullopt when there is none. One statement.
[[nodiscard]] std::optional<core::Message> pin_clash(core::Session& session, const FamilyFile& file);

} // namespace kindrel::people
