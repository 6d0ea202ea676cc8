#pragma once

#include "output/list_reader.h"
#include "people/setup_lists.h"

namespace kindrel::output {

/// Those of the working list who carry one item of a setup list, in the list's order. Of an item that families carry,
/// each family stands once, by its first person.
struct ItemSection
{
    people::SetupItem item;
    int type = 0; ///< Ministries: a MinistryState.
    std::vector<people::Member> members;
};

/// In the order of the setup list; items that nobody carries are left out. Ministries have a section for each state.
/// Two statements, whatever their number. Throws core::DatabaseError.
[[nodiscard]] std::vector<ItemSection> read_item_sections(core::Session& session, const people::WorkingList& list,
                                                          people::SetupKind kind);

/// The heading of a section: "Worship (Potential) - 12".
[[nodiscard]] QString title_of(const ItemSection& section);

/// Everybody, section after section.
[[nodiscard]] std::vector<people::Member> members_of(std::span<const ItemSection> sections);

/// Tells, place by place in members_of(), which section a member belongs to and whether they are its first.
class SectionCursor
{
public:
    explicit SectionCursor(std::span<const ItemSection> sections) : m_sections(sections) {}

    /// The section of this place. Places only grow.
    [[nodiscard]] const ItemSection& at(std::size_t place);
    /// Whether the last call of at() went on to another section.
    [[nodiscard]] bool moved_on() const { return m_moved_on; }

private:
    std::span<const ItemSection> m_sections;
    std::size_t m_index = 0;
    std::size_t m_first = 0; ///< Place of the section's first member.
    bool m_started = false;
    bool m_moved_on = false;
};

} // namespace kindrel::output
