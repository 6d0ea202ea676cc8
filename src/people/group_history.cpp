#include "people/group_history.h"

namespace kindrel::people {

using namespace Qt::StringLiterals;

void write_group_history(core::Session& session, const std::vector<Membership>& joined,
                         const std::vector<Membership>& left, const QDate& today)
{
    const auto date = core::Date::from(today);
    for (const auto& [person, group] : left) {
        session.execute(u"UPDATE [tbl_group_history] SET [date_out]=?, [completed]=-1 "
                        "WHERE [person_id]=? AND [group_id]=? AND [completed]=0;"_s,
                        date, person, group);
    }
    if (joined.empty())
        return;
    int key = session.allocate(core::Entity::history, static_cast<int>(joined.size()));
    std::vector<std::vector<core::Value>> rows;
    for (const auto& [person, group] : joined) {
        rows.push_back({core::to_value(key++), core::to_value(person), core::to_value(group), core::to_value(date),
                        core::to_value(false)});
    }
    session.insert(u"tbl_group_history"_s,
                   {u"history_id"_s, u"person_id"_s, u"group_id"_s, u"date_in"_s, u"completed"_s}, rows);
}

} // namespace kindrel::people
