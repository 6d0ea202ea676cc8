#include "desktop/shell/look.h"

#include "desktop/shell/house_style.h"

#include <QApplication>
#include <QFontInfo>
#include <QLabel>

#include <algorithm>
#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

struct Size
{
    int points;
    QFont::Weight weight;
};

constexpr std::array sizes{Size{14, QFont::Bold}, Size{11, QFont::Bold}, Size{10, QFont::Normal},
                           Size{9, QFont::Normal}};
constexpr int body_points = 10;

/// The desktop's font, or Noto Sans where the desktop names none that exists.
QString usable_family(const QString& desktop_family)
{
    const QString real = QFontInfo(QFont(desktop_family)).family();
    const bool named = !desktop_family.isEmpty() && real.compare(desktop_family, Qt::CaseInsensitive) == 0;
    return named ? desktop_family : u"Noto Sans"_s;
}

/// What a widget was dressed with, so that it can be dressed again.
constexpr auto size_property = "kindrel_text_size";
constexpr auto width_property = "kindrel_width";
constexpr auto quiet_property = "kindrel_quiet";

void refresh_colour(QWidget& widget)
{
    QPalette palette;
    palette.setColor(QPalette::WindowText, quiet_colour(shade_of(QApplication::palette())));
    widget.setPalette(palette);
}

void refresh(QWidget& widget)
{
    if (const QVariant size = widget.property(size_property); size.isValid())
        widget.setFont(font_for(TextSize(size.toInt())));
    if (const QVariant width = widget.property(width_property); width.isValid())
        widget.setFixedWidth(int(width.toInt() * QApplication::font().pointSizeF() / body_points));
    if (widget.property(quiet_property).toBool())
        refresh_colour(widget);
}

} // namespace

Look::Look(QApplication& application)
    : m_application(application), m_desktop_shade(shade_of(QApplication::palette())),
      m_font_family(usable_family(QApplication::font().family()))
{
    QApplication::setStyle(new HouseStyle);
}

void Look::apply(Appearance appearance, int percent)
{
    m_appearance = appearance;
    m_percent = percent;
    const Shade chosen = appearance == Appearance::dark ? Shade::dark : Shade::light;
    QApplication::setPalette(palette_of(appearance == Appearance::desktop ? m_desktop_shade : chosen));
    QFont font(m_font_family);
    font.setPointSizeF(body_points * percent / 100.0);
    QApplication::setFont(font);
    const auto widgets = QApplication::allWidgets();
    for (QWidget* widget : widgets)
        refresh(*widget);
}

QFont font_for(TextSize size)
{
    const Size& wanted = sizes[static_cast<std::size_t>(size)];
    QFont font = QApplication::font();
    font.setPointSizeF(font.pointSizeF() * wanted.points / body_points);
    font.setWeight(wanted.weight);
    return font;
}

int row_height()
{
    return std::max(space::row, QFontMetrics(QApplication::font()).height() + 6);
}

void keep_text_size(QWidget& widget, TextSize size)
{
    widget.setProperty(size_property, int(size));
    refresh(widget);
}

void keep_width(QWidget& widget, int pixels)
{
    widget.setProperty(width_property, pixels);
    refresh(widget);
}

void dress(QLabel& label, TextSize size)
{
    label.setProperty(quiet_property, size == TextSize::secondary);
    keep_text_size(label, size);
}

} // namespace kindrel::desktop
