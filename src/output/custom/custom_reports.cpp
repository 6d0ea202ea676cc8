#include "output/custom/custom_reports.h"

#include "core/entry.h"
#include "core/files.h"
#include "output/custom/custom_run.h"
#include "people/sort_key.h"

#include <QDir>
#include <QFileInfo>

#include <algorithm>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

/// The layout's own title, or the file's name where it has none or cannot be read.
QString title_of(const QString& file)
{
    const auto name = QFileInfo(file).completeBaseName();
    try {
        const auto title = load_layout(file).layout.title;
        return title.isEmpty() ? name : title;
    } catch (const core::FileError&) {
        return name;
    }
}

std::vector<CustomReport> own_layouts(const core::Office& office, const QStringList& patterns)
{
    std::vector<CustomReport> layouts;
    const auto folder = office.paths.folder(core::Folder::custom);
    for (const auto& file : QDir(folder).entryList(patterns, QDir::Files, QDir::Name))
        layouts.push_back({folder + file, title_of(folder + file)});
    return layouts;
}

void sort(std::vector<CustomReport>& reports)
{
    std::ranges::stable_sort(reports, {}, [](const auto& report) { return people::sort_key(report.title); });
}

bool is_report(const core::Plugin& plugin)
{
    return !plugin.file.endsWith(u".sub", Qt::CaseInsensitive);
}

QString shown(const std::vector<LayoutFault>& faults)
{
    constexpr qsizetype most = 40; // A box must fit on the screen.
    QStringList lines;
    for (const auto& fault : faults) {
        if (lines.size() == most) {
            lines += u"… and %1 more."_s.arg(qsizetype(faults.size()) - most);
            break;
        }
        lines += fault.shown();
    }
    return lines.join(u'\n');
}

} // namespace

std::vector<CustomReport> custom_reports(const core::Office& office)
{
    auto reports = own_layouts(office, {u"*.rpt"_s, u"*.rpy"_s});
    for (const auto& plugin : office.plugins.reports) {
        if (is_report(plugin))
            reports.push_back({office.paths.file(core::Folder::plugin_reports, plugin.file), plugin.title, true});
    }
    sort(reports);
    return reports;
}

std::vector<CustomReport> custom_receipts(const core::Office& office)
{
    auto receipts = own_layouts(office, {u"*.rct"_s});
    sort(receipts);
    return receipts;
}

CustomLayout titled(CustomLayout layout, const CustomReport& report)
{
    if (layout.title.isEmpty())
        layout.title = report.title;
    return layout;
}

std::optional<CustomLayout> usable_layout(core::Dialogue& dialogue, const QString& file)
{
    auto parsed = load_layout(file);
    if (parsed.faults.empty())
        return std::move(parsed.layout);
    dialogue.show({u"The layout \"%1\" cannot be used until this is put right:"_s.arg(QFileInfo(file).fileName()),
                   shown(parsed.faults)});
    return std::nullopt;
}

bool run_custom_report(const CustomReport& report, const ReportInput& input, core::Progress& progress,
                       pages::PageSpool& spool)
{
    auto& dialogue = input.office.dialogue;
    if (!core::permitted(input.office, core::Area::report_outputs))
        return false;
    if (input.list.members.empty()) {
        dialogue.show({u"No people found for creating a report"_s});
        return false;
    }
    auto layout = usable_layout(dialogue, report.file);
    if (!layout)
        return false;
    if (layout->kind == LayoutKind::receipts) {
        dialogue.show({u"\"%1\" is a receipt. Receipts are made from what people gave."_s.arg(report.title)});
        return false;
    }
    return write_custom_report(titled(std::move(*layout), report), input, progress, spool);
}

} // namespace kindrel::output
