#pragma once

#include "core/session.h"

#include <QDate>

#include <vector>

namespace kindrel::people {

struct Membership
{
    int person_id = 0;
    int group_id = 0;

    auto operator<=>(const Membership&) const = default;
};

/// A person's time in a group, past or present.
struct HistoryEntry
{
    int person_id = 0;
    QString group; ///< As the list has it, else the name the group had when it was removed.
    std::optional<core::Date> date_in;
    std::optional<core::Date> date_out;
    bool completed = false;
};

/// Of all people of a family, the latest joining first.
[[nodiscard]] std::vector<HistoryEntry> read_group_history(core::Session& session, int surname_id);

/// Writes what joining and leaving groups leaves behind: an open entry for each joined group, and the open entries of
/// the left ones closed today. The only writer of group history, whoever changes the memberships. Call inside the
/// transaction that does.
void write_group_history(core::Session& session, const std::vector<Membership>& joined,
                         const std::vector<Membership>& left, const QDate& today);

enum class HistoryAct { joining, leaving };

/// Takes back what write_group_history() wrote on a day: entries of joining go, entries of leaving are open again.
/// Those that something has happened to since stay. Call inside the transaction that takes the memberships back.
void take_back_group_history(core::Session& session, const std::vector<Membership>& memberships, HistoryAct act,
                             const QDate& day);

} // namespace kindrel::people
