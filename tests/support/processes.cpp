#include "support/processes.h"

#include <gtest/gtest.h>

#include <array>
#include <csignal>
#include <cstdio>
#include <exception>
#include <thread>

#include <sys/wait.h>
#include <unistd.h>

namespace kindrel::test {

namespace {

struct Child
{
    pid_t pid = -1;
    int output = -1;
};

/// The child writes to its end of a pipe and ends without unwinding the parent's state.
Child start(const std::function<void(int output)>& work)
{
    std::array<int, 2> ends{};
    if (pipe(ends.data()) != 0)
        throw std::runtime_error("No pipe.");
    const pid_t pid = fork();
    if (pid > 0) {
        close(ends[1]);
        return {pid, ends[0]};
    }
    close(ends[0]);
    int status = 0;
    try {
        work(ends[1]);
    } catch (const std::exception& error) {
        std::fprintf(stderr, "child: %s\n", error.what());
        status = 1;
    }
    _exit(status);
}

int status_of(const Child& child)
{
    int status = 0;
    waitpid(child.pid, &status, 0);
    close(child.output);
    return status;
}

QByteArray read_all(int input)
{
    QByteArray all;
    std::array<char, 4096> part{};
    for (ssize_t got = 0; (got = read(input, part.data(), part.size())) > 0;)
        all.append(part.data(), static_cast<qsizetype>(got));
    return all;
}

} // namespace

void run_and_kill(const std::function<void(const Ready&)>& work, std::chrono::microseconds after)
{
    const auto child = start([&](int output) {
        work([output] {
            if (write(output, "r", 1) != 1)
                _exit(2);
        });
    });
    char ready = 0;
    const bool began = read(child.output, &ready, 1) == 1;
    EXPECT_TRUE(began) << "The child failed before its work began.";
    std::this_thread::sleep_for(after);
    kill(child.pid, SIGKILL);
    const int status = status_of(child);
    EXPECT_TRUE(WIFSIGNALED(status)) << "The child ended by itself.";
}

std::vector<QByteArray> run_together(const std::vector<std::function<QByteArray()>>& works)
{
    std::vector<Child> children;
    for (const auto& work : works) {
        children.push_back(start([&](int output) {
            const auto result = work();
            if (write(output, result.constData(), static_cast<std::size_t>(result.size())) != result.size())
                _exit(2);
        }));
    }
    std::vector<QByteArray> results;
    for (const auto& child : children) {
        results.push_back(read_all(child.output));
        EXPECT_EQ(status_of(child), 0);
    }
    return results;
}

} // namespace kindrel::test
