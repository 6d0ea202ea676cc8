#include "core/locks.h"

#include <QCoreApplication>

#include <algorithm>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

/// A kind of lock as it is stored, and as it is told to a person.
struct LockTable
{
    const char16_t* table;
    const char16_t* field;
    const char16_t* words; ///< What a lock of this kind stands on; its name, where it has one, follows in quotes.
    const char16_t* names = nullptr;     ///< The table that knows the name of the locked thing.
    const char16_t* names_key = nullptr; ///< Its field that the lock's key stands for.
    const char16_t* name = nullptr;      ///< Its field that holds the name.
    const char16_t* given = nullptr;     ///< Its field with the second part of the name.
};

constexpr LockTable tables[]{
    {u"tbl_locked_area", u"locked_area", u"Area"},
    {u"tbl_locked_family_files", u"surname_id", u"Family file", u"tbl_surname", u"Surname_ID", u"surname",
     u"Primary_name"},
    {u"tbl_locked_roll_area", u"locked_id", u"People within the Roll area"},
    {u"tbl_locked_finance_area", u"locked_id", u"People within the Finance area"},
    {u"tbl_locked_roster_area", u"locked_id", u"People within the Roster area"},
    {u"tbl_locked_wardline_area", u"locked_id", u"People within the Wardline area"},
    {u"tbl_roll_locked", u"roll_locked", u"Roll project", u"tbl_roll_project", u"roll_project_id", u"roll_project"},
    {u"tbl_finance_locked", u"finance_locked", u"Finance project", u"tbl_finance_project", u"finance_project_id",
     u"finance_project"},
    {u"tbl_weekly_locked", u"weekly_locked", u"Weekly project", u"tbl_weekly_project", u"weekly_project_id",
     u"weekly_project"},
    {u"tbl_roster_locked", u"roster_locked", u"Roster project", u"tbl_roster_project", u"roster_project_id",
     u"roster_project"},
    {u"tbl_wardline_locked", u"Wardline_locked", u"Wardline compliance", u"tbl_wardline_compliance", u"compliance_id",
     u"compliance"},
    {u"Tbl_custom_letter_lock", u"Letter", u"Custom letter"},
    {u"Tbl_custom_report_lock", u"report", u"Custom report"},
};
static_assert(std::size(tables) == lock_kind_count);

struct NamedArea
{
    AreaCode code;
    const char16_t* name;
};
constexpr std::array areas{
    NamedArea{AreaCode::setup, u"Setup area"},
    NamedArea{AreaCode::visitation, u"Visitation area"},
    NamedArea{AreaCode::project_setup, u"Roll/Finance/Weekly setup area"},
    NamedArea{AreaCode::roster_setup, u"Roster setup area"},
    NamedArea{AreaCode::wardline_setup, u"Wardline setup area"},
    NamedArea{AreaCode::security, u"Security area"},
};

const LockTable& table_of(LockKind kind)
{
    return tables[static_cast<std::size_t>(kind)];
}

bool is_people_area(LockKind kind)
{
    return kind >= LockKind::roll_area && kind <= LockKind::wardline_area;
}

bool has_text_key(LockKind kind)
{
    return kind == LockKind::custom_letter || kind == LockKind::custom_report;
}

QString quoted(const QString& name)
{
    return u'[' + name + u']';
}

QString field_or_null(const char16_t* field)
{
    return field ? u"n."_s + quoted(QString::fromUtf16(field)) : u"CAST(NULL AS TEXT)"_s;
}

/// The rows of a kind with the names of what they lock; a condition on `l` and the order are to follow.
QString with_names(const LockTable& table)
{
    const QString field = QString::fromUtf16(table.field);
    auto text = u"SELECT l.[%1] AS [lock_key], l.[workstation], l.[process], l.[taken], %2 AS [lock_name], "
                "%3 AS [given] FROM [%4] l"_s.arg(field, field_or_null(table.name), field_or_null(table.given),
                                                  QString::fromUtf16(table.table));
    if (table.names)
        text += u" LEFT JOIN [%1] n ON n.[%2]=l.[%3]"_s.arg(QString::fromUtf16(table.names),
                                                            QString::fromUtf16(table.names_key), field);
    return text;
}

QString condition(const LockCheck& check)
{
    const QString field = QString::fromUtf16(table_of(check.kind).field);
    if (check.key)
        return u"l.[%1]=?"_s.arg(field);
    return (has_text_key(check.kind) ? u"l.[%1] IS NOT NULL"_s : u"l.[%1]>0"_s).arg(field);
}

std::vector<Value> values_of(const LockCheck& check)
{
    return check.key ? std::vector{check.key->value()} : std::vector<Value>{};
}

QString area_in_words(qint64 code)
{
    const auto found =
        std::ranges::find_if(areas, [&](const auto& area) { return static_cast<qint64>(area.code) == code; });
    return found == areas.end() ? u"Area %1"_s.arg(code) : QString::fromUtf16(found->name);
}

/// A thing that is gone, or has no name, is known by its key.
QString in_words(LockKind kind, const Value& key, const QString& name, const QString& given)
{
    const QString words = QString::fromUtf16(table_of(kind).words);
    if (const auto* text = std::get_if<QString>(&key))
        return u"%1 '%2'"_s.arg(words, *text);
    const qint64 number = std::holds_alternative<qint64>(key) ? std::get<qint64>(key) : 0;
    if (kind == LockKind::area)
        return area_in_words(number);
    if (is_people_area(kind))
        return words;
    const QString whole = given.isEmpty() ? name : u"%1, %2"_s.arg(name, given);
    return whole.isEmpty() ? u"%1 %2"_s.arg(words).arg(number) : u"%1 '%2'"_s.arg(words, whole);
}

/// A lock's row as it is stored.
struct StoredLock
{
    Value key, workstation, process, taken;
    [[nodiscard]] std::vector<Value> values() const { return {key, workstation, process, taken}; }
};

/// Deletes every row that is the same in all fields: none has a key of its own.
int delete_rows(Session& session, LockKind kind, const StoredLock& row)
{
    const LockTable& table = table_of(kind);
    return session.execute_with(
        u"DELETE FROM [%1] WHERE [%2]=? AND [workstation] IS NOT DISTINCT FROM ? AND "
        "[process] IS NOT DISTINCT FROM ? AND [taken] IS NOT DISTINCT FROM ?;"_s.arg(table.table, table.field),
        row.values());
}

void add_row(Session& session, LockKind kind, const StoredLock& row)
{
    const LockTable& table = table_of(kind);
    session.execute_with(
        u"INSERT INTO [%1] ([%2],[workstation],[process],[taken]) VALUES (?,?,?,?);"_s.arg(table.table, table.field),
        row.values());
}

/// The row that a release takes: that of this program, else the first.
std::optional<StoredLock> row_to_release(Session& session, LockKind kind, const LockKey& key, const StoredLock& own)
{
    auto rows = session.select(
        u"SELECT [workstation],[process],[taken] FROM [%1] WHERE [%2]=? ORDER BY COALESCE([taken],'');"_s.arg(
            table_of(kind).table, table_of(kind).field),
        key.value());
    std::optional<StoredLock> first;
    for (const Row& row : rows) {
        const StoredLock found{key.value(), row.value(Column{0}), row.value(Column{1}), row.value(Column{2})};
        if (found.workstation == own.workstation && found.process == own.process)
            return found;
        if (!first)
            first = found;
    }
    return first;
}

void release_one(Session& session, LockKind kind, const LockKey& key, const StoredLock& own)
{
    Transaction transaction(session);
    if (const auto row = row_to_release(session, kind, key, own)) {
        const int gone = delete_rows(session, kind, *row);
        for (int twin = 1; twin < gone; ++twin)
            add_row(session, kind, *row);
    }
    transaction.commit();
}

} // namespace

Locks::Locks(Session& session, Workstation& workstation, Clock& clock)
    : m_session(session), m_workstation(workstation), m_clock(clock)
{
}

bool Locks::found(const LockCheck& check)
{
    auto rows = m_session.select_with(
        u"SELECT 1 FROM [%1] l WHERE %2 LIMIT 1;"_s.arg(table_of(check.kind).table, condition(check)),
        values_of(check));
    return rows.first() != nullptr;
}

bool Locks::check(LockKind kind, const LockKey& key)
{
    return found({kind, key});
}

bool Locks::any(LockKind kind)
{
    return found({kind});
}

int Locks::count(LockKind kind)
{
    auto rows = m_session.select(u"SELECT COUNT(*) FROM [%1];"_s.arg(table_of(kind).table));
    return rows.first()->integer(Column{0});
}

bool Locks::take(LockKind kind, const LockKey& key, std::span<const LockCheck> unless)
{
    Transaction transaction(m_session);
    const bool held = !is_people_area(kind) && check(kind, key);
    if (held || std::ranges::any_of(unless, [this](const LockCheck& other) { return found(other); }))
        return false;
    add_row(m_session, kind,
            {key.value(), m_workstation.name(), QCoreApplication::applicationPid(),
             m_clock.now().toString(Qt::ISODateWithMs)});
    transaction.commit();
    return true;
}

void Locks::release(LockKind kind, const LockKey& key) noexcept
{
    try {
        release_one(m_session, kind, key, {{}, m_workstation.name(), QCoreApplication::applicationPid(), {}});
    } catch (const std::exception&) {
        // The row stays, as that of a workstation that failed does, until somebody unlocks it.
    }
}

std::optional<Holder> Locks::holder(LockKind kind, const LockKey& key)
{
    const auto rows = held({kind, key});
    return rows.empty() ? std::nullopt : std::optional(rows.front().holder);
}

HeldLock Locks::in_row(LockKind kind, const Row& row, const std::array<Column, 6>& columns) const
{
    const auto [key, workstation, process, taken, name, given] = columns;
    Holder holder{row.text(workstation), row.number(process), QDateTime::fromString(row.text(taken), Qt::ISODateWithMs),
                  row.text(workstation) == m_workstation.name()};
    const bool stale = holder.this_workstation && holder.process > 0 && !m_workstation.process_runs(holder.process);
    return {kind, LockKey(row.value(key)), in_words(kind, row.value(key), row.text(name), row.text(given)),
            std::move(holder), stale};
}

std::vector<HeldLock> Locks::rows_of(LockKind kind, const QString& where, std::span<const Value> values)
{
    auto rows = m_session.select_with(
        with_names(table_of(kind)) + where + u" ORDER BY COALESCE(l.[taken],''),[lock_key];"_s, values);
    const std::array columns{rows.column(u"lock_key"), rows.column(u"workstation"), rows.column(u"process"),
                             rows.column(u"taken"),    rows.column(u"lock_name"),   rows.column(u"given")};
    std::vector<HeldLock> locks;
    for (const Row& row : rows)
        locks.push_back(in_row(kind, row, columns));
    return locks;
}

std::vector<HeldLock> Locks::held(const LockCheck& check)
{
    return rows_of(check.kind, u" WHERE "_s + condition(check), values_of(check));
}

std::vector<HeldLock> Locks::all()
{
    std::vector<HeldLock> locks;
    for (int kind = 0; kind < lock_kind_count; ++kind)
        std::ranges::move(rows_of(static_cast<LockKind>(kind), {}, {}), std::back_inserter(locks));
    return locks;
}

int Locks::unlock(LockKind kind, const LockKey& key)
{
    const LockTable& table = table_of(kind);
    return m_session.execute(u"DELETE FROM [%1] WHERE [%2]=?;"_s.arg(table.table, table.field), key.value());
}

std::vector<HeldLock> Locks::stale()
{
    auto locks = all();
    std::erase_if(locks, [](const HeldLock& lock) { return !lock.stale; });
    return locks;
}

int Locks::release_stale()
{
    Transaction transaction(m_session);
    int released = 0;
    for (const HeldLock& lock : stale()) {
        const LockTable& table = table_of(lock.kind);
        released += m_session.execute(
            u"DELETE FROM [%1] WHERE [%2]=? AND [workstation]=? AND [process]=?;"_s.arg(table.table, table.field),
            lock.key.value(), lock.holder.workstation, lock.holder.process);
    }
    transaction.commit();
    return released;
}

LockKey Locks::own_place()
{
    return LockKey(to_value(QCoreApplication::applicationPid()));
}

QString held_line(const HeldLock& lock, DayOrder order)
{
    const Holder& holder = lock.holder;
    auto line = u"%1 is held"_s.arg(lock.what);
    if (holder.this_workstation)
        line += u" by this workstation"_s;
    else if (!holder.workstation.isEmpty())
        line += u" by the workstation '%1'"_s.arg(holder.workstation);
    if (holder.since.isValid())
        line += u" since %1 on %2"_s.arg(holder.since.toString(u"HH:mm"), Date::from(holder.since.date()).shown(order));
    return line + u'.';
}

void offer_stale_locks(Office& office)
{
    Locks locks(office);
    const auto stale = locks.stale();
    if (stale.empty())
        return;
    QStringList lines;
    for (const HeldLock& lock : stale)
        lines += held_line(lock, office.day_order());
    const Message question{.text = u"This workstation left locks behind when %1 last ended. Do you wish to release "
                                   "them?"_s.arg(product),
                           .more = lines.join(u'\n'),
                           .icon = Icon::question};
    // Where nobody else can be in the church, nobody can be hurt by it.
    if (office.dialogue.confirm(question, office.shared() ? Answer::no : Answer::yes))
        locks.release_stale();
}

} // namespace kindrel::core
