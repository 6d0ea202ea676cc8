#include "output/permission.h"

namespace kindrel::output {

using namespace Qt::StringLiterals;

bool permitted(core::Office& office, core::Area area)
{
    if (office.may(area))
        return true;
    office.dialogue.show({u"Your password does not give access to \"%1\""_s.arg(core::area_name(area))});
    return false;
}

} // namespace kindrel::output
