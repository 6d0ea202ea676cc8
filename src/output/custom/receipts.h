#pragma once

#include "output/custom/custom_fields.h"
#include "output/custom/custom_reports.h"

namespace kindrel::output {

/// One person and what they gave. Names, address and P.I.N. come from the register, as far as they may be shown.
struct ReceiptGiver
{
    people::Member giver;
    ReceiptFacts facts;
};

/// Writes a receipt of custom_receipts() in the order of the givers and closes the spool. False when it was refused,
/// which the person has been told, or cancelled. Whoever gave and is no longer in the register gets none. The caller
/// answers for the right to see what was given. Throws core::DatabaseError and core::FileError.
[[nodiscard]] bool run_receipts(core::Office& office, const CustomReport& receipt, std::span<const ReceiptGiver> givers,
                                const RunOptions& options, core::Progress& progress, pages::PageSpool& spool);

} // namespace kindrel::output
