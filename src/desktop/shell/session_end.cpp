#include "desktop/shell/session_end.h"

#include <QEvent>
#include <QGuiApplication>

namespace kindrel::desktop {

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
    if (event->type() == QEvent::Quit && target == QCoreApplication::instance()) {
        m_told_to_quit = true; // While the windows are closed; one of them may stay.
        QMetaObject::invokeMethod(
            this, [this] { m_told_to_quit = false; }, Qt::QueuedConnection);
    }
    return QObject::eventFilter(target, event);
}

} // namespace kindrel::desktop
