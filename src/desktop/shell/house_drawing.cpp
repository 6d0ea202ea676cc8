#include "desktop/shell/house_drawing.h"

#include "desktop/shell/palette.h"

#include <QPainter>
#include <QStyle>

#include <algorithm>

namespace kindrel::desktop {

namespace {

constexpr qreal corner = 4;
constexpr int least_slider = 32;
constexpr int tab_line = 2;

QColor fill_of(const QStyleOption& option, Ground ground)
{
    const Shade shade = shade_of(option.palette);
    if (option.state & (QStyle::State_Sunken | QStyle::State_On))
        return line_colour(shade);
    if ((option.state & QStyle::State_Enabled) && (option.state & QStyle::State_MouseOver))
        return hover_colour(shade);
    return ground == Ground::flat ? QColor(Qt::transparent) : option.palette.color(QPalette::Base);
}

QPen edge_of(const QStyleOption& option, Ground ground)
{
    if ((option.state & QStyle::State_HasFocus) && (option.state & QStyle::State_KeyboardFocusChange))
        return {option.palette.color(QPalette::Highlight), 2};
    if (ground == Ground::flat)
        return Qt::NoPen;
    const bool dark = shade_of(option.palette) == Shade::dark;
    return {option.palette.color(QPalette::Mid).darker(dark ? 80 : 115), 1};
}

} // namespace

void draw_button(const QStyleOption& option, QPainter& painter, Ground ground)
{
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(edge_of(option, ground));
    painter.setBrush(fill_of(option, ground));
    painter.drawRoundedRect(QRectF(option.rect).adjusted(1, 1, -1, -1), corner, corner);
    painter.restore();
}

void draw_tick_box(const QStyleOption& option, QPainter& painter)
{
    const bool enabled = option.state & QStyle::State_Enabled;
    const bool filled = option.state & (QStyle::State_On | QStyle::State_NoChange);
    const QColor edge = enabled ? edge_colour(shade_of(option.palette)) : option.palette.color(QPalette::Mid);
    const qreal side = std::min(option.rect.width(), option.rect.height()) - 1;
    QRectF box(0, 0, side, side);
    box.moveCenter(QRectF(option.rect).center());
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(filled && enabled ? option.palette.color(QPalette::Highlight) : edge);
    painter.setBrush(option.palette.color(filled ? QPalette::Highlight : QPalette::Base));
    painter.drawRoundedRect(box, 2, 2);
    painter.setPen(QPen(option.palette.color(QPalette::HighlightedText), side / 7, Qt::SolidLine, Qt::RoundCap));
    const auto at = [&](qreal x, qreal y) {
        return box.topLeft() + QPointF(x, y) * side;
    };
    if (option.state & QStyle::State_On)
        painter.drawPolyline(QPolygonF({at(0.22, 0.52), at(0.42, 0.72), at(0.78, 0.3)}));
    else if (option.state & QStyle::State_NoChange)
        painter.drawLine(at(0.25, 0.5), at(0.75, 0.5));
    painter.restore();
}

void draw_field_edge(const QStyleOption& option, QPainter& painter)
{
    const bool focused = option.state & QStyle::State_HasFocus;
    const bool enabled = option.state & QStyle::State_Enabled;
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setBrush(Qt::NoBrush);
    painter.setPen(focused   ? QPen(option.palette.color(QPalette::Highlight), 2)
                   : enabled ? QPen(edge_colour(shade_of(option.palette)))
                             : QPen(line_colour(shade_of(option.palette))));
    const qreal inset = focused ? 1 : 0.5;
    painter.drawRoundedRect(QRectF(option.rect).adjusted(inset, inset, -inset, -inset), 3, 3);
    painter.restore();
}

void draw_frame(const QStyleOption& option, QPainter& painter)
{
    painter.setPen(edge_of(option, Ground::raised));
    painter.setBrush(Qt::NoBrush);
    painter.drawRect(option.rect.adjusted(0, 0, -1, -1));
}

void draw_header_ground(const QStyleOption& option, QPainter& painter)
{
    painter.fillRect(option.rect, option.palette.color(QPalette::Window));
    painter.setPen(line_colour(shade_of(option.palette)));
    painter.drawLine(option.rect.bottomLeft(), option.rect.bottomRight());
}

void draw_header_section(const QStyleOptionHeader& option, QPainter& painter)
{
    draw_header_ground(option, painter);
    if (option.position == QStyleOptionHeader::End || option.position == QStyleOptionHeader::OnlyOneSection)
        return;
    painter.drawLine(option.rect.topRight() + QPoint(0, 5), option.rect.bottomRight() - QPoint(0, 5));
}

void draw_tab(const QStyleOptionTab& option, QPainter& painter)
{
    const bool chosen = option.state & QStyle::State_Selected;
    const QRect line(option.rect.left(), option.rect.bottom() - tab_line + 1, option.rect.width(), tab_line);
    if (!chosen && (option.state & QStyle::State_MouseOver))
        painter.fillRect(option.rect, hover_colour(shade_of(option.palette)));
    if (chosen)
        painter.fillRect(line, option.palette.color(QPalette::Highlight));
    if ((option.state & QStyle::State_HasFocus) && chosen) {
        painter.setPen(option.palette.color(QPalette::Highlight));
        painter.drawRect(option.rect.adjusted(2, 2, -3, -tab_line - 3));
    }
}

QRect scroll_slider(const QStyleOptionSlider& option)
{
    const bool across = option.orientation == Qt::Horizontal;
    const int room = across ? option.rect.width() : option.rect.height();
    const qint64 range = qint64(option.maximum) - option.minimum;
    const int wanted = range > 0 ? int(qint64(room) * option.pageStep / (range + option.pageStep)) : room;
    const int length = std::min(room, std::max(least_slider, wanted));
    const int start = QStyle::sliderPositionFromValue(option.minimum, option.maximum, option.sliderPosition,
                                                      room - length, option.upsideDown);
    return across ? QRect(option.rect.left() + start, option.rect.top(), length, option.rect.height())
                  : QRect(option.rect.left(), option.rect.top() + start, option.rect.width(), length);
}

void draw_scroll_bar(const QStyleOptionSlider& option, const QRect& slider, QPainter& painter)
{
    const bool touched = (option.state & (QStyle::State_MouseOver | QStyle::State_Sunken)) != 0;
    painter.save();
    painter.fillRect(option.rect, option.palette.color(QPalette::Window));
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(option.palette.color(touched ? QPalette::Dark : QPalette::Mid));
    const QRectF handle = QRectF(slider).adjusted(3, 3, -3, -3);
    painter.drawRoundedRect(handle, corner - 1, corner - 1);
    painter.restore();
}

} // namespace kindrel::desktop
