#pragma once

#include "core/side_file.h"

/// The side files and their layouts. `spare` bytes are kept for what later editions may add.
namespace kindrel::core::side_files {

extern const SideFile church_names; ///< `church_1` to `church_7`.
extern const SideFile sounds;
extern const SideFile common; ///< Options of all churches.
extern const SideFile labels; ///< Measures in tenths of a millimetre, sizes in points.
extern const SideFile workstation_logo;
extern const SideFile network;
extern const SideFile backup;
extern const SideFile viewer;
extern const SideFile email_delay; ///< `batch` is 1, not -1, while sending in batches is on.
extern const SideFile tracking;    ///< The keys of people, separated by commas.
extern const SideFile busy;        ///< Its presence keeps others out of the church.
extern const SideFile opening;     ///< Its presence keeps other workstations from opening at the same moment.
extern const SideFile write_test;
extern const SideFile set_up; ///< Its presence tells that the church is in use.
extern const SideFile map_specification;
extern const SideFile map_land;
extern const SideFile map_layers;

} // namespace kindrel::core::side_files

namespace kindrel::core {

/// The side files that a started program holds.
struct SideSettings
{
    SideRecord sounds{side_files::sounds};
    SideRecord common{side_files::common};
    SideRecord labels{side_files::labels};
    SideRecord backup{side_files::backup};
    SideRecord viewer{side_files::viewer};
    SideRecord email_delay{side_files::email_delay};
};

} // namespace kindrel::core
