#pragma once

#include "core/clock.h"

#include <QList>

#include <functional>

namespace kindrel::test {

/// Stands still but for the waiting, which takes no time.
class FixedClock : public core::Clock
{
public:
    explicit FixedClock(const QDate& today = {2024, 5, 15}, const QTime& time = {10, 30}) : m_now(today, time) {}

    void set(const QDateTime& now) { m_now = now; }
    void set(const QDate& today) { m_now.setDate(today); }
    /// What happens meanwhile, with the number of the wait from 1.
    void on_wait(std::function<void(int)> event) { m_on_wait = std::move(event); }
    [[nodiscard]] const QList<std::chrono::milliseconds>& waits() const { return m_waits; }

    [[nodiscard]] QDateTime now() const override { return m_now; }
    [[nodiscard]] bool wait(std::chrono::milliseconds time, core::Progress&) override
    {
        m_waits += time;
        m_now = m_now.addMSecs(time.count());
        if (m_on_wait)
            m_on_wait(static_cast<int>(m_waits.size()));
        return true;
    }

private:
    QDateTime m_now;
    std::function<void(int)> m_on_wait;
    QList<std::chrono::milliseconds> m_waits;
};

} // namespace kindrel::test
