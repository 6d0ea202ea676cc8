#include "output/catalogue.h"

#include "core/entry.h"
#include "output/decoration.h"
#include "output/directory.h"

#include <algorithm>
#include <array>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

constexpr auto directories = "Church Directories";

constexpr std::array reports{
    ReportDefinition{"k10", directories, "Directory 1",
                     "One column: names, address, phone, fax, e-mail and map details", core::Area::report_outputs,
                     write_directory, &directory_layouts[0]},
};

const ReportLayout& layout_of(const ReportDefinition& report)
{
    return *static_cast<const ReportLayout*>(report.layout);
}

bool is_called(const ReportDefinition& report, QStringView name)
{
    return name.compare(QLatin1StringView(report.key), Qt::CaseInsensitive) == 0 ||
           name.compare(QLatin1StringView(report.leaf), Qt::CaseInsensitive) == 0;
}

/// Everything that can be refused before the first page.
bool may_run(const ReportDefinition& report, const ReportInput& input)
{
    if (!core::permitted(input.office, report.area))
        return false;
    if (input.list.members.empty())
        input.office.dialogue.show({u"No people found for creating a report"_s});
    return !input.list.members.empty();
}

} // namespace

std::span<const ReportDefinition> catalogue()
{
    return reports;
}

const ReportDefinition* find_report(QStringView key_or_leaf)
{
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
    auto setup = layout.page;
    const auto& options = input.options;
    setup.paper = options.paper;
    const double text_size = layout.text_size * options.text_percent / 100;
    pages::Flow flow(spool, setup, pages::TypeScale::around({.size = text_size}));
    decorate(flow, options.title.isEmpty() ? QString::fromUtf8(layout.title) : options.title, input);
    if (!report.write(input, report.layout, progress, flow))
        return false;
    flow.finish();
    return true;
}

} // namespace kindrel::output
