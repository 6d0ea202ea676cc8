#include "desktop/shell/link_button.h"

#include "desktop/shell/look.h"

#include <QEvent>
#include <QPainter>

namespace kindrel::desktop {

namespace {

constexpr int icon_size = 22;
constexpr int padding = 5;
constexpr int hint_width = 200;
constexpr int bar_width = 3;

} // namespace

LinkButton::LinkButton(const QString& text, QWidget* parent) : QAbstractButton(parent)
{
    setText(text);
    setAccessibleName(text);
    setFocusPolicy(Qt::StrongFocus);
    setAttribute(Qt::WA_Hover);
    setCursor(Qt::PointingHandCursor);
    QSizePolicy policy(QSizePolicy::Expanding, QSizePolicy::Fixed);
    policy.setHeightForWidth(true);
    setSizePolicy(policy);
}

void LinkButton::set_figure(const QString& figure)
{
    m_figure = figure;
    setAccessibleName(text() + u' ' + figure);
    update();
}

void LinkButton::set_description(const QString& description)
{
    m_description = description;
    setAccessibleDescription(description);
    setToolTip(description);
    setStatusTip(description);
    updateGeometry();
}

QRect LinkButton::text_place(int width) const
{
    const int left = space::field + (icon().isNull() ? 0 : icon_size + space::field);
    return {left, padding, width - left - space::field, 0};
}

QSize LinkButton::sizeHint() const
{
    return {hint_width, heightForWidth(hint_width)};
}

int LinkButton::heightForWidth(int width) const
{
    int height = QFontMetrics(font()).height();
    if (!m_description.isEmpty())
        height += QFontMetrics(font_for(TextSize::secondary))
                      .boundingRect(QRect(0, 0, text_place(width).width(), 1000), Qt::TextWordWrap, m_description)
                      .height();
    return height + 2 * padding;
}

void LinkButton::paint_ground(QPainter& painter) const
{
    const QRectF place = QRectF(rect()).adjusted(1, 1, -1, -1);
    painter.setPen(hasFocus() ? QPen(palette().color(QPalette::Highlight), 2) : QPen(Qt::NoPen));
    const bool raised = isEnabled() && (underMouse() || isChecked() || isDown());
    painter.setBrush(raised ? QBrush(hover_colour(shade_of(palette()))) : QBrush(Qt::NoBrush));
    painter.drawRoundedRect(place, 4, 4);
    if (isChecked())
        painter.fillRect(QRect(1, padding, bar_width, height() - 2 * padding), palette().color(QPalette::Highlight));
}

void LinkButton::paint_texts(QPainter& painter) const
{
    const QRect place = text_place(width());
    const int line = QFontMetrics(font()).height();
    QFont title = font();
    title.setBold(isChecked());
    painter.setFont(title);
    painter.setPen(palette().color(isEnabled() ? QPalette::Link : QPalette::WindowText));
    const int figure_width = QFontMetrics(title).horizontalAdvance(m_figure);
    painter.drawText(QRect(place.left(), padding, place.width(), line), Qt::AlignLeft | Qt::AlignVCenter,
                     QFontMetrics(title).elidedText(text(), Qt::ElideRight, place.width() - figure_width));
    painter.setPen(palette().color(QPalette::WindowText));
    painter.drawText(QRect(place.left(), padding, place.width(), line), Qt::AlignRight | Qt::AlignVCenter, m_figure);
    painter.setFont(font_for(TextSize::secondary));
    if (isEnabled())
        painter.setPen(quiet_colour(shade_of(palette())));
    painter.drawText(QRect(place.left(), padding + line, place.width(), height()), Qt::TextWordWrap, m_description);
}

void LinkButton::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    paint_ground(painter);
    icon().paint(&painter, QRect(space::field, padding, icon_size, icon_size), Qt::AlignTop,
                 isEnabled() ? QIcon::Normal : QIcon::Disabled);
    paint_texts(painter);
}

void LinkButton::changeEvent(QEvent* event)
{
    QAbstractButton::changeEvent(event);
    if (event->type() == QEvent::FontChange)
        updateGeometry();
}

} // namespace kindrel::desktop
