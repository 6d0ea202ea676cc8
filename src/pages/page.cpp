#include "pages/page.h"

#include <QStringList>

namespace kindrel::pages {

namespace {

struct Mover
{
    QPointF by;

    void operator()(TextItem& item) const { item.at += by; }
    void operator()(LineItem& item) const
    {
        item.from += by;
        item.to += by;
    }
    void operator()(RectsItem& item) const
    {
        for (auto& rect : item.rects)
            rect.translate(by);
    }
    void operator()(PolygonItem& item) const
    {
        for (auto& point : item.points)
            point += by;
    }
    void operator()(PictureItem& item) const { item.where.translate(by); }
};

QRectF times(const QRectF& rect, qreal factor)
{
    return {rect.topLeft() * factor, rect.size() * factor};
}

struct Scaler
{
    qreal factor;

    void operator()(TextItem& item) const
    {
        item.at *= factor;
        item.width *= factor;
        item.style.size *= factor;
        for (auto& span : item.spans)
            span.style.size *= factor;
    }
    void operator()(LineItem& item) const
    {
        item.from *= factor;
        item.to *= factor;
        item.thickness *= factor;
    }
    void operator()(RectsItem& item) const
    {
        for (auto& rect : item.rects)
            rect = times(rect, factor);
        item.thickness *= factor;
    }
    void operator()(PolygonItem& item) const
    {
        for (auto& point : item.points)
            point *= factor;
        item.thickness *= factor;
    }
    void operator()(PictureItem& item) const { item.where = times(item.where, factor); }
};

} // namespace

Item moved(Item item, QPointF by)
{
    std::visit(Mover{by}, item);
    return item;
}

Item scaled(Item item, qreal factor)
{
    std::visit(Scaler{factor}, item);
    return item;
}

QStringList texts_of(const Page& page, int total)
{
    QStringList texts;
    for (const auto& item : page.items) {
        if (const auto* text = std::get_if<TextItem>(&item))
            texts.push_back(QString(text->text).replace(page_total_mark, QString::number(total)));
    }
    return texts;
}

} // namespace kindrel::pages
