#include "desktop/shell/mode_words.h"

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

QString mode_words(const core::Office& office)
{
    switch (office.mode) {
    case core::Mode::training:
        return u"Training Mode"_s;
    case core::Mode::booked_out:
        return u"Remote Access Mode"_s;
    case core::Mode::network:
        return u"Network Mode"_s;
    case core::Mode::normal:
        break;
    }
    return u"This workstation"_s;
}

} // namespace kindrel::desktop
