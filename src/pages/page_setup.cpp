#include "pages/page_setup.h"

#include <QPageSize>

namespace kindrel::pages {

QSizeF PageSetup::size() const
{
    if (sheet)
        return *sheet;
    const auto upright = QPageSize(paper == Paper::a4 ? QPageSize::A4 : QPageSize::Letter).size(QPageSize::Point);
    return orientation == Orientation::portrait ? upright : upright.transposed();
}

} // namespace kindrel::pages
