#pragma once

#include "core/session.h"

#include <QString>

#include <vector>

namespace kindrel::people {

struct Member
{
    int person_id = 0;
    int surname_id = 0;
};

/// The chosen people in the chosen order; `criteria` is one plain sentence.
struct WorkingList
{
    std::vector<Member> members;
    QString criteria;

    /// Each family once, in order of its first member.
    [[nodiscard]] std::vector<int> families() const;
};

/// Fills the temporary table `work_people` (place, person_id, surname_id), place counted from 1.
void lend(core::Session& session, const WorkingList& list);

/// The living people of the active families, family by family.
[[nodiscard]] WorkingList active_families(core::Session& session);

} // namespace kindrel::people
