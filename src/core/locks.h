#pragma once

#include "core/office.h"

#include <span>

namespace kindrel::core {

/// The lock tables.
enum class LockKind {
    area,          ///< Key: an AreaCode.
    family,        ///< Key: `surname_id`.
    roll_area,     ///< Somebody works with people's files there; held by as many workstations as are at work.
    finance_area,  ///< The same, finance.
    roster_area,   ///< The same, rosters.
    wardline_area, ///< The same, Wardline.
    roll,          ///< Key: the project's.
    finance,       ///< Key: the project's.
    weekly,        ///< Key: the project's.
    roster,        ///< Key: the project's.
    wardline,      ///< Key: the compliance type's.
    custom_letter, ///< Key: the letter's name.
    custom_report  ///< Key: the report's name.
};
inline constexpr int lock_kind_count = 13;

/// The areas that one person at a time may be in. 2 and 4 are as old as the lock tables; the others are this
/// program's own and begin above what older files may hold.
enum class AreaCode : int {
    setup = 2, ///< The setup of the family file options.
    visitation = 4,
    project_setup = 21, ///< Roll, finance and weekly projects.
    roster_setup = 22,
    wardline_setup = 23,
    security = 24
};

/// What a lock stands on within its kind.
class LockKey
{
public:
    LockKey(int key) : m_value(to_value(key)) {}
    LockKey(AreaCode code) : m_value(to_value(code)) {}
    LockKey(const QString& name) : m_value(to_value(name)) {}
    explicit LockKey(Value stored) : m_value(std::move(stored)) {}
    [[nodiscard]] const Value& value() const { return m_value; }
    friend bool operator==(const LockKey&, const LockKey&) = default;

private:
    Value m_value;
};

/// Who took a lock. Rows of other programs may lack all of it.
struct Holder
{
    QString workstation;
    qint64 process = 0;
    QDateTime since;
    bool this_workstation = false;
};

/// A row of a lock table, in words.
struct HeldLock
{
    LockKind kind;
    LockKey key;
    QString what; ///< For example "Family file 'Naismith, Ann'" or "Roll project 'Morning'".
    Holder holder;
    bool stale = false; ///< Of this workstation, and the program that took it runs no more.
};

/// A lock to look for. Without a key: any row of the kind whose key is above 0.
struct LockCheck
{
    LockKind kind;
    std::optional<LockKey> key = std::nullopt;
};

/// The locks by which workstations that share a church keep out of each other's way. Holds nothing itself: a lock is a
/// row, and stays until it is released, whatever becomes of the program that took it. Knows nothing of rights and
/// modes: areas are entered through enter(). Throws DatabaseError, but for release().
class Locks
{
public:
    Locks(Session& session, Workstation& workstation, Clock& clock);
    explicit Locks(Office& office) : Locks(*office.session, office.workstation, office.clock) {}

    /// True when anybody holds it, this program included.
    [[nodiscard]] bool check(LockKind kind, const LockKey& key);
    /// True when anything of the kind with a key above 0 is held.
    [[nodiscard]] bool any(LockKind kind);
    [[nodiscard]] int count(LockKind kind);
    /// Takes the lock unless somebody holds it, this program included, or one of `unless` is held. Looking and taking
    /// are one step: of several workstations one succeeds. The people areas (`roll_area` to `wardline_area`) are
    /// never refused on their own account.
    [[nodiscard]] bool take(LockKind kind, const LockKey& key, std::span<const LockCheck> unless = {});
    /// Gives back one row: this program's own, else the first found. Errors are ignored, and so is a missing row.
    void release(LockKind kind, const LockKey& key) noexcept;
    /// The first holder.
    [[nodiscard]] std::optional<Holder> holder(LockKind kind, const LockKey& key);
    /// The rows that a check finds, oldest first.
    [[nodiscard]] std::vector<HeldLock> held(const LockCheck& check);
    /// Every row of every kind, in the order of the kinds.
    [[nodiscard]] std::vector<HeldLock> all();
    /// Deletes every row of the lock, whoever took it; the number of rows.
    int unlock(LockKind kind, const LockKey& key);

    /// The rows that this workstation left behind: it took them and the program that did so runs no more.
    [[nodiscard]] std::vector<HeldLock> stale();
    /// Deletes exactly the rows that stale() finds; the number of rows.
    int release_stale();

    /// The key under which this program stands in the people areas: that of its process.
    [[nodiscard]] static LockKey own_place();

private:
    [[nodiscard]] bool found(const LockCheck& check);
    [[nodiscard]] std::vector<HeldLock> rows_of(LockKind kind, const QString& where, std::span<const Value> values);
    [[nodiscard]] HeldLock in_row(LockKind kind, const Row& row, const std::array<Column, 6>& columns) const;

    Session& m_session;
    Workstation& m_workstation;
    Clock& m_clock;
};

/// "Family file 'Naismith, Ann' is held by the workstation 'office-2' since 10:31 on 15/05/2024."
[[nodiscard]] QString held_line(const HeldLock& lock, DayOrder order);

/// Offers the person to release what this workstation left behind when the program last ended without leaving.
void offer_stale_locks(Office& office);

} // namespace kindrel::core
