#include "people/group_details.h"

#include "core/entry.h"

#include <array>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

const std::array fields{
    Field<GroupDetails>{"Day", &GroupDetails::Day},
    Field<GroupDetails>{"Time", &GroupDetails::Time},
    Field<GroupDetails>{"Frequency", &GroupDetails::Frequency},
    Field<GroupDetails>{"Address", &GroupDetails::Address},
    Field<GroupDetails>{"leader", &GroupDetails::leader},
    Field<GroupDetails>{"leader_phone", &GroupDetails::leader_phone},
    Field<GroupDetails>{"assistant_leader", &GroupDetails::assistant_leader},
    Field<GroupDetails>{"assistant_leader_phone", &GroupDetails::assistant_leader_phone},
    Field<GroupDetails>{"host", &GroupDetails::host},
    Field<GroupDetails>{"host_phone", &GroupDetails::host_phone},
    Field<GroupDetails>{"comments", &GroupDetails::comments},
};

bool exists(core::Session& session, int group_id)
{
    auto rows = session.select(u"SELECT [group_id] FROM [tbl_group_setup] WHERE [group_id]=?;"_s, group_id);
    return rows.first() != nullptr;
}

/// False when the group is gone.
bool write(core::Session& session, const GroupDetails& details)
{
    QStringList names{u"group_id"_s};
    append_names<GroupDetails>(names, fields);
    std::vector<core::Value> values{core::to_value(details.group_id)};
    append_values<GroupDetails>(values, details, fields);
    core::Transaction transaction(session);
    if (!exists(session, details.group_id))
        return false;
    session.execute(u"DELETE FROM [tbl_group_details] WHERE [group_id]=?;"_s, details.group_id);
    session.insert(u"tbl_group_details"_s, names, std::array{values});
    transaction.commit();
    return true;
}

} // namespace

std::span<const Field<GroupDetails>> group_detail_fields()
{
    return fields;
}

GroupDetails load_group_details(core::Session& session, int group_id)
{
    auto rows = session.select(u"SELECT * FROM [tbl_group_details] WHERE [group_id]=?;"_s, group_id);
    const FieldReader<GroupDetails> reader(rows, fields);
    GroupDetails details;
    details.group_id = group_id;
    if (const auto* row = rows.first())
        reader.read(*row, details);
    return details;
}

bool save_group_details(core::Office& office, const GroupDetails& details)
{
    if (!core::permitted(office, core::Area::family_file_setup))
        return false;
    if (write(*office.session, details))
        return true;
    office.dialogue.show({u"Unable to save these details as the group is no longer in the list of groups"_s});
    return false;
}

} // namespace kindrel::people
