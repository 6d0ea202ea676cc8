#pragma once

#include "desktop/shell/remembered.h"

#include <QPointer>
#include <QWidget>

#include <vector>

namespace kindrel::desktop {

/// The windows beside the main one: family cards and previews. They go when the office goes.
class Windows
{
public:
    explicit Windows(Remembered& remembered) : m_remembered(remembered) {}
    Windows(const Windows&) = delete;
    Windows& operator=(const Windows&) = delete;
    ~Windows();

    /// Shows the window, a step beside its last sister, and owns it until it closes.
    void open(QWidget* window, QSize first_size);
    /// The open windows of one kind, in the order of opening.
    template <class W>
    [[nodiscard]] std::vector<W*> all() const
    {
        std::vector<W*> found;
        for (const auto& window : m_windows)
            if (auto* wanted = qobject_cast<W*>(window.data()))
                found.push_back(wanted);
        return found;
    }

private:
    Remembered& m_remembered;
    std::vector<QPointer<QWidget>> m_windows;
};

/// To the front, with the keyboard.
void bring_forward(QWidget& window);

} // namespace kindrel::desktop
