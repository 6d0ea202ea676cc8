#include "output/reports/group_history_lines.h"

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

QString order_of(HistoryOrder order)
{
    const auto groups = u"CASE WHEN i.[position] IS NULL THEN 1 ELSE 0 END,i.[position],h.[group_id],"_s;
    return (order == HistoryOrder::groups ? groups : QString()) +
           u"w.[place],CASE WHEN h.[date_in] IS NULL THEN 0 ELSE 1 END,h.[date_in],h.[history_id]"_s;
}

} // namespace

std::vector<HistoryLine> read_history_lines(core::Session& session, const people::WorkingList& list, HistoryOrder order)
{
    people::lend(session, list);
    auto rows = session.select(
        u"SELECT w.[person_id],w.[surname_id],h.[group_id],h.[group],h.[date_in],h.[date_out] "
        "FROM [work_people] w "
        "INNER JOIN [qry_group_history] h ON h.[person_id]=w.[person_id] "
        "LEFT JOIN [tbl_group_setup] i ON i.[group_id]=h.[group_id] ORDER BY %1;"_s.arg(order_of(order)));
    const auto person = rows.column(u"person_id");
    const auto family = rows.column(u"surname_id");
    const auto group_id = rows.column(u"group_id");
    const auto group = rows.column(u"group");
    const auto date_in = rows.column(u"date_in");
    const auto date_out = rows.column(u"date_out");
    std::vector<HistoryLine> lines;
    for (const core::Row& row : rows)
        lines.push_back({{row.integer(person), row.integer(family)},
                         row.integer(group_id),
                         row.text(group),
                         row.date(date_in),
                         row.date(date_out)});
    return lines;
}

} // namespace kindrel::output
