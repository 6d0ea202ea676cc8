#pragma once

#include "desktop/shell/palette.h"
#include "people/address_book.h"
#include "people/listed_people.h"

namespace kindrel::desktop {

[[nodiscard]] QString status_word(people::FileStatus status);
[[nodiscard]] State state_of(people::FileStatus status);
/// What stands in a list's status column, and in which colour: booked out goes before the file's own status.
[[nodiscard]] QString status_words(const people::AddressBookEntry& entry);
[[nodiscard]] State state_of(const people::AddressBookEntry& entry);
/// The gravest of a person's states.
[[nodiscard]] State state_of(const people::PersonStates& states);

} // namespace kindrel::desktop
