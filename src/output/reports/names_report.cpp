#include "output/reports/names_report.h"

#include "output/list_reader.h"
#include "output/report_layout.h"

#include <array>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

constexpr ReportLayout layout{
    .title = "Names Report", .page = {.columns = 3, .column_rule = pages::ColumnRule::hairline}, .text_size = 9.5};

// Points.
constexpr qreal line_distance = 3;
constexpr qreal hanging_indent = 12;

bool write_names(const ReportInput& input, const void*, core::Progress& progress, pages::Flow& flow)
{
    const auto& body = flow.type().body;
    const pages::ParagraphStyle look{.indent = hanging_indent, .first_indent = -hanging_indent, .after = line_distance};
    const auto write = [&](const ListedMember& listed) {
        const pages::Keep together(flow);
        const auto given = listed.listed_name().sliced(listed.surname().size());
        flow.paragraph({{listed.surname(), body.bolder()}, {given, body}}, look);
    };
    return for_each_person(input, progress, write, {});
}

constexpr std::array reports{
    ReportDefinition{"k150", "Names Report", "Names Report", "A report of peoples names only",
                     core::Area::report_outputs, write_names, &layout},
};

} // namespace

std::span<const ReportDefinition> names_reports()
{
    return reports;
}

} // namespace kindrel::output
