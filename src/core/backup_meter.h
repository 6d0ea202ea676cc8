#pragma once

#include "core/progress_run.h"

#include <algorithm>

namespace kindrel::core {

/// The person gave up a long run. Thrown and caught inside the engine: what was begun is taken away on the way.
struct Cancelled
{
};

/// Turns amounts of bytes into `meter_steps` steps of a progress: so many that a church with its photographs makes one
/// several times a second. Work that has to be done twice makes more.
class ByteMeter
{
public:
    static constexpr int meter_steps = 500;

    ByteMeter(Progress& progress, qint64 total) : m_progress(progress), m_total(std::max<qint64>(total, 1)) {}

    /// False once cancelled.
    [[nodiscard]] bool advance(qint64 bytes)
    {
        m_done += bytes;
        for (; m_running && m_steps < m_done * meter_steps / m_total; ++m_steps)
            m_running = m_progress.step();
        return m_running;
    }
    /// Throws Cancelled.
    void add(qint64 bytes)
    {
        if (!advance(bytes))
            throw Cancelled();
    }
    /// A step more, after work that is not counted in bytes. Throws Cancelled.
    void step()
    {
        m_running = m_running && m_progress.step();
        if (!m_running)
            throw Cancelled();
    }

private:
    Progress& m_progress;
    qint64 m_total;
    qint64 m_done = 0;
    int m_steps = 0;
    bool m_running = true;
};

} // namespace kindrel::core
