#pragma once

#include "core/startup.h"
#include "core/upgrade.h"

/// The steps of start-up. Each returns false when it ends the program, after it has shown why. Until the database is
/// opened the office has no session, and until build_paths() its paths are those of church 1.
namespace kindrel::core::startup_steps {

struct State
{
    const StartRequest& request;
    Progress& progress;
    Office& office;
    bool working_on_booked_out = false; ///< Chosen by the person because the network cannot be reached.
    QString backup_fault = {};          ///< Told once the church is open: one that cannot be opened has its own box.

    [[nodiscard]] bool on_desktop() const { return request.purpose == Purpose::desktop; }
};

/// The paths of the data drive: that of the request, else of `local_data_drive.dat`, else the workstation's own.
[[nodiscard]] Paths first_paths(const StartRequest& request, const Workstation& workstation);

[[nodiscard]] bool write_manifest(State&);
[[nodiscard]] bool confirm_data_folder(State&);
[[nodiscard]] bool claim_single_instance(State&);
[[nodiscard]] bool check_date_separator(State&);
[[nodiscard]] bool reach_network(State&);
[[nodiscard]] bool read_church_names(State&);
[[nodiscard]] bool choose_church(State&);
[[nodiscard]] bool build_paths(State&);

[[nodiscard]] bool rotate_backups(State&);
[[nodiscard]] bool find_logo(State&);
[[nodiscard]] bool read_sounds_and_options(State&);
[[nodiscard]] bool provide_database(State&);
[[nodiscard]] bool check_busy_marker(State&);
[[nodiscard]] bool set_caption(State&);
[[nodiscard]] bool open_database(State&);
/// Brings a restore that was cut off to its end, before anybody works in what may be a mixture of two churches.
[[nodiscard]] bool settle_restore(State&);
[[nodiscard]] bool check_version(State&);
[[nodiscard]] bool load_settings(State&);
[[nodiscard]] bool count_start(State&);
[[nodiscard]] bool find_tutorial(State&);
[[nodiscard]] bool read_side_settings(State&);
[[nodiscard]] bool compact_when_due(State&);
[[nodiscard]] bool check_day_order(State&);
[[nodiscard]] bool check_display(State&);
[[nodiscard]] bool load_plugin_catalogue(State&);

/// What check_version() does for a program of version `ours` that knows the upgrades of `chain`.
[[nodiscard]] bool bring_to_version(State&, int ours, std::span<const Upgrade> chain);

/// The record, or the fallbacks when the file is missing or, after telling so, damaged.
[[nodiscard]] SideRecord read_or_default(Office& office, const SideFile& file);
/// The same, with the fallbacks written when the file is missing.
[[nodiscard]] SideRecord read_or_create(Office& office, const SideFile& file);

} // namespace kindrel::core::startup_steps
