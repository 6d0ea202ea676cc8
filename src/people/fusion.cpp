#include "people/fusion.h"

#include "core/removal.h"
#include "people/filter_texts.h"
#include "people/fusion_rows.h"

#include <algorithm>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::to_value;

constexpr std::array<QStringView, fusion_mode_count> mode_words{
    u" (OR+ Can be in Group)", u" (OR- Can be Not in Group)", u" (And+ Must be in group)",
    u" (And- Must Not be in Group)"};

/// In `field4`.
constexpr int marked_only = -1;

QString stored_states(const PersonStates& states)
{
    QString text;
    for (const auto& row : person_states())
        text += states.*row.on ? u'1' : u'0';
    return text;
}

PersonStates states_from(QStringView text)
{
    PersonStates states;
    for (qsizetype place = 0; const auto& row : person_states()) {
        states.*row.on = place < text.size() && text[place] == u'1';
        ++place;
    }
    return states;
}

/// Kinds are stored from 1.
int stored_kind(FilterKind kind)
{
    return static_cast<int>(kind) + 1;
}

int stored_choice(const FilterItem& item)
{
    if (item.marks == Marks::marked)
        return marked_only;
    return item.ministry == MinistryChoice::any ? 0 : static_cast<int>(item.ministry);
}

struct EntryColumns
{
    explicit EntryColumns(const core::Rows& rows)
        : kind(rows.column(u"field0")), item(rows.column(u"field1")), mode(rows.column(u"field2")),
          text(rows.column(u"field3")), choice(rows.column(u"field4")), value(rows.column(u"field5")),
          fusion(rows.column(u"field6"))
    {
    }
    core::Column kind, item, mode, text, choice, value, fusion;
};

/// Nullopt for a row that no version of the fusions ever wrote.
std::optional<FusionEntry> entry_from(const core::Row& row, const EntryColumns& columns)
{
    const int kind = row.integer(columns.kind);
    const int mode = row.integer(columns.mode);
    if (kind < 1 || kind > filter_kind_count || mode < 0 || mode >= fusion_mode_count)
        return std::nullopt;
    FusionEntry entry{.item = {.kind = static_cast<FilterKind>(kind - 1)}, .mode = static_cast<FusionMode>(mode)};
    auto& item = entry.item;
    item.item = row.integer(columns.item);
    item.text = row.text(columns.text);
    const int choice = row.integer(columns.choice);
    if (choice == marked_only && filter_kind(item.kind).has_marks())
        item.marks = Marks::marked;
    if (filter_kind(item.kind).has_states() && (choice == 1 || choice == 2))
        item.ministry = static_cast<MinistryChoice>(choice);
    if (filter_kind(item.kind).has_value() && !row.is_null(columns.value))
        item.value = row.text(columns.value);
    return entry;
}

std::vector<Fusion> read_groups(core::Session& session)
{
    auto rows = session.select(u"SELECT [fusion_id],[fusion_group],[fusion_status] FROM [Tbl_fusion_group] "
                               "ORDER BY [position],[fusion_id];"_s);
    std::vector<Fusion> fusions;
    for (const core::Row& row : rows)
        fusions.push_back(
            {row.integer(core::Column{0}), row.text(core::Column{1}), states_from(row.text(core::Column{2})), {}});
    return fusions;
}

void read_entries(core::Session& session, std::vector<Fusion>& fusions)
{
    auto rows = session.select(u"SELECT * FROM [Tbl_fusion_records] ORDER BY [field6],[position];"_s);
    const EntryColumns columns(rows);
    for (const core::Row& row : rows) {
        const auto owner = std::ranges::find(fusions, row.integer(columns.fusion), &Fusion::fusion_id);
        if (owner == fusions.end())
            continue;
        if (auto entry = entry_from(row, columns))
            owner->entries.push_back(std::move(*entry));
    }
}

void find_texts(core::Session& session, std::vector<Fusion>& fusions)
{
    ItemTexts texts(session);
    for (auto& fusion : fusions) {
        for (auto& entry : fusion.entries)
            entry.lost = !texts.refresh(entry.item.kind, entry.item.item, entry.item.text);
    }
}

void insert_fusions(core::Session& session, const std::vector<Fusion>& fusions, const std::vector<int>& positions)
{
    std::vector<std::vector<core::Value>> groups, records;
    for (std::size_t index = 0; index < fusions.size(); ++index) {
        const auto& fusion = fusions[index];
        groups.push_back({to_value(fusion.fusion_id), to_value(fusion.name), to_value(stored_states(fusion.states)),
                          to_value(positions[index])});
        for (int place = 0; const auto& [item, mode, lost] : fusion.entries)
            records.push_back({to_value(stored_kind(item.kind)), to_value(item.item), to_value(mode),
                               to_value(item.text), to_value(stored_choice(item)),
                               to_value(item.value.value_or(QString())), to_value(fusion.fusion_id),
                               to_value(++place)});
    }
    session.insert(u"Tbl_fusion_group"_s, {u"fusion_id"_s, u"fusion_group"_s, u"fusion_status"_s, u"position"_s},
                   groups);
    session.insert(
        u"Tbl_fusion_records"_s,
        {u"field0"_s, u"field1"_s, u"field2"_s, u"field3"_s, u"field4"_s, u"field5"_s, u"field6"_s, u"position"_s},
        records);
}

} // namespace

QStringView fusion_mode_words(FusionMode mode)
{
    return mode_words[static_cast<std::size_t>(mode)];
}

QString FusionEntry::shown() const
{
    QString words = item.marks == Marks::marked ? u"(Tag) "_s : QString();
    if (item.ministry == MinistryChoice::active)
        words += u"(Active) "_s;
    if (item.ministry == MinistryChoice::potential)
        words += u"(Potential) "_s;
    words += item.text;
    if (item.value)
        words += u" = "_s + *item.value;
    words += fusion_mode_words(mode);
    return words;
}

std::vector<Fusion> read_fusions(core::Session& session)
{
    auto fusions = read_groups(session);
    read_entries(session, fusions);
    find_texts(session, fusions);
    return fusions;
}

std::vector<Fusion> read_fusions(core::Session& session, std::span<const int> keys)
{
    const auto all = read_groups(session);
    std::vector<Fusion> fusions;
    for (const int key : keys) {
        const auto found = std::ranges::find(all, key, &Fusion::fusion_id);
        if (found != all.end())
            fusions.push_back(*found);
    }
    read_entries(session, fusions);
    find_texts(session, fusions);
    return fusions;
}

void apply(Filter& filter, const Fusion& fusion)
{
    if (std::ranges::find(filter.fusions, fusion.fusion_id) == filter.fusions.end())
        filter.fusions.push_back(fusion.fusion_id);
    filter.states = fusion.states;
}

void save_fusions(core::Session& session, std::vector<Fusion> fusions, std::span<const Fusion> known)
{
    core::Transaction transaction(session);
    // Allocated inside, so that the counter is held until the end.
    const auto added = static_cast<int>(std::ranges::count(fusions, 0, &Fusion::fusion_id));
    int next = added > 0 ? session.allocate(core::Entity::fusion, added) : 0;
    std::vector<Fusion> written;
    std::vector<int> positions, gone;
    for (const auto& fusion : known) {
        const auto kept = std::ranges::find(fusions, fusion.fusion_id, &Fusion::fusion_id);
        if (kept == fusions.end() || *kept != fusion)
            gone.push_back(fusion.fusion_id);
    }
    for (int position = 0; auto& fusion : fusions) {
        ++position;
        const bool unchanged = std::ranges::find(known, fusion) != known.end();
        if (unchanged)
            continue;
        if (fusion.fusion_id == 0)
            fusion.fusion_id = next++;
        written.push_back(std::move(fusion));
        positions.push_back(position);
    }
    core::remove_entities(session, core::Entity::fusion, gone);
    insert_fusions(session, written, positions);
    transaction.commit();
}

} // namespace kindrel::people
