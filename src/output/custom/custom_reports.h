#pragma once

#include "output/catalogue.h"
#include "output/custom/custom_layout.h"

namespace kindrel::output {

/// A report or receipt that a church has laid out itself, or a report that came as a plug-in.
struct CustomReport
{
    QString file; ///< Its whole path.
    QString title;
    bool plugin = false;

    friend bool operator==(const CustomReport&, const CustomReport&) = default;
};

/// The "*.rpt" and "*.rpy" of the custom folder and the plug-ins, in the order of their titles.
[[nodiscard]] std::vector<CustomReport> custom_reports(const core::Office& office);

/// The "*.rct" of the custom folder, likewise.
[[nodiscard]] std::vector<CustomReport> custom_receipts(const core::Office& office);

/// As run_report(). A layout with faults is refused with all of them in one box.
[[nodiscard]] bool run_custom_report(const CustomReport& report, const ReportInput& input, core::Progress& progress,
                                     pages::PageSpool& spool);

/// The report's layout; where it has no title of its own, under that of the report.
[[nodiscard]] CustomLayout titled(CustomLayout layout, const CustomReport& report);

/// The layout of the file; nullopt after telling what is wrong with it.
[[nodiscard]] std::optional<CustomLayout> usable_layout(core::Dialogue& dialogue, const QString& file);

} // namespace kindrel::output
