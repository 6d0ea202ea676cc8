#include "pages/painter.h"

#include "pages/line_layout.h"
#include "pages/text_metrics.h"

#include <algorithm>

namespace kindrel::pages {

namespace {

constexpr qreal units = units_per_point;
constexpr int picture_memory = 64 * 1024; ///< Kilobytes of decoded pictures kept.
constexpr qreal frame_thickness = 0.5;

QRectF in_units(const QRectF& rect)
{
    return {rect.topLeft() * units, rect.size() * units};
}

} // namespace

PagePainter::PagePainter() : m_pictures(picture_memory) {}

void PagePainter::paint(QPainter& painter, const Page& page, int total)
{
    m_total = QString::number(total);
    m_look = nullptr;
    painter.save();
    painter.setRenderHints(QPainter::Antialiasing | QPainter::TextAntialiasing | QPainter::SmoothPixmapTransform);
    painter.scale(1 / units, 1 / units);
    for (const auto& item : page.items)
        std::visit([&](const auto& one) { draw(painter, one); }, item);
    painter.restore();
}

const PagePainter::Face& PagePainter::face_of(const TextStyle& style)
{
    if (m_look && m_look->style == style)
        return *m_look;
    const auto known =
        std::ranges::find(m_faces, style, [](const auto& face) -> const TextStyle& { return face->style; });
    if (known != m_faces.end())
        return **known;
    return *m_faces.emplace_back(std::make_unique<Face>(style, reference_font(style)));
}

void PagePainter::take_up(QPainter& painter, const Face& face)
{
    if (m_look == &face)
        return;
    painter.setFont(face.font);
    painter.setPen(QColor::fromRgba(face.style.colour));
    m_look = &face;
}

/// For shapes; the next text has to take up its look again.
void PagePainter::set_look(QPainter& painter, QRgb fill, QRgb outline, qreal thickness)
{
    m_look = nullptr;
    painter.setBrush(fill == ink::none ? QBrush(Qt::NoBrush) : QBrush(QColor::fromRgba(fill)));
    QPen pen(QColor::fromRgba(outline), thickness * units);
    pen.setJoinStyle(Qt::MiterJoin);
    pen.setCapStyle(Qt::FlatCap);
    painter.setPen(outline == ink::none ? QPen(Qt::NoPen) : pen);
}

void PagePainter::draw(QPainter& painter, const TextItem& item)
{
    if (item.text.contains(page_total_mark))
        return draw(painter, with_total(item));
    if (item.angle != 0)
        return draw_turned(painter, item);
    if (!item.spans.empty())
        return draw_spans(painter, item);
    take_up(painter, face_of(item.style));
    const auto direction = item.right_to_left ? Qt::RightToLeft : Qt::LeftToRight;
    if (painter.layoutDirection() != direction)
        painter.setLayoutDirection(direction);
    painter.drawText(item.at * units, item.text);
}

/// The end by which the text is aligned stays where it is.
TextItem PagePainter::with_total(TextItem item)
{
    item.text.replace(page_total_mark, m_total);
    const auto width = QFontMetricsF(face_of(item.style).font).horizontalAdvance(item.text) / units;
    const auto growth = width - item.width;
    item.at.rx() -= item.align == Align::right ? growth : item.align == Align::centre ? growth / 2 : 0;
    item.width = width;
    item.spans.clear();
    return item;
}

void PagePainter::draw_turned(QPainter& painter, TextItem item)
{
    painter.save();
    painter.translate(item.at * units);
    painter.rotate(item.angle);
    item.at = {};
    item.angle = 0;
    draw(painter, item);
    painter.restore();
    m_look = nullptr;
}

/// One line that mixes looks; shaped anew, it comes out as it was laid out.
void PagePainter::draw_spans(QPainter& painter, const TextItem& item)
{
    QTextLayout layout;
    const auto line = shape_line(layout, item, [this](const TextStyle& style) { return face_of(style).font; });
    layout.draw(&painter, {item.at.x() * units - line.naturalTextRect().x(), item.at.y() * units - line.ascent()});
    m_look = nullptr;
}

void PagePainter::draw(QPainter& painter, const LineItem& item)
{
    set_look(painter, ink::none, item.colour, item.thickness);
    painter.drawLine(item.from * units, item.to * units);
}

void PagePainter::draw(QPainter& painter, const RectsItem& item)
{
    set_look(painter, item.fill, item.outline, item.thickness);
    QList<QRectF> rects;
    for (const auto& rect : item.rects)
        rects.push_back(in_units(rect));
    painter.drawRects(rects);
}

void PagePainter::draw(QPainter& painter, const PolygonItem& item)
{
    set_look(painter, item.fill, item.outline, item.thickness);
    QPolygonF polygon;
    for (const auto& point : item.points)
        polygon.push_back(point * units);
    painter.drawPolygon(polygon);
}

void PagePainter::draw(QPainter& painter, const PictureItem& item)
{
    auto* image = m_pictures.object(item.picture.key());
    if (!image && !item.picture.empty()) {
        image = new QImage(item.picture.decoded());
        const auto kilobytes = std::min<qsizetype>(image->sizeInBytes() / 1024 + 1, picture_memory);
        m_pictures.insert(item.picture.key(), image, kilobytes);
    }
    if (image && !image->isNull()) {
        painter.drawImage(in_units(item.where), *image);
        return;
    }
    set_look(painter, ink::none, ink::hairline, frame_thickness);
    painter.drawRect(in_units(item.where));
}

} // namespace kindrel::pages
