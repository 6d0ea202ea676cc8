#pragma once

#include <span>

namespace kindrel::core {

struct Office;

/// What is about to be done to people's records.
enum class PersonAct { change, move, remove, remove_family };

/// A room that keeps records of people which nobody may disturb without its leave.
class PersonGuard
{
public:
    virtual ~PersonGuard() = default;
    /// False after saying why. Asks once, however many of the people it has records of.
    [[nodiscard]] virtual bool allows(Office& office, PersonAct act, std::span<const int> person_ids) const = 0;
};

/// Whether every guard of the office allows it; the first that does not has said why.
[[nodiscard]] bool guards_allow(Office& office, PersonAct act, std::span<const int> person_ids);

} // namespace kindrel::core
