#pragma once

#include "core/clock.h"
#include "core/passwords.h"

namespace kindrel::core {

/// The passwords that let a locked-out church in once each: known here by their hashes only.
struct RecoveryList
{
    QByteArray salt;
    QStringList hashes; ///< The place in the list, from 1, is the number under which the use is recorded.
};

/// The list of this program: sixteen passwords of eight capital letters, each more costly to try than a user's.
[[nodiscard]] const RecoveryList& recovery_list();

enum class Recovery {
    unknown,    ///< None of the list.
    admitted,   ///< Lets in, and is marked as used.
    used_before ///< Has let somebody in already.
};

/// Uses a recovery password. Of several workstations that try the same one at the same time one is admitted. Small
/// letters count as capitals, and blanks around it do not count.
[[nodiscard]] Recovery use_recovery_password(Session& session, const Clock& clock, const Password& typed,
                                             const RecoveryList& list = recovery_list());

} // namespace kindrel::core
