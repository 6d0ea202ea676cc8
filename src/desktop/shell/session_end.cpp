#include "desktop/shell/session_end.h"

#include <QEvent>
#include <QGuiApplication>
#include <QSessionManager>
#include <QWidget>

namespace kindrel::desktop {

namespace {

bool ends_program(const QObject* target, const QEvent& event)
{
    return event.type() == QEvent::Quit && target == QCoreApplication::instance();
}

bool closes_window(const QObject* target, const QEvent& event)
{
    const auto* widget = event.type() == QEvent::Close ? qobject_cast<const QWidget*>(target) : nullptr;
    return widget && widget->isWindow() && !widget->isModal() && widget->windowType() != Qt::Popup;
}

} // namespace

SessionEnd::SessionEnd()
{
    QCoreApplication::instance()->installEventFilter(this);
}

bool SessionEnd::under_way() const
{
    return m_told_to_quit || qGuiApp->isSavingSession();
}

bool SessionEnd::eventFilter(QObject* target, QEvent* event)
{
    if (ends_program(target, *event)) {
        m_told_to_quit = true; // While the windows are closed; one of them may stay.
        QMetaObject::invokeMethod(
            this, [this] { m_told_to_quit = false; }, Qt::QueuedConnection);
    }
    return QObject::eventFilter(target, event);
}

SessionHold::SessionHold()
{
    QCoreApplication::instance()->installEventFilter(this);
    connect(
        qGuiApp, &QGuiApplication::commitDataRequest, this,
        [](QSessionManager& session) {
            if (session.allowsErrorInteraction())
                session.cancel();
        },
        Qt::DirectConnection);
}

bool SessionHold::eventFilter(QObject* target, QEvent* event)
{
    if (!ends_program(target, *event) && !closes_window(target, *event))
        return false;
    event->ignore();
    return true;
}

} // namespace kindrel::desktop
