#include "output/reports/group_heads.h"

#include <array>
#include <optional>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

using people::GroupDetails;

// The heads that a field stands in.
constexpr int everything = static_cast<int>(GroupHead::everything);
constexpr int leader = static_cast<int>(GroupHead::leader) | everything;
constexpr int meeting = static_cast<int>(GroupHead::meeting) | everything;

/// A value of the details; values of one line stand beside each other.
struct DetailField
{
    int heads;
    std::size_t line;
    const char16_t* caption;
    QString GroupDetails::*value;
    std::optional<people::Detail> detail = {}; ///< Withheld with these.
};

constexpr std::array detail_fields{
    DetailField{meeting, 0, u"Day: ", &GroupDetails::Day},
    DetailField{meeting, 0, u"   Time: ", &GroupDetails::Time},
    DetailField{meeting, 0, u"   Frequency: ", &GroupDetails::Frequency},
    DetailField{meeting, 1, u"Address: ", &GroupDetails::Address, people::Detail::addresses},
    DetailField{leader, 2, u"Leader: ", &GroupDetails::leader},
    DetailField{leader, 2, u"   Leader Phone: ", &GroupDetails::leader_phone, people::Detail::phones},
    DetailField{leader, 3, u"Assistant Leader: ", &GroupDetails::assistant_leader},
    DetailField{leader, 3, u"   Assistant Leader Phone: ", &GroupDetails::assistant_leader_phone,
                people::Detail::phones},
    DetailField{everything, 4, u"Host: ", &GroupDetails::host},
    DetailField{everything, 4, u"   Host Phone: ", &GroupDetails::host_phone, people::Detail::phones},
    DetailField{everything, 5, u"Comments: ", &GroupDetails::comments},
};
constexpr std::size_t most_lines = 6;

bool stands(const DetailField& field, GroupHead head, const people::Details& withheld)
{
    const bool kept_back = field.detail && withheld[static_cast<std::size_t>(*field.detail)];
    return (field.heads & static_cast<int>(head)) && !kept_back;
}

} // namespace

QHash<int, GroupDetails> read_group_details(core::Session& session)
{
    auto rows = session.select(u"SELECT * FROM [tbl_group_details];"_s);
    const auto key = rows.column(u"group_id");
    const people::FieldReader reader(rows, people::group_detail_fields());
    QHash<int, GroupDetails> details;
    for (const core::Row& row : rows)
        reader.read(row, details[row.integer(key)]);
    return details;
}

CaptionLines head_lines(const GroupDetails& details, GroupHead head, const people::Details& withheld)
{
    CaptionLines lines(most_lines);
    for (const auto& field : detail_fields) {
        if (const auto& value = details.*field.value; stands(field, head, withheld) && !value.isEmpty())
            lines[field.line].push_back({QStringView(field.caption).toString(), value});
    }
    std::erase_if(lines, [](const auto& line) { return line.empty(); });
    return lines;
}

} // namespace kindrel::output
