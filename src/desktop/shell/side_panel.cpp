#include "desktop/shell/side_panel.h"

#include "desktop/shell/look.h"

#include <QScrollArea>

namespace kindrel::desktop {

QScrollArea* make_side_panel(QLayout* content, int width)
{
    auto* panel = new QWidget;
    panel->setLayout(content);
    panel->setAutoFillBackground(false);
    auto* scroll = new QScrollArea;
    scroll->setWidgetResizable(true);
    scroll->setFrameShape(QFrame::NoFrame);
    scroll->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    scroll->setFocusPolicy(Qt::NoFocus);
    keep_width(*scroll, width);
    scroll->setWidget(panel);
    scroll->viewport()->setAutoFillBackground(false);
    return scroll;
}

} // namespace kindrel::desktop
