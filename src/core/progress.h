#pragma once

#include <QString>

namespace kindrel::core {

/// A long run's report. A step yields to the event loop: nothing of the office's own session may be open then.
class Progress
{
public:
    virtual ~Progress() = default;
    /// Empty question: no cancelling.
    virtual void begin(const QString& what, int steps, const QString& cancel_question) = 0;
    /// False once cancelled and confirmed.
    [[nodiscard]] virtual bool step(const QString& what = {}) = 0;
    virtual void end() = 0;
};

/// Reports nothing and is never cancelled.
class SilentProgress : public Progress
{
public:
    void begin(const QString&, int, const QString&) override {}
    bool step(const QString& = {}) override { return true; }
    void end() override {}
};

} // namespace kindrel::core
