#include "people/setup_rows.h"

#include "core/references.h"
#include "people/group_history.h"

#include <QHash>
#include <QSet>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::Session;
using core::to_value;

/// The keys whose rows a save takes away: those of changed items, to be written anew, and those of removed ones.
constexpr QStringView lent = u"SELECT [item] FROM [work_setup]";
constexpr QStringView lent_removed = u"SELECT [item] FROM [work_setup] WHERE [removed]=-1";

QString latin(const char* name)
{
    return QString::fromLatin1(name);
}

QSet<int> keys_of(const std::vector<SetupItem>& items)
{
    QSet<int> keys;
    for (const auto& item : items)
        keys.insert(item.key);
    return keys;
}

/// What a save does to the rows of one list.
class Change
{
public:
    Change(const core::OrderedList<SetupItem>& items, const std::vector<SetupRow>& rows)
        : m_items(items.items()), m_kept(keys_of(items.items())), m_known(keys_of(items.stored()))
    {
        for (const auto& row : rows) {
            m_rows.insert(row.item.key, &row);
            if (!m_kept.contains(row.item.key) && !m_known.contains(row.item.key))
                m_strangers.push_back(row.item);
        }
    }

    /// New items get keys from `next` on. An item that was added elsewhere too takes the key it has there; the others
    /// that were added elsewhere are kept at the end.
    void settle_keys(int next)
    {
        for (auto& item : m_items) {
            if (item.key != 0)
                continue;
            const auto same = std::ranges::find(m_strangers, sameness(item),
                                                [](const SetupItem& stranger) { return sameness(stranger); });
            if (same == m_strangers.end()) {
                item.key = next++;
            } else {
                item.key = same->key;
                m_strangers.erase(same);
            }
        }
        m_items.insert(m_items.end(), m_strangers.begin(), m_strangers.end());
    }

    [[nodiscard]] std::vector<SetupRow> written() const
    {
        std::vector<SetupRow> rows;
        for (int position = 0; const auto& item : m_items) {
            SetupRow row{item, ++position};
            row.item.users = 0;
            const auto* stored = m_rows.value(item.key);
            if (!stored || row != *stored)
                rows.push_back(std::move(row));
        }
        return rows;
    }
    [[nodiscard]] std::vector<int> removed() const
    {
        const auto gone = m_known - m_kept;
        return {gone.begin(), gone.end()};
    }
    [[nodiscard]] std::vector<SetupItem> take_items() { return std::move(m_items); }

private:
    std::vector<SetupItem> m_items;
    QSet<int> m_kept, m_known;
    QHash<int, const SetupRow*> m_rows;
    std::vector<SetupItem> m_strangers;
};

void lend(Session& session, const std::vector<SetupRow>& written, const std::vector<int>& removed)
{
    std::vector<std::vector<core::Value>> rows;
    for (const auto& row : written)
        rows.push_back({to_value(row.item.key), to_value(false)});
    for (const int key : removed)
        rows.push_back({to_value(key), to_value(true)});
    session.fill_temporary(u"work_setup"_s, {u"item"_s, u"removed"_s}, rows);
}

/// The members leave into their history, which keeps the name of the group.
void close_groups(Session& session, const QDate& today)
{
    std::vector<Membership> left;
    {
        auto rows = session.select(
            u"SELECT [person_id],[group_id] FROM [tbl_group] WHERE [group_id] IN (%1);"_s.arg(lent_removed));
        for (const core::Row& row : rows)
            left.push_back({row.integer(core::Column{0}), row.integer(core::Column{1})});
    }
    write_group_history(session, {}, left, today);
    session.execute(u"UPDATE [tbl_group_history] SET [group]=(SELECT s.[group] FROM [tbl_group_setup] s "
                    "WHERE s.[group_id]=[tbl_group_history].[group_id]) WHERE [group_id] IN (%1);"_s.arg(lent_removed));
}

void remove_what_refers(Session& session, const SetupList& list)
{
    for (const auto& reference : core::references()) {
        if (reference.to == list.entity && reference.bond != core::Bond::keep)
            session.execute(u"DELETE FROM [%1] WHERE [%2] IN (%3);"_s.arg(latin(reference.table),
                                                                          latin(reference.field), lent_removed));
    }
}

} // namespace

std::vector<SetupRow> read_setup_rows(Session& session, const SetupList& list)
{
    auto rows =
        session.select(u"SELECT * FROM [%1] ORDER BY [position],[%2];"_s.arg(latin(list.query), latin(list.key)));
    const auto key = rows.column(latin(list.key));
    const auto text = rows.column(latin(list.text));
    const auto position = rows.column(u"position");
    const auto extra = list.extra ? rows.column(latin(list.extra)) : key;
    std::vector<SetupRow> found;
    for (const core::Row& row : rows) {
        SetupItem item{.key = row.integer(key), .text = row.text(text)};
        if (list.kind == SetupKind::suburbs)
            item.postcode = row.text(extra);
        if (list.kind == SetupKind::groups)
            item.not_active = row.flag(extra);
        found.push_back({std::move(item), row.integer(position)});
    }
    return found;
}

void insert_setup_rows(Session& session, const SetupList& list, std::span<const SetupRow> rows)
{
    QStringList fields{latin(list.key), latin(list.text), u"position"_s};
    if (list.extra)
        fields += latin(list.extra);
    std::vector<std::vector<core::Value>> values;
    values.reserve(rows.size());
    for (const auto& [item, position] : rows) {
        auto& row = values.emplace_back();
        row = {to_value(item.key), to_value(item.text), to_value(position)};
        if (list.extra)
            row.push_back(list.kind == SetupKind::groups ? to_value(item.not_active) : to_value(item.postcode));
    }
    session.insert(latin(list.table), fields, values);
}

std::vector<SetupItem> save_setup_list(Session& session, const SetupList& list,
                                       const core::OrderedList<SetupItem>& items, const QDate& today)
{
    core::Transaction transaction(session);
    // Allocated inside: the counter is held until the end, so that nobody adds to the list between its reading and its
    // writing.
    const auto added = static_cast<int>(std::ranges::count(items, 0, &SetupItem::key));
    const int next = added > 0 ? session.allocate(list.entity, added) : 0;
    const auto rows = read_setup_rows(session, list);
    Change change(items, rows);
    change.settle_keys(next);
    const auto written = change.written();
    const auto removed = change.removed();
    lend(session, written, removed);
    if (!removed.empty()) {
        if (list.kind == SetupKind::groups)
            close_groups(session, today);
        remove_what_refers(session, list);
    }
    session.execute(u"DELETE FROM [%1] WHERE [%2] IN (%3);"_s.arg(latin(list.table), latin(list.key), lent));
    insert_setup_rows(session, list, written);
    transaction.commit();
    return change.take_items();
}

std::optional<core::Message> too_long(const SetupItem& item)
{
    if (std::max(item.text.size(), item.postcode.size()) <= longest_setup_text)
        return std::nullopt;
    return core::Message{u"Please enter no more than %1 characters"_s.arg(longest_setup_text)};
}

} // namespace kindrel::people
