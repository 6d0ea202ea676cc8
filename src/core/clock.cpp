#include "core/clock.h"

#include <QThread>

namespace kindrel::core {

QDateTime SystemClock::now() const
{
    return QDateTime::currentDateTime();
}

bool SystemClock::wait(std::chrono::milliseconds time, Progress& progress)
{
    using namespace std::chrono_literals;
    const auto slice = 50ms;
    for (auto left = time; left > 0ms; left -= slice) {
        QThread::msleep(static_cast<unsigned long>(std::min(left, slice).count()));
        if (!progress.step())
            return false;
    }
    return true;
}

} // namespace kindrel::core
