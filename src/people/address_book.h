#pragma once

#include "core/session.h"
#include "people/records.h"

#include <array>

namespace kindrel::people {

/// The family lists in the order of the search screen's selector.
enum class FamilyList { all, active, privacy, active_and_privacy, prospect, archive, booked_in, booked_out };
inline constexpr int family_list_count = 8;

[[nodiscard]] QString family_list_name(FamilyList list);

/// One line of a family list: the family, its first person and the address as far as it is open.
struct AddressBookEntry
{
    int Surname_ID = 0;
    QString surname;
    QString name; ///< As listed: given or preferred name of the person who stands for the family.
    FileStatus Condition = FileStatus::active;
    bool booked_out = false;
    QString street; ///< Empty where the residential address is hidden.
    QString suburb;
    QString phone; ///< Empty where hidden.
};

/// In order of surname and first name; those of one family group alone where its key is given. One statement.
[[nodiscard]] std::vector<AddressBookEntry> read_address_book(core::Session& session, FamilyList list,
                                                              bool use_preferred_names,
                                                              std::optional<int> family_group = {});

struct FamilyTotal
{
    FamilyList list;
    QString caption; ///< As the main menu shows it.
    int count = 0;
};

/// The totals of the main menu in its order, counted from `tbl_surname`.
[[nodiscard]] std::vector<FamilyTotal> family_totals(core::Session& session);

} // namespace kindrel::people
