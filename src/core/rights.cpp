#include "core/rights.h"

#include <array>

namespace kindrel::core {

namespace {

constexpr std::array<QStringView, area_count> names{
    u"Read Only Access on Family Data",
    u"Add Family",
    u"Search for Family",
    u"Family File Notebook",
    u"Visitation Notes in Family Notebook",
    u"Personal Notes in Family Notebook",
    u"Birth Dates Access",
    u"Roll",
    u"P.I.N. Financial Access Only",
    u"Full Financial Access",
    u"Weekly Statistics",
    u"Rosters",
    u"Wardline",
    u"Report Outputs",
    u"Data Analysis",
    u"Create and Send Emails",
    u"Tagging",
    u"School Year Manager",
    u"Kindrel Visitation",
    u"Visitation Tab on family file",
    u"People Organiser",
    u"Group History Manager",
    u"Export",
    u"Report Viewer",
    u"Custom Report",
    u"Custom Letter",
    u"Backup Data",
    u"Restore Data",
    u"Book In / Out Family Files",
    u"File Clearance",
    u"Legend",
    u"QuickDate",
    u"Fast Find",
    u"Family File Setup",
    u"Filter Fusion Setup",
    u"Roll/Finance/Weekly Setup",
    u"Roster Setup",
    u"Wardline Setup",
    u"Global Data Setup",
    u"Vision Setup",
    u"Network Setup",
    u"Security",
};

/// Granting one of these takes something away: it stands in place of a wider right.
constexpr std::array restrictions{Area::read_only_family_data, Area::pin_financial_only};

} // namespace

QStringView area_name(Area area)
{
    return names[static_cast<std::size_t>(area)];
}

Rights Rights::all()
{
    Rights rights;
    rights.m_granted.set();
    for (const Area restriction : restrictions)
        rights.set(restriction, false);
    return rights;
}

} // namespace kindrel::core
