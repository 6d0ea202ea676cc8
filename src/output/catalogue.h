#pragma once

#include "core/office.h"
#include "output/run_options.h"
#include "pages/flow.h"
#include "people/working_list.h"

#include <span>

namespace kindrel::output {

struct ReportInput
{
    core::Office& office;
    const people::WorkingList& list;
    RunOptions options = {};
};

/// A leaf of the catalogue's tree. Leaves of one family follow each other.
struct ReportDefinition
{
    const char *key, *family, *leaf, *description;
    core::Area area;
    bool (*write)(const ReportInput&, const void* layout, core::Progress&, pages::Flow&); ///< False when cancelled.
    const void* layout; ///< A row of the family's own table, which begins with a ReportLayout.
    pages::PageSetup (*page)(const ReportInput&) = nullptr; ///< Unset: the layout's, on the paper of the run.
    std::optional<core::Area> also = {};                    ///< A right that is needed beside `area`.
    bool (*printable)(const core::Office&) = nullptr; ///< Whether its setup can be printed; says nothing. Unset: yes.
};

[[nodiscard]] std::span<const ReportDefinition> catalogue();
/// By "k10" or "Directory 1", without regard to case; null when there is none.
[[nodiscard]] const ReportDefinition* find_report(QStringView key_or_leaf);

/// Writes the report of the working list's people into the spool and closes it. False when it was refused, which the
/// person has been told, or cancelled; the spool then stays open. Throws core::DatabaseError and core::FileError.
[[nodiscard]] bool run_report(const ReportDefinition& report, const ReportInput& input, core::Progress& progress,
                              pages::PageSpool& spool);

} // namespace kindrel::output
