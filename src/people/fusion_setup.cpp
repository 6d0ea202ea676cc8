#include "people/fusion_setup.h"

#include "core/entry.h"
#include "core/open_church.h"
#include "people/fusion_rows.h"

#include <algorithm>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

/// Whether two items are one line of the screen's lists.
bool same_line(const FilterItem& left, const FilterItem& right)
{
    return left.kind == right.kind && left.item == right.item && left.ministry == right.ministry;
}

/// What a fusion keeps of an item: how it is joined says the entry's mode.
FilterItem kept(FilterItem item)
{
    const auto& kind = filter_kind(item.kind);
    item.exclude = false;
    if (!kind.has_states() || (item.ministry != MinistryChoice::potential && item.ministry != MinistryChoice::active))
        item.ministry = MinistryChoice::any;
    if (!kind.has_marks() || item.marks != Marks::marked)
        item.marks = Marks::any;
    if (!kind.has_value() || (item.value && item.value->isEmpty()))
        item.value.reset();
    return item;
}

} // namespace

FusionSetup::FusionSetup(core::Office& office) : m_office(office), m_fusions(read_fusions(*office.session)) {}

std::vector<FilterItem> FusionSetup::choices(FilterKind kind) const
{
    std::vector<FilterItem> items;
    for (const auto& stored : read_setup_items(*m_office.session, filter_kind(kind).list)) {
        if (stored.not_active)
            continue;
        FilterItem item{.kind = kind, .item = stored.key, .text = stored.text};
        if (filter_kind(kind).has_states()) {
            item.ministry = MinistryChoice::active;
            items.push_back(item);
            item.ministry = MinistryChoice::potential;
        }
        items.push_back(item);
    }
    return items;
}

bool FusionSetup::refuse(const QString& words) const
{
    m_office.dialogue.show({words});
    return false;
}

bool FusionSetup::fits(const QString& name, int except) const
{
    if (name.isEmpty())
        return refuse(u"Please enter a fusion name"_s);
    if (name.size() > longest_setup_text)
        return refuse(u"Please enter no more than %1 characters"_s.arg(longest_setup_text));
    for (int index = 0; index < m_fusions.size(); ++index) {
        if (index != except && sameness(m_fusions[index].name) == sameness(name))
            return refuse(u"This fusion already exists in the list"_s);
    }
    return true;
}

bool FusionSetup::chosen(int fusion, int entry, const QString& words) const
{
    const bool holds =
        m_fusions.holds(fusion) && entry >= 0 && entry < static_cast<int>(m_fusions[fusion].entries.size());
    return holds || refuse(words);
}

bool FusionSetup::add(const QString& name)
{
    Fusion fusion;
    fusion.name = tidy(name);
    if (!fits(fusion.name, -1))
        return false;
    m_fusions.add(std::move(fusion));
    return true;
}

bool FusionSetup::rename(int fusion, const QString& name)
{
    if (!m_fusions.holds(fusion))
        return refuse(u"Please select a fusion group first before attempting to rename it"_s);
    if (!fits(tidy(name), fusion))
        return false;
    auto renamed = m_fusions[fusion];
    renamed.name = tidy(name);
    m_fusions.replace(fusion, std::move(renamed));
    return true;
}

bool FusionSetup::remove(int fusion)
{
    if (!m_fusions.holds(fusion))
        return refuse(u"Please select a fusion group first before attempting to delete it"_s);
    const core::Message question{u"Are you sure that you wish to delete this filter fusion"_s, m_fusions[fusion].name};
    if (!m_office.dialogue.confirm(question, core::Answer::no))
        return false;
    m_fusions.remove(fusion);
    return true;
}

bool FusionSetup::set_states(int fusion, const PersonStates& states)
{
    if (!m_fusions.holds(fusion))
        return refuse(u"Please select a fusion group first"_s);
    auto changed = m_fusions[fusion];
    changed.states = states;
    m_fusions.replace(fusion, std::move(changed));
    return true;
}

bool FusionSetup::add_entry(int fusion, const FilterItem& item, FusionMode mode)
{
    if (m_fusions.empty())
        return refuse(u"Please add a new fusion name before adding filters to it"_s);
    if (!m_fusions.holds(fusion))
        return refuse(u"Please select a fusion group first before attempting to add filters to it"_s);
    auto changed = m_fusions[fusion];
    const FusionEntry added{kept(item), mode};
    const auto is_there = [&](const FusionEntry& entry) {
        return same_line(entry.item, added.item);
    };
    if (std::ranges::any_of(changed.entries, is_there))
        return refuse(u"This filter has already been added to the filters list"_s);
    changed.entries.push_back(added);
    m_fusions.replace(fusion, std::move(changed));
    return true;
}

bool FusionSetup::set_mode(int fusion, int entry, FusionMode mode)
{
    if (!chosen(fusion, entry, u"Please select an item for changing"_s))
        return false;
    auto changed = m_fusions[fusion];
    changed.entries[static_cast<std::size_t>(entry)].mode = mode;
    m_fusions.replace(fusion, std::move(changed));
    return true;
}

bool FusionSetup::remove_entry(int fusion, int entry)
{
    if (!chosen(fusion, entry, u"Please select an item for removing"_s))
        return false;
    auto changed = m_fusions[fusion];
    changed.entries.erase(changed.entries.begin() + entry);
    m_fusions.replace(fusion, std::move(changed));
    return true;
}

bool FusionSetup::move_entry(int fusion, int entry, int to, const QString& refusal)
{
    if (!chosen(fusion, entry, u"Please select an item for moving"_s) || !chosen(fusion, to, refusal))
        return false;
    auto changed = m_fusions[fusion];
    std::swap(changed.entries[static_cast<std::size_t>(entry)], changed.entries[static_cast<std::size_t>(to)]);
    m_fusions.replace(fusion, std::move(changed));
    return true;
}

bool FusionSetup::move_entry_up(int fusion, int entry)
{
    return move_entry(fusion, entry, entry - 1, u"This is the highest position this item can be moved to"_s);
}

bool FusionSetup::move_entry_down(int fusion, int entry)
{
    return move_entry(fusion, entry, entry + 1, u"This is the lowest position this item can be moved to"_s);
}

bool FusionSetup::save()
{
    if (!core::permitted(m_office, core::Area::filter_fusion_setup) || !core::network_guard(m_office))
        return false;
    if (!altered())
        return true;
    save_fusions(*m_office.session, m_fusions.items(), m_fusions.stored());
    m_fusions = List(read_fusions(*m_office.session));
    return true;
}

} // namespace kindrel::people
