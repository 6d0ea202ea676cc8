#pragma once

#include "pages/page.h"

#include <QCache>
#include <QFont>
#include <QPainter>

#include <memory>
#include <vector>

namespace kindrel::pages {

/// Draws pages on any painter: screen, printer, PDF, thumbnail. One instance serves many pages and keeps their fonts
/// and pictures at hand; a drawing run that wants each picture embedded once keeps its instance.
class PagePainter
{
public:
    PagePainter();

    /// One unit of `painter` is taken as one point: scale it first. `total` fills in the number of pages.
    void paint(QPainter& painter, const Page& page, int total);

private:
    struct Face
    {
        TextStyle style;
        QFont font;
    };

    void draw(QPainter& painter, const TextItem& item);
    void draw(QPainter& painter, const LineItem& item);
    void draw(QPainter& painter, const RectsItem& item);
    void draw(QPainter& painter, const PolygonItem& item);
    void draw(QPainter& painter, const PictureItem& item);
    void draw_turned(QPainter& painter, TextItem item);
    void draw_spans(QPainter& painter, const TextItem& item);
    [[nodiscard]] TextItem with_total(TextItem item);
    [[nodiscard]] const Face& face_of(const TextStyle& style);
    void take_up(QPainter& painter, const Face& face);
    void set_look(QPainter& painter, QRgb fill, QRgb outline, qreal thickness);

    std::vector<std::unique_ptr<Face>> m_faces;
    const Face* m_look = nullptr; ///< Whose font and colour the painter has now.
    QCache<QByteArray, QImage> m_pictures;
    QString m_total;
};

} // namespace kindrel::pages
