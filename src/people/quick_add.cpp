#include "people/quick_add.h"

#include "core/entry.h"
#include "core/open_church.h"
#include "people/setup_rows.h"

#include <algorithm>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

std::optional<int> refused(core::Office& office, const core::Message& message)
{
    office.dialogue.show(message);
    return std::nullopt;
}

int add_at_end(core::Session& session, const SetupList& list, SetupItem item)
{
    core::Transaction transaction(session);
    // The key comes first: its counter is held until the end, so that two workstations cannot add the same text at
    // once. A text that is there already leaves the transaction undone and gives the key back.
    item.key = session.allocate(list.entity);
    int highest = 0;
    for (const auto& row : read_setup_rows(session, list)) {
        if (sameness(row.item) == sameness(item))
            return row.item.key;
        highest = std::max(highest, row.position);
    }
    insert_setup_rows(session, list, std::array{SetupRow{item, highest + 1}});
    transaction.commit();
    return item.key;
}

/// Whoever sets up the lists may add to them, and so may whoever fills in families.
bool may_add(const core::Office& office)
{
    if (office.may(core::Area::family_file_setup))
        return true;
    if (!core::may_enter(office, core::AreaId::family_editor))
        return core::permitted(office, core::Area::family_file_setup);
    if (!office.may(core::Area::read_only_family_data))
        return true;
    office.dialogue.show({u"Unable to add this item as you only have read only access within family files"_s});
    return false;
}

std::optional<int> add(core::Office& office, SetupKind kind, const SetupItem& item)
{
    if (const auto message = too_long(item))
        return refused(office, *message);
    if (!may_add(office) || !core::network_guard(office))
        return std::nullopt;
    return add_at_end(*office.session, setup_list(kind), item);
}

} // namespace

std::optional<int> add_occupation(core::Office& office, const QString& text)
{
    const SetupItem item{.text = tidy(text)};
    if (item.text.isEmpty())
        return refused(office, {u"Please enter a Occupation"_s});
    return add(office, SetupKind::occupations, item);
}

std::optional<int> add_new_suburb(core::Office& office, const QString& suburb, const QString& postcode)
{
    const SetupItem item{.text = tidy(suburb), .postcode = tidy(postcode)};
    if (item.text.isEmpty())
        return refused(office, {u"Please enter a suburb"_s});
    if (item.postcode.isEmpty())
        return refused(office, {u"Please enter a postcode"_s});
    return add(office, SetupKind::suburbs, item);
}

} // namespace kindrel::people
