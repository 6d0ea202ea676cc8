#pragma once

#include "core/mender.h"

/// The checks of this room, by the files that hold them.
namespace kindrel::core::mender_checks {

// The engine and the schema.
[[nodiscard]] Findings examine_engine(MenderPlace& place);
void mend_engine(MenderPlace& place);
[[nodiscard]] Findings examine_schema(MenderPlace& place);
void mend_schema(MenderPlace& place);
[[nodiscard]] Findings examine_doubles(MenderPlace& place);
void mend_doubles(MenderPlace& place);

// The rows.
[[nodiscard]] Findings examine_orphans(MenderPlace& place);
void mend_orphans(MenderPlace& place);
[[nodiscard]] Findings examine_companions(MenderPlace& place);
void mend_companions(MenderPlace& place);
[[nodiscard]] Findings examine_version(MenderPlace& place);
[[nodiscard]] Findings examine_positions(MenderPlace& place);
void mend_positions(MenderPlace& place);
[[nodiscard]] Findings examine_counters(MenderPlace& place);
void mend_counters(MenderPlace& place);
[[nodiscard]] Findings examine_locks(MenderPlace& place);

// The folder.
[[nodiscard]] Findings examine_markers(MenderPlace& place);
[[nodiscard]] Findings examine_leftovers(MenderPlace& place);
void mend_leftovers(MenderPlace& place);
[[nodiscard]] Findings examine_side_files(MenderPlace& place);
void mend_side_files(MenderPlace& place);

/// What the embedded engine says of the file, but for indexes that do not fit their tables.
[[nodiscard]] QStringList faults_of_file(Session& session);
/// The tables that hold locks; without all of them nobody can tell who is inside.
[[nodiscard]] QStringList lock_tables();
/// Makes those again that are missing, without a lock in them.
void make_lock_tables(MenderPlace& place);
/// Who is working in the church as its locks tell, in words; empty when nobody is. Throws DatabaseError where they
/// cannot be read.
[[nodiscard]] QString others_inside(MenderPlace& place);
/// Why nothing is done while the busy marker is there.
[[nodiscard]] QString locked_by_marker();
/// The table as the church office would call it.
[[nodiscard]] QString in_words(QStringView table);
/// The first number of the first row; 0 without rows.
[[nodiscard]] int number_from(Session& session, const QString& statement);

} // namespace kindrel::core::mender_checks
