#include "desktop/areas.h"

#include "desktop/backup/backup_page.h"
#include "desktop/backup/restore_page.h"
#include "desktop/core/global_variables_page.h"
#include "desktop/core/network_page.h"
#include "desktop/core/security_page.h"
#include "desktop/core/vision_page.h"
#include "desktop/output/catalogue_page.h"
#include "desktop/output/label_setup_page.h"
#include "desktop/people/editor_page.h"
#include "desktop/people/filters_page.h"
#include "desktop/people/fusion_page.h"
#include "desktop/people/main_menu.h"
#include "desktop/people/search_page.h"
#include "desktop/people/setup_page.h"
#include "desktop/people/tagging_page.h"
#include "desktop/registers/project_setup_page.h"
#include "desktop/registers/weekly_page.h"

#include <array>

namespace kindrel::desktop {

namespace {

template <class P>
Page* make(Desk& desk)
{
    return new P(desk);
}

/// Null where the page may not be entered, which it has told.
template <class P>
Page* enter(Desk& desk)
{
    return P::open(desk);
}

constexpr std::array areas{
    AreaDefinition{"main_menu", "Main Menu", "go-home", std::nullopt, Parked::stay, make<MainMenu>},
    AreaDefinition{"editor", "Family Editor", "user-identity", core::AreaId::family_editor, Parked::setups_leave,
                   enter<EditorPage>},
    AreaDefinition{"search", "Search", "edit-find", core::AreaId::search, Parked::stay, enter<SearchPage>},
    AreaDefinition{"filters", "Filters", "view-filter", core::AreaId::search, Parked::stay, make<FiltersPage>},
    AreaDefinition{"tagging", "Tagging", "tag", core::AreaId::tagging, Parked::setups_leave, enter<TaggingPage>},
    AreaDefinition{"reports", "Reports", "office-report", core::AreaId::reports, Parked::stay, make<CataloguePage>},
    AreaDefinition{"weekly", "Weekly", "office-chart-bar", core::AreaId::weekly, Parked::setups_leave,
                   enter<WeeklyPage>},
    AreaDefinition{"setup", "Setup", "settings-configure", core::AreaId::family_setup, Parked::leave_first,
                   enter<SetupPage>},
    AreaDefinition{"fusions", "Fusions", "merge", core::AreaId::fusions, Parked::stay, enter<FusionPage>},
    AreaDefinition{"setup_projects", "Project Setup", "project-development", core::AreaId::project_setup,
                   Parked::leave_first, enter<ProjectSetupPage>},
    AreaDefinition{"security", "Security", "object-locked", core::AreaId::security, Parked::leave_first,
                   enter<SecurityPage>},
    AreaDefinition{"network", "Network", "network-workgroup", core::AreaId::network_setup, Parked::leave_first,
                   enter<NetworkPage>},
    AreaDefinition{"labels", "Labels", "view-list-icons", core::AreaId::reports, Parked::stay, enter<LabelSetupPage>},
    AreaDefinition{"vision", "Vision", "flag", core::AreaId::vision_setup, Parked::leave_first, enter<VisionPage>},
    AreaDefinition{"global_data", "Global Data", "globe", core::AreaId::global_data, Parked::leave_first,
                   enter<GlobalVariablesPage>},
    AreaDefinition{"backup", "Backup", "backup", core::AreaId::backup, Parked::leave_first, enter<BackupPage>},
    AreaDefinition{"restore", "Restore", "document-revert", core::AreaId::restore, Parked::leave_first,
                   enter<RestorePage>},
};

} // namespace

std::span<const AreaDefinition> all_areas()
{
    return areas;
}

} // namespace kindrel::desktop
