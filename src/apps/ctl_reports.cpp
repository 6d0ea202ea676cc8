#include "apps/ctl_command.h"
#include "apps/ctl_listing.h"

#include "output/report_choices.h"
#include "pages/pdf.h"

namespace kindrel::apps {

using namespace Qt::StringLiterals;

namespace {

/// Nullopt for a size that is not known.
std::optional<pages::Paper> paper_from(const QString& word)
{
    if (word == "a4"_L1)
        return pages::Paper::a4;
    return word == "letter"_L1 ? std::optional(pages::Paper::letter) : std::nullopt;
}

Status write_report(Context& context, const output::ReportChoice& report, pages::Paper paper, const QString& file)
{
    const auto list = people::active_families(*context.office->session);
    core::SilentProgress progress;
    pages::PageSpool spool;
    if (!report.run({*context.office, list, {.paper = paper}}, progress, spool))
        return Status::refused;
    const pages::PdfProperties properties{report.leaf, context.office->church_name};
    if (!pages::write_pdf(spool, file, properties))
        return Status::refused;
    context.out << u"%1: %2 pages in %3\n"_s.arg(properties.title).arg(spool.page_count()).arg(file);
    return Status::done;
}

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
    const auto name = context.arguments.positional.front();
    const auto file = context.arguments.value(u"pdf"_s);
    const auto paper = paper_from(context.arguments.value(u"paper"_s, u"a4"_s));
    if (file.isEmpty() || !paper) {
        context.dialogue.show({file.isEmpty() ? u"--pdf names the file to write."_s : u"--paper is a4 or letter."_s});
        return Status::wrong_usage;
    }
    const auto report = find_choice(*context.office, name);
    if (!report) {
        context.dialogue.show({u"There is no report \"%1\", see \"kindrelctl reports\"."_s.arg(name)});
        return Status::refused;
    }
    return write_report(context, *report, *paper, file);
}

} // namespace kindrel::apps
