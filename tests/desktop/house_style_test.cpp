#include "desktop/desktop_fixture.h"
#include "desktop/shell/palette.h"

#include <QCheckBox>
#include <QLineEdit>
#include <QStyle>

#include <algorithm>
#include <cmath>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

using HouseStyleTest = DesktopTest;

qreal luminance(QColor colour)
{
    const auto linear = [](float part) {
        return part <= 0.04045F ? qreal(part) / 12.92 : std::pow((qreal(part) + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(colour.redF()) + 0.7152 * linear(colour.greenF()) + 0.0722 * linear(colour.blueF());
}

qreal contrast(QColor one, QColor other)
{
    const auto [dark, light] = std::minmax({luminance(one), luminance(other)});
    return (light + 0.05) / (dark + 0.05);
}

/// The best contrast against the window along a line down the middle of the `width` left-most pixels.
qreal strongest_edge(QWidget& widget, int width)
{
    const QImage picture = widget.grab().toImage();
    const QColor ground = widget.palette().color(QPalette::Window);
    qreal best = 1;
    for (int y = 0; y < picture.height(); ++y)
        best = std::max(best, contrast(picture.pixelColor(width / 2, y), ground));
    return best;
}

} // namespace

TEST_F(HouseStyleTest, WhatIsTickedOrFilledInHasAnEdgeThatCanBeSeen)
{
    for (const auto appearance : {desktop::Appearance::light, desktop::Appearance::dark}) {
        look.apply(appearance, 100);
        QCheckBox box;
        QLineEdit field;
        EXPECT_GE(strongest_edge(box, box.style()->pixelMetric(QStyle::PM_IndicatorWidth)), 3) << int(appearance);
        EXPECT_GE(strongest_edge(field, field.sizeHint().width()), 3) << int(appearance);
    }
}

TEST_F(HouseStyleTest, ATickCanBeToldFromAnEmptyBoxAndFromNeither)
{
    for (const auto appearance : {desktop::Appearance::light, desktop::Appearance::dark}) {
        look.apply(appearance, 100);
        QCheckBox box;
        box.setTristate(true);
        std::vector<QImage> pictures;
        for (const auto state : {Qt::Unchecked, Qt::PartiallyChecked, Qt::Checked}) {
            box.setCheckState(state);
            pictures.push_back(box.grab().toImage());
        }
        EXPECT_TRUE(pictures[0] != pictures[1] && pictures[1] != pictures[2] && pictures[0] != pictures[2]);
    }
}

} // namespace kindrel::test
