#include "pages/block.h"

namespace kindrel::pages {

qreal height_of(const Blocks& blocks)
{
    qreal height = 0;
    for (const auto& block : blocks)
        height += block.height;
    return height;
}

} // namespace kindrel::pages
