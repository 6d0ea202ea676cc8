#pragma once

#include <QByteArray>

#include <chrono>
#include <functional>
#include <vector>

namespace kindrel::test {

/// Tells the parent that the work proper begins.
using Ready = std::function<void()>;

/// Runs `work` in a process of its own and kills it this long after it said that it is ready. The work should go on for
/// ever; a child that ends by itself or fails before it is ready fails the test.
void run_and_kill(const std::function<void(const Ready&)>& work, std::chrono::microseconds after);

/// Runs each piece of work in a process of its own, all at once, and returns what each returned. A child that throws
/// fails the test.
[[nodiscard]] std::vector<QByteArray> run_together(const std::vector<std::function<QByteArray()>>& works);

} // namespace kindrel::test
