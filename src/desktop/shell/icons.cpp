#include "desktop/shell/icons.h"

#include "desktop/shell/palette.h"

#include <QApplication>
#include <QFile>
#include <QIconEngine>
#include <QPainter>
#include <QSvgRenderer>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

/// The file drawn for sizes like this one, else the general one.
QString file_of(const QString& name, Shade shade, int size)
{
    const QString folder = shade == Shade::dark ? u":/icons/dark/"_s : u":/icons/light/"_s;
    const int drawn = size <= 16 ? 16 : size <= 32 ? 22 : 64;
    const QString file = u"%1%2/%3.svg"_s.arg(folder).arg(drawn).arg(name);
    return QFile::exists(file) ? file : folder + u"22/"_s + name + u".svg"_s;
}

class ThemedIcon : public QIconEngine
{
public:
    explicit ThemedIcon(QString name) : m_name(std::move(name)) {}

    void paint(QPainter* painter, const QRect& rect, QIcon::Mode mode, QIcon::State) override
    {
        const Shade shade = mode == QIcon::Selected ? Shade::dark : shade_of(QApplication::palette());
        const int side = std::min(rect.width(), rect.height());
        QRect place(0, 0, side, side);
        place.moveCenter(rect.center());
        QSvgRenderer drawing(file_of(m_name, shade, side));
        painter->save();
        if (mode == QIcon::Disabled)
            painter->setOpacity(0.4);
        drawing.render(painter, place);
        painter->restore();
    }

    QPixmap pixmap(const QSize& size, QIcon::Mode mode, QIcon::State state) override
    {
        QPixmap picture(size);
        picture.fill(Qt::transparent);
        QPainter painter(&picture);
        paint(&painter, QRect(QPoint(), size), mode, state);
        return picture;
    }

    QIconEngine* clone() const override { return new ThemedIcon(*this); }
    bool isNull() override { return !QFile::exists(file_of(m_name, Shade::light, 22)); }

private:
    QString m_name;
};

} // namespace

QIcon icon(const QString& name)
{
    return QIcon(new ThemedIcon(name));
}

} // namespace kindrel::desktop
