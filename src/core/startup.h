#pragma once

#include "core/office.h"

namespace kindrel::core {

/// The edition of this program, version 10.0.0: every release has a higher one. Workstations record it in
/// `tbl_startup.network_Version`.
inline constexpr int program_edition = 100000;

/// Who starts the office: the desktop runs every step; the command line neither rotates backups, counts starts nor
/// compacts, and asks nothing but the password.
enum class Purpose { desktop, command_line };

struct StartRequest
{
    Purpose purpose = Purpose::desktop;
    int church = 0;          ///< A requested church: 1 to 9; 0 leaves the choice to start-up.
    QString data_drive = {}; ///< Overrides `local_data_drive.dat`; empty does not.
};

/// Runs the start-up sequence. Null when a check ended the program: its message has been shown.
[[nodiscard]] std::unique_ptr<Office> start_up(const StartRequest& request, Workstation& workstation,
                                               Dialogue& dialogue, Clock& clock, Progress& progress);

} // namespace kindrel::core
