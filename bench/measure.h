#pragma once

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <functional>
#include <string>
#include <vector>

namespace kindrel::bench {

using Work = std::function<void()>;

/// Milliseconds of each round, in order of time.
class Times
{
public:
    void add(double milliseconds) { m_all.push_back(milliseconds); }
    [[nodiscard]] double median() const { return sorted()[m_all.size() / 2]; }
    [[nodiscard]] double best() const { return sorted().front(); }
    [[nodiscard]] double worst() const { return sorted().back(); }

private:
    [[nodiscard]] std::vector<double> sorted() const
    {
        auto all = m_all;
        std::ranges::sort(all);
        return all;
    }
    std::vector<double> m_all;
};

inline double milliseconds_of(const Work& work)
{
    const auto start = std::chrono::steady_clock::now();
    work();
    return std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start).count();
}

struct Comparison
{
    Times ours;
    Times bare;

    [[nodiscard]] double ratio() const { return ours.median() / bare.median(); }
};

/// Runs both in turn, so that whatever else the machine does weighs on both alike.
inline Comparison compare(const Work& ours, const Work& bare, int rounds)
{
    Comparison comparison;
    for (int round = 0; round < rounds; ++round) {
        comparison.bare.add(milliseconds_of(bare));
        comparison.ours.add(milliseconds_of(ours));
    }
    return comparison;
}

inline void print(const std::string& what, int people, const Comparison& comparison, double goal)
{
    std::printf("| %-34s | %6d | %9.3f | %9.3f | %5.2f | %4.1f |\n", what.c_str(), people, comparison.ours.median(),
                comparison.bare.median(), comparison.ratio(), goal);
    std::fflush(stdout);
}

} // namespace kindrel::bench
