#include "people/family_editor.h"

#include "core/entry.h"
#include "core/open_church.h"
#include "people/family_store.h"
#include "people/move_family.h"
#include "people/names.h"

#include <algorithm>

// The coming and going of families, and undoing.
namespace kindrel::people {

using namespace Qt::StringLiterals;
using core::Area;

namespace {

constexpr std::size_t most_undone = 200;

const QString held_elsewhere =
    u"To insure the integrity of your data files a user is not allowed to edit a family file while another user is in "
    "the family file you wish to enter."_s;
const QString only_reading = u"as you only have read only access within family files"_s;

/// All families, in the order of the family list.
std::vector<int> all_families(core::Session& session)
{
    auto rows =
        session.select(u"SELECT [Surname_ID] FROM [tbl_surname] ORDER BY [sort_key],[Primary_name],[Surname_ID];"_s);
    std::vector<int> keys;
    for (const core::Row& row : rows)
        keys.push_back(row.integer(core::Column{0}));
    return keys;
}

} // namespace

FamilyEditor::FamilyEditor(core::Office& office) : m_office(office), m_drafts(office) {}

FamilyEditor::~FamilyEditor()
{
    release();
}

FamilyFile FamilyEditor::as_new(FamilyFile file)
{
    Family family;
    family.surname = file.family.surname;
    family.Condition = file.family.Condition;
    file.family = std::move(family);
    for (auto& person : file.people)
        person.person_id = person.Surname_ID = person.position = 0;
    return file;
}

bool FamilyEditor::altered() const
{
    return m_file != m_stored;
}

FileAccess FamilyEditor::access() const
{
    if (m_office.may(Area::read_only_family_data))
        return FileAccess::read_only;
    return is_away(m_stored.family) ? FileAccess::booked_out : FileAccess::edit;
}

bool FamilyEditor::is_away(const Family& family) const
{
    return m_office.mode == core::Mode::booked_out ? !family.active_in_book : family.booked_out;
}

QString FamilyEditor::caption() const
{
    const QString name = is_new() ? u"New File "_s : m_file.family.surname + u" Family File"_s;
    const bool reading = access() == FileAccess::read_only;
    return name + (reading ? u" (Read Only Access)"_s : QString()) +
           booked_out_note(m_file.family, m_office.day_order());
}

bool FamilyEditor::refuse(const QString& text, const QString& more) const
{
    m_office.dialogue.show({.text = text, .more = more});
    return false;
}

bool FamilyEditor::refuse_reading(const QString& act) const
{
    if (access() == FileAccess::read_only)
        return refuse(u"Unable to %1 this family file "_s.arg(act) + only_reading);
    if (m_office.mode == core::Mode::booked_out) {
        return refuse(u"Unable to alter data while in Remote Access Mode"_s,
                      u"When in this mode you can only edit the family files that are booked out. All family files can "
                      "be viewed, reports can be run, analysis can be conducted on all the data."_s);
    }
    return refuse(u"Unable to %1 this family file as it is booked out"_s.arg(act),
                  booked_out_note(m_stored.family, m_office.day_order()).trimmed());
}

void FamilyEditor::become(FamilyFile stored)
{
    m_file = stored;
    m_stored = std::move(stored);
    m_before.clear();
    m_last_change.clear();
    m_guilty.reset();
}

void FamilyEditor::drop()
{
    m_drafts.forget(m_stored.family.Surname_ID);
    become(FamilyFile(m_stored));
}

void FamilyEditor::release() noexcept
{
    if (m_held)
        core::Locks(m_office).release(core::LockKind::family, m_held);
    m_held = 0;
}

bool FamilyEditor::settle()
{
    if (!altered())
        return true;
    const auto answer = m_office.dialogue.confirm_or_cancel(
        {.text = u"This file has been altered."_s, .more = u"Save family file?"_s, .icon = core::Icon::question});
    if (!answer)
        return false;
    if (*answer)
        return save() != Saved::no;
    drop();
    return true;
}

bool FamilyEditor::leave()
{
    if (!settle())
        return false;
    release();
    become({});
    return true;
}

bool FamilyEditor::start_new()
{
    if (!settle())
        return false;
    if (!core::permitted(m_office, Area::add_family))
        return false;
    release();
    become({});
    return true;
}

bool FamilyEditor::open(int surname_id)
{
    if (!settle() || !core::network_guard(m_office))
        return false;
    if (!m_office.may(Area::read_only_family_data) && !core::permitted(m_office, Area::search_for_family))
        return false;
    if (m_walk_name == core::product)
        m_walk.clear();
    switch (hold(surname_id)) {
    case Opened::yes:
        return true;
    case Opened::held:
        tell_held(u"Unable to enter this family file another user is currently editing the family file."_s,
                  held_elsewhere, surname_id);
        return false;
    case Opened::gone:
        break;
    }
    tell_gone();
    release();
    become({});
    return true;
}

FamilyEditor::Opened FamilyEditor::hold(int surname_id)
{
    core::Session& session = *m_office.session;
    core::Locks locks(m_office);
    if (surname_id != m_held) {
        // One commit gives the family before back and takes this one.
        core::Transaction transaction(session);
        if (m_held)
            locks.release(core::LockKind::family, m_held);
        const core::LockCheck setting_up{core::LockKind::area, core::LockKey(core::AreaCode::setup)};
        if (!locks.take(core::LockKind::family, surname_id, {&setting_up, 1}))
            return Opened::held;
        transaction.commit();
        m_held = surname_id;
    }
    auto file = load_family(session, surname_id);
    if (!file)
        return Opened::gone;
    become(std::move(*file));
    return Opened::yes;
}

void FamilyEditor::tell_held(const QString& text, const QString& explanation, int surname_id) const
{
    core::Locks locks(m_office);
    auto held = locks.held({core::LockKind::family, core::LockKey(surname_id)});
    if (held.empty())
        held = locks.held({core::LockKind::area, core::LockKey(core::AreaCode::setup)});
    QStringList lines{explanation};
    for (const auto& lock : held)
        lines += core::held_line(lock, m_office.day_order());
    lines.removeAll(QString());
    (void)refuse(text, lines.join(u'\n'));
}

void FamilyEditor::tell_gone(const QString& more) const
{
    (void)refuse(
        u"Unable to access this family file because another user has removed it from the database. The program "
        "is now entering the family editor in new file mode."_s,
        more);
}

void FamilyEditor::walk(std::vector<int> surname_ids, const QString& name)
{
    m_walk = std::move(surname_ids);
    m_walk_name = name;
}

bool FamilyEditor::step(int by)
{
    if (!settle() || !core::network_guard(m_office))
        return false;
    if (m_walk.empty())
        walk(all_families(*m_office.session), core::product.toString());
    if (m_walk.empty())
        return refuse(u"Unable to move to a new file as no family records exist within %1"_s.arg(core::product));
    const auto here = std::ranges::find(m_walk, m_stored.family.Surname_ID);
    auto place = here != m_walk.end() ? here - m_walk.begin() + by : by > 0 ? 0 : std::ssize(m_walk) - 1;
    for (; place >= 0 && place < std::ssize(m_walk); place += by) {
        const int target = m_walk[static_cast<std::size_t>(place)];
        switch (hold(target)) {
        case Opened::yes:
            return true;
        case Opened::held:
            tell_held(u"Unable to move to this family file as another user is presently editing that family file"_s, {},
                      target);
            return stay();
        case Opened::gone: // Removed since the list was read: the one behind it is meant.
            break;
        }
    }
    (void)refuse((by > 0 ? u"Unable to move up as this is the last family file within %1"_s
                         : u"Unable to move down as this is the first family file within %1"_s)
                     .arg(m_walk_name));
    return stay();
}

bool FamilyEditor::stay()
{
    const int here = m_stored.family.Surname_ID;
    if (m_held != here)
        release();
    if (here != 0 && m_held == 0)
        (void)hold(here);
    return false;
}

bool FamilyEditor::move_to_church(std::optional<int> church, core::Progress& progress)
{
    if (altered())
        return refuse(u"This file has been altered and needs to be saved before moving to another church."_s);
    if (is_new() || !move_family(m_office, m_stored.family.Surname_ID, church, progress))
        return false;
    forget_family();
    return true;
}

void FamilyEditor::change(const QString& what, const std::function<void(FamilyFile&)>& make)
{
    if (!may_edit())
        return;
    auto changed = m_file;
    make(changed);
    if (changed == m_file)
        return;
    if (m_before.empty() || what.isEmpty() || what != m_last_change) {
        m_before.push_back(std::move(m_file));
        if (m_before.size() > most_undone)
            m_before.erase(m_before.begin());
    }
    m_last_change = what;
    m_file = std::move(changed);
}

void FamilyEditor::undo()
{
    if (m_before.empty())
        return;
    m_file = std::move(m_before.back());
    m_before.pop_back();
    m_last_change.clear();
}

void FamilyEditor::keep_draft()
{
    if (altered())
        m_drafts.keep({m_stored, m_file, m_office.clock.now()});
    else
        m_drafts.forget(m_stored.family.Surname_ID);
}

bool FamilyEditor::restore(const Draft& draft)
{
    const int key = draft.stored.family.Surname_ID;
    if (!(key ? open(key) : start_new()))
        return false;
    const bool gone = key != 0 && is_new();
    if (gone)
        m_drafts.forget(key);
    if (!may_edit())
        return true;
    m_file = gone ? as_new(draft.typed) : draft.typed;
    // What it was typed over is what it is compared with: a save finds out what others changed since.
    if (key && !gone)
        m_stored = draft.stored;
    return true;
}

} // namespace kindrel::people
