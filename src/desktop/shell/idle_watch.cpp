#include "desktop/shell/idle_watch.h"

#include <QCoreApplication>
#include <QEvent>
#include <QTimer>

namespace kindrel::desktop {

IdleWatch::IdleWatch(QObject* parent) : QObject(parent), m_timer(new QTimer(this))
{
    m_timer->setSingleShot(true);
    m_timer->setInterval(patience);
    connect(m_timer, &QTimer::timeout, this, &IdleWatch::idle);
    m_timer->start();
    QCoreApplication::instance()->installEventFilter(this);
}

bool IdleWatch::eventFilter(QObject* target, QEvent* event)
{
    switch (event->type()) {
    case QEvent::KeyPress:
    case QEvent::MouseButtonPress:
    case QEvent::MouseMove:
    case QEvent::Wheel:
        if (!m_timer->isActive())
            Q_EMIT returned();
        m_timer->start();
        break;
    default:
        break;
    }
    return QObject::eventFilter(target, event);
}

} // namespace kindrel::desktop
