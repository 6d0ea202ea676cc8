#include "apps/ctl_pdf.h"

#include "core/day_refusal.h"
#include "registers/projects.h"
#include "registers/weekly_reports.h"

#include <algorithm>

namespace kindrel::apps {

using namespace Qt::StringLiterals;
using registers::PeriodKind;
using registers::ReportPeriod;

namespace {

bool same(const QString& one, const QString& other)
{
    return one.compare(other, Qt::CaseInsensitive) == 0;
}

/// By name or by title; a title that stands for two reports means the first.
const registers::WeeklyReport* find_report(const QString& name)
{
    if (const auto* report = registers::find_weekly_report(name))
        return report;
    const auto reports = registers::weekly_reports();
    const auto found =
        std::ranges::find_if(reports, [&](const auto& report) { return same(name, QString::fromUtf8(report.title)); });
    return found == reports.end() ? nullptr : &*found;
}

QString report_names()
{
    QString names;
    for (const auto& report : registers::weekly_reports())
        names += u"%1 (%2)\n"_s.arg(QString::fromLatin1(report.name), QString::fromUtf8(report.title));
    return names.trimmed();
}

QString style_names()
{
    QStringList names;
    for (const auto& style : pages::chart_styles())
        names += QString::fromLatin1(style.name);
    return u"The styles are: %1."_s.arg(names.join(u", "_s));
}

/// The one that is named, or the only one; 0 when none is chosen. Nullopt, after saying why, when it is not there.
std::optional<int> find_project(Context& context)
{
    const auto projects =
        registers::read_projects(*context.office->session, registers::register_kind(registers::Kind::weekly));
    if (projects.empty() || !context.arguments.has(u"project"_s))
        return projects.size() == 1 ? projects.front().key : 0;
    const auto name = context.arguments.value(u"project"_s);
    const auto found = std::ranges::find_if(projects, [&](const auto& project) { return same(project.name, name); });
    if (found != projects.end())
        return found->key;
    context.dialogue.show({u"There is no weekly project \"%1\"."_s.arg(name)});
    return {};
}

/// Those that are named, or all; none without a project. Nullopt, after saying why, when one is not there.
std::optional<std::vector<int>> find_categories(Context& context, int project)
{
    if (project == 0)
        return std::vector<int>();
    const auto categories = registers::read_categories(*context.office->session, project);
    std::vector<int> keys;
    for (const auto& name : context.arguments.values(u"category"_s)) {
        const auto found = std::ranges::find_if(categories, [&](const auto& each) { return same(each.name, name); });
        if (found == categories.end()) {
            context.dialogue.show({u"The project has no category \"%1\"."_s.arg(name)});
            return {};
        }
        keys.push_back(found->key);
    }
    if (keys.empty())
        std::ranges::transform(categories, std::back_inserter(keys), &registers::Category::key);
    return keys;
}

/// Nullopt, after saying why, when a day cannot be read.
std::optional<registers::PeriodChoice> read_days(Context& context)
{
    registers::PeriodChoice choice;
    for (const auto& [name, day] : {std::pair{u"from"_s, &choice.from}, std::pair{u"to"_s, &choice.to}}) {
        if (!context.arguments.has(name))
            continue;
        const auto order = context.office->day_order();
        const auto typed = context.arguments.value(name);
        *day = core::parse_date(typed, order, context.office->clock.today());
        if (!*day) {
            context.dialogue.show(core::day_refusal(typed, order));
            return {};
        }
    }
    return choice;
}

bool of_several_years(ReportPeriod period)
{
    return period == ReportPeriod::years || period == ReportPeriod::two_years;
}

/// Why the report cannot be of what is given: not one period of its kind, or a chart where it has none. Empty when it
/// can.
QString usage_fault(const Arguments& typed, const registers::WeeklyReport& report)
{
    const bool year = typed.has(u"year"_s), financial = typed.has(u"financial-year"_s);
    const bool ends = typed.has(u"from"_s) || typed.has(u"to"_s);
    const auto title = QString::fromUtf8(report.title);
    if (int(year) + int(financial) + int(ends) > 1)
        return u"A report is of one period: --year, --financial-year, or --from and --to."_s;
    if (ends && report.period == ReportPeriod::one_year)
        return u"\"%1\" is a report of one year: --year or --financial-year."_s.arg(title);
    if ((year || financial) && of_several_years(report.period))
        return u"\"%1\" is a report of several years: --from and --to."_s.arg(title);
    if (typed.has(u"chart"_s) && report.charts == registers::ReportCharts::none)
        return u"\"%1\" is a report without charts."_s.arg(title);
    return {};
}

std::optional<registers::PeriodChoice> read_choice(Context& context, ReportPeriod period)
{
    const auto& typed = context.arguments;
    const bool financial = typed.has(u"financial-year"_s);
    if (of_several_years(period))
        return registers::PeriodChoice{
            .kind = PeriodKind::year_span, .year = typed.value(u"from"_s), .to_year = typed.value(u"to"_s)};
    if (period == ReportPeriod::any_days && !financial && !typed.has(u"year"_s))
        return read_days(context);
    return registers::PeriodChoice{.kind = financial ? PeriodKind::financial_year : PeriodKind::calendar_year,
                                   .year = typed.value(financial ? u"financial-year"_s : u"year"_s)};
}

/// Nullopt, after saying why, when the arguments do not name what is there.
std::optional<registers::WeeklyReportRequest> read_request(Context& context, const registers::WeeklyReport& report)
{
    const auto project = find_project(context);
    auto categories = project ? find_categories(context, *project) : std::nullopt;
    const auto period = categories ? read_choice(context, report.period) : std::nullopt;
    if (!period)
        return {};
    const bool required = report.charts == registers::ReportCharts::required;
    const auto* first_style = pages::chart_styles().front().name;
    const auto style = context.arguments.value(u"chart"_s, required ? QString::fromLatin1(first_style) : QString());
    const auto* chart = pages::find_chart_style(style);
    if (!chart && !style.isEmpty()) {
        context.dialogue.show({u"There is no chart style \"%1\"."_s.arg(style), style_names()});
        return {};
    }
    return registers::WeeklyReportRequest{
        .project = *project, .report = &report, .categories = *categories, .period = *period, .chart = chart};
}

} // namespace

Status run_weekly_report(Context& context)
{
    const auto order = pdf_order(context);
    if (!order)
        return Status::wrong_usage;
    const auto name = context.arguments.positional.front();
    const auto* report = find_report(name);
    if (!report) {
        context.dialogue.show({u"There is no report of weekly statistics \"%1\"."_s.arg(name), report_names()});
        return Status::refused;
    }
    if (const auto fault = usage_fault(context.arguments, *report); !fault.isEmpty()) {
        context.dialogue.show({fault});
        return Status::wrong_usage;
    }
    const auto request = read_request(context, *report);
    registers::ReportCheck check{context.dialogue};
    const auto plan = request ? registers::plan_weekly_report(*context.office, *request, check) : std::nullopt;
    core::SilentProgress progress;
    pages::PageSpool spool;
    if (!plan || !registers::write_weekly_report(*context.office, *plan, order->paper, progress, spool))
        return Status::refused;
    return write_document(context, spool, *order, QString::fromUtf8(report->title));
}

} // namespace kindrel::apps
