#pragma once

#include "core/office.h"
#include "core/progress.h"
#include "people/drafts.h"
#include "people/family_checks.h"
#include "people/records.h"

#include <functional>

namespace kindrel::people {

/// What the person may do with the family in the editor.
enum class FileAccess {
    edit,
    read_only, ///< By the password.
    booked_out ///< The family is away, or not among those booked out to this computer.
};

/// The lists of rows that a person (the first six) or the family carries.
enum class RowList {
    status,
    groups,
    ministries,
    flexi,
    dates,
    occupations,
    family_groups,
    family_dates,
    other_contacts,
    events
};
[[nodiscard]] inline bool is_of_person(RowList list)
{
    return list <= RowList::occupations;
}
/// Whether the order of the rows is the person's own; the others stand in the order of their setup list.
[[nodiscard]] bool has_own_order(RowList list);

/// A row of a list: `person` is a place in the family and counts for the lists of a person alone.
struct RowPlace
{
    RowList list;
    int person = 0;
    int row = -1;
};

enum class Saved { yes, no, left }; ///< `left`: the person chose to leave the editor without saving.

/// One family file with all its people, held under its lock: opened, changed in memory, and written back as a whole.
/// Operations say what stands in their way, then return false and change nothing. An index of -1 means that nothing is
/// chosen. Throws core::DatabaseError and core::FileError. A family left open is released by the destructor, and what
/// was not saved stays as a draft.
class FamilyEditor
{
public:
    /// Starts as a new file.
    explicit FamilyEditor(core::Office& office);
    FamilyEditor(const FamilyEditor&) = delete;
    FamilyEditor& operator=(const FamilyEditor&) = delete;
    ~FamilyEditor();

    [[nodiscard]] const FamilyFile& file() const { return m_file; }
    /// As the database had it when it was read or saved last.
    [[nodiscard]] const FamilyFile& stored() const { return m_stored; }
    [[nodiscard]] bool is_new() const { return m_file.family.Surname_ID == 0; }
    [[nodiscard]] bool altered() const;
    [[nodiscard]] FileAccess access() const;
    [[nodiscard]] bool may_edit() const { return access() == FileAccess::edit; }
    [[nodiscard]] QString caption() const;

    // Coming and going. What is altered is offered for saving first; false when the person stays.
    [[nodiscard]] bool start_new();
    /// A family that is gone opens a new file, which has been told.
    [[nodiscard]] bool open(int surname_id);
    /// Within walk()'s families, else within all families by surname.
    [[nodiscard]] bool next() { return step(1); }
    [[nodiscard]] bool previous() { return step(-1); }
    /// The families that next() and previous() move within, and their name in a sentence: "the list".
    void walk(std::vector<int> surname_ids, const QString& name);
    /// Releases the family. True once nothing is left to lose.
    [[nodiscard]] bool leave();
    [[nodiscard]] Saved save();
    /// Where the last refused save belongs on the screen.
    [[nodiscard]] std::optional<SaveRefusal::Where> guilty() const { return m_guilty; }
    /// Deletes the family with its files and starts a new file.
    [[nodiscard]] bool remove_family();
    /// `church` as of other_churches(). The editor starts a new file afterwards.
    [[nodiscard]] bool move_to_church(std::optional<int> church, core::Progress& progress);

    // Changes in memory.
    /// `what` names the field: changes of the same field that follow each other are undone together.
    void change(const QString& what, const std::function<void(FamilyFile&)>& make);
    [[nodiscard]] bool can_undo() const { return !m_before.empty(); }
    void undo();

    [[nodiscard]] bool add_adult(const QString& name);
    [[nodiscard]] bool add_child(const QString& name);
    [[nodiscard]] bool remove_person(int index);
    /// Among the adults or the children, whichever the person belongs to.
    [[nodiscard]] bool move_person_up(int index) { return move_person(index, -1); }
    [[nodiscard]] bool move_person_down(int index) { return move_person(index, 1); }
    /// Nullopt for none.
    [[nodiscard]] bool set_school_year(int index, std::optional<int> year);
    [[nodiscard]] bool set_new_pin(int index);

    /// Adds an item of the list's setup list at the end. False without a word when it is carried already.
    [[nodiscard]] bool add_item(RowPlace place, int item, const QString& text, int type = 0);
    [[nodiscard]] bool remove_row(RowPlace place);
    [[nodiscard]] bool move_row_up(RowPlace place) { return move_row(place, -1); }
    [[nodiscard]] bool move_row_down(RowPlace place) { return move_row(place, 1); }
    /// Of an event, a family date or a personal date.
    [[nodiscard]] bool set_today(RowPlace place);

    // What is stored at once. The family must be saved; an altered one is offered for saving.
    /// Whether anybody can be transferred out of the family as it is; otherwise says why not.
    [[nodiscard]] bool may_transfer() const;
    [[nodiscard]] bool transfer_to_new(int index);
    [[nodiscard]] bool transfer_to(int index, int surname_id);
    /// Whether notebook and photographs can be opened: the family is stored and has a person.
    [[nodiscard]] bool may_open_notebook();
    [[nodiscard]] bool may_open_portrait();
    /// Adds today's entry with the family's summary to the visits.
    [[nodiscard]] bool add_to_visitation();

    /// Writes unsaved work where a power cut does not reach it; forgets it when there is none.
    void keep_draft();
    /// Opens the family of a draft with what was typed. The draft stays until the work is saved or dropped.
    [[nodiscard]] bool restore(const Draft& draft);

private:
    [[nodiscard]] bool refuse(const QString& text, const QString& more = {}) const;
    /// Whether the family is booked out, or not among those booked out to this computer.
    [[nodiscard]] bool is_away(const Family& family) const;
    [[nodiscard]] bool refuse_reading(const QString& act) const;
    /// Offers what is altered for saving; false when the person stays.
    [[nodiscard]] bool settle();
    void drop();
    void forget_family();
    [[nodiscard]] Saved refused_save();
    /// Whether the rooms that keep records of the people allow what the save would do to them.
    [[nodiscard]] bool may_disturb() const;
    [[nodiscard]] bool write();
    /// Others have saved the family meanwhile.
    [[nodiscard]] bool meet(const FamilyFile& theirs);
    /// Others have removed the family meanwhile; always false.
    [[nodiscard]] bool go_on_as_new();
    void settle_on(FamilyFile saved);
    void become(FamilyFile stored);
    [[nodiscard]] bool step(int by);
    /// Goes on with the family that was open before a step; always false.
    [[nodiscard]] bool stay();
    enum class Opened { yes, held, gone };
    [[nodiscard]] Opened hold(int surname_id);
    void tell_held(const QString& text, const QString& explanation, int surname_id) const;
    void tell_gone(const QString& more = {}) const;
    void release() noexcept;
    /// The same family and people, without the keys under which they were stored once.
    [[nodiscard]] static FamilyFile as_new(FamilyFile file);
    /// The key of the person, once everything that must come before a transfer is done.
    [[nodiscard]] std::optional<int> person_to_transfer(int index);
    /// Whether an adult is left at the first place without the person.
    [[nodiscard]] bool can_spare(int person_id) const;
    [[nodiscard]] bool confirm_end_of_family(int person_id, const FamilyFile& target);
    [[nodiscard]] bool carry_over(int person_id, int surname_id);
    /// The family that stays behind, as it was stored; nullopt, and nothing is written, when others changed it.
    [[nodiscard]] std::optional<FamilyFile> write_founding(int person_id);
    /// The same with the family that took the person in; one that stays without people is gone.
    [[nodiscard]] std::optional<std::pair<FamilyFile, FamilyFile>> write_transfer(int person_id, int surname_id);
    /// The family as it is in the database, unless others changed it since it was read here.
    [[nodiscard]] std::optional<FamilyFile> unchanged() const;
    /// Says so and shows what is there now; always false.
    [[nodiscard]] bool changed_elsewhere();
    [[nodiscard]] bool may_open(const QString& unsaved, const QString& no_person);
    [[nodiscard]] bool move_person(int index, int by);
    [[nodiscard]] bool move_row(RowPlace place, int by);
    [[nodiscard]] bool add_person(const QString& name, int marital);

    core::Office& m_office;
    Drafts m_drafts;
    FamilyFile m_stored;
    FamilyFile m_file;
    std::vector<FamilyFile> m_before; ///< What undo() goes back to, the newest last.
    QString m_last_change;
    int m_held = 0; ///< The family under this editor's lock.
    std::vector<int> m_walk;
    QString m_walk_name;
    std::optional<SaveRefusal::Where> m_guilty;
};

} // namespace kindrel::people
