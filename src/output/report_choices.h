#pragma once

#include "output/catalogue.h"
#include "pages/page.h"

#include <array>
#include <functional>
#include <optional>

namespace kindrel::output {

/// A leaf of the report tree, whether the program brought it or the church: the catalogue's reports, and what lies in
/// the folders of custom and plug-in layouts and letters. Leaves of one family follow each other.
struct ReportChoice
{
    using Write = std::function<bool(const ReportInput&, core::Progress&, pages::PageSpool&)>;

    QString key; ///< The same as long as its file keeps its name.
    QString family, leaf, description;
    /// As run_report().
    Write run;
    /// Whether nothing stands in the way of a run: it would say nothing.
    std::function<bool(const core::Office&)> ready;
    /// The pages alone, without the locks and the boxes of a run: false where something stands in its way. Empty where
    /// a run that is ready has neither.
    Write draw = {};
    QString printed = {}; ///< Said when it has been printed; empty: nothing of its own.
};

/// The families of what the church brings itself. They stand in the tree even while they are empty.
inline constexpr std::array own_families{"Custom Reports", "Custom Letters"};

/// All of them, as the folders are now.
[[nodiscard]] std::vector<ReportChoice> report_choices(const core::Office& office);

/// Writes the first page of the report over the beginning of the list, for a picture of its layout. Nullopt when there
/// is nothing to show; it never says anything. Throws core::DatabaseError and core::FileError.
[[nodiscard]] std::optional<pages::Page> first_page(const ReportChoice& report, const ReportInput& input);

} // namespace kindrel::output
