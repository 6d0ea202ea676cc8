#include "people/family_editor.h"

#include "core/entry.h"
#include "people/family_changes.h"
#include "people/family_roles.h"
#include "people/family_rows.h"
#include "people/family_store.h"
#include "people/names.h"

#include <algorithm>
#include <array>

// What is stored at once: a person's way into another family, and visits.
namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

const QString keeps_an_adult =
    u"Unable to move this person, as you must always have at least one person as the primary adult in the family."_s;

int place_of(const FamilyFile& file, int person_id)
{
    const auto found = std::ranges::find(file.people, person_id, &Person::person_id);
    return found == file.people.end() ? -1 : static_cast<int>(found - file.people.begin());
}

Person take_out(FamilyFile& file, int person_id)
{
    const auto found = std::ranges::find(file.people, person_id, &Person::person_id);
    Person person = std::move(*found);
    file.people.erase(found);
    return person;
}

void note_transfer(FamilyFile& file, const QString& event, const QDate& today)
{
    file.events.push_back({core::Date::from(today), event});
    file.address.transfer_exists = true;
}

QString family_of(const FamilyFile& file)
{
    return u"%1 family file"_s.arg(file.family.surname);
}

/// What the person is called in a family, as its place and code have it.
QString role_in(const FamilyFile& file, int person_id)
{
    const auto household = household_of(file.people);
    if (household.spouse && household.spouse->person_id == person_id)
        return u"spouse"_s;
    const bool child =
        std::ranges::any_of(household.children, [&](const Person* each) { return each->person_id == person_id; });
    return child ? u"child"_s : u"further adult"_s;
}

/// The family that a person founds: the address and standing of the old one. A child becomes a single adult, and a
/// surname of the person's own becomes the family's.
FamilyFile family_for(Person person, const FamilyFile& from)
{
    FamilyFile founded;
    founded.family.surname = person.other_surname.isEmpty() ? from.family.surname : person.other_surname;
    founded.family.Condition = from.family.Condition;
    founded.address = from.address;
    founded.address.audio_note.clear();
    founded.residential = from.residential;
    founded.postal = from.postal;
    founded.access = from.access;
    person.other_surname.clear();
    person.surname_hidden = false;
    if (is_child(person))
        person.Marital = marital::single_adult;
    founded.people.push_back(std::move(person));
    return founded;
}

/// The family's own row, for a person's row to point to.
int add_family_row(core::Session& session, const FamilyFile& file, const QDate& today)
{
    FamilyFile bare;
    bare.family.Surname_ID = session.allocate(core::Entity::surname);
    bare.family.surname = file.family.surname;
    bare.family.created = core::Date::from(today);
    FamilyRows rows;
    rows.add_new(bare);
    rows.insert(session);
    return bare.family.Surname_ID;
}

void repoint(core::Session& session, int person_id, int surname_id)
{
    session.execute(u"UPDATE [tbl_people] SET [Surname_ID]=? WHERE [person_id]=?;"_s, surname_id, person_id);
}

/// The lock of the target family, for as long as a transfer into it lasts.
class TargetLock
{
public:
    TargetLock(core::Office& office, int surname_id)
        : m_locks(office), m_key(surname_id), m_taken(m_locks.take(core::LockKind::family, surname_id))
    {
    }
    TargetLock(const TargetLock&) = delete;
    TargetLock& operator=(const TargetLock&) = delete;
    ~TargetLock()
    {
        if (m_taken)
            m_locks.release(core::LockKind::family, m_key);
    }
    [[nodiscard]] bool taken() const { return m_taken; }

private:
    core::Locks m_locks;
    int m_key;
    bool m_taken;
};

} // namespace

bool FamilyEditor::may_transfer() const
{
    if (!may_edit())
        return refuse_reading(u"change"_s);
    if (is_new())
        return refuse(u"Unable to transfer this person until the family file is saved"_s);
    if (m_file.family.surname.trimmed().isEmpty())
        return refuse(u"Unable to do a transfer as a surname does not exist on this family file"_s);
    return true;
}

std::optional<int> FamilyEditor::person_to_transfer(int index)
{
    if (!may_transfer() || index < 0 || index >= std::ssize(m_file.people))
        return std::nullopt;
    int person = m_file.people[static_cast<std::size_t>(index)].person_id;
    if (!settle() || is_new())
        return std::nullopt;
    // A person who was new has got a key by the save, at the same place.
    if (person == 0 && index < std::ssize(m_file.people))
        person = m_file.people[static_cast<std::size_t>(index)].person_id;
    if (place_of(m_stored, person) < 0)
        return std::nullopt;
    if (!core::guards_allow(m_office, core::PersonAct::move, std::array{person}))
        return std::nullopt;
    return person;
}

bool FamilyEditor::can_spare(int person_id) const
{
    if (place_of(m_stored, person_id) > 0)
        return true;
    return m_stored.people.size() > 1 && !is_child(m_stored.people[1]);
}

bool FamilyEditor::transfer_to_new(int index)
{
    const auto person = person_to_transfer(index);
    if (!person)
        return false;
    if (!can_spare(*person))
        return refuse(keeps_an_adult);
    if (!core::permitted(m_office, core::Area::add_family))
        return false;
    auto left = write_founding(*person);
    if (!left)
        return changed_elsewhere();
    const QString name = m_stored.people[static_cast<std::size_t>(place_of(m_stored, *person))].Name;
    become(std::move(*left));
    m_office.dialogue.show(core::information(name + u" has now been transferred to a new family file."_s));
    return true;
}

std::optional<FamilyFile> FamilyEditor::write_founding(int person_id)
{
    core::Session& session = *m_office.session;
    const auto today = m_office.clock.today();
    core::Transaction transaction(session);
    auto from = unchanged();
    if (!from)
        return std::nullopt;
    FamilyFile founded = family_for(take_out(*from, person_id), *from);
    const QString name = founded.people.front().Name;
    note_transfer(founded, u"%1 came from the %2"_s.arg(name, family_of(*from)), today);
    note_transfer(*from, u"%1 went to a new family file"_s.arg(name), today);
    founded.family.Surname_ID = add_family_row(session, founded, today);
    founded.family.created = core::Date::from(today);
    repoint(session, person_id, founded.family.Surname_ID);
    from = save_family(session, std::move(*from), today);
    (void)save_family(session, std::move(founded), today);
    transaction.commit();
    return from;
}

std::optional<FamilyFile> FamilyEditor::unchanged() const
{
    auto now = load_family(*m_office.session, m_stored.family.Surname_ID);
    return now && changes_between(m_stored, *now).isEmpty() ? now : std::nullopt;
}

bool FamilyEditor::changed_elsewhere()
{
    (void)refuse(u"Nobody was transferred, as this family file was changed elsewhere while it was open here"_s,
                 u"It is shown as it is now. Please look at it and transfer the person again."_s);
    if (hold(m_stored.family.Surname_ID) == Opened::gone) {
        tell_gone();
        forget_family();
    }
    return false;
}

bool FamilyEditor::transfer_to(int index, int surname_id)
{
    const auto person = person_to_transfer(index);
    if (!person || surname_id == m_stored.family.Surname_ID)
        return false;
    const bool last = m_stored.people.size() == 1;
    if (!last && !can_spare(*person))
        return refuse(keeps_an_adult);
    const TargetLock lock(m_office, surname_id);
    if (!lock.taken()) {
        tell_held(u"Unable to move to this family file as another user is presently editing that family file"_s, {},
                  surname_id);
        return false;
    }
    auto target = load_family(*m_office.session, surname_id);
    if (!target)
        return refuse(u"Unable to access this family file because another user has removed it from the database."_s);
    if (target->family.booked_out && !target->family.active_in_book)
        return refuse(u"Unable to transfer to this family file as it is booked out"_s,
                      booked_out_note(target->family, m_office.day_order()).trimmed());
    if (std::ssize(target->people) >= most_people) {
        m_office.dialogue.show(family_is_full());
        return false;
    }
    return (!last || confirm_end_of_family(*person, *target)) && carry_over(*person, surname_id);
}

bool FamilyEditor::confirm_end_of_family(int person_id, const FamilyFile& target)
{
    if (!core::may_delete_people(m_office))
        return false;
    const QString name = m_stored.people[static_cast<std::size_t>(place_of(m_stored, person_id))].Name;
    return m_office.dialogue.confirm(
        {.text =
             u"%1 is the only person in this family file. Do you wish to transfer %1 and delete this file?"_s.arg(name),
         .more = u"%1 keeps everything of their own in the %2. The address, events and visits of this file go."_s.arg(
             name, family_of(target)),
         .icon = core::Icon::question},
        core::Answer::no);
}

bool FamilyEditor::carry_over(int person_id, int surname_id)
{
    const auto carried = write_transfer(person_id, surname_id);
    if (!carried)
        return changed_elsewhere();
    const auto& [from, target] = *carried;
    const QString name = m_stored.people[static_cast<std::size_t>(place_of(m_stored, person_id))].Name;
    if (from.people.empty()) {
        forget_family();
        remove_family_files(m_office, from);
    } else {
        become(from);
    }
    m_office.dialogue.show(core::information(
        u"%1 has now been transferred to the %2 family file as a %3. If you need to position %1 to a different "
        "position in the %2 family then enter the family file and use the positioning arrows under the names list box "
        "on the individual tab to move the person to a different position."_s.arg(name, target.family.surname,
                                                                                  role_in(target, person_id))));
    return true;
}

std::optional<std::pair<FamilyFile, FamilyFile>> FamilyEditor::write_transfer(int person_id, int surname_id)
{
    core::Session& session = *m_office.session;
    const auto today = m_office.clock.today();
    core::Transaction transaction(session);
    auto from = unchanged();
    auto target = load_family(session, surname_id);
    if (!from || !target || std::ssize(target->people) >= most_people)
        return std::nullopt;
    target->people.push_back(take_out(*from, person_id));
    Person& person = target->people.back();
    const QString name = person.Name;
    if (person.other_surname.isEmpty() && from->family.surname != target->family.surname)
        person.other_surname = from->family.surname;
    else if (person.other_surname == target->family.surname)
        person.other_surname.clear();
    note_transfer(*target, u"%1 came from the %2"_s.arg(name, family_of(*from)), today);
    note_transfer(*from, u"%1 went to the %2"_s.arg(name, family_of(*target)), today);
    repoint(session, person_id, surname_id);
    target = save_family(session, std::move(*target), today);
    if (from->people.empty())
        remove_family_rows(session, from->family.Surname_ID);
    else
        from = save_family(session, std::move(*from), today);
    transaction.commit();
    return std::pair(std::move(*from), std::move(*target));
}

bool FamilyEditor::may_open(const QString& unsaved, const QString& no_person)
{
    if (m_file.people.empty())
        return refuse(no_person);
    if (is_new())
        return refuse(unsaved);
    return settle() && !is_new();
}

bool FamilyEditor::may_open_notebook()
{
    return may_open(u"Unable to open the family Notebook until the family file is saved"_s,
                    u"Unable to access the notebook until a person has been entered in the family file first."_s);
}

bool FamilyEditor::may_open_portrait()
{
    return may_open(
        u"Unable to open the Portrait program until the family file is saved"_s,
        u"Unable to access the Portrait program until a person has been entered in the family file first."_s);
}

bool FamilyEditor::add_to_visitation()
{
    if (m_file.people.empty())
        return refuse(u"Unable to add to visitation list until a person has been entered in the family file first."_s);
    if (!may_edit())
        return refuse_reading(u"change"_s);
    if (!core::permitted(m_office, core::Area::visitation_tab) || !settle() || is_new())
        return false;
    const Visit visit{.date = core::Date::from(m_office.clock.today()),
                      .visitor = m_office.user_name,
                      .comments = family_summary(m_stored, m_office.settings.use_preferred_names)};
    add_visit(*m_office.session, m_stored.family.Surname_ID, visit);
    m_file.visits.push_back(visit);
    m_stored.visits = m_file.visits;
    return true;
}

} // namespace kindrel::people
