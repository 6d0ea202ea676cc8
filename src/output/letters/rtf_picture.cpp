#include "output/letters/rtf_picture.h"

#include "pages/picture.h"

#include <algorithm>

namespace kindrel::output {

namespace {

bool is_jpeg(const QByteArray& bytes)
{
    return bytes.startsWith("\xFF\xD8\xFF");
}

qreal side(int twips, int percent, int pixels)
{
    constexpr int twips_per_pixel = 15;
    constexpr int most_percent = 1000;
    const auto wanted =
        twips > 0 ? qint64(twips) * std::clamp(percent, 1, most_percent) / 100 : qint64(pixels) * twips_per_pixel;
    const auto widest = qint64(widest_on_page * twips_per_point);
    return qreal(std::clamp<qint64>(wanted, qint64(twips_per_point), widest)) / twips_per_point;
}

} // namespace

bool is_png(const QByteArray& bytes)
{
    return bytes.startsWith("\x89PNG");
}

LetterPicture picture_from(const RtfPicture& picture)
{
    const auto bytes = picture.bytes.isEmpty() ? QByteArray::fromHex(picture.hex) : picture.bytes;
    if (!is_png(bytes) && !is_jpeg(bytes))
        return {};
    const auto pixels = pages::Picture::from_bytes(bytes, {widest_on_page, widest_on_page}).pixels();
    if (pixels.isEmpty())
        return {};
    return {bytes,
            {side(picture.width, picture.width_percent, pixels.width()),
             side(picture.height, picture.height_percent, pixels.height())}};
}

} // namespace kindrel::output
