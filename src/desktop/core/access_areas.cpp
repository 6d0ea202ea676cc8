#include "desktop/core/access_areas.h"

#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QCheckBox>
#include <QHBoxLayout>
#include <QLabel>

#include <algorithm>
#include <span>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using core::Area;

struct AreaGroup
{
    const char* title;
    int column;
    std::span<const Area> areas;
};

namespace {

constexpr int column_count = 2;
/// Beneath the words of a tick box rather than beneath its square.
constexpr int explanation_inset = 20;

constexpr std::array families{Area::read_only_family_data,
                              Area::add_family,
                              Area::search_for_family,
                              Area::family_file_notebook,
                              Area::visitation_notes_in_notebook,
                              Area::personal_notes_in_notebook,
                              Area::birth_dates,
                              Area::tagging,
                              Area::school_year_manager,
                              Area::visitation,
                              Area::visitation_tab,
                              Area::people_organiser,
                              Area::group_history_manager,
                              Area::legend,
                              Area::quick_date,
                              Area::fast_find};
constexpr std::array registers{Area::roll, Area::pin_financial_only, Area::full_financial, Area::weekly_statistics};
constexpr std::array service{Area::rosters, Area::wardline};
constexpr std::array output{Area::report_outputs, Area::data_analysis, Area::create_and_send_emails, Area::export_text,
                            Area::report_viewer,  Area::custom_report, Area::custom_letter};
constexpr std::array data{Area::backup_data, Area::restore_data, Area::book_in_out, Area::file_clearance};
constexpr std::array setup{Area::family_file_setup, Area::filter_fusion_setup, Area::project_setup,
                           Area::roster_setup,      Area::wardline_setup,      Area::global_data_setup,
                           Area::vision_setup,      Area::network_setup,       Area::security};

constexpr std::array groups{
    AreaGroup{"Families and People", 0, families},
    AreaGroup{"Registers and Giving", 0, registers},
    AreaGroup{"Rosters and Wardline", 1, service},
    AreaGroup{"Output", 1, output},
    AreaGroup{"Data", 1, data},
    AreaGroup{"Setup", 1, setup},
};

/// How often the groups list an area.
constexpr auto listed(Area area)
{
    std::ptrdiff_t count = 0;
    for (const AreaGroup& group : groups)
        count += std::ranges::count(group.areas, area);
    return count;
}

constexpr bool each_area_once()
{
    for (int area = 0; area < core::area_count; ++area) {
        if (listed(static_cast<Area>(area)) != 1)
            return false;
    }
    return true;
}
static_assert(each_area_once());

struct Explanation
{
    Area area;
    const char* words;
};

/// Areas that take away when they are ticked.
constexpr std::array explanations{
    Explanation{Area::read_only_family_data, "A restriction: families are shown, and nothing in them can be altered."},
    Explanation{Area::pin_financial_only,
                "A restriction: gifts are entered by P.I.N., the rest of the finances stays closed."},
};

QLabel* make_explanation(const Explanation& explanation)
{
    auto* words = new QLabel(QString::fromLatin1(explanation.words));
    words->setTextFormat(Qt::PlainText);
    words->setWordWrap(true);
    words->setContentsMargins(explanation_inset, 0, 0, space::field / 2);
    dress(*words, TextSize::secondary);
    return words;
}

} // namespace

AccessAreas::AccessAreas(QWidget* parent) : QWidget(parent)
{
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::group);
    for (int place = 0; place < column_count; ++place) {
        auto* column = new QVBoxLayout;
        column->setSpacing(space::margin);
        for (const AreaGroup& group : groups) {
            if (group.column == place)
                column->addLayout(make_group(group));
        }
        column->addStretch(1);
        row->addLayout(column, 1);
    }
}

QVBoxLayout* AccessAreas::make_group(const AreaGroup& group)
{
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field / 4);
    auto* heading = new QLabel(QString::fromLatin1(group.title));
    QFont bold = heading->font();
    bold.setBold(true);
    heading->setFont(bold);
    column->addWidget(heading);
    for (const Area area : group.areas)
        add_area(*column, area);
    return column;
}

void AccessAreas::add_area(QVBoxLayout& column, Area area)
{
    auto* box = new QCheckBox(core::area_name(area).toString());
    box->setObjectName(box->text());
    connect(box, &QCheckBox::clicked, this, [this, area](bool granted) { Q_EMIT ticked(area, granted); });
    column.addWidget(box);
    m_boxes[static_cast<std::size_t>(area)] = box;
    const auto* explanation = std::ranges::find(explanations, area, &Explanation::area);
    if (explanation == explanations.end())
        return;
    QLabel* words = make_explanation(*explanation);
    box->setAccessibleDescription(words->text());
    column.addWidget(words);
}

void AccessAreas::show_rights(const core::Rights& rights)
{
    for (int area = 0; area < core::area_count; ++area)
        box(static_cast<Area>(area)).setChecked(rights.may(static_cast<Area>(area)));
}

} // namespace kindrel::desktop
