#include "desktop/shell/windows.h"

#include <QAbstractEventDispatcher>
#include <QEvent>
#include <QKeySequence>
#include <QShortcut>
#include <QThread>

#include <algorithm>
#include <utility>

namespace kindrel::desktop {

namespace {

constexpr QPoint cascade{28, 28};

}

Windows::Windows(Remembered& remembered)
    : m_remembered(remembered), m_own_loop(std::max(1, QThread::currentThread()->loopLevel()))
{
    connect(QAbstractEventDispatcher::instance(), &QAbstractEventDispatcher::aboutToBlock, this, &Windows::let_go);
}

Windows::~Windows()
{
    for (const auto& window : m_windows)
        delete window.data();
}

void Windows::open(QWidget* window, QSize first_size)
{
    std::erase_if(m_windows, [](const auto& one) { return one.isNull(); });
    const auto sister = std::find_if(m_windows.rbegin(), m_windows.rend(), [window](const auto& one) {
        return one->objectName() == window->objectName() && one->isVisible();
    });
    window->setAttribute(Qt::WA_DeleteOnClose);
    window->installEventFilter(this);
    follow_window(m_remembered, *window, first_size);
    if (sister != m_windows.rend())
        window->move((*sister)->pos() + cascade);
    auto* close = new QShortcut(QKeySequence(Qt::CTRL | Qt::Key_W), window);
    QObject::connect(close, &QShortcut::activated, window, &QWidget::close);
    m_windows.emplace_back(window);
    bring_forward(*window);
}

void Windows::close_all()
{
    for (const auto& window : std::vector(m_windows))
        if (window)
            window->close();
}

bool Windows::eventFilter(QObject* target, QEvent* event)
{
    auto* window = qobject_cast<QWidget*>(target);
    if (window && event->type() == QEvent::Close && !boxes_gone()) {
        window->setAttribute(Qt::WA_DeleteOnClose, false);
        m_closed.emplace_back(window);
    }
    return QObject::eventFilter(target, event);
}

bool Windows::boxes_gone() const
{
    return QThread::currentThread()->loopLevel() <= m_own_loop;
}

void Windows::let_go()
{
    if (!boxes_gone())
        return;
    for (const auto& window : std::exchange(m_closed, {})) {
        if (window && window->isVisible()) // It stayed.
            window->setAttribute(Qt::WA_DeleteOnClose);
        else
            delete window.data();
    }
}

void bring_forward(QWidget& window)
{
    window.show();
    window.raise();
    window.activateWindow();
}

} // namespace kindrel::desktop
