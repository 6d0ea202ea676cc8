#include "desktop/shell/input_guard.h"

#include <QApplication>
#include <QKeyEvent>
#include <QWidget>

namespace kindrel::desktop {

std::chrono::milliseconds since_start()
{
    using namespace std::chrono;
    return duration_cast<milliseconds>(steady_clock::now().time_since_epoch());
}

InputGuard::InputGuard(QWidget& box, Stopwatch now)
    : QObject(&box), m_box(box), m_now(std::move(now)), m_shown_at(m_now())
{
    QApplication::instance()->installEventFilter(this);
}

InputGuard::~InputGuard() = default;

bool InputGuard::is_answer(QEvent& event) const
{
    switch (event.type()) {
    case QEvent::ShortcutOverride:
    case QEvent::KeyPress:
    case QEvent::KeyRelease:
        return m_now() - m_shown_at < deaf_time || static_cast<QKeyEvent&>(event).isAutoRepeat();
    case QEvent::Shortcut:
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
        return m_now() - m_shown_at < deaf_time;
    default:
        return false;
    }
}

bool InputGuard::eventFilter(QObject* target, QEvent* event)
{
    auto* widget = qobject_cast<QWidget*>(target);
    if (!widget || widget->window() != &m_box)
        return false;
    if (widget == &m_box && event->type() == QEvent::Show)
        m_shown_at = m_now();
    if (!is_answer(*event))
        return false;
    // An accepted override is what keeps a shortcut from firing.
    event->accept();
    return true;
}

} // namespace kindrel::desktop
