#pragma once

#include "sample/made_family.h"

#include <map>

namespace kindrel::sample {

/// Who belongs and belonged to the groups: their history and, from among their members, those who lead them.
class GroupBook
{
public:
    /// Of a family that is stored: its people must have their keys.
    void note(const MadeFamily& family);
    /// Writes the history anew, with the days on which people joined and left, and the details of every group.
    void write(core::Session& session, const SetupLists& lists) const;

private:
    struct Entry
    {
        core::Date in;
        int person, group;
        std::optional<core::Date> out;
        auto operator<=>(const Entry&) const = default;
    };
    struct Leader
    {
        QString name, phone, address;
    };
    void write_history(core::Session& session) const;
    [[nodiscard]] Leader leader(const SetupItem& group, std::size_t place) const;

    std::vector<Entry> m_entries;
    std::map<int, std::vector<Leader>> m_members; ///< Grown members who could lead, a few of each group.
    std::vector<Leader> m_anyone;                 ///< For groups that have no grown members.
};

} // namespace kindrel::sample
