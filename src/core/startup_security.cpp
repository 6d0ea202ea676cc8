#include "core/startup_security.h"

#include "core/locks.h"
#include "core/users.h"

namespace kindrel::core::startup_steps {

bool ask_password(State& state)
{
    Office& office = state.office;
    if (!office.settings.Security)
        return true;
    // A command runs by itself: it has one try, and must not use up what lets a locked-out church in.
    const EntryRules rules = state.on_desktop() ? EntryRules{} : EntryRules{.tries = 1, .recovery = nullptr};
    return enter_by_password(office, state.progress, rules);
}

bool release_left_locks(State& state)
{
    offer_stale_locks(state.office);
    return true;
}

} // namespace kindrel::core::startup_steps
