#pragma once

#include "people/disclosed.h"
#include "people/group_history.h"
#include "people/records.h"

#include <QStringList>

#include <span>
#include <vector>

namespace kindrel::desktop {

/// What the card's words depend on beside the family itself.
struct CardReader
{
    people::Disclosure disclosure;
    bool visits = true;
    std::span<const people::HistoryEntry> history = {}; ///< Of all people of the family.
};

/// A caption and its value; a null `hidden` means that the value has no hidden twin.
template <class Of>
struct CardField
{
    const char* caption;
    QString (*value)(const Of&, const CardReader&);
    bool (*hidden)(const Of&) = nullptr;
};

using FamilyField = CardField<people::FamilyFile>;
using PersonField = CardField<people::Person>;

[[nodiscard]] std::span<const FamilyField> residential_fields();
[[nodiscard]] std::span<const FamilyField> postal_fields();
[[nodiscard]] std::span<const FamilyField> contact_fields();
[[nodiscard]] std::span<const PersonField> name_fields();
[[nodiscard]] std::span<const PersonField> reach_fields();

using CardRows = std::vector<QStringList>;

/// A list on the card: its heading, its columns, and the rows of a family or a person.
template <class Of>
struct CardList
{
    const char* title;
    std::vector<const char*> columns;
    CardRows (*rows)(const Of&, const CardReader&);
    bool people::RecordAccess::*open; ///< The section of the record that the list belongs to.
};

using FamilyCardList = CardList<people::FamilyFile>;
using PersonCardList = CardList<people::Person>;

[[nodiscard]] const std::vector<PersonCardList>& group_lists();
[[nodiscard]] const std::vector<PersonCardList>& date_lists();
[[nodiscard]] const std::vector<FamilyCardList>& event_lists();
[[nodiscard]] const FamilyCardList& other_contact_list();
[[nodiscard]] const FamilyCardList& visit_list();
[[nodiscard]] const FamilyCardList& access_list();

/// "Naismith Family File" with the note on booking out.
[[nodiscard]] QString card_caption(const people::Family& family, core::DayOrder order);
/// "File Created 12/03/2020   Last Edit 01/05/2024", as far as known.
[[nodiscard]] QString file_dates(const people::Family& family, core::DayOrder order);

} // namespace kindrel::desktop
