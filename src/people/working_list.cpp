#include "people/working_list.h"

#include <QSet>

namespace kindrel::people {

using namespace Qt::StringLiterals;

std::vector<int> WorkingList::families() const
{
    std::vector<int> keys;
    QSet<int> seen;
    for (const auto& member : members) {
        const auto before = seen.size();
        seen.insert(member.surname_id);
        if (seen.size() > before)
            keys.push_back(member.surname_id);
    }
    return keys;
}

void lend(core::Session& session, const WorkingList& list)
{
    std::vector<std::vector<core::Value>> rows;
    rows.reserve(list.members.size());
    for (qint64 place = 0; const auto& member : list.members)
        rows.push_back({++place, core::to_value(member.person_id), core::to_value(member.surname_id)});
    session.fill_temporary(u"work_people"_s, {u"place"_s, u"person_id"_s, u"surname_id"_s}, rows);
}

WorkingList active_families(core::Session& session)
{
    auto rows = session.select(
        u"SELECT p.[person_id],s.[Surname_ID] FROM [tbl_surname] s "
        "INNER JOIN [tbl_people] p ON p.[Surname_ID]=s.[Surname_ID] WHERE s.[Condition]=0 AND p.[Decease]=0 "
        "ORDER BY s.[sort_key],s.[Primary_name],s.[Surname_ID],p.[position];"_s);
    WorkingList list{{}, u"Active Families"_s};
    for (const core::Row& row : rows)
        list.members.push_back({row.integer(core::Column{0}), row.integer(core::Column{1})});
    return list;
}

} // namespace kindrel::people
