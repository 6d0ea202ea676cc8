#include "desktop/shell/rail_button.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"

#include <QPainter>

#include <algorithm>
#include <utility>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int icon_size = 22;
constexpr int inset = 4;
constexpr int button_height = 40;
constexpr int dot_size = 8;
constexpr int mark_size = 16;
constexpr QStringView still_locked = u"still locked for others";

} // namespace

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

void RailButton::set_narrow(bool shortened)
{
    m_narrow = shortened;
    update();
}

void RailButton::set_low(bool low)
{
    if (std::exchange(m_low, low) != low)
        updateGeometry();
}

void RailButton::set_tip(const QString& tip)
{
    m_tip = tip;
    set_marks(m_marks);
}

void RailButton::set_marks(const RailMarks& marks)
{
    m_marks = marks;
    const QString words = mark_words();
    setToolTip(words.isEmpty() ? m_tip : m_tip + u'\n' + words);
    setAccessibleDescription(words);
    updateGeometry();
    update();
}

QString RailButton::mark_words() const
{
    QStringList words;
    if (m_marks.altered)
        words += u"has unsaved work"_s;
    if (m_marks.locked)
        words += m_marks.idle ? still_locked.toString() : u"locked for others"_s;
    return words.join(u'\n');
}

int RailButton::full_height() const
{
    return std::max(button_height, fontMetrics().height() + 2 * space::field);
}

QSize RailButton::sizeHint() const
{
    const bool low = m_low && !m_marks.idle;
    const int height = low ? std::max(low_height, fontMetrics().height() + space::field) : full_height();
    return {m_narrow ? narrow : wide, height};
}

void RailButton::paint_ground(QPainter& painter) const
{
    const QRectF place = QRectF(rect()).adjusted(inset, 2, -inset, -2);
    if (stands_out() || (isEnabled() && underMouse())) {
        painter.setPen(Qt::NoPen);
        painter.setBrush(stands_out() ? palette().color(QPalette::Highlight) : hover_colour(shade_of(palette())));
        painter.drawRoundedRect(place, 5, 5);
    }
    if (!hasFocus())
        return;
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(palette().color(stands_out() ? QPalette::HighlightedText : QPalette::Highlight), 2));
    painter.drawRoundedRect(place.adjusted(2, 2, -2, -2), 4, 4);
}

void RailButton::paint_words(QPainter& painter, QRect place) const
{
    const auto elided = [&](const QString& words) {
        return painter.fontMetrics().elidedText(words, Qt::ElideRight, place.width(), Qt::TextShowMnemonic);
    };
    painter.setPen(palette().color(stands_out() ? QPalette::HighlightedText : QPalette::WindowText));
    if (!m_marks.idle) {
        painter.drawText(place, Qt::AlignVCenter | Qt::TextShowMnemonic, elided(text()));
        return;
    }
    place.adjust(0, inset, 0, -inset);
    painter.drawText(place, Qt::AlignTop | Qt::TextShowMnemonic, elided(text()));
    painter.setFont(font_for(TextSize::secondary));
    painter.drawText(place.adjusted(0, 0, dot_size + mark_size, 0), Qt::AlignBottom, still_locked.toString());
}

void RailButton::paint_marks(QPainter& painter) const
{
    // On the icon's corners when there is no room beside the name.
    const int right = width() - inset - (m_narrow ? 2 : space::field);
    const int middle = m_narrow || m_marks.idle ? inset + mark_size / 2 + 2 : height() / 2;
    int place = right;
    if (m_marks.locked) {
        place -= mark_size;
        desktop::icon(u"object-locked"_s)
            .paint(&painter,
                   QRect(place, m_narrow ? height() - inset - mark_size : middle - mark_size / 2, mark_size, mark_size),
                   Qt::AlignCenter, stands_out() ? QIcon::Selected : QIcon::Normal);
        place = m_narrow ? right : place - inset;
    }
    if (m_marks.altered) {
        painter.setPen(Qt::NoPen);
        painter.setBrush(stands_out() ? palette().color(QPalette::HighlightedText)
                                      : state_colour(State::altered, shade_of(palette())));
        painter.drawEllipse(QRectF(place - dot_size, middle - dot_size / 2.0, dot_size, dot_size));
    }
}

void RailButton::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    paint_ground(painter);
    const QRect picture(m_narrow ? (width() - icon_size) / 2 : space::margin, (height() - icon_size) / 2, icon_size,
                        icon_size);
    icon().paint(&painter, picture, Qt::AlignCenter,
                 !isEnabled()   ? QIcon::Disabled
                 : stands_out() ? QIcon::Selected
                                : QIcon::Normal);
    const int marks = (m_marks.altered ? dot_size + inset : 0) + (m_marks.locked ? mark_size + inset : 0);
    if (!m_narrow)
        paint_words(painter, rect().adjusted(picture.right() + space::field + 2, 0, -space::field - marks, 0));
    paint_marks(painter);
}

} // namespace kindrel::desktop
