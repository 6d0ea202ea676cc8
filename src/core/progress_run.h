#pragma once

#include "core/progress.h"

namespace kindrel::core {

/// Begins a long run and ends it, however it goes.
class ProgressRun
{
public:
    ProgressRun(Progress& progress, const QString& what, int steps, const QString& cancel_question)
        : m_progress(progress)
    {
        m_progress.begin(what, steps, cancel_question);
    }
    ProgressRun(const ProgressRun&) = delete;
    ProgressRun& operator=(const ProgressRun&) = delete;
    ~ProgressRun() { m_progress.end(); }

private:
    Progress& m_progress;
};

} // namespace kindrel::core
