#pragma once

#include "core/progress.h"

#include <QTextStream>

#include <csignal>

namespace kindrel::apps {

/// Shows on standard error how far a run has come, where that is a terminal. While it lives, Ctrl+C and a request to
/// end do not kill the program, which would leave the church marked as busy: they give the run up at its next step.
class TerminalProgress final : public core::Progress
{
public:
    TerminalProgress();
    ~TerminalProgress() override;
    TerminalProgress(const TerminalProgress&) = delete;
    TerminalProgress& operator=(const TerminalProgress&) = delete;
    void begin(const QString& what, int steps, const QString& cancel_question) override;
    bool step(const QString& what = {}) override;
    void end() override;
    [[nodiscard]] bool given_up() const { return m_given_up; }

private:
    /// Whatever is written next stands in place of the line.
    void write_line(const QString& line);

    QTextStream m_err;
    bool m_shown;
    QString m_what;
    int m_steps = 0;
    int m_done = 0;
    bool m_given_up = false;
    sigset_t m_before{};
};

} // namespace kindrel::apps
