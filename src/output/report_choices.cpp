#include "output/report_choices.h"

#include "core/files.h"
#include "output/custom/custom_reports.h"
#include "output/custom/custom_run.h"
#include "output/labels/labels.h"
#include "output/letters/letter_run.h"

#include <QFileInfo>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

/// More people than any report has on a page, with families of several on a sheet of small labels.
constexpr std::size_t sample_size = 400;

/// Ends a run once its first page is there.
class UntilFirstPage : public core::SilentProgress
{
public:
    explicit UntilFirstPage(const pages::PageSpool& spool) : m_spool(spool) {}
    [[nodiscard]] bool step(const QString& = {}) override { return m_spool.page_count() == 0; }

private:
    const pages::PageSpool& m_spool;
};

void add_catalogue(std::vector<ReportChoice>& choices)
{
    for (const auto& report : catalogue())
        choices.push_back({QString::fromUtf8(report.key), QString::fromUtf8(report.family),
                           QString::fromUtf8(report.leaf), QString::fromUtf8(report.description),
                           [&report](const ReportInput& input, core::Progress& progress, pages::PageSpool& spool) {
                               return run_report(report, input, progress, spool);
                           },
                           [&report](const core::Office& office) {
                               return office.may(report.area) && (!report.also || office.may(*report.also)) &&
                                      (!report.printable || report.printable(office));
                           },
                           label_drawing(report)});
}

/// The report's layout when it can be run; says nothing.
std::optional<CustomLayout> sound_layout(const CustomReport& report)
{
    try {
        auto parsed = load_layout(report.file);
        const bool sound = parsed.faults.empty() && parsed.layout.kind != LayoutKind::receipts;
        return sound ? std::optional(titled(std::move(parsed.layout), report)) : std::nullopt;
    } catch (const core::FileError&) {
        return std::nullopt;
    }
}

bool may_print(const core::Office& office)
{
    return office.may(core::Area::report_outputs);
}

void add_custom_reports(std::vector<ReportChoice>& choices, const core::Office& office)
{
    for (const auto& report : custom_reports(office)) {
        const auto name = QFileInfo(report.file).fileName();
        choices.push_back({(report.plugin ? u"plugin report/"_s : u"custom report/"_s) + name,
                           QString::fromLatin1(own_families[0]),
                           report.plugin ? report.title + u" (Plugin Reports)"_s : report.title,
                           report.plugin ? u"Run a plugin custom report"_s
                                         : u"Run a custom report made within "_s + core::product.toString(),
                           [report](const ReportInput& input, core::Progress& progress, pages::PageSpool& spool) {
                               return run_custom_report(report, input, progress, spool);
                           },
                           [report](const core::Office& run_by) { return may_print(run_by) && sound_layout(report); },
                           [report](const ReportInput& input, core::Progress& progress, pages::PageSpool& spool) {
                               const auto sound = may_print(input.office) ? sound_layout(report) : std::nullopt;
                               return sound && write_custom_report(*sound, input, progress, spool);
                           }});
    }
}

/// The letter when it can be run; says nothing.
std::optional<LetterForm> sound_letter(const QString& file)
{
    try {
        const auto read = load_letter(file);
        LetterForm letter(read.letter);
        return read.fault.isEmpty() && !letter.fault() ? std::optional(std::move(letter)) : std::nullopt;
    } catch (const core::FileError&) {
        return std::nullopt;
    }
}

void add_custom_letters(std::vector<ReportChoice>& choices, const core::Office& office)
{
    for (const auto& letter : custom_letters(office)) {
        const auto& file = letter.file;
        choices.push_back(
            {(letter.plugin ? u"plugin letter/"_s : u"letter/"_s) + QFileInfo(file).fileName(),
             QString::fromLatin1(own_families[1]), letter.plugin ? letter.title + u" (Plugin Letters)"_s : letter.title,
             letter.plugin ? u"Run a plugin custom letter"_s
                           : u"Run a report using a custom letter made within "_s + core::product.toString(),
             [file](const ReportInput& input, core::Progress& progress, pages::PageSpool& spool) {
                 return run_letter(file, input, progress, spool);
             },
             [file](const core::Office& run_by) { return may_print(run_by) && sound_letter(file); },
             [file](const ReportInput& input, core::Progress& progress, pages::PageSpool& spool) {
                 const auto sound = may_print(input.office) ? sound_letter(file) : std::nullopt;
                 return sound && write_letter(*sound, input, progress, spool);
             },
             letters_printed()});
    }
}

} // namespace

std::vector<ReportChoice> report_choices(const core::Office& office)
{
    std::vector<ReportChoice> choices;
    add_catalogue(choices);
    add_custom_reports(choices, office);
    add_custom_letters(choices, office);
    return choices;
}

std::optional<pages::Page> first_page(const ReportChoice& report, const ReportInput& input)
{
    people::WorkingList sample{input.list.members, input.list.criteria};
    // What draws itself looks itself whether it can.
    if (sample.members.empty() || (!report.draw && !(report.ready && report.ready(input.office))))
        return std::nullopt;
    sample.members.resize(std::min(sample.members.size(), sample_size));
    pages::PageSpool spool;
    UntilFirstPage progress(spool);
    const auto& write = report.draw ? report.draw : report.run;
    static_cast<void>(write({input.office, sample, input.options}, progress, spool));
    return spool.page_count() > 0 ? std::optional(spool.page(1)) : std::nullopt;
}

} // namespace kindrel::output
