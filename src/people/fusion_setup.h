#pragma once

#include "core/office.h"
#include "core/ordered_list.h"
#include "people/fusion.h"

namespace kindrel::people {

/// The fusions in memory: nothing is written before save(), and destroying it drops every change. Operations say what
/// stands in their way, then return false and change nothing. An index of -1 means that nothing is chosen.
class FusionSetup
{
public:
    using List = core::OrderedList<Fusion>;

    /// Reads the fusions. Throws core::DatabaseError.
    explicit FusionSetup(core::Office& office);

    [[nodiscard]] const List& fusions() const { return m_fusions; }
    /// What can be added of a kind, without mode: every ministry in both states, of the groups those that still meet.
    [[nodiscard]] std::vector<FilterItem> choices(FilterKind kind) const;

    /// At the end, without entries.
    [[nodiscard]] bool add(const QString& name);
    [[nodiscard]] bool rename(int fusion, const QString& name);
    /// Asks first.
    [[nodiscard]] bool remove(int fusion);
    [[nodiscard]] bool set_states(int fusion, const PersonStates& states);

    /// At the end of the fusion's entries.
    [[nodiscard]] bool add_entry(int fusion, const FilterItem& item, FusionMode mode);
    [[nodiscard]] bool set_mode(int fusion, int entry, FusionMode mode);
    [[nodiscard]] bool remove_entry(int fusion, int entry);
    [[nodiscard]] bool move_entry_up(int fusion, int entry);
    [[nodiscard]] bool move_entry_down(int fusion, int entry);

    [[nodiscard]] bool altered() const { return m_fusions.altered(); }
    /// All altered fusions in one transaction; what other workstations did to others is kept. False, after saying why,
    /// without the right or the connection. Throws core::DatabaseError, and then nothing is written.
    [[nodiscard]] bool save();

private:
    /// Shows the message; false, for the caller to return.
    bool refuse(const QString& words) const;
    /// Whether a fusion may bear the name beside all but the one at `except`.
    [[nodiscard]] bool fits(const QString& name, int except) const;
    [[nodiscard]] bool chosen(int fusion, int entry, const QString& words) const;
    bool move_entry(int fusion, int entry, int to, const QString& refusal);

    core::Office& m_office;
    List m_fusions;
};

} // namespace kindrel::people
