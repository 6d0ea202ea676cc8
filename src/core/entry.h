#pragma once

#include "core/locks.h"

namespace kindrel::core {

/// The areas that are entered from the main menu.
enum class AreaId {
    family_editor,
    search,
    tagging,
    organiser,
    roll,
    finance,
    weekly,
    roster,
    wardline,
    visitation,
    reports,
    data_analysis,
    custom_letter,
    email,
    export_text,
    custom_report,
    fusions,
    group_history,
    school_year,
    file_clearance,
    family_setup,
    project_setup, ///< Roll, finance and weekly projects.
    roster_setup,
    wardline_setup,
    global_data,
    vision_setup,
    network_setup,
    security,
    backup,
    restore,
    book_in_out
};
inline constexpr int area_id_count = 31;

/// The right to be in an area, with its lock where it has one. Leaving is the end of this object, which must come
/// before that of the office.
class AreaEntry
{
public:
    AreaEntry(AreaEntry&& other) noexcept;
    AreaEntry& operator=(AreaEntry&& other) noexcept;
    ~AreaEntry();
    [[nodiscard]] AreaId area() const { return m_area; }

private:
    friend std::optional<AreaEntry> enter(Office& office, AreaId area);
    explicit AreaEntry(AreaId area) : m_area(area) {}
    void leave() noexcept;

    struct Taken
    {
        Locks locks;
        LockKind kind;
        LockKey key;
    };
    AreaId m_area;
    std::optional<Taken> m_taken;
};

/// Checks the right, the mode, the connection and the locks, in this order, and takes the area's own lock. Nullopt
/// after telling why the area stays closed. Area locks are taken and looked for only where the church is shared.
[[nodiscard]] std::optional<AreaEntry> enter(Office& office, AreaId area);

/// Whether a right that opens the area is granted: what the main menu shows as open. Says nothing.
[[nodiscard]] bool may_enter(const Office& office, AreaId area);

/// Whether the right is granted; otherwise says that it is missing. The first question of every engine entry.
[[nodiscard]] bool permitted(const Office& office, Area area);

/// Whether nobody works with people's files; otherwise says so.
[[nodiscard]] bool may_delete_people(Office& office);

} // namespace kindrel::core
