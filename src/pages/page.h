#pragma once

#include "pages/picture.h"
#include "pages/style.h"

#include <QPointF>
#include <QRectF>
#include <QSizeF>
#include <QString>

#include <variant>
#include <vector>

namespace kindrel::pages {

/// Stands in a text for the number of pages, which is known only once the last page is written.
inline constexpr QChar page_total_mark{0xE1F7};

/// A stretch of a text item in a look of its own, only where one item mixes looks.
struct Span
{
    int length = 0;
    TextStyle style;

    bool operator==(const Span&) const = default;
};

/// One line's worth of text.
struct TextItem
{
    QPointF at; ///< Left end of the baseline.
    qreal width = 0;
    Align align = Align::left; ///< Which end stays when the page total takes another width than its mark.
    bool right_to_left = false;
    int angle = 0; ///< Degrees clockwise around `at`.
    TextStyle style = {};
    QString text = {};
    std::vector<Span> spans = {}; ///< Empty: all in `style`.

    bool operator==(const TextItem&) const = default;
};

struct LineItem
{
    QPointF from, to;
    qreal thickness = 0.5;
    QRgb colour = ink::black;

    bool operator==(const LineItem&) const = default;
};

/// Rectangles of one look: shading, frames, tick boxes, bars.
struct RectsItem
{
    std::vector<QRectF> rects = {};
    QRgb fill = ink::none;
    QRgb outline = ink::none;
    qreal thickness = 0.5;

    bool operator==(const RectsItem&) const = default;
};

struct PolygonItem
{
    std::vector<QPointF> points = {};
    QRgb fill = ink::none;
    QRgb outline = ink::none;
    qreal thickness = 0.5;

    bool operator==(const PolygonItem&) const = default;
};

/// Fills `where` exactly; an empty picture is a thin frame.
struct PictureItem
{
    QRectF where;
    Picture picture;

    bool operator==(const PictureItem&) const = default;
};

using Item = std::variant<TextItem, LineItem, RectsItem, PolygonItem, PictureItem>;

[[nodiscard]] Item moved(Item item, QPointF by);
/// Grown or shrunk around the origin, text sizes and line widths with it.
[[nodiscard]] Item scaled(Item item, qreal factor);

/// Items in a place of their own, origin at the upper left: a chart, a barcode, a mark.
struct Drawing
{
    QSizeF size;
    std::vector<Item> items = {};

    bool operator==(const Drawing&) const = default;
};

/// A finished page: everything on it, in the order of drawing, from the upper left corner of the paper.
struct Page
{
    int number = 0; ///< From 1.
    QSizeF size;
    std::vector<Item> items = {};

    bool operator==(const Page&) const = default;
};

/// The page's texts in the order they were written, a line each; marks of the page total read `total`.
[[nodiscard]] QStringList texts_of(const Page& page, int total);

} // namespace kindrel::pages
