#include "registers/notes.h"

#include "core/entry.h"
#include "core/open_church.h"
#include "registers/register_kind.h"

#include <algorithm>
#include <array>

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

/// Where the notes of an area lie.
struct NotesTable
{
    NotesArea area;
    const char16_t* title;
    const char16_t* query; ///< Every date with its note, or with none.
    const char16_t* table;
    const char16_t* date_key;
    const char16_t* date;
    const char16_t* project_key;
    core::AreaId entry;
    core::Area right;
};

constexpr std::array tables{
    NotesTable{NotesArea::roll, u"Roll Notes", u"Qry_roll_memo", u"tbl_roll_memo", u"roll_date_id", u"roll_date",
               u"roll_project_id", core::AreaId::roll, core::Area::roll},
    NotesTable{NotesArea::roster, u"Roster Notes", u"Qry_roster_memo", u"tbl_roster_memo", u"date_id", u"date",
               u"roster_project_id", core::AreaId::roster, core::Area::rosters},
    NotesTable{NotesArea::weekly, u"Weekly Notes", u"Qry_weekly_memo", u"tbl_weekly_memo", u"weekly_date_id",
               u"weekly_date", u"weekly_project_id", core::AreaId::weekly, core::Area::weekly_statistics},
    NotesTable{NotesArea::finance, u"Finance Notes", u"Qry_finance_memo", u"tbl_finance_memo", u"finance_date_id",
               u"finance_date", u"finance_project_id", core::AreaId::finance, core::Area::full_financial},
};
static_assert(std::ranges::is_sorted(tables, {}, &NotesTable::area));

const NotesTable& table_of(NotesArea area)
{
    return tables[static_cast<std::size_t>(area)];
}

bool may_work(const core::Office& office, const NotesTable& table)
{
    return (core::may_enter(office, table.entry) || core::permitted(office, table.right)) &&
           core::network_guard(office);
}

/// The stored note; nullopt when the date is gone.
std::optional<QString> stored_note(core::Session& session, const NotesTable& table, int date_key)
{
    auto rows = session.select(u"SELECT [Notes] FROM %1 WHERE %2=?;"_s.arg(named(table.query), named(table.date_key)),
                               date_key);
    const auto* row = rows.first();
    return row ? std::optional(row->text(core::Column{0})) : std::nullopt;
}

/// Empty text takes the note's row away.
void write_note(core::Session& session, const NotesTable& table, int date_key, const QString& text)
{
    const auto key = named(table.date_key);
    session.execute(u"DELETE FROM %1 WHERE %2=?;"_s.arg(named(table.table), key), date_key);
    if (!text.isEmpty())
        session.execute(u"INSERT INTO %1 (%2,[Notes]) VALUES (?,?);"_s.arg(named(table.table), key), date_key, text);
}

} // namespace

QString notes_title(NotesArea area)
{
    return QString::fromUtf16(table_of(area).title);
}

QString notes_button(core::Session& session, NotesArea area, int date_key)
{
    const auto& table = table_of(area);
    auto rows =
        session.select(u"SELECT 1 FROM %1 WHERE %2=?;"_s.arg(named(table.table), named(table.date_key)), date_key);
    return rows.first() ? u"&Notes Exist"_s : u"&Add Notes"_s;
}

Notes::Notes(core::Office& office, NotesArea area, int project, int date_key)
    : m_office(office), m_area(area), m_project(project)
{
    if (may_work(office, table_of(area)))
        read_dates(date_key);
}

bool Notes::refuse(const QString& text, const QString& more) const
{
    m_office.dialogue.show({.text = text, .more = more});
    return false;
}

void Notes::read_dates(int date_key)
{
    const auto& table = table_of(m_area);
    auto rows = m_office.session->select(
        u"SELECT %1,%2,[Notes] FROM %3 WHERE %4=? ORDER BY %2 DESC,%1 DESC;"_s.arg(
            named(table.date_key), named(table.date), named(table.query), named(table.project_key)),
        m_project);
    std::vector<DatedNote> dates;
    for (const core::Row& row : rows)
        dates.push_back({row.integer(core::Column{0}), row.date(core::Column{1}).value_or(core::Date{}),
                         row.text(core::Column{2})});
    m_dates = std::move(dates);
    m_shown.reset();
    m_text.clear();
    if (m_dates.empty())
        return;
    const auto found = std::ranges::find(m_dates, date_key, &DatedNote::key);
    m_shown = found == m_dates.end() ? 0 : static_cast<int>(found - m_dates.begin());
    m_text = at_shown().note;
}

DatedNote& Notes::at_shown()
{
    return m_dates.at(static_cast<std::size_t>(m_shown.value()));
}

bool Notes::altered() const
{
    return m_shown && m_text != m_dates[static_cast<std::size_t>(*m_shown)].note;
}

bool Notes::show(int place)
{
    // Saving may find that dates are gone: what is meant is the date, not its place.
    const int key = m_dates.at(static_cast<std::size_t>(place)).key;
    if (!leave())
        return false;
    const auto found = std::ranges::find(m_dates, key, &DatedNote::key);
    if (found == m_dates.end())
        return false;
    m_shown = static_cast<int>(found - m_dates.begin());
    m_text = found->note;
    return true;
}

bool Notes::leave()
{
    if (!altered())
        return true;
    const auto answer = m_office.dialogue.confirm_or_cancel(
        {.text = u"This note has been altered. Do you wish to save it?"_s, .icon = core::Icon::question});
    if (!answer)
        return false;
    if (*answer)
        return save();
    m_text = at_shown().note;
    return true;
}

bool Notes::save()
{
    const auto& table = table_of(m_area);
    if (!altered())
        return true;
    if (!may_work(m_office, table))
        return false;
    auto& shown = at_shown();
    std::optional<QString> theirs;
    {
        core::Transaction transaction(*m_office.session);
        theirs = stored_note(*m_office.session, table, shown.key);
        if (theirs == shown.note) {
            write_note(*m_office.session, table, shown.key, m_text);
            transaction.commit();
            shown.note = m_text;
            return true;
        }
    }
    if (!theirs)
        return refuse(u"This date has been removed by another user."_s, u"The note was not stored."_s);
    shown.note = *theirs;
    return refuse(u"This note has been changed by another user. Saving it once more puts yours in its place."_s,
                  *theirs);
}

} // namespace kindrel::registers
