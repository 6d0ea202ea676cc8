#include "output/reports/barcode_place.h"

#include "pages/barcode.h"

namespace kindrel::output {

using namespace Qt::StringLiterals;

QString barcode_content(int person_id)
{
    return QString::number(person_id) + u'$';
}

qreal barcode_width(const QString& content, qreal module)
{
    return qreal(pages::code128(content).size() + 2 * pages::quiet_modules) * module;
}

void write_barcode(pages::Writer& place, int person_id, qreal height, pages::Align align)
{
    const auto content = barcode_content(person_id);
    place.barcode(content, {std::min(barcode_width(content), place.width()), height}, align);
}

} // namespace kindrel::output
