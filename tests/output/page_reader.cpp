#include "output/page_reader.h"

#include "pages/barcode.h"
#include "pages/painter.h"

#include <algorithm>
#include <cmath>
#include <zbar.h>

namespace kindrel::test {

namespace {

constexpr qreal dots = 300 / 72.0; ///< To the point.

/// As one text's bars are drawn; table lines are grey.
bool is_barcode(const pages::RectsItem& item)
{
    return item.fill == pages::ink::black && item.rects.size() > 12;
}

QRectF with_quiet_zones(const std::vector<QRectF>& bars)
{
    const auto module = std::ranges::min_element(bars, {}, &QRectF::width)->width();
    const auto quiet = module * pages::quiet_modules;
    return QRectF(bars.front().topLeft(), bars.back().bottomRight()).adjusted(-quiet, 0, quiet, 0);
}

QImage printed(const pages::Page& page)
{
    QImage image((page.size * dots).toSize(), QImage::Format_Grayscale8);
    image.fill(Qt::white);
    QPainter painter(&image);
    painter.scale(dots, dots);
    pages::PagePainter().paint(painter, page, 1);
    return image;
}

QString scanned(const QImage& image, const QRectF& part)
{
    const auto cut = image.copy(QRectF(part.topLeft() * dots, part.size() * dots).toAlignedRect());
    zbar::ImageScanner scanner;
    zbar::Image picture(uint(cut.bytesPerLine()), uint(cut.height()), "Y800", cut.constBits(),
                        ulong(cut.sizeInBytes()));
    if (scanner.scan(picture) != 1)
        return {};
    return QString::fromStdString(picture.symbol_begin()->get_data());
}

} // namespace

std::vector<QRectF> barcodes_of(const pages::Page& page)
{
    std::vector<QRectF> places;
    for (const auto& item : page.items) {
        if (const auto* rects = std::get_if<pages::RectsItem>(&item); rects && is_barcode(*rects))
            places.push_back(with_quiet_zones(rects->rects));
    }
    return places;
}

QString scanned(const pages::Page& page, const QRectF& part)
{
    return scanned(printed(page), part);
}

QStringList scanned(const pages::Page& page)
{
    QStringList codes;
    const auto image = printed(page);
    for (const auto& place : barcodes_of(page))
        codes += scanned(image, place);
    return codes;
}

std::vector<pages::TextItem> texts_reading(const pages::Page& page, const QString& text)
{
    std::vector<pages::TextItem> found;
    for (const auto& item : page.items) {
        if (const auto* one = std::get_if<pages::TextItem>(&item); one && one->text == text)
            found.push_back(*one);
    }
    return found;
}

std::vector<qreal> lines_down(const pages::Page& page)
{
    std::vector<qreal> places;
    for (const auto& item : page.items) {
        const auto* lines = std::get_if<pages::RectsItem>(&item);
        if (!lines || is_barcode(*lines) || lines->fill != pages::ink::hairline)
            continue;
        for (const auto& line : lines->rects) {
            const auto known = [&](qreal x) {
                return std::abs(x - line.center().x()) < 0.1;
            };
            if (line.height() > line.width() && std::ranges::none_of(places, known))
                places.push_back(line.center().x());
        }
    }
    std::ranges::sort(places);
    return places;
}

} // namespace kindrel::test
