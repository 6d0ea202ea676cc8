#include "output/reports/check_lists.h"

#include "output/list_reader.h"
#include "pages/table.h"

#include <array>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

constexpr QMarginsF margins{30, 30, 30, 30};
constexpr auto landscape = pages::Orientation::landscape;
constexpr qreal condensed = 15;
constexpr qreal large = 22;
/// Lines of the heading's height, so that a date can be written into it upright.
constexpr int heading_lines = 4;
constexpr QRgb stripe = 0xfff2f2f2;

constexpr std::array layouts{
    CheckListLayout{{.title = "Check List", .page = {.margins = margins}, .text_size = 9}, 23, 14, condensed},
    CheckListLayout{{.title = "Check List", .page = {.margins = margins}, .text_size = 9}, 11, 26, condensed},
    CheckListLayout{{.title = "Check List", .page = {.margins = margins}, .text_size = 12}, 23, 14.5, large},
    CheckListLayout{{.title = "Check List", .page = {.margins = margins}, .text_size = 12}, 11, 26, large},
    CheckListLayout{{.title = "Check List", .page = {.margins = margins, .columns = 2}}, 7, 16, condensed},
    CheckListLayout{{.title = "Check List", .page = {.margins = margins, .columns = 2}}, 3, 24, condensed},
    CheckListLayout{{.title = "Check List", .page = {.orientation = landscape, .margins = margins, .columns = 3}},
                    5,
                    18,
                    condensed},
    CheckListLayout{{.title = "Check List", .page = {.orientation = landscape, .margins = margins, .columns = 3}},
                    3,
                    22,
                    condensed},
};

std::vector<pages::TableColumn> columns_of(const CheckListLayout& list)
{
    std::vector<pages::TableColumn> columns{{.heading = QString(heading_lines - 1, u'\n') + u"Name"_s}};
    columns.insert(columns.end(), std::size_t(list.tick_spaces), pages::TableColumn{.width = list.space_width});
    return columns;
}

constexpr auto family_name = "Check Lists";

constexpr ReportDefinition check_list(const char* key, const char* leaf, const char* description,
                                      const CheckListLayout& layout)
{
    return {key, family_name, leaf, description, core::Area::report_outputs, write_check_list, &layout};
}

constexpr std::array reports{
    check_list("k30", "Check Lists 1 (Condensed)", "Names in close lines with 23 spaces to tick", layouts[0]),
    check_list("k31", "Check Lists 2 (Condensed)", "Names in close lines with 11 spaces to tick", layouts[1]),
    check_list("k32", "Check Lists 3 (Large)", "Names in large lines with 23 spaces to tick", layouts[2]),
    check_list("k33", "Check Lists 4 (Large)", "Names in large lines with 11 spaces to tick", layouts[3]),
    check_list("k34", "Check Lists 5 (Two Column)", "Two columns of names with 7 spaces to tick", layouts[4]),
    check_list("k35", "Check Lists 6 (Two Column)", "Two columns of names with 3 spaces to tick", layouts[5]),
    check_list("k36", "Check Lists 7 (Three Column)", "Landscape: three columns of names with 5 spaces to tick",
               layouts[6]),
    check_list("k37", "Check Lists 8 (Three Column)", "Landscape: three columns of names with 3 spaces to tick",
               layouts[7]),
};

} // namespace

bool write_check_list(const ReportInput& input, const void* layout, core::Progress& progress, pages::Flow& flow)
{
    const auto& list = *static_cast<const CheckListLayout*>(layout);
    pages::TableStyle style;
    style.lines = pages::TableLines::grid;
    style.row_height = list.row_height * input.options.text_percent / 100;
    style.vertical_padding = 1;
    style.vertical_align = pages::VerticalAlign::middle;
    style.stripe = stripe;
    pages::Table table(flow, columns_of(list), style);
    const auto write = [&](const ListedMember& listed) {
        table.row({listed.listed_name()});
    };
    return for_each_person(input, progress, write, {});
}

std::span<const ReportDefinition> check_list_reports()
{
    return reports;
}

} // namespace kindrel::output
