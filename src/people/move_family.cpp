#include "people/move_family.h"

#include "core/entry.h"
#include "core/files.h"
#include "core/open_church.h"
#include "core/progress_run.h"
#include "core/removal.h"
#include "core/schema.h"
#include "people/family_store.h"
#include "people/move_arrival.h"
#include "people/move_files.h"
#include "people/move_steps.h"

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::Office;

constexpr int own_churches = 7;
constexpr int most_items_named = 10;

bool refuse(const Office& office, const QString& text, const QString& more = {})
{
    office.dialogue.show({.text = text, .more = more});
    return false;
}

core::Paths paths_of(const Office& office, int church)
{
    return {office.paths.folder(core::Folder::program), office.paths.data_drive(),
            office.paths.folder(core::Folder::data_root), office.mode, church};
}

bool is_other(const Office& office, int church)
{
    return church >= 1 && church <= own_churches && church != office.church;
}

/// What can be said before the other church is looked at.
bool permitted(Office& office, std::optional<int> church)
{
    if (office.mode == core::Mode::training)
        return refuse(office, u"Unable to move a family to another church in training mode"_s,
                      u"This option is not available while the program is in training mode."_s);
    if (office.mode == core::Mode::booked_out)
        return refuse(office, u"Unable to move a family to another church as you are in Family Booked out mode"_s,
                      u"This option is not available while the program is in Booked out mode."_s);
    if (!core::may_enter(office, core::AreaId::family_editor))
        return core::permitted(office, core::Area::search_for_family);
    if (office.may(core::Area::read_only_family_data))
        return refuse(office,
                      u"Unable to move this family file as you only have read only access within family files"_s);
    if (!church || !is_other(office, *church))
        return refuse(office, u"Please select a church to move the family too first"_s);
    return core::network_guard(office) && core::may_delete_people(office);
}

QString counted(qsizetype count, const QString& one, const QString& many)
{
    return count == 1 ? one : many.arg(count);
}

/// Empty when nothing is added.
QString told_of_items(const CarriedItems& missing)
{
    QStringList names;
    for (const auto& list : setup_lists()) {
        for (const auto& item : missing[static_cast<std::size_t>(list.kind)])
            names += u"%1 (%2)"_s.arg((item.text + u' ' + item.postcode).trimmed(), list.caption);
    }
    if (names.isEmpty())
        return {};
    const auto named = QStringList(names.mid(0, most_items_named)).join(u", "_s);
    const auto others = names.size() - most_items_named;
    return counted(names.size(), u"1 item will be added to its setup lists: "_s,
                   u"%1 items will be added to its setup lists: "_s) +
           named + (others > 0 ? u" and %1 more."_s.arg(others) : u"."_s);
}

/// One family's move from the office's church into another one.
class Move
{
public:
    Move(Office& office, int surname_id, int church, core::Progress& progress, const MoveWatch& watch)
        : m_office(office), m_surname_id(surname_id), m_church(church), m_progress(progress), m_watch(watch),
          m_paths(paths_of(office, church)), m_name(office.church_names.value(church - 1))
    {
    }

    [[nodiscard]] bool run();

private:
    [[nodiscard]] bool open();
    [[nodiscard]] bool connect_there();
    [[nodiscard]] bool end_earlier_moves();
    [[nodiscard]] bool is_in_the_office(const Family& family) const;
    [[nodiscard]] bool guards_agree(const FamilyFile& file);
    [[nodiscard]] bool not_underway_elsewhere();
    [[nodiscard]] bool free_there();
    [[nodiscard]] bool confirmed(const Parcel& parcel);
    [[nodiscard]] bool carry();
    [[nodiscard]] bool depart(const FamilyFile& sent);
    void end(const Passage& passage, const MoveWatch& told);
    void end_or_tell();
    void done(MoveStep step);

    [[nodiscard]] core::Session& here() { return *m_office.session; }
    [[nodiscard]] bool gone() const
    {
        return refuse(m_office, u"Unable to move this family file because another user has removed it from the "
                                "database."_s);
    }

    Office& m_office;
    int m_surname_id;
    int m_church;
    core::Progress& m_progress;
    const MoveWatch& m_watch;
    core::Paths m_paths;
    QString m_name;
    std::unique_ptr<core::Session> m_there;
    Passage m_passage;
    QString m_surname;
};

bool Move::run()
{
    if (!open())
        return false;
    if (end_earlier_moves())
        return true;
    const auto parcel = pack(here(), m_surname_id);
    if (!parcel)
        return gone();
    m_surname = parcel->file.family.surname;
    if (!is_in_the_office(parcel->file.family) || !guards_agree(parcel->file) || !not_underway_elsewhere() ||
        !free_there() || !confirmed(*parcel))
        return false;
    const core::ProgressRun run(m_progress, u"Moving the %1 family to '%2'"_s.arg(m_surname, m_name), move_steps, {});
    return carry();
}

bool Move::open()
{
    if (!core::church_present(m_paths))
        return refuse(m_office, u"Unable to move the family as '%1' has no database yet"_s.arg(m_name),
                      u"Load that church once from the main menu, which makes its database."_s);
    if (m_paths.exists(core::Folder::church, QLatin1String(core::side_files::busy.name))) {
        m_office.dialogue.show(core::busy_notice());
        return false;
    }
    if (!connect_there())
        return false;
    if (core::read_version(*m_there) == core::schema_version)
        return true;
    return refuse(m_office, u"Unable to move the family as the database of '%1' is of another version"_s.arg(m_name),
                  u"Load that church once from the main menu, so that it is brought to this version."_s);
}

bool Move::connect_there()
{
    const auto unable = u"Unable to open the database of '%1'"_s.arg(m_name);
    try {
        m_there = core::connect_in_turn(m_paths, m_office.mode, m_office.clock, m_progress);
    } catch (const core::DatabaseError& error) {
        return refuse(m_office, unable, error.text());
    } catch (const core::FileError& error) {
        return refuse(m_office, unable, error.text());
    }
    return m_there || refuse(m_office, unable, u"Another workstation is opening it. Please try again in a moment."_s);
}

/// Moves out of this church whose family has left it need but their end. True when the family at hand is one of them.
bool Move::end_earlier_moves()
{
    const auto passages = read_passages(*m_there, m_office.church);
    QList<int> families;
    for (const auto& passage : passages)
        families += passage.from;
    const auto present = present_families(here(), families);
    bool ended = false;
    m_passage = {.from_church = m_office.church, .from = m_surname_id};
    for (const auto& passage : passages) {
        const bool at_hand = passage.from == m_surname_id;
        if (at_hand)
            m_passage = passage;
        if (present.contains(passage.from))
            continue;
        ended |= at_hand && present_families(*m_there, {passage.to}).contains(passage.to);
        try {
            end(passage, {});
        } catch (const core::FileError&) {
            // Its note stays for the next move; this one does not depend on it.
        }
    }
    return ended;
}

bool Move::is_in_the_office(const Family& family) const
{
    return !family.booked_out ||
           refuse(m_office,
                  u"Unable to move the %1 family as it is booked out to %2"_s.arg(m_surname, family.booked_out_person),
                  u"Please book it in first."_s);
}

bool Move::guards_agree(const FamilyFile& file)
{
    std::vector<int> people;
    for (const auto& person : file.people)
        people.push_back(person.person_id);
    return core::guards_allow(m_office, core::PersonAct::move, people);
}

/// A family that may have arrived in a third church would be in two churches afterwards.
bool Move::not_underway_elsewhere()
{
    const int earlier = earlier_destination(here(), m_surname_id).value_or(m_church);
    if (earlier == m_church || !is_other(m_office, earlier) || !core::church_present(paths_of(m_office, earlier)))
        return true;
    return refuse(m_office,
                  u"Unable to move the %1 family to '%2' as it is on its way to '%3'"_s.arg(
                      m_surname, m_name, m_office.church_names.value(earlier - 1)),
                  u"An earlier move was cut off before its end. Please move the family there, so that it is not in two "
                  "churches."_s);
}

/// What an earlier try wrote there is not taken from under the hands of somebody who works on it.
bool Move::free_there()
{
    if (m_passage.to <= 0)
        return true;
    core::Locks locks(*m_there, m_office.workstation, m_office.clock);
    for (const auto& lock : locks.held({core::LockKind::family, core::LockKey(m_passage.to)})) {
        if (!lock.stale)
            return refuse(
                m_office, u"Unable to move the %1 family as somebody is working on it in '%2'"_s.arg(m_surname, m_name),
                u"An earlier try has brought it there already. "_s + core::held_line(lock, m_office.day_order()));
    }
    return true;
}

bool Move::confirmed(const Parcel& parcel)
{
    QStringList lines{told_of_items(missing_items(*m_there, parcel.items))};
    if (const auto names = holders_of_taken_pins(*m_there, parcel.file, m_passage); !names.isEmpty())
        lines += counted(names.size(), u"This P.I.N. is in use there and will be left out: that of "_s,
                         u"%1 P.I.N. numbers are in use there and will be left out: those of "_s) +
                 names.join(u", "_s) + u'.';
    lines +=
        u"Roster duties and Wardline records of the family end with the move. Attendance and giving totals stay in "
        "this church."_s;
    if (!present_families(*m_there, {m_passage.to}).isEmpty())
        lines += u"An earlier try has brought the family there already. It is written anew from here; what was changed "
                 "there since is lost."_s;
    lines.removeAll(QString());
    const auto people = counted(static_cast<qsizetype>(parcel.file.people.size()), u"1 person"_s, u"%1 people"_s);
    return m_office.dialogue.confirm(
        {.text = u"Please confirm that you wish to move the %1 family (%2) to '%3'"_s.arg(m_surname, people, m_name),
         .more = lines.join(u'\n'),
         .icon = core::Icon::question},
        core::Answer::no);
}

bool Move::carry()
{
    // Read again: the question may have stood for long.
    const auto parcel = pack(here(), m_surname_id);
    if (!parcel)
        return gone();
    if (!is_in_the_office(parcel->file.family))
        return false;
    keep_destination(here(), m_surname_id, m_church);
    keep_passage(*m_there, m_passage, parcel->file);
    done(MoveStep::keys_kept);
    copy_own_files(m_office.paths, m_paths, m_passage);
    done(MoveStep::files_copied);
    write_arrival(*m_there, *parcel, m_passage, m_office.clock.today());
    done(MoveStep::arrived);
    if (!depart(parcel->file))
        return refuse(m_office,
                      u"The %1 family stays here for now, as another user changed it meanwhile"_s.arg(m_surname),
                      u"Nothing is lost. Please move it again."_s);
    done(MoveStep::departed);
    end_or_tell();
    return true;
}

/// Removes the family here, unless it is no longer what was sent.
bool Move::depart(const FamilyFile& sent)
{
    core::Transaction transaction(here());
    if (load_family(here(), m_surname_id) != sent)
        return false;
    core::remove_entities(here(), core::Entity::surname, std::array{m_surname_id});
    transaction.commit();
    return true;
}

void Move::end(const Passage& passage, const MoveWatch& told)
{
    remove_left_files({m_office.paths, here()}, passage.from, passage.people.keys());
    if (told)
        told(MoveStep::files_removed);
    remove_left_files({m_paths, *m_there}, passage.to, passage.people.values());
    forget_destination(here(), passage.from);
    forget_passage(*m_there, passage);
    if (told)
        told(MoveStep::note_removed);
}

/// The family has moved: what cannot be tidied up now is left to the next move.
void Move::end_or_tell()
{
    const auto tell = [this](const QString& why) {
        m_office.dialogue.show(core::information(
            u"The %1 family has been moved, but its photographs and notebook pages could not be removed here"_s.arg(
                m_surname),
            u"The next move to '%1' tries again. %2"_s.arg(m_name, why)));
    };
    try {
        end(m_passage, [this](MoveStep step) { done(step); });
    } catch (const core::FileError& error) {
        tell(error.text());
    } catch (const core::DatabaseError& error) {
        tell(error.text());
    }
}

void Move::done(MoveStep step)
{
    if (m_watch)
        m_watch(step);
    (void)m_progress.step();
}

} // namespace

std::vector<OtherChurch> other_churches(const Office& office)
{
    std::vector<OtherChurch> churches;
    if (office.mode == core::Mode::training || office.mode == core::Mode::booked_out)
        return churches;
    for (int church = 1; church <= own_churches; ++church) {
        if (is_other(office, church) && core::church_present(paths_of(office, church)))
            churches.push_back({church, office.church_names.value(church - 1)});
    }
    return churches;
}

bool move_family_watched(Office& office, int surname_id, std::optional<int> church, core::Progress& progress,
                         const MoveWatch& watch)
{
    return permitted(office, church) && Move(office, surname_id, *church, progress, watch).run();
}

bool move_family(Office& office, int surname_id, std::optional<int> church, core::Progress& progress)
{
    return move_family_watched(office, surname_id, church, progress, {});
}

} // namespace kindrel::people
