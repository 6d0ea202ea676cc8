#include "desktop/shell/only_window.h"

#include <QApplication>
#include <QEvent>
#include <QWidget>

namespace kindrel::desktop {

namespace {

bool is_input(const QEvent& event)
{
    switch (event.type()) {
    case QEvent::KeyPress:
    case QEvent::KeyRelease:
    case QEvent::ShortcutOverride:
    case QEvent::Shortcut:
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
    case QEvent::Wheel:
    case QEvent::ContextMenu:
        return true;
    case QEvent::Close:
        return event.spontaneous();
    default:
        return false;
    }
}

} // namespace

OnlyWindow::OnlyWindow(QWidget& window) : m_window(window)
{
    QApplication::instance()->installEventFilter(this);
}

OnlyWindow::~OnlyWindow() = default;

bool OnlyWindow::eventFilter(QObject* target, QEvent* event)
{
    if (!is_input(*event))
        return false;
    auto* widget = qobject_cast<QWidget*>(target);
    if (!widget || widget->window() == &m_window || widget->window()->isModal() ||
        widget->window()->windowType() == Qt::Popup)
        return false;
    event->setAccepted(event->type() != QEvent::Close);
    return true;
}

} // namespace kindrel::desktop
