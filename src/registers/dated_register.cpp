#include "registers/dated_register.h"

#include "core/day_refusal.h"
#include "core/open_church.h"
#include "core/removal.h"
#include "registers/belongings.h"

#include <QCoreApplication>
#include <QLocale>

#include <algorithm>

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

using core::to_value;

constexpr std::size_t dates_looked_at = 12;
constexpr std::size_t fewest_dates = 3; ///< Of fewer no habit can be told.

const QString no_date_chosen = u"Please choose a date that you wish to View or Alter"_s;
const QString date_used = u"This date has already been used. Please enter another date."_s;
const QString other_date_exists =
    u"Unable to change to this date as it already exists, please choose a date which has not been used yet."_s;
const QString date_removed = u"This date has been removed by another user."_s;

/// The weekday, from 1 for Monday, of more than half of the dates; 0 when there is none.
int usual_weekday(const std::vector<RegisterDate>& dates)
{
    const auto looked_at = std::min(dates.size(), dates_looked_at);
    if (looked_at < fewest_dates)
        return 0;
    std::array<std::size_t, 8> counts{};
    for (std::size_t i = 0; i < looked_at; ++i)
        ++counts[static_cast<std::size_t>(dates[i].date.qdate().dayOfWeek())];
    const auto most = std::max_element(counts.begin() + 1, counts.end());
    return *most * 2 > looked_at ? static_cast<int>(most - counts.begin()) : 0;
}

/// The rows of a statement as one text.
QByteArray text_of(core::Rows rows)
{
    QByteArray text;
    const int columns = rows.column_count();
    for (const core::Row& row : rows) {
        for (int column = 0; column < columns; ++column)
            text += row.text(core::Column{column}).toUtf8() + '\t';
        text += '\n';
    }
    return text;
}

/// The setup of lists and projects, in which nobody may be while a project is taken.
std::array<core::LockCheck, 2> setup_areas()
{
    return {core::LockCheck{core::LockKind::area, core::LockKey(core::AreaCode::setup)},
            core::LockCheck{core::LockKind::area, core::LockKey(core::AreaCode::project_setup)}};
}

} // namespace

DatedRegister::DatedRegister(core::Office& office, const RegisterKind& kind) : m_office(office), m_kind(kind) {}

DatedRegister::~DatedRegister()
{
    release();
}

bool DatedRegister::refuse(const QString& text, const QString& more) const
{
    m_office.dialogue.show({.text = text, .more = more});
    return false;
}

bool DatedRegister::may_work() const
{
    return permitted(m_office, m_kind) && core::network_guard(m_office);
}

bool DatedRegister::enter()
{
    m_none_set_up = false;
    if (!may_work())
        return false;
    m_projects = read_projects(session(), m_kind);
    m_none_set_up = m_projects.empty();
    if (m_none_set_up)
        return refuse(QString::fromUtf16(m_kind.no_projects));
    m_project = remembered_project(session(), m_kind, Page::entry);
    refresh_dates();
    return true;
}

bool DatedRegister::choose_project(int key)
{
    if (key == m_project)
        return true;
    if (!may_work() || !leave())
        return false;
    m_projects = read_projects(session(), m_kind);
    if (std::ranges::find(m_projects, key, &Project::key) == m_projects.end())
        return lose_project();
    m_project = key;
    m_dates.clear(); // Until they are read.
    remember_project(session(), m_kind, Page::entry, key);
    refresh_dates();
    return true;
}

void DatedRegister::refresh_dates()
{
    auto rows = session().select(
        u"SELECT %1,%2 FROM %3 WHERE %4=? ORDER BY %2 DESC,%1 DESC;"_s.arg(
            named(m_kind.date_key), named(m_kind.date), named(m_kind.dates_query), named(m_kind.project_key)),
        m_project);
    std::vector<RegisterDate> dates;
    for (const core::Row& row : rows)
        dates.push_back({row.integer(core::Column{0}), row.date(core::Column{1}).value_or(core::Date{})});
    m_dates = std::move(dates);
}

QString DatedRegister::date_note(const core::Date& date) const
{
    const QDate day = date.qdate();
    if (!day.isValid())
        return {};
    const auto name = [](int weekday) {
        return QLocale::c().dayName(weekday);
    };
    const auto shown = date.shown(m_office.day_order());
    const int usual = usual_weekday(m_dates);
    QStringList parts;
    if (usual != 0 && day.dayOfWeek() != usual)
        parts +=
            u"%1 is a %2, but most dates of this project are %3s."_s.arg(shown, name(day.dayOfWeek()), name(usual));
    if (day > m_office.clock.today())
        parts += u"%1 lies in the future."_s.arg(shown);
    return parts.join(u' ');
}

// Locks.

QString DatedRegister::holders(const HeldWords& words) const
{
    core::Locks locks(m_office);
    QStringList lines{QString::fromUtf16(words.explanation).arg(core::product)};
    std::vector<core::LockCheck> checks{{m_kind.lock, core::LockKey(m_project)}};
    std::ranges::copy(setup_areas(), std::back_inserter(checks));
    for (const auto& check : checks) {
        for (const auto& held : locks.held(check))
            lines += core::held_line(held, m_office.day_order());
    }
    return lines.join(u'\n');
}

bool DatedRegister::hold(const HeldWords& words)
{
    if (m_held == m_project && has_lock())
        return true;
    if (!core::Locks(m_office).take(m_kind.lock, m_project, setup_areas()))
        return refuse(QString::fromUtf16(words.sentence), holders(words));
    m_held = m_project;
    return project_exists() || lose_project();
}

bool DatedRegister::has_lock()
{
    const auto held = core::Locks(m_office).held({m_kind.lock, core::LockKey(m_held)});
    return std::ranges::any_of(held, [](const core::HeldLock& lock) {
        return lock.holder.this_workstation && lock.holder.process == QCoreApplication::applicationPid();
    });
}

void DatedRegister::release() noexcept
{
    try {
        // A lock that was taken away may be somebody else's by now.
        if (m_held != 0 && has_lock())
            core::Locks(m_office).release(m_kind.lock, m_held);
    } catch (const std::exception&) {
        // The row stays, as that of a workstation that failed does, until somebody unlocks it.
    }
    m_held = 0;
}

void DatedRegister::release_unused() noexcept
{
    if (!m_open)
        release();
}

bool DatedRegister::project_exists()
{
    auto rows = session().select(
        u"SELECT 1 FROM %1 WHERE %2=?;"_s.arg(named(m_kind.project_table), named(m_kind.project_key)), m_project);
    return rows.first() != nullptr;
}

bool DatedRegister::lose_project()
{
    close();
    m_projects = read_projects(session(), m_kind);
    m_project = remembered_project(session(), m_kind, Page::entry);
    refresh_dates();
    return refuse(u"This %1 has been removed by another user."_s.arg(QString::fromUtf16(m_kind.words)));
}

// Coming and going.

bool DatedRegister::settle()
{
    if (!m_open || !altered())
        return true;
    const auto answer = m_office.dialogue.confirm_or_cancel(
        {.text = QString::fromUtf16(m_kind.unsaved_question), .icon = core::Icon::question});
    if (!answer)
        return false;
    if (*answer)
        return save();
    drop_rows();
    return true;
}

void DatedRegister::close()
{
    m_open.reset();
    m_mark.clear();
    clear_rows();
    release();
}

bool DatedRegister::leave()
{
    if (!settle())
        return false;
    close();
    return true;
}

void DatedRegister::show_date(const RegisterDate& date)
{
    m_open = date;
    try {
        m_mark = stored_mark();
        load_rows();
    } catch (...) {
        close(); // The rows in memory are another date's.
        throw;
    }
}

bool DatedRegister::open(int date_key)
{
    if (date_key == 0)
        return refuse(no_date_chosen);
    if (!may_work() || !settle() || !hold(m_kind.held_at_entry))
        return false;
    refresh_dates();
    const auto found = std::ranges::find(m_dates, date_key, &RegisterDate::key);
    if (found == m_dates.end()) {
        close();
        return refuse(date_removed);
    }
    show_date(*found);
    return true;
}

bool DatedRegister::usable(const core::Date& date) const
{
    if (date.qdate().isValid())
        return true;
    const auto order = m_office.day_order();
    m_office.dialogue.show(core::day_refusal(date.shown(order), order));
    return false;
}

bool DatedRegister::insert_date(const RegisterDate& date)
{
    try {
        session().execute(u"INSERT INTO %1 (%2,%3,%4) VALUES (?,?,?);"_s.arg(named(m_kind.date_table),
                                                                             named(m_kind.date_key), named(m_kind.date),
                                                                             named(m_kind.project_key)),
                          date.key, date.date, m_project);
    } catch (const core::DatabaseError& error) {
        if (!error.constraint_broken())
            throw;
        return false;
    }
    return true;
}

bool DatedRegister::add(const core::Date& date)
{
    if (!usable(date) || !may_work() || !settle() || !hold(m_kind.held_at_entry))
        return false;
    const RegisterDate added{session().allocate(m_kind.date_entity), date};
    const bool inserted = insert_date(added);
    refresh_dates();
    if (!inserted) {
        release_unused();
        return refuse(date_used);
    }
    show_date(added);
    return true;
}

// Writing.

QByteArray DatedRegister::stored_mark()
{
    const int key = m_open->key;
    auto mark = text_of(session().select(
        u"SELECT %1 FROM %2 WHERE %3=?;"_s.arg(named(m_kind.date), named(m_kind.date_table), named(m_kind.date_key)),
        key));
    for (const auto& rows : m_kind.belonging_tables()) {
        if (rows.typed)
            mark += text_of(session().select(
                u"SELECT * FROM %1 WHERE %2=? ORDER BY 1,2,3;"_s.arg(named(rows.table), named(rows.date_key)), key));
    }
    return mark;
}

bool DatedRegister::date_exists(int date_key)
{
    auto rows = session().select(
        u"SELECT 1 FROM %1 WHERE %2=?;"_s.arg(named(m_kind.date_table), named(m_kind.date_key)), date_key);
    return rows.first() != nullptr;
}

DatedRegister::Standing DatedRegister::standing()
{
    if (!date_exists(m_open->key))
        return Standing::removed;
    if (!has_lock() && !core::Locks(m_office).take(m_kind.lock, m_project, setup_areas()))
        return Standing::lost;
    return stored_mark() == m_mark && setup_unchanged() ? Standing::good : Standing::changed;
}

bool DatedRegister::refuse_standing(Standing standing)
{
    const auto kept = u"Nothing was stored. What was typed stands here until you leave the date."_s;
    switch (standing) {
    case Standing::good:
        return true;
    case Standing::removed:
        refresh_dates();
        return refuse(date_removed, kept);
    case Standing::lost:
        return refuse(
            u"The lock on this %1 was taken away while the date was open here, and another user has it now."_s.arg(
                QString::fromUtf16(m_kind.words)),
            kept + u'\n' + holders(m_kind.held_at_entry));
    case Standing::changed:
        return refuse(
            u"What is stored of this date has changed since it was opened here."_s,
            u"Another user may have changed it after the lock on this %1 was taken away, or the connection was "
            "lost while it was being stored. "_s.arg(QString::fromUtf16(m_kind.words)) +
                kept);
    }
    return false;
}

void DatedRegister::commit_marked(core::Transaction& transaction)
{
    auto mark = stored_mark();
    transaction.commit();
    m_mark = std::move(mark);
}

bool DatedRegister::save()
{
    if (!m_open)
        return refuse(no_date_chosen);
    if (!may_work())
        return false;
    auto found = Standing::good;
    {
        core::Transaction transaction(session());
        found = standing();
        if (found == Standing::good) {
            save_rows();
            commit_marked(transaction);
        }
    }
    if (found != Standing::good)
        return refuse_standing(found);
    keep_rows();
    return true;
}

bool DatedRegister::update_date(const core::Date& date, Standing& found)
{
    core::Transaction transaction(session());
    found = standing();
    if (found != Standing::good)
        return false;
    try {
        session().execute(u"UPDATE %1 SET %2=? WHERE %3=?;"_s.arg(named(m_kind.date_table), named(m_kind.date),
                                                                  named(m_kind.date_key)),
                          date, m_open->key);
    } catch (const core::DatabaseError& error) {
        if (!error.constraint_broken())
            throw;
        return false;
    }
    commit_marked(transaction);
    return true;
}

bool DatedRegister::change_date(const core::Date& date)
{
    if (!m_open)
        return refuse(no_date_chosen);
    if (!usable(date) || !may_work())
        return false;
    if (date == m_open->date)
        return true;
    auto found = Standing::good;
    if (!update_date(date, found))
        return found == Standing::good ? refuse(other_date_exists) : refuse_standing(found);
    m_open->date = date;
    refresh_dates();
    date_moved();
    return true;
}

bool DatedRegister::remove(int date_key)
{
    if (date_key == 0)
        return refuse(u"Please choose a record to delete"_s);
    if (!may_work())
        return false;
    const core::Message question{.text = u"Please confirm that you wish to remove this record"_s,
                                 .more = told_with_date(session(), m_kind, date_key),
                                 .icon = core::Icon::question};
    if (!m_office.dialogue.confirm(question, core::Answer::no) || !hold(m_kind.held_at_removal))
        return false;
    auto found = Standing::good;
    {
        core::Transaction transaction(session());
        if (m_open)
            found = standing();
        if (found == Standing::good || found == Standing::removed) {
            core::remove_entities(session(), m_kind.date_entity, std::array{date_key});
            transaction.commit();
        }
    }
    if (found == Standing::lost || found == Standing::changed)
        return refuse_standing(found);
    if (m_open && m_open->key == date_key)
        close();
    release_unused();
    refresh_dates();
    return true;
}

} // namespace kindrel::registers
