#include "desktop/shell/chip.h"

#include "desktop/shell/look.h"

#include <QEvent>
#include <QPainter>

namespace kindrel::desktop {

Chip::Chip(QWidget* parent) : QLabel(parent)
{
    keep_text_size(*this, TextSize::secondary);
    setContentsMargins(space::field, 2, space::field, 2);
    setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Fixed);
    setTextInteractionFlags(Qt::NoTextInteraction);
    hide();
}

void Chip::set(const QString& word, State state)
{
    m_state = state;
    setText(word);
    setVisible(!word.isEmpty());
    colour();
}

void Chip::colour()
{
    QPalette own;
    own.setColor(QPalette::WindowText, state_colour(m_state, shade_of(palette())));
    if (own.color(QPalette::WindowText) != palette().color(QPalette::WindowText))
        setPalette(own);
}

void Chip::paintEvent(QPaintEvent* event)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const QRectF frame = QRectF(rect()).adjusted(0.5, 0.5, -0.5, -0.5);
    painter.setPen(palette().color(QPalette::WindowText));
    painter.drawRoundedRect(frame, frame.height() / 2, frame.height() / 2);
    painter.end();
    QLabel::paintEvent(event);
}

void Chip::changeEvent(QEvent* event)
{
    QLabel::changeEvent(event);
    if (event->type() == QEvent::PaletteChange)
        colour();
}

} // namespace kindrel::desktop
