#include "desktop/shell/look.h"

#include "desktop/shell/house_style.h"

#include <QApplication>
#include <QEvent>
#include <QFontDatabase>
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

constexpr std::array sizes{Size{14, QFont::Bold}, Size{11, QFont::Bold}, Size{10, QFont::Normal}, Size{9, QFont::Normal}};
constexpr int body_points = 10;

/// The desktop's font, or Noto Sans where the desktop names none that exists.
QString usable_family(const QString& desktop_family)
{
    const QString real = QFontInfo(QFont(desktop_family)).family();
    const bool named = !desktop_family.isEmpty() && real.compare(desktop_family, Qt::CaseInsensitive) == 0;
    return named ? desktop_family : u"Noto Sans"_s;
}

/// Keeps secondary text quiet when the palette changes under it.
class QuietText : public QObject
{
public:
    explicit QuietText(QLabel& label) : QObject(&label), m_label(label)
    {
        label.installEventFilter(this);
        paint();
    }

protected:
    bool eventFilter(QObject* target, QEvent* event) override
    {
        if (event->type() == QEvent::PaletteChange)
            paint();
        return QObject::eventFilter(target, event);
    }

private:
    void paint()
    {
        const QColor quiet = quiet_colour(shade_of(m_label.palette()));
        if (m_label.palette().color(QPalette::WindowText) == quiet)
            return;
        QPalette palette;
        palette.setColor(QPalette::WindowText, quiet);
        m_label.setPalette(palette);
    }

    QLabel& m_label;
};

}

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

void dress(QLabel& label, TextSize size)
{
    label.setFont(font_for(size));
    if (size == TextSize::secondary)
        new QuietText(label);
}

}
