#include "output/catalogue.h"

#include "core/entry.h"
#include "output/decoration.h"
#include "output/labels/labels.h"
#include "output/reports/barcode_reports.h"
#include "output/reports/check_lists.h"
#include "output/reports/directory.h"
#include "output/reports/family_data_reports.h"
#include "output/reports/group_history_reports.h"
#include "output/reports/group_reports.h"
#include "output/reports/miscellaneous.h"
#include "output/reports/names_report.h"
#include "output/reports/photo_albums.h"
#include "output/reports/sign_in_sheets.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <vector>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

/// The families in the order of the tree.
constexpr std::array families{
    directory_reports,     check_list_reports,  sign_in_reports,          label_reports,
    family_data_reports,   all_group_reports,   individual_group_reports, group_history_reports,
    miscellaneous_reports, photo_album_reports, barcode_reports,          names_reports,
};

std::vector<ReportDefinition> all_reports()
{
    std::vector<ReportDefinition> reports;
    for (const auto& family : families)
        std::ranges::copy(family(), std::back_inserter(reports));
    return reports;
}

const ReportLayout& layout_of(const ReportDefinition& report)
{
    return *static_cast<const ReportLayout*>(report.layout);
}

pages::PageSetup page_of(const ReportDefinition& report, const ReportInput& input)
{
    if (report.page)
        return report.page(input);
    auto setup = layout_of(report).page;
    setup.paper = input.options.paper;
    return setup;
}

bool is_called(const ReportDefinition& report, QStringView name)
{
    return name.compare(QLatin1StringView(report.key), Qt::CaseInsensitive) == 0 ||
           name.compare(QLatin1StringView(report.leaf), Qt::CaseInsensitive) == 0;
}

/// Everything that can be refused before the first page.
bool may_run(const ReportDefinition& report, const ReportInput& input)
{
    if (!core::permitted(input.office, report.area) || (report.also && !core::permitted(input.office, *report.also)))
        return false;
    if (input.list.members.empty())
        input.office.dialogue.show({u"No people found for creating a report"_s});
    return !input.list.members.empty();
}

} // namespace

std::span<const ReportDefinition> catalogue()
{
    static const auto reports = all_reports();
    return reports;
}

const ReportDefinition* find_report(QStringView key_or_leaf)
{
    const auto reports = catalogue();
    const auto found =
        std::ranges::find_if(reports, [&](const auto& report) { return is_called(report, key_or_leaf); });
    return found == reports.end() ? nullptr : &*found;
}

bool run_report(const ReportDefinition& report, const ReportInput& input, core::Progress& progress,
                pages::PageSpool& spool)
{
    if (!may_run(report, input))
        return false;
    const auto& layout = layout_of(report);
    const auto& options = input.options;
    const double text_size = layout.text_size * options.text_percent / 100;
    pages::Flow flow(spool, page_of(report, input), pages::TypeScale::around({.size = text_size}));
    if (layout.decorated)
        decorate(flow, options.title.isEmpty() ? QString::fromUtf8(layout.title) : options.title, input,
                 {.header = {}, .footer = {}, .layout = QString::fromUtf8(report.leaf)});
    if (!report.write(input, report.layout, progress, flow))
        return false;
    flow.finish();
    return true;
}

} // namespace kindrel::output
