#include "desktop/areas.h"

#include "desktop/core/network_page.h"
#include "desktop/core/security_page.h"
#include "desktop/output/catalogue_page.h"
#include "desktop/people/main_menu.h"
#include "desktop/people/setup_page.h"

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
    AreaDefinition{"main_menu", "Main Menu", "go-home", std::nullopt, make<MainMenu>},
    AreaDefinition{"reports", "Reports", "office-report", core::Area::report_outputs, make<CataloguePage>},
    AreaDefinition{"setup", "Setup", "settings-configure", core::Area::family_file_setup, enter<SetupPage>},
    AreaDefinition{"security", "Security", "object-locked", core::Area::security, enter<SecurityPage>},
    AreaDefinition{"network", "Network", "network-workgroup", core::Area::network_setup, enter<NetworkPage>},
};

} // namespace

std::span<const AreaDefinition> all_areas()
{
    return areas;
}

} // namespace kindrel::desktop
