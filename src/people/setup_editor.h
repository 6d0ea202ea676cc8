#pragma once

#include "core/office.h"
#include "core/ordered_list.h"
#include "people/setup_lists.h"

#include <optional>

namespace kindrel::people {

/// What an import brought.
struct ImportCount
{
    int added = 0;
    int existing = 0; ///< Left out, for the list holds them already.

    /// "12 items were added, 3 exist already."
    [[nodiscard]] QString words() const;
};

/// The ten setup lists in memory: nothing is written before save(), and destroying it drops every change. Operations
/// say what stands in their way, then return false and change nothing. An index of -1 means that nothing is chosen.
class SetupEditor
{
public:
    using List = core::OrderedList<SetupItem>;

    /// Reads the lists. Throws core::DatabaseError.
    explicit SetupEditor(core::Office& office);

    [[nodiscard]] const List& list(SetupKind kind) const { return m_lists[static_cast<std::size_t>(kind)]; }
    /// The line below the list.
    [[nodiscard]] QString count_line(SetupKind kind) const;

    /// At the end of the list. `postcode` belongs to suburbs alone.
    [[nodiscard]] bool add(SetupKind kind, const QString& text, const QString& postcode = {});
    [[nodiscard]] bool rename(SetupKind kind, int index, const QString& text, const QString& postcode = {});
    /// Asks first. Who carries the item loses it at the save; a group's members leave it into their history then.
    [[nodiscard]] bool remove(SetupKind kind, int index);
    [[nodiscard]] bool move_up(SetupKind kind, int index);
    [[nodiscard]] bool move_down(SetupKind kind, int index);
    /// Asks first.
    [[nodiscard]] bool sort(SetupKind kind);
    /// A group that no longer meets is kept for its history.
    [[nodiscard]] bool set_not_active(int group_index, bool not_active);

    /// Asks for a file and imports it; nullopt when none was chosen or nothing could be imported.
    [[nodiscard]] std::optional<ImportCount> import(SetupKind kind);
    /// A text file of one item a line, all of it or nothing.
    [[nodiscard]] std::optional<ImportCount> import_file(SetupKind kind, const QString& file);

    /// The key under which the group's details lie. A new group has none: it is offered for saving, and the list of
    /// groups is saved on Yes. Nullopt when the details cannot be opened.
    [[nodiscard]] std::optional<int> group_for_details(int group_index);

    [[nodiscard]] bool altered() const;
    /// Back to what was read or saved last; nothing is read anew.
    void drop();
    /// Each altered list in a transaction of its own; items that other workstations have added meanwhile are kept at
    /// the end. False, after saying why, without the right or the connection. Throws core::DatabaseError: the lists
    /// before the failing one are stored, and save() may be tried again.
    [[nodiscard]] bool save();

private:
    /// Shows the message; false, for the caller to return.
    bool refuse(const core::Message& message) const;
    /// Whether text and postcode may stand in the list beside all items but the one at `except`.
    [[nodiscard]] bool fits(SetupKind kind, const SetupItem& item, int except) const;
    [[nodiscard]] bool may_save() const;
    void save_list(SetupKind kind);
    [[nodiscard]] List& at(SetupKind kind) { return m_lists[static_cast<std::size_t>(kind)]; }

    core::Office& m_office;
    std::array<List, setup_list_count> m_lists;
};

} // namespace kindrel::people
