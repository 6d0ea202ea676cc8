#include "people/group_history.h"

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

/// The entries of the lent memberships that a condition on `h` holds for.
QString entries_where(const QString& condition)
{
    return u"[history_id] IN (SELECT h.[history_id] FROM [work_memberships] w INNER JOIN [tbl_group_history] h "
           "ON h.[person_id]=w.[person_id] AND h.[group_id]=w.[group_id] WHERE %1);"_s.arg(condition);
}

void lend(core::Session& session, const std::vector<Membership>& memberships)
{
    std::vector<std::vector<core::Value>> rows;
    for (qint64 place = 0; const auto& [person, group] : memberships)
        rows.push_back({++place, core::to_value(person), core::to_value(group)});
    session.fill_temporary(u"work_memberships"_s, {u"place"_s, u"person_id"_s, u"group_id"_s}, rows);
}

/// One statement, whatever the number of memberships.
void close_entries(core::Session& session, const std::vector<Membership>& left, const core::Date& date)
{
    if (left.empty())
        return;
    lend(session, left);
    session.execute(u"UPDATE [tbl_group_history] SET [date_out]=?, [completed]=-1 WHERE "_s +
                        entries_where(u"h.[completed]=0"_s),
                    date);
}

} // namespace

std::vector<HistoryEntry> read_group_history(core::Session& session, int surname_id)
{
    auto rows = session.select(u"SELECT * FROM [qry_group_history] WHERE [person_id] IN "
                               "(SELECT [person_id] FROM [tbl_people] WHERE [Surname_ID]=?) "
                               "ORDER BY [date_in] DESC,[history_id] DESC;"_s,
                               surname_id);
    const auto person = rows.column(u"person_id");
    const auto group = rows.column(u"group");
    const auto date_in = rows.column(u"date_in");
    const auto date_out = rows.column(u"date_out");
    const auto completed = rows.column(u"completed");
    std::vector<HistoryEntry> history;
    for (const core::Row& row : rows) {
        history.push_back(
            {row.integer(person), row.text(group), row.date(date_in), row.date(date_out), row.flag(completed)});
    }
    return history;
}

void write_group_history(core::Session& session, const std::vector<Membership>& joined,
                         const std::vector<Membership>& left, const QDate& today)
{
    const auto date = core::Date::from(today);
    close_entries(session, left, date);
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

void take_back_group_history(core::Session& session, const std::vector<Membership>& memberships, HistoryAct act,
                             const QDate& day)
{
    if (memberships.empty())
        return;
    lend(session, memberships);
    const auto date = core::Date::from(day);
    if (act == HistoryAct::joining)
        session.execute(
            u"DELETE FROM [tbl_group_history] WHERE "_s + entries_where(u"h.[completed]=0 AND h.[date_in]=?"_s), date);
    else
        session.execute(u"UPDATE [tbl_group_history] SET [date_out]=NULL, [completed]=0 WHERE "_s +
                            entries_where(u"h.[completed]=-1 AND h.[date_out]=?"_s),
                        date);
}

} // namespace kindrel::people
