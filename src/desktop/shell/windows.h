#pragma once

#include "desktop/shell/remembered.h"

#include <QPointer>
#include <QWidget>

#include <vector>

namespace kindrel::desktop {

/// The windows beside the main one: family cards and previews. They go when the office goes.
class Windows : public QObject
{
    Q_OBJECT

public:
    explicit Windows(Remembered& remembered);
    ~Windows() override;

    /// Shows the window, a step beside its last sister, and owns it until it closes.
    void open(QWidget* window, QSize first_size);
    void close_all();
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

protected:
    /// A window that closed stays until no box above it is open any more: the box may be its child.
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    [[nodiscard]] bool boxes_gone() const;
    void let_go();

    Remembered& m_remembered;
    int m_own_loop;
    std::vector<QPointer<QWidget>> m_windows;
    std::vector<QPointer<QWidget>> m_closed; ///< Those of them that are to be deleted.
};

/// To the front, with the keyboard.
void bring_forward(QWidget& window);

} // namespace kindrel::desktop
