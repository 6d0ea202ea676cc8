#pragma once

#include "core/office.h"
#include "people/fields.h"

namespace kindrel::people {

/// Where and when a group meets: one row of `tbl_group_details`.
struct GroupDetails
{
    int group_id = 0;
    QString Day, Time, Frequency, Address;
    QString leader, leader_phone, assistant_leader, assistant_leader_phone, host, host_phone;
    QString comments;

    friend bool operator==(const GroupDetails&, const GroupDetails&) = default;
};

[[nodiscard]] std::span<const Field<GroupDetails>> group_detail_fields(); ///< Without the key.

/// Empty details for a group that has none yet.
[[nodiscard]] GroupDetails load_group_details(core::Session& session, int group_id);
/// False, after saying why, without the right or when the group is gone. Throws core::DatabaseError.
[[nodiscard]] bool save_group_details(core::Office& office, const GroupDetails& details);

} // namespace kindrel::people
