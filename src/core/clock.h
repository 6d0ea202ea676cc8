#pragma once

#include "core/progress.h"

#include <QDateTime>

#include <chrono>

namespace kindrel::core {

/// Today, now and waiting; rules never ask the system itself.
class Clock
{
public:
    virtual ~Clock() = default;
    [[nodiscard]] virtual QDateTime now() const = 0;
    /// False when cancelled.
    [[nodiscard]] virtual bool wait(std::chrono::milliseconds time, Progress& progress) = 0;
    [[nodiscard]] QDate today() const { return now().date(); }
};

/// The workstation's own clock.
class SystemClock : public Clock
{
public:
    [[nodiscard]] QDateTime now() const override;
    [[nodiscard]] bool wait(std::chrono::milliseconds time, Progress& progress) override;
};

} // namespace kindrel::core
