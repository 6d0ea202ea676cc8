#include "pages/picture.h"

#include <QBuffer>
#include <QCryptographicHash>
#include <QFile>
#include <QImageReader>

namespace kindrel::pages {

namespace {

constexpr qreal dots_per_point = 300 / 72.0;
constexpr int jpeg_quality = 90;

QByteArray encode(const QImage& image)
{
    QByteArray bytes;
    QBuffer buffer(&bytes);
    image.hasAlphaChannel() ? image.save(&buffer, "PNG") : image.save(&buffer, "JPG", jpeg_quality);
    return bytes;
}

QByteArray key_of(const QByteArray& bytes)
{
    return QCryptographicHash::hash(bytes, QCryptographicHash::Sha1);
}

} // namespace

Picture Picture::from_file(const QString& file, QSizeF within)
{
    QFile source(file);
    return source.open(QIODevice::ReadOnly) ? from_bytes(source.readAll(), within) : Picture();
}

Picture Picture::from_bytes(const QByteArray& bytes, QSizeF within)
{
    QBuffer buffer;
    buffer.setData(bytes);
    QImageReader reader(&buffer);
    reader.setAutoTransform(true);
    reader.setDecideFormatFromContent(true);
    const auto stored = reader.size();
    const auto most = (within * dots_per_point).toSize();
    const bool turned = reader.transformation().testFlag(QImageIOHandler::TransformationRotate90);
    const auto wanted = stored.scaled(turned ? most.transposed() : most, Qt::KeepAspectRatio);
    const bool shrink = stored.isValid() && wanted.width() < stored.width();
    if (shrink)
        reader.setScaledSize(wanted.expandedTo({1, 1}));
    const auto image = reader.read();
    if (image.isNull())
        return {};
    if (shrink || reader.transformation() != QImageIOHandler::TransformationNone || reader.format() == "bmp")
        return from_image(image);
    return restored(bytes, key_of(bytes), image.size());
}

Picture Picture::from_image(const QImage& image)
{
    if (image.isNull())
        return {};
    const auto bytes = encode(image);
    return restored(bytes, key_of(bytes), image.size());
}

Picture Picture::restored(const QByteArray& encoded, const QByteArray& key, QSize pixels)
{
    Picture picture;
    if (!encoded.isEmpty())
        picture.m_content = std::make_shared<const Content>(encoded, key, pixels);
    return picture;
}

QImage Picture::decoded() const
{
    return QImage::fromData(encoded());
}

} // namespace kindrel::pages
