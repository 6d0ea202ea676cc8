#include "core/person_guard.h"

#include "core/office.h"

#include <algorithm>

namespace kindrel::core {

bool guards_allow(Office& office, PersonAct act, std::span<const int> person_ids)
{
    return person_ids.empty() || std::ranges::all_of(office.person_guards, [&](const PersonGuard* guard) {
               return guard->allows(office, act, person_ids);
           });
}

} // namespace kindrel::core
