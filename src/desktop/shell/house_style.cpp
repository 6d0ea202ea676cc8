#include "desktop/shell/house_style.h"

#include "desktop/shell/house_drawing.h"
#include "desktop/shell/look.h"

#include <QPainter>
#include <QStyleFactory>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int header_margin = 6;

}

HouseStyle::HouseStyle() : QProxyStyle(QStyleFactory::create(u"Fusion"_s)) {}

QSize HouseStyle::sizeFromContents(ContentsType type, const QStyleOption* option, const QSize& size,
                                   const QWidget* widget) const
{
    QSize result = QProxyStyle::sizeFromContents(type, option, size, widget);
    switch (type) {
    case CT_PushButton:
    case CT_LineEdit:
    case CT_ComboBox:
    case CT_SpinBox:
    case CT_ToolButton:
        result.setHeight(std::max(result.height(), space::control));
        break;
    case CT_ItemViewItem:
        result.setHeight(std::max(result.height(), row_height()));
        break;
    case CT_TabBarTab:
        result += QSize(space::field, space::field / 2);
        break;
    default:
        break;
    }
    return result;
}

int HouseStyle::pixelMetric(PixelMetric metric, const QStyleOption* option, const QWidget* widget) const
{
    switch (metric) {
    case PM_ToolBarItemSpacing:
        return space::field / 2;
    case PM_ToolBarItemMargin:
        return space::field / 2;
    case PM_ButtonShiftHorizontal:
    case PM_ButtonShiftVertical:
    case PM_TabBarTabShiftVertical:
        return 0;
    case PM_FocusFrameHMargin: // What stands before the text of a row.
        return 6;
    case PM_TabBarTabHSpace:
        return space::margin;
    case PM_HeaderMargin:
        return header_margin;
    case PM_ScrollBarExtent:
        return 12;
    default:
        return QProxyStyle::pixelMetric(metric, option, widget);
    }
}

int HouseStyle::styleHint(StyleHint hint, const QStyleOption* option, const QWidget* widget,
                          QStyleHintReturn* data) const
{
    if (hint == SH_EtchDisabledText || hint == SH_DitherDisabledText)
        return 0;
    return QProxyStyle::styleHint(hint, option, widget, data);
}

QRect HouseStyle::subElementRect(SubElement element, const QStyleOption* option, const QWidget* widget) const
{
    const QRect place = QProxyStyle::subElementRect(element, option, widget);
    return element == SE_LineEditContents ? place.adjusted(3, 0, -3, 0) : place;
}

QRect HouseStyle::subControlRect(ComplexControl control, const QStyleOptionComplex* option, SubControl part,
                                 const QWidget* widget) const
{
    const auto* bar = qstyleoption_cast<const QStyleOptionSlider*>(option);
    if (control != CC_ScrollBar || !bar)
        return QProxyStyle::subControlRect(control, option, part, widget);
    const QRect slider = scroll_slider(*bar);
    const QRect all = option->rect;
    const bool across = bar->orientation == Qt::Horizontal;
    switch (part) {
    case SC_ScrollBarSlider:
        return slider;
    case SC_ScrollBarGroove:
        return all;
    case SC_ScrollBarSubPage:
        return across ? QRect(all.topLeft(), QPoint(slider.left() - 1, all.bottom()))
                      : QRect(all.topLeft(), QPoint(all.right(), slider.top() - 1));
    case SC_ScrollBarAddPage:
        return across ? QRect(QPoint(slider.right() + 1, all.top()), all.bottomRight())
                      : QRect(QPoint(all.left(), slider.bottom() + 1), all.bottomRight());
    default:
        return {};
    }
}

void HouseStyle::drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                               const QWidget* widget) const
{
    const auto* button = qstyleoption_cast<const QStyleOptionButton*>(option);
    if (element == PE_PanelButtonCommand && button)
        draw_button(*option, *painter, button->features & QStyleOptionButton::Flat ? Ground::flat : Ground::raised);
    else if (element == PE_PanelButtonTool)
        draw_button(*option, *painter, Ground::flat);
    else if (element == PE_IndicatorCheckBox)
        draw_tick_box(*option, *painter);
    else if (element == PE_FrameLineEdit)
        draw_field_edge(*option, *painter);
    else if (element == PE_Frame)
        draw_frame(*option, *painter);
    else
        QProxyStyle::drawPrimitive(element, option, painter, widget);
}

void HouseStyle::drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
                             const QWidget* widget) const
{
    const auto* tab = qstyleoption_cast<const QStyleOptionTab*>(option);
    const auto* heading = qstyleoption_cast<const QStyleOptionHeader*>(option);
    if (element == CE_HeaderSection && heading)
        draw_header_section(*heading, *painter);
    else if (element == CE_HeaderLabel && heading) {
        // The margin is meant for the sides: a heading needs the whole height.
        QStyleOptionHeader whole(*heading);
        whole.rect.adjust(0, -header_margin, 0, header_margin);
        QProxyStyle::drawControl(element, &whole, painter, widget);
    } else if (element == CE_HeaderEmptyArea)
        draw_header_ground(*option, *painter);
    else if (element == CE_TabBarTabShape && tab)
        draw_tab(*tab, *painter);
    else
        QProxyStyle::drawControl(element, option, painter, widget);
}

void HouseStyle::drawComplexControl(ComplexControl control, const QStyleOptionComplex* option, QPainter* painter,
                                    const QWidget* widget) const
{
    const auto* bar = qstyleoption_cast<const QStyleOptionSlider*>(option);
    if (control == CC_ScrollBar && bar)
        draw_scroll_bar(*bar, scroll_slider(*bar), *painter);
    else
        QProxyStyle::drawComplexControl(control, option, painter, widget);
}

} // namespace kindrel::desktop
