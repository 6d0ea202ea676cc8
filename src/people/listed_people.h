#pragma once

#include "people/filter.h"
#include "people/records.h"
#include "people/working_list.h"

namespace kindrel::people {

/// A line of a people list.
struct ListedPerson
{
    Member member;
    QString name;         ///< As of listed_name().
    QString surname;      ///< Of the family.
    QString sort_key;     ///< Of that surname.
    QString own_sort_key; ///< Of the surname under which the person sorts: the own one unless it is hidden.
    PersonStates states;
    bool booked_out = false; ///< The family is away.
};

[[nodiscard]] PersonStates states_of(const Person& person);

/// The listed name as lists of people show it: with the own surname where it is another than the family's and not
/// hidden, and with the markers.
[[nodiscard]] QString listed_name(const Person& person, const QString& surname, bool use_preferred_names);

/// The people of the list in its order; who is no longer in the register is passed over. One statement. Throws
/// core::DatabaseError, as all here do.
[[nodiscard]] std::vector<ListedPerson> listed_people(core::Session& session, const WorkingList& list,
                                                      bool use_preferred_names);
/// Everybody in the register, family by family.
[[nodiscard]] std::vector<ListedPerson> everybody(core::Session& session, bool use_preferred_names);

/// What a person must have that a report can print: of the family or of the person's own.
struct Needs
{
    bool address = false;
    bool phone = false;
    bool email = false;
    bool birth_date = false;

    [[nodiscard]] bool any() const { return address || phone || email || birth_date; }
    friend bool operator==(const Needs&, const Needs&) = default;
};

/// Those of the list who have it all. What is kept hidden does not count. One statement.
[[nodiscard]] WorkingList having(core::Session& session, const WorkingList& list, const Needs& needs);
/// "with an address and a phone number"; empty without needs.
[[nodiscard]] QString needs_words(const Needs& needs);

} // namespace kindrel::people
