#include "desktop/areas.h"

#include "desktop/core/network_page.h"
#include "desktop/core/security_page.h"
#include "desktop/output/catalogue_page.h"
#include "desktop/people/editor_page.h"
#include "desktop/people/filters_page.h"
#include "desktop/people/fusion_page.h"
#include "desktop/people/main_menu.h"
#include "desktop/people/search_page.h"
#include "desktop/people/setup_page.h"
#include "desktop/people/tagging_page.h"

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
    AreaDefinition{"setup", "Setup", "settings-configure", core::AreaId::family_setup, Parked::leave_first,
                   enter<SetupPage>},
    AreaDefinition{"fusions", "Fusions", "merge", core::AreaId::fusions, Parked::stay, enter<FusionPage>},
    AreaDefinition{"security", "Security", "object-locked", core::AreaId::security, Parked::leave_first,
                   enter<SecurityPage>},
    AreaDefinition{"network", "Network", "network-workgroup", core::AreaId::network_setup, Parked::leave_first,
                   enter<NetworkPage>},
};

} // namespace

std::span<const AreaDefinition> all_areas()
{
    return areas;
}

} // namespace kindrel::desktop
