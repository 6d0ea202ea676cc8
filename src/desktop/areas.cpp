#include "desktop/areas.h"

#include "desktop/output/catalogue_page.h"
#include "desktop/people/main_menu.h"

#include <array>

namespace kindrel::desktop {

namespace {

template <class P>
Page* make(Desk& desk)
{
    return new P(desk);
}

constexpr std::array areas{
    AreaDefinition{"main_menu", "Main Menu", "go-home", std::nullopt, make<MainMenu>},
    AreaDefinition{"reports", "Reports", "office-report", core::Area::report_outputs, make<CataloguePage>},
};

}

std::span<const AreaDefinition> all_areas()
{
    return areas;
}

}
