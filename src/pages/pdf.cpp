#include "pages/pdf.h"

#include "core/files.h"
#include "pages/painter.h"
#include "pages/text_metrics.h"

#include <QDir>
#include <QPageLayout>
#include <QPainter>
#include <QPdfWriter>
#include <QSaveFile>

using namespace Qt::StringLiterals;

namespace kindrel::pages {

namespace {

QPageLayout layout_for(const Page& page)
{
    const bool across = page.size.width() > page.size.height();
    const QPageSize paper(across ? page.size.transposed() : page.size, QPageSize::Point, {}, QPageSize::FuzzyMatch);
    QPageLayout layout(paper, across ? QPageLayout::Landscape : QPageLayout::Portrait, {});
    layout.setMode(QPageLayout::FullPageMode);
    return layout;
}

/// Ends the run on the device however it is left.
class Sheets
{
public:
    explicit Sheets(QPagedPaintDevice& device) : m_device(device) {}

    void draw(const Page& page, int total)
    {
        m_device.setPageLayout(layout_for(page));
        if (m_painter.isActive() ? !m_device.newPage() : !m_painter.begin(&m_device))
            throw core::FileError(u"The pages could not be written out"_s);
        m_painter.resetTransform();
        m_painter.scale(m_device.logicalDpiX() / 72.0, m_device.logicalDpiY() / 72.0);
        m_pages.paint(m_painter, page, total);
    }

private:
    QPagedPaintDevice& m_device;
    QPainter m_painter;
    PagePainter m_pages;
};

[[nodiscard]] core::FileError not_written(const QSaveFile& file)
{
    return core::FileError(
        u"%1 could not be written: %2"_s.arg(QDir::toNativeSeparators(file.fileName()), file.errorString()));
}

} // namespace

bool draw_pages(const PageSpool& spool, QPagedPaintDevice& device, PageRange range, core::Progress* progress)
{
    const auto total = spool.page_count();
    const auto last = range.last == 0 ? total : std::min(range.last, total);
    Sheets sheets(device);
    for (int number = range.first; number <= last; ++number) {
        sheets.draw(spool.page(number), total);
        if (progress && !progress->step())
            return false;
    }
    return true;
}

bool write_pdf(const PageSpool& spool, const QString& file, const PdfProperties& properties, core::Progress* progress)
{
    QSaveFile target(file);
    if (!target.open(QIODevice::WriteOnly))
        throw not_written(target);
    {
        QPdfWriter writer(&target);
        writer.setResolution(units_per_point * 72);
        writer.setTitle(properties.title);
        writer.setCreator(properties.creator);
        if (!draw_pages(spool, writer, {}, progress))
            return false;
    }
    if (!target.commit())
        throw not_written(target);
    return true;
}

} // namespace kindrel::pages
