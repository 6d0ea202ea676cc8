#pragma once

#include "core/dialogue.h"
#include "core/progress.h"
#include "desktop/shell/input_guard.h"

#include <memory>

class QProgressDialog;

namespace kindrel::desktop {

class SessionHold;

/// A box with a bar in front of everything, once a run has lasted long enough to be noticed. A new text is shown at
/// once, so it belongs to a few steps of a run. The program stays open until the run has ended.
class QtProgress : public core::Progress
{
public:
    explicit QtProgress(core::Dialogue& dialogue, Stopwatch now = since_start);
    ~QtProgress() override;

    void begin(const QString& what, int steps, const QString& cancel_question) override;
    [[nodiscard]] bool step(const QString& what) override;
    void end() override;

private:
    void show_state();
    /// Whoever wished to stop did so under the text before, and was asked already.
    void show_text(const QString& what);
    /// Asks where the box was cancelled.
    [[nodiscard]] bool stopped();

    core::Dialogue& m_dialogue;
    std::unique_ptr<QProgressDialog> m_box;
    std::unique_ptr<SessionHold> m_hold;
    QString m_question;
    int m_done = 0;
    Stopwatch m_now;
    std::chrono::milliseconds m_begun{0}, m_shown{0};
};

} // namespace kindrel::desktop
