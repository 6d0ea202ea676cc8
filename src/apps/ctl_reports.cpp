#include "apps/ctl_command.h"
#include "apps/ctl_listing.h"
#include "apps/ctl_pdf.h"

#include "output/report_choices.h"

namespace kindrel::apps {

using namespace Qt::StringLiterals;

namespace {

/// By key or by name, without regard to case.
std::optional<output::ReportChoice> find_choice(const core::Office& office, const QString& name)
{
    for (auto& choice : output::report_choices(office)) {
        if (choice.key.compare(name, Qt::CaseInsensitive) == 0 || choice.leaf.compare(name, Qt::CaseInsensitive) == 0)
            return std::move(choice);
    }
    return std::nullopt;
}

} // namespace

Status run_reports(Context& context)
{
    Listing listing({{u"key"_s, u"Key"_s},
                     {u"family"_s, u"Family"_s},
                     {u"report"_s, u"Report"_s},
                     {u"description"_s, u"Content"_s}});
    for (const auto& report : output::report_choices(*context.office))
        listing.add({report.key, report.family, report.leaf, report.description});
    listing.print(context.out, context.arguments.has(u"json"_s));
    return Status::done;
}

Status run_report(Context& context)
{
    const auto order = pdf_order(context);
    if (!order)
        return Status::wrong_usage;
    const auto name = context.arguments.positional.front();
    const auto report = find_choice(*context.office, name);
    if (!report) {
        context.dialogue.show({u"There is no report \"%1\", see \"kindrelctl reports\"."_s.arg(name)});
        return Status::refused;
    }
    const auto list = people::active_families(*context.office->session);
    core::SilentProgress progress;
    pages::PageSpool spool;
    if (!report->run({*context.office, list, {.paper = order->paper}}, progress, spool))
        return Status::refused;
    return write_document(context, spool, *order, report->leaf);
}

} // namespace kindrel::apps
