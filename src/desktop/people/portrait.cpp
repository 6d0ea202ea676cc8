#include "desktop/people/portrait.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/palette.h"

#include <QImageReader>
#include <QPainter>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr QSize frame{132, 168};
constexpr int corner = 4;

QImage read(const QString& file)
{
    QImageReader reader(file);
    reader.setAutoTransform(true);
    return reader.read();
}

} // namespace

Portrait::Portrait(QWidget* parent) : QWidget(parent)
{
    setFixedSize(frame);
    setObjectName(u"portrait"_s);
}

void Portrait::show_file(const QString& file)
{
    const QImage picture = read(file);
    m_picture = picture.isNull()
                    ? QPixmap()
                    : QPixmap::fromImage(picture.scaled(frame * devicePixelRatio(), Qt::KeepAspectRatioByExpanding,
                                                        Qt::SmoothTransformation));
    setAccessibleName(empty() ? u"No photograph"_s : u"Photograph"_s);
    update();
}

void Portrait::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(line_colour(shade_of(palette())));
    painter.setBrush(palette().color(QPalette::Base));
    painter.drawRoundedRect(QRectF(rect()).adjusted(0.5, 0.5, -0.5, -0.5), corner, corner);
    if (empty()) {
        constexpr int size = 48;
        icon(u"user-identity"_s)
            .paint(&painter, rect().adjusted((width() - size) / 2, 0, -(width() - size) / 2, 0), Qt::AlignCenter,
                   QIcon::Disabled);
        return;
    }
    const QSize seen = frame * devicePixelRatio();
    const QRect part(QPoint((m_picture.width() - seen.width()) / 2, (m_picture.height() - seen.height()) / 2), seen);
    painter.drawPixmap(rect().adjusted(1, 1, -1, -1), m_picture, part);
}

} // namespace kindrel::desktop
