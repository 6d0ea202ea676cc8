#pragma once

#include "sample/made_family.h"

namespace kindrel::sample {

/// Residential and postal address, family phones and e-mail, map reference.
void give_address(MadeFamily& family, const Stock& stock, Chance& chance);
/// A street and suburb of its own behind the residential one.
void give_postal_address(MadeFamily& family, const Stock& stock, Chance& chance);
/// Middle names, own surnames, mobiles, e-mail and business contacts of everybody.
void give_personal_contacts(MadeFamily& family, const Stock& stock, Chance& chance);
/// Other contacts, events and visits.
void give_records(MadeFamily& family, const Stock& stock, Chance& chance);
/// Marks a few of the values as hidden.
void hide_some(MadeFamily& family, Chance& chance);

[[nodiscard]] people::Suburb suburb_from(const SetupItem& item, people::SuburbType type);

} // namespace kindrel::sample
