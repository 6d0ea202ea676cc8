#include "pages/spool.h"

#include "core/files.h"
#include "pages/packing.h"

#include <QDir>

using namespace Qt::StringLiterals;

namespace kindrel::pages {

namespace {

core::FileError spool_failed(const QFileDevice& file)
{
    return core::FileError(u"The pages of this report could not be kept in %1: %2"_s.arg(
        QDir::toNativeSeparators(file.fileName()), file.errorString()));
}

} // namespace

PageSpool::PageSpool() : m_file(QDir::tempPath() + u"/kindrel-pages-XXXXXX"_s)
{
    if (!m_file.open())
        throw spool_failed(m_file);
}

void PageSpool::append(const Page& page)
{
    store_pictures(page);
    m_pages.push_back(store(packed(page)));
    if (m_on_page)
        m_on_page(page_count());
}

Page PageSpool::page(int number) const
{
    return unpacked(fetch(m_pages.at(size_t(number) - 1)), [this](const QByteArray& key) { return picture(key); });
}

PageSpool::Extent PageSpool::store(const QByteArray& bytes)
{
    const Extent extent{m_file.size(), bytes.size()};
    if (!m_file.seek(extent.offset) || m_file.write(bytes) != bytes.size() || !m_file.flush())
        throw spool_failed(m_file);
    return extent;
}

QByteArray PageSpool::fetch(Extent extent) const
{
    QByteArray bytes;
    if (m_file.seek(extent.offset))
        bytes = m_file.read(extent.length);
    if (bytes.size() != extent.length)
        throw spool_failed(m_file);
    return bytes;
}

void PageSpool::store_pictures(const Page& page)
{
    for (const auto& item : page.items) {
        const auto* placed = std::get_if<PictureItem>(&item);
        if (!placed || placed->picture.empty() || m_pictures.contains(placed->picture.key()))
            continue;
        const auto& picture = placed->picture;
        m_pictures.insert(picture.key(), {store(picture.encoded()), picture.pixels()});
    }
}

Picture PageSpool::picture(const QByteArray& key) const
{
    const auto& stored = *m_pictures.constFind(key);
    return Picture::restored(fetch(stored.extent), key, stored.pixels);
}

} // namespace kindrel::pages
