#pragma once

#include "pages/page.h"

#include <QHash>
#include <QTemporaryFile>

#include <functional>
#include <vector>

namespace kindrel::pages {

/// Finished pages on disk, so that a report of any length holds one page in memory. Pages can be read while later
/// ones are still being written. The file is private to the user and goes with the spool.
class PageSpool
{
public:
    PageSpool();

    /// Called after each page is stored, with its number.
    void on_page(std::function<void(int number)> call) { m_on_page = std::move(call); }

    /// Throws core::FileError when the disk refuses.
    void append(const Page& page);
    /// No more pages will come: from here the count is the document's total.
    void finish() { m_finished = true; }

    [[nodiscard]] int page_count() const { return int(m_pages.size()); }
    [[nodiscard]] bool finished() const { return m_finished; }
    /// `number` from 1 to page_count(). Throws core::FileError when the file cannot be read back.
    [[nodiscard]] Page page(int number) const;

private:
    struct Extent
    {
        qint64 offset = 0;
        qint64 length = 0;
    };
    struct StoredPicture
    {
        Extent extent;
        QSize pixels;
    };

    Extent store(const QByteArray& bytes);
    [[nodiscard]] QByteArray fetch(Extent extent) const;
    void store_pictures(const Page& page);
    [[nodiscard]] Picture picture(const QByteArray& key) const;

    mutable QTemporaryFile m_file;
    std::vector<Extent> m_pages;
    QHash<QByteArray, StoredPicture> m_pictures;
    std::function<void(int)> m_on_page;
    bool m_finished = false;
};

} // namespace kindrel::pages
