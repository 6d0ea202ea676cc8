#include "desktop/shell/rail.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"

#include <QPainter>
#include <QVBoxLayout>

#include <algorithm>

namespace kindrel::desktop {

namespace {

constexpr int icon_size = 22;
constexpr int inset = 4;
constexpr int button_height = 40;

}

RailButton::RailButton(const QString& icon_name, const QString& text)
{
    setIcon(desktop::icon(icon_name));
    setText(text);
    setAccessibleName(text);
    setToolTip(text);
    setFocusPolicy(Qt::TabFocus);
    setAttribute(Qt::WA_Hover);
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
}

void RailButton::set_narrow(bool narrow)
{
    m_narrow = narrow;
    update();
}

QSize RailButton::sizeHint() const
{
    return {m_narrow ? Rail::narrow : Rail::wide, std::max(button_height, fontMetrics().height() + 2 * space::field)};
}

void RailButton::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const QRectF place = QRectF(rect()).adjusted(inset, 2, -inset, -2);
    const bool shown = isChecked() || isDown();
    if (shown || (isEnabled() && underMouse())) {
        painter.setPen(Qt::NoPen);
        painter.setBrush(shown ? palette().color(QPalette::Highlight) : hover_colour(shade_of(palette())));
        painter.drawRoundedRect(place, 5, 5);
    }
    if (hasFocus()) {
        painter.setBrush(Qt::NoBrush);
        painter.setPen(QPen(shown ? palette().color(QPalette::HighlightedText) : palette().color(QPalette::Highlight), 2));
        painter.drawRoundedRect(place.adjusted(2, 2, -2, -2), 4, 4);
    }
    const QRect picture(m_narrow ? (width() - icon_size) / 2 : space::margin, (height() - icon_size) / 2, icon_size,
                        icon_size);
    icon().paint(&painter, picture, Qt::AlignCenter,
                 !isEnabled() ? QIcon::Disabled
                 : shown      ? QIcon::Selected
                              : QIcon::Normal);
    if (m_narrow)
        return;
    painter.setPen(palette().color(shown ? QPalette::HighlightedText : QPalette::WindowText));
    const QRect words = rect().adjusted(picture.right() + space::field + 2, 0, -space::field, 0);
    painter.drawText(words, Qt::AlignVCenter | Qt::TextShowMnemonic,
                     fontMetrics().elidedText(text(), Qt::ElideRight, words.width(), Qt::TextShowMnemonic));
}

Rail::Rail(QWidget* parent) : QWidget(parent), m_column(new QVBoxLayout(this))
{
    setFixedWidth(wide);
    m_column->setContentsMargins(0, space::field, 1, space::field);
    m_column->setSpacing(2);
    m_column->addStretch(1);
}

RailButton* Rail::add_area(const QString& icon_name, const QString& text)
{
    auto* button = new RailButton(icon_name, text);
    button->setCheckable(true);
    button->setAutoExclusive(true);
    const int place = int(m_areas.size());
    m_column->insertWidget(place, button);
    m_areas.push_back(button);
    connect(button, &QAbstractButton::clicked, this, [this, place] { Q_EMIT chosen(place); });
    return button;
}

RailButton* Rail::add_foot(const QString& icon_name, const QString& text)
{
    auto* button = new RailButton(icon_name, text);
    m_column->addWidget(button);
    m_foot.push_back(button);
    return button;
}

void Rail::set_narrow(bool shortened)
{
    setFixedWidth(shortened ? narrow : wide);
    for (const auto* group : {&m_areas, &m_foot})
        for (RailButton* button : *group)
            button->set_narrow(shortened);
}

void Rail::choose(int area)
{
    m_areas.at(std::size_t(area))->setChecked(true);
}

void Rail::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.fillRect(rect(), palette().color(QPalette::Button));
    painter.setPen(line_colour(shade_of(palette())));
    painter.drawLine(rect().topRight(), rect().bottomRight());
}

}
