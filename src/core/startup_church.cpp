#include "core/startup_steps.h"

#include "core/backup_rotation.h"
#include "core/compaction.h"
#include "core/logo.h"
#include "core/marker.h"
#include "core/open_church.h"
#include "core/restore_swap.h"
#include "core/schema.h"
#include "core/upgrade.h"

#include <QFileInfo>

// The second half of start-up: the chosen church, its database and its settings.
namespace kindrel::core::startup_steps {

using namespace Qt::StringLiterals;

namespace {

constexpr int depth_of_256_colours = 8;
constexpr QSize smallest_display{1024, 768};

const QString newer_edition = u"A newer edition of Kindrel has been installed on your network."_s;
const QString newer_edition_advice =
    u"At least one of the workstations on your network has been upgraded with a new edition of Kindrel; most "
    "likely from obtaining the latest update from the Internet. It is highly recommended that you upgrade "
    "all workstations with the latest update."_s;
const QString upgrade_failed =
    u"Kindrel was unable to upgrade your data files, they are as they were before. Kindrel is now going to "
    "shut down."_s;
const QString rotation_failed = u"Kindrel was unable to renew the system backup of this church."_s;
const QString compaction_failed = u"Kindrel was unable to compact the database, your data is as it was before."_s;
const QString plugins_failed = u"Kindrel was unable to load all plug-ins."_s;
const QString master_missing =
    u"Unable to access your master database file because it is missing from your system, please reload "
    "Kindrel again from the installation CD to recover the master database file."_s;
const QString newer_database =
    u"Your database files are newer than the program edition of Kindrel installed on this computer, you need "
    "to obtain the latest update of Kindrel from the person or web page that supplied Kindrel to you."_s;
const QString older_database =
    u"Please Note - You are trying to load a database that was created in a previous version. Please use the "
    "conversion program to convert your data files."_s;
const QString wrong_day_order =
    u"Please note: Kindrel has found your Windows system settings not set to Australian Date format "
    "(DD-MM-YYYY). Please change your settings so that Kindrel can correctly analyse dates, this is done in "
    "the regional settings of the windows control panel"_s;
const QString too_few_colours =
    u"Your display shows 256 colours or fewer. Please set it to more colours so that Kindrel can be seen as "
    "it should."_s;
const QString display_too_small =
    u"Your display is smaller than 1024 X 768. Please set it to at least this size so that every part of "
    "Kindrel can be seen."_s;

/// Why the work failed; nullopt when it did not.
template <class Work>
std::optional<QString> failure_of(Work&& work)
{
    try {
        work();
        return std::nullopt;
    } catch (const DatabaseError& error) {
        return error.text();
    } catch (const FileError& error) {
        return error.text();
    }
}

/// False when the work failed, after telling `sentence` and the cause.
template <class Work>
bool attempt(Office& office, const QString& sentence, Work&& work)
{
    const std::optional<QString> failure = failure_of(work);
    if (failure)
        office.dialogue.show(information(sentence, *failure));
    return !failure;
}

QString name_of_church(const Office& office)
{
    if (office.church == training_church)
        return u"Training Church"_s;
    return office.church == booked_out_church ? u"Booked Out Data"_s : office.church_names[office.church - 1];
}

/// One start-up more; counted where the number lies, since other workstations count too.
int counted_start(Session& session)
{
    Transaction transaction(session);
    session.execute(u"UPDATE [tbl_startup] SET [compact_count]=[compact_count]+1;"_s);
    const int count = read_settings(session).compact_count;
    transaction.commit();
    return count;
}

/// Tells of a newer edition on the network, or records this one.
void compare_editions(Office& office, int recorded)
{
    if (recorded > program_edition)
        office.dialogue.show(information(newer_edition, newer_edition_advice));
    else if (recorded < program_edition)
        write_setting(*office.session, u"network_Version"_s, program_edition);
}

bool upgrade(Office& office, int from, int to, std::span<const Upgrade> chain)
{
    bool busy = false;
    const bool done = attempt(office, upgrade_failed, [&] {
        const auto marker = Marker::take(office.paths, side_files::busy);
        busy = !marker;
        if (marker)
            upgrade_church(*office.session, office.paths, chain, from, to);
    });
    if (busy)
        office.dialogue.show(busy_notice());
    return done && !busy;
}

bool month_first(const QString& pattern)
{
    const auto month = pattern.indexOf(u'M');
    return month >= 0 && month < pattern.indexOf(u'd');
}

} // namespace

bool rotate_backups(State& state)
{
    Office& office = state.office;
    const auto failure = failure_of([&] { rotate_system_backups(office.paths, office.church, office.clock.today()); });
    state.backup_fault = failure.value_or(QString());
    return true;
}

bool find_logo(State& state)
{
    Office& office = state.office;
    office.logo =
        workstation_logo_path(office.paths, read_or_default(office, side_files::workstation_logo).text("logo"));
    return true;
}

bool read_sounds_and_options(State& state)
{
    Office& office = state.office;
    office.side.sounds = read_or_create(office, side_files::sounds);
    office.side.common = read_or_create(office, side_files::common);
    if (office.logo.isEmpty())
        office.logo = logo_path(office.paths, office.side.common.text("logo"));
    return true;
}

bool provide_database(State& state)
{
    Office& office = state.office;
    if (church_present(office.paths))
        return true;
    const QString master = office.paths.file(Folder::program, u"master/KR10_records.kdl"_s);
    if (!QFileInfo::exists(master)) {
        office.dialogue.show(information(master_missing));
        return false;
    }
    make_folder(office.paths.folder(Folder::church));
    copy_file(master, office.paths.database());
    return true;
}

bool check_busy_marker(State& state)
{
    if (!state.office.paths.exists(Folder::church, QLatin1String(side_files::busy.name)))
        return true;
    state.office.dialogue.show(busy_notice());
    return false;
}

bool set_caption(State& state)
{
    Office& office = state.office;
    office.church_name = name_of_church(office);
    switch (office.mode) {
    case Mode::training:
        office.caption_suffix = u" (Training Mode)"_s;
        break;
    case Mode::booked_out:
        office.caption_suffix = u" (Remote Access Mode)"_s;
        break;
    case Mode::network:
        office.caption_suffix = u" (Network Mode)  (%1)"_s.arg(office.church_name);
        break;
    case Mode::normal:
        office.caption_suffix = u" (%1)"_s.arg(office.church_name);
        break;
    }
    return true;
}

bool open_database(State& state)
{
    Office& office = state.office;
    office.session = open_church(office.paths, office.mode, office.dialogue, office.clock, state.progress);
    if (office.session && !state.backup_fault.isEmpty())
        office.dialogue.show(information(rotation_failed, state.backup_fault));
    return office.session != nullptr;
}

bool settle_restore(State& state)
{
    Office& office = state.office;
    if (!restore_unsettled(office.paths))
        return true;
    const auto busy = Marker::take(office.paths, side_files::busy); // It may be under way at another workstation.
    if (!busy) {
        office.dialogue.show(busy_notice());
        return false;
    }
    settle_interrupted_restore(office.paths, *office.session);
    office.church_names.clear(); // These and the settings may have been read from files that are exchanged now.
    return read_church_names(state) && find_logo(state) && read_sounds_and_options(state) && set_caption(state);
}

bool bring_to_version(State& state, int ours, std::span<const Upgrade> chain)
{
    Office& office = state.office;
    const int theirs = read_version(*office.session);
    if (theirs > ours) {
        office.dialogue.show(information(newer_database));
        return false;
    }
    if (theirs == ours)
        return true;
    if (leads(chain, theirs, ours))
        return upgrade(office, theirs, ours, chain);
    office.dialogue.show(information(older_database));
    return false;
}

bool check_version(State& state)
{
    Office& office = state.office;
    if (!bring_to_version(state, schema_version, upgrades()))
        return false;
    if (office.mode == Mode::network)
        compare_editions(office, read_settings(*office.session).network_Version);
    return true;
}

bool load_settings(State& state)
{
    Office& office = state.office;
    office.settings = read_settings(*office.session);
    office.rights = office.settings.Security ? Rights() : Rights::all();
    return true;
}

bool count_start(State& state)
{
    state.office.settings.compact_count = counted_start(*state.office.session);
    return true;
}

bool find_tutorial(State& state)
{
    state.office.tutorial = state.office.paths.exists(Folder::program, u"TUTOR/intro.mpg"_s);
    return true;
}

bool read_side_settings(State& state)
{
    Office& office = state.office;
    office.side.labels = read_or_default(office, side_files::labels);
    office.side.labels.fill_blanks();
    office.side.backup = read_or_default(office, side_files::backup);
    office.side.viewer = read_or_default(office, side_files::viewer);
    office.side.email_delay = read_or_default(office, side_files::email_delay);
    return true;
}

bool compact_when_due(State& state)
{
    Office& office = state.office;
    const int interval = office.side.common.number("starts_between_compactions");
    if (interval <= 0 || office.settings.compact_count < interval)
        return true;
    attempt(office, compaction_failed, [&] { compact_church(office); });
    return true;
}

bool check_day_order(State& state)
{
    Office& office = state.office;
    if (!office.settings.American_date && month_first(office.workstation.short_date_pattern()))
        office.dialogue.show(information(wrong_day_order));
    return true;
}

bool check_display(State& state)
{
    Office& office = state.office;
    const int depth = office.workstation.display_depth();
    if (depth > 0 && depth <= depth_of_256_colours)
        office.dialogue.show(information(too_few_colours));
    const QSize size = office.workstation.display_size();
    if (!size.isEmpty() && (size.width() < smallest_display.width() || size.height() < smallest_display.height()))
        office.dialogue.show(information(display_too_small));
    return true;
}

bool load_plugin_catalogue(State& state)
{
    Office& office = state.office;
    attempt(office, plugins_failed, [&] { office.plugins = load_plugins(office.paths); });
    return true;
}

} // namespace kindrel::core::startup_steps
