#include "sample/group_book.h"

#include <algorithm>

namespace kindrel::sample {

using namespace Qt::StringLiterals;

namespace {

using core::to_value;

constexpr int youngest_leader = 21;
constexpr std::size_t leaders_noted = 3;
constexpr std::size_t anyone_noted = 60;

} // namespace

void GroupBook::note(const MadeFamily& family)
{
    const auto& file = family.file;
    for (const auto& stay : family.stays)
        m_entries.push_back({stay.in, file.people[stay.place].person_id, stay.group, stay.out});
    for (std::size_t place = 0; place < file.people.size(); ++place) {
        const auto& person = file.people[place];
        if (family.figures[place].age < youngest_leader || !person.Active || person.Decease || person.mobile_hidden ||
            person.mobile_phone.isEmpty() || file.address.res_hidden || !file.residential)
            continue;
        const Leader leader{person.Name + u' ' + file.family.surname, person.mobile_phone,
                            file.address.res_street + u", "_s + file.residential->suburb};
        if (m_anyone.size() < anyone_noted)
            m_anyone.push_back(leader);
        for (const auto& group : person.groups) {
            if (auto& members = m_members[group.item]; members.size() < leaders_noted)
                members.push_back(leader);
        }
    }
}

GroupBook::Leader GroupBook::leader(const SetupItem& group, std::size_t place) const
{
    const auto members = m_members.find(group.key);
    if (members != m_members.end() && place < members->second.size())
        return members->second[place];
    if (m_anyone.empty())
        return {};
    return m_anyone[(static_cast<std::size_t>(group.key) * leaders_noted + place) % m_anyone.size()];
}

void GroupBook::write(core::Session& session, const SetupLists& lists) const
{
    write_history(session);
    std::vector<std::vector<core::Value>> rows;
    for (const auto& group : lists.items(SetupList::groups)) {
        const auto first = leader(group, 0);
        const auto second = leader(group, 1);
        const auto host = leader(group, 2);
        const auto& room = group.more[4];
        rows.push_back({to_value(group.key), to_value(group.more[1]), to_value(group.more[2]), to_value(group.more[3]),
                        to_value(room.isEmpty() ? host.address : room), to_value(first.name), to_value(first.phone),
                        to_value(second.name), to_value(second.phone), to_value(host.name), to_value(host.phone),
                        to_value(SetupLists::meets(group) ? QString() : u"Kept for its history."_s)});
    }
    session.insert(u"tbl_group_details"_s,
                   {u"group_id"_s, u"Day"_s, u"Time"_s, u"Frequency"_s, u"Address"_s, u"leader"_s, u"leader_phone"_s,
                    u"assistant_leader"_s, u"assistant_leader_phone"_s, u"host"_s, u"host_phone"_s, u"comments"_s},
                   rows);
}

void GroupBook::write_history(core::Session& session) const
{
    // What the families brought says that everybody joined today.
    session.execute(u"DELETE FROM [tbl_group_history];"_s);
    if (m_entries.empty())
        return;
    auto entries = m_entries;
    std::ranges::sort(entries);
    int key = session.allocate(core::Entity::history, static_cast<int>(entries.size()));
    std::vector<std::vector<core::Value>> rows;
    for (const auto& entry : entries)
        rows.push_back({to_value(key++), to_value(entry.person), to_value(entry.group), to_value(entry.in),
                        to_value(entry.out), to_value(entry.out.has_value())});
    session.insert(u"tbl_group_history"_s,
                   {u"history_id"_s, u"person_id"_s, u"group_id"_s, u"date_in"_s, u"date_out"_s, u"completed"_s}, rows);
}

} // namespace kindrel::sample
