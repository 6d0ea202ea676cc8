#pragma once

#include "core/dialogue.h"
#include "core/progress.h"

#include <QElapsedTimer>
#include <QWidget>

class QLabel;
class QProgressBar;
class QPushButton;

namespace kindrel::desktop {

/// A run's progress in the foot of the window that waits for it, with the way to cancel. Yields to the event loop.
class RunStrip : public QWidget, public core::Progress
{
    Q_OBJECT

public:
    explicit RunStrip(core::Dialogue& dialogue, QWidget* parent = nullptr);

    void begin(const QString& what, int steps, const QString& cancel_question) override;
    [[nodiscard]] bool step(const QString& what) override;
    void end() override;
    /// Asks at the next step whether to cancel.
    void ask_to_cancel() { m_asked = true; }
    /// Lets the window draw itself now.
    void yield();

private:
    core::Dialogue& m_dialogue;
    QLabel* m_what;
    QProgressBar* m_bar;
    QPushButton* m_cancel;
    QString m_question;
    bool m_asked = false;
    int m_done = 0;
    QElapsedTimer m_shown;
};

} // namespace kindrel::desktop
