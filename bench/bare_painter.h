#pragma once

#include "pages/page.h"

#include <QPageLayout>
#include <QPainter>
#include <QPdfWriter>

#include <chrono>
#include <vector>

namespace kindrel::bench {

/// Draws the items as any program must: each text at its place in its font, each line, rectangle and picture.
struct BarePainter
{
    QPainter& painter;
    qreal unit;

    void operator()(const pages::TextItem& text) const
    {
        QFont font(text.style.family);
        font.setPointSizeF(text.style.size);
        font.setBold(text.style.bold);
        painter.setFont(font);
        painter.setPen(QColor::fromRgba(text.style.colour));
        painter.drawText(text.at * unit, text.text);
    }
    void operator()(const pages::LineItem& line) const { painter.drawLine(line.from * unit, line.to * unit); }
    void operator()(const pages::RectsItem& rects) const
    {
        painter.setBrush(rects.fill ? QBrush(QColor::fromRgba(rects.fill)) : QBrush());
        for (const auto& rect : rects.rects)
            painter.drawRect(QRectF(rect.topLeft() * unit, rect.size() * unit));
    }
    void operator()(const pages::PolygonItem& polygon) const
    {
        QPolygonF points;
        for (const auto& point : polygon.points)
            points << point * unit;
        painter.drawPolygon(points);
    }
    void operator()(const pages::PictureItem& picture) const
    {
        const QRectF where(picture.where.topLeft() * unit, picture.where.size() * unit);
        if (picture.picture.empty())
            painter.drawRect(where);
        else
            painter.drawImage(where, picture.picture.decoded());
    }
};

/// Seconds for the pages as a PDF.
inline double draw_bare(const std::vector<pages::Page>& pages, const QString& file)
{
    const auto start = std::chrono::steady_clock::now();
    QPdfWriter writer(file);
    writer.setPageLayout(QPageLayout(QPageSize(QPageSize::A4), QPageLayout::Portrait, {}));
    QPainter painter(&writer);
    const BarePainter draw{painter, writer.resolution() / 72.0};
    for (const auto& page : pages) {
        if (&page != &pages.front())
            writer.newPage();
        for (const auto& item : page.items)
            std::visit(draw, item);
    }
    painter.end();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

} // namespace kindrel::bench
