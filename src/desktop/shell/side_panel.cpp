#include "desktop/shell/side_panel.h"

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
    scroll->setFixedWidth(width);
    scroll->setWidget(panel);
    scroll->viewport()->setAutoFillBackground(false);
    return scroll;
}

}
