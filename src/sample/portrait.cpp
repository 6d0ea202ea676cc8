#include "sample/portrait.h"

#include "core/files.h"

#include <QBuffer>
#include <QImage>
#include <QPainter>
#include <QPainterPath>

#include <array>

namespace kindrel::sample {

using namespace Qt::StringLiterals;

namespace {

constexpr int quality = 52;
constexpr std::array<QRgb, 7> grounds{0xffcfe3ef, 0xffe8dcc6, 0xffd5e6cf, 0xfff0d9d2,
                                      0xffdcd6ea, 0xfff4e7b8, 0xffc9dcdc};
constexpr std::array<QRgb, 6> skins{0xfff6d7c0, 0xffe9bf9b, 0xffd49f74, 0xffae7749, 0xff8a5a35, 0xff60402a};
constexpr std::array<QRgb, 6> hairs{0xff2b1d16, 0xff4a2f1e, 0xff7a4a25, 0xffb5813f, 0xffd9b872, 0xff8f3f23};
constexpr std::array<QRgb, 7> clothes{0xff2f5d8a, 0xff8a2f3c, 0xff3d7350, 0xff6b4a86,
                                      0xffb0622a, 0xff37474f, 0xff00796b};
constexpr QRgb grey_hair = 0xffc9c9c6;
constexpr QRgb line = 0xff3a2a22;

/// Colours and shapes of one face, on a field of 300 by 400.
struct Face
{
    explicit Face(const Figure& figure);

    bool female, child, beard, glasses, long_hair, bald;
    QColor skin, hair, cloth;
    int smile;
};

Face::Face(const Figure& figure) : female(figure.female), child(figure.age < 14)
{
    Chance chance(figure.face);
    const bool grown_man = !female && figure.age > 22;
    skin = skins[static_cast<std::size_t>(figure.tone)];
    // The darker the skin, the fewer of the fair and red hairs at the end of the list.
    const int last_hair = figure.tone < 2 ? 5 : figure.tone < 4 ? 2 : 1;
    hair = hairs[static_cast<std::size_t>(chance.between(0, last_hair))];
    if (figure.age > 60 && chance.percent(85))
        hair = grey_hair;
    cloth = chance.pick(clothes);
    beard = chance.percent(30) && grown_man;
    bald = chance.percent(figure.age > 50 ? 40 : 8) && grown_man;
    glasses = chance.percent(figure.age > 45 ? 50 : 14);
    long_hair = chance.percent(figure.age > 60 ? 25 : 70) && female;
    smile = chance.between(24, 44);
}

void draw_shoulders(QPainter& painter, const Face& face)
{
    painter.setBrush(face.cloth);
    painter.drawRoundedRect(QRectF(30, 316, 240, 160), 90, 90);
    painter.setBrush(face.skin.darker(112));
    painter.drawRoundedRect(QRectF(122, 258, 56, 84), 24, 24);
    painter.setBrush(face.cloth.lighter(135));
    painter.drawPolygon(QPolygonF({{112, 322}, {150, 372}, {188, 322}, {206, 336}, {150, 396}, {94, 336}}));
}

void draw_hair_behind(QPainter& painter, const Face& face)
{
    if (!face.long_hair)
        return;
    painter.setBrush(face.hair.darker(115));
    painter.drawRoundedRect(QRectF(64, 78, 172, 250), 80, 80);
}

void draw_head(QPainter& painter, const Face& face)
{
    painter.setBrush(face.skin.darker(108));
    painter.drawEllipse(QPointF(78, 196), 14, 22);
    painter.drawEllipse(QPointF(222, 196), 14, 22);
    painter.setBrush(face.skin);
    painter.drawEllipse(QPointF(150, 190), 74, face.child ? 82 : 94);
}

void draw_hair(QPainter& painter, const Face& face)
{
    painter.setBrush(face.hair);
    if (face.bald) {
        painter.drawEllipse(QPointF(80, 172), 12, 32);
        painter.drawEllipse(QPointF(220, 172), 12, 32);
    } else {
        // The upper part of a cap around the head, cut by the forehead.
        QPainterPath cap;
        cap.addEllipse(QPointF(150, 172), 84, 88);
        QPainterPath forehead;
        forehead.addEllipse(QPointF(face.female ? 168 : 150, 236), 92, 100);
        painter.drawPath(cap.subtracted(forehead));
    }
    if (face.beard) {
        QPainterPath beard;
        beard.addEllipse(QPointF(150, 238), 66, 52);
        QPainterPath cheeks;
        cheeks.addEllipse(QPointF(150, 204), 70, 44);
        painter.drawPath(beard.subtracted(cheeks));
    }
}

void draw_features(QPainter& painter, const Face& face)
{
    painter.setBrush(QColor(line));
    for (const int x : {120, 180})
        painter.drawEllipse(QPointF(x, 190), 7, 9);
    painter.setBrush(QColor(235, 120, 110, 70));
    for (const int x : {104, 196})
        painter.drawEllipse(QPointF(x, 222), 15, 11);
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(QColor(line), 5, Qt::SolidLine, Qt::RoundCap));
    painter.drawArc(QRectF(150 - face.smile, 212, 2.0 * face.smile, 40), 200 * 16, 140 * 16);
    painter.drawArc(QRectF(141, 196, 18, 24), 210 * 16, 120 * 16);
    if (!face.glasses)
        return;
    painter.setPen(QPen(QColor(line), 4));
    painter.drawEllipse(QPointF(120, 190), 25, 22);
    painter.drawEllipse(QPointF(180, 190), 25, 22);
    painter.drawLine(QPointF(145, 188), QPointF(155, 188));
}

void draw_face(QPainter& painter, const QRectF& place, const Figure& figure)
{
    const Face face(figure);
    const double size = face.child ? 0.88 : 1;
    painter.save();
    painter.translate(place.left(), place.top());
    painter.scale(place.width() / 300, place.height() / 400);
    painter.translate(150 * (1 - size), 400 * (1 - size));
    painter.scale(size, size);
    painter.setPen(Qt::NoPen);
    for (const auto draw : {draw_hair_behind, draw_shoulders, draw_head, draw_hair, draw_features})
        draw(painter, face);
    painter.restore();
}

QImage ground_for(const Figure& figure, const QSize& size)
{
    QImage image(size, QImage::Format_RGB32);
    image.fill(QColor(grounds[figure.face % grounds.size()]));
    return image;
}

void write_picture(const QImage& image, const QString& file)
{
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    if (!image.save(&buffer, "JPG", quality))
        throw core::FileError(u"The picture for %1 could not be made."_s.arg(file));
    core::write_file(file, bytes);
}

} // namespace

QImage portrait_of(const Figure& figure)
{
    auto image = ground_for(figure, {300, 400});
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    draw_face(painter, {0, 0, 300, 400}, figure);
    return image;
}

QImage family_photo_of(std::span<const Figure> figures)
{
    const auto shown = figures.first(std::min<std::size_t>(figures.size(), 6));
    auto image = ground_for(shown.front(), {400, 300});
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    const double step = 400.0 / static_cast<double>(shown.size() + 1);
    const double width = std::min(210.0, step * 2.1);
    for (std::size_t i = shown.size(); i > 0; --i) {
        const double middle = step * static_cast<double>(i);
        draw_face(painter, {middle - width / 2, 300 - width * 4 / 3, width, width * 4 / 3}, shown[i - 1]);
    }
    return image;
}

void write_photographs(const MadeFamily& family, const QString& folder)
{
    const auto& file = family.file;
    for (std::size_t place = 0; place < file.people.size(); ++place) {
        if (const int person = file.people[place].person_id; person % 3 == 0)
            write_picture(portrait_of(family.figures[place]), core::as_folder(folder) + u"%1.jpg"_s.arg(person));
    }
    if (const int surname = file.family.Surname_ID; surname % 9 == 0)
        write_picture(family_photo_of(family.figures), core::as_folder(folder) + u"F%1.jpg"_s.arg(surname));
}

} // namespace kindrel::sample
