#include "desktop/shell/windows.h"

#include <QKeySequence>
#include <QShortcut>

#include <algorithm>

namespace kindrel::desktop {

namespace {

constexpr QPoint cascade{28, 28};

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
    follow_window(m_remembered, *window, first_size);
    if (sister != m_windows.rend())
        window->move((*sister)->pos() + cascade);
    auto* close = new QShortcut(QKeySequence(Qt::CTRL | Qt::Key_W), window);
    QObject::connect(close, &QShortcut::activated, window, &QWidget::close);
    m_windows.emplace_back(window);
    bring_forward(*window);
}

void bring_forward(QWidget& window)
{
    window.show();
    window.raise();
    window.activateWindow();
}

} // namespace kindrel::desktop
