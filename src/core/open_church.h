#pragma once

#include "core/office.h"

namespace kindrel::core {

/// The file in a church folder that names the database server in place of a church file: one line of libpq keywords.
inline constexpr QStringView connection_file = u"KR10_records.server";

/// True when the church folder holds a database or names a server.
[[nodiscard]] bool church_present(const Paths& paths);

/// Opens what the church folder names: the server of the connection file, else the church file. Throws DatabaseError
/// or FileError.
[[nodiscard]] std::unique_ptr<Session> connect_church(const Paths& paths);
/// The same for reading alone: what a transaction reads is of one moment.
[[nodiscard]] std::unique_ptr<Session> connect_to_read(const Paths& paths);
/// What connect_church() does, in network mode behind the `security.dat` looks. Null when it did not become this
/// workstation's turn.
[[nodiscard]] std::unique_ptr<Session> connect_in_turn(const Paths& paths, Mode mode, Clock& clock, Progress& progress);

/// Opens the church's session behind the `security.dat` looks of network mode. On failure the stated message is shown
/// and null is returned: the program ends.
[[nodiscard]] std::unique_ptr<Session> open_church(const Paths& paths, Mode mode, Dialogue& dialogue, Clock& clock,
                                                   Progress& progress);

/// The box of a database that cannot be opened or read; `why` stands beneath.
[[nodiscard]] Message unable_to_connect(const QString& why);
/// The box of a church whose busy marker is there: somebody works on its whole database.
[[nodiscard]] Message busy_notice();

/// True while the church's database is reachable; false after telling the person that it is not.
[[nodiscard]] bool network_guard(const Office& office);

/// Adds the `tbl_personal_details` and `tbl_address` rows that a person or family lacks; a key of 0 is passed over.
void ensure_companion_rows(Session& session, int person_id, int surname_id);

} // namespace kindrel::core
