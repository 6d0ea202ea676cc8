#pragma once

#include "pages/page.h"

#include <QTextLayout>

namespace kindrel::pages {

constexpr qreal widest_line = 1 << 24; ///< In units; more than any paper.

/// Shapes an item's one line in `layout` as it was laid out for the page, in units. `font_of` gives the reference font
/// of a style.
template <class FontOf>
QTextLine shape_line(QTextLayout& layout, const TextItem& item, const FontOf& font_of)
{
    QList<QTextLayout::FormatRange> formats;
    int start = 0;
    for (const auto& span : item.spans) {
        QTextCharFormat format;
        format.setFont(font_of(span.style));
        format.setForeground(QColor::fromRgba(span.style.colour));
        formats.push_back({start, span.length, format});
        start += span.length;
    }
    QTextOption option(Qt::AlignLeft | Qt::AlignAbsolute);
    option.setWrapMode(QTextOption::NoWrap);
    option.setTextDirection(item.right_to_left ? Qt::RightToLeft : Qt::LeftToRight);
    layout.setText(item.text);
    layout.setFont(font_of(item.style));
    layout.setTextOption(option);
    layout.setFormats(formats);
    layout.beginLayout();
    auto line = layout.createLine();
    line.setLineWidth(widest_line);
    layout.endLayout();
    return line;
}

} // namespace kindrel::pages
