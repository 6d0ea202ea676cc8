#include "people/family_editor.h"

#include "core/entry.h"
#include "core/open_church.h"
#include "people/family_changes.h"
#include "people/family_store.h"
#include "people/person_files.h"
#include "people/pins.h"

#include <algorithm>

// The save of the family as a whole, and its end.
namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

constexpr qsizetype most_changes_told = 12;

std::vector<int> keys_of(const std::vector<Person>& people)
{
    std::vector<int> keys;
    for (const auto& person : people) {
        if (person.person_id != 0)
            keys.push_back(person.person_id);
    }
    return keys;
}

const Person* person_of(const FamilyFile& file, int person_id)
{
    const auto found = std::ranges::find(file.people, person_id, &Person::person_id);
    return found == file.people.end() ? nullptr : &*found;
}

/// Keys that another workstation has taken out of the family may stand in another one by now.
void forget_keys(FamilyFile& file, const FamilyFile& theirs)
{
    for (auto& person : file.people) {
        if (!person_of(theirs, person.person_id))
            person.person_id = 0;
    }
}

QString shortened(QStringList lines)
{
    const auto count = lines.size();
    if (count > most_changes_told) {
        lines.resize(most_changes_told);
        lines += u"And %1 more."_s.arg(count - most_changes_told);
    }
    return lines.join(u'\n');
}

} // namespace

Saved FamilyEditor::refused_save()
{
    const auto refusal = save_refusal(m_file);
    if (!refusal)
        return Saved::yes;
    m_guilty = refusal->where;
    if (!refusal->question) {
        (void)refuse(refusal->text);
        return Saved::no;
    }
    if (!m_office.dialogue.confirm({.text = refusal->text, .icon = core::Icon::question}, core::Answer::no))
        return Saved::no;
    drop();
    release();
    become({});
    return Saved::left;
}

bool FamilyEditor::may_disturb() const
{
    std::vector<int> changed;
    std::vector<int> removed;
    for (const auto& person : m_stored.people) {
        const Person* is = person_of(m_file, person.person_id);
        if (!is)
            removed.push_back(person.person_id);
        else if (*is != person)
            changed.push_back(person.person_id);
    }
    if (!removed.empty() && !core::may_delete_people(m_office))
        return false;
    return core::guards_allow(m_office, core::PersonAct::change, changed);
}

Saved FamilyEditor::save()
{
    m_guilty.reset();
    if (!may_edit()) {
        (void)refuse_reading(u"save"_s);
        return Saved::no;
    }
    if (!core::network_guard(m_office))
        return Saved::no;
    if (const auto refused = refused_save(); refused != Saved::yes)
        return refused;
    if (const auto clash = pin_clash(*m_office.session, m_file)) {
        m_office.dialogue.show(*clash);
        return Saved::no;
    }
    if (!may_disturb())
        return Saved::no;
    if (is_new() && !core::permitted(m_office, core::Area::add_family))
        return Saved::no;
    try {
        return write() ? Saved::yes : Saved::no;
    } catch (const core::DatabaseError& error) {
        // Between the look and the save somebody else may have stored the same number.
        const auto taken = error.constraint_broken() ? pin_clash(*m_office.session, m_file) : std::nullopt;
        if (!taken)
            throw;
        m_office.dialogue.show(*taken);
        return Saved::no;
    }
}

bool FamilyEditor::write()
{
    core::Session& session = *m_office.session;
    std::optional<FamilyFile> theirs;
    if (is_new()) {
        settle_on(save_family(session, m_file, m_office.clock.today()));
        return true;
    }
    {
        core::Transaction transaction(session);
        theirs = load_family(session, m_file.family.Surname_ID);
        if (theirs && !is_away(theirs->family) && changes_between(m_stored, *theirs).isEmpty()) {
            auto saved = save_family(session, m_file, m_office.clock.today());
            transaction.commit();
            settle_on(std::move(saved));
            return true;
        }
    }
    if (!theirs)
        return go_on_as_new();
    if (!is_away(theirs->family))
        return meet(*theirs);
    m_stored.family = theirs->family; // Booked out meanwhile: from now on it is only shown.
    return refuse_reading(u"save"_s);
}

bool FamilyEditor::meet(const FamilyFile& theirs)
{
    const core::Message question{.text = u"This family file was changed elsewhere while it was open here."_s,
                                 .more = shortened(changes_between(m_stored, theirs)),
                                 .icon = core::Icon::question};
    const auto choice = m_office.dialogue.choose(
        question, {u"Keep both: those changes and what was typed here"_s, u"Keep only what was typed here"_s});
    if (!choice)
        return false;
    if (*choice == 0)
        m_file = merged(m_stored, m_file, theirs);
    else
        forget_keys(m_file, theirs);
    m_stored = theirs;
    return save() == Saved::yes;
}

bool FamilyEditor::go_on_as_new()
{
    m_drafts.forget(m_stored.family.Surname_ID);
    tell_gone(u"What was typed is kept. Saving it makes a new family file."_s);
    release();
    m_stored = {};
    m_file = as_new(std::move(m_file));
    return false;
}

void FamilyEditor::settle_on(FamilyFile saved)
{
    std::vector<OwnFile> files;
    for (const auto& person : m_stored.people) {
        if (!person_of(saved, person.person_id))
            std::ranges::move(files_of_person(person.person_id), std::back_inserter(files));
    }
    const bool added = is_new();
    m_drafts.forget(m_stored.family.Surname_ID);
    become(std::move(saved));
    if (added && core::Locks(m_office).take(core::LockKind::family, m_file.family.Surname_ID))
        m_held = m_file.family.Surname_ID;
    if (added && m_walk_name == core::product)
        m_walk.clear();
    remove_files(m_office.paths, files);
}

bool FamilyEditor::remove_family()
{
    if (!may_edit())
        return refuse_reading(u"delete"_s);
    if (is_new())
        return start_new();
    if (!core::network_guard(m_office) || !core::may_delete_people(m_office))
        return false;
    const auto people = keys_of(m_stored.people);
    if (!core::guards_allow(m_office, core::PersonAct::remove_family, people))
        return false;
    const auto facts =
        u"%1 with %2 people, their photographs and notebook pages. Giving and attendance totals stay."_s.arg(
            caption(), QString::number(people.size()));
    if (!m_office.dialogue.confirm(
            {.text = u"Are you sure that you want to delete this file?"_s, .more = facts, .icon = core::Icon::question},
            core::Answer::no))
        return false;
    remove_stored_family(m_office, m_stored);
    forget_family();
    return true;
}

void FamilyEditor::forget_family()
{
    m_drafts.forget(m_stored.family.Surname_ID);
    std::erase(m_walk, m_stored.family.Surname_ID);
    release();
    become({});
}

} // namespace kindrel::people
