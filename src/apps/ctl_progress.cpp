#include "apps/ctl_progress.h"

#include <algorithm>

#include <unistd.h>

namespace kindrel::apps {

using namespace Qt::StringLiterals;

namespace {

constexpr int whole = 100;

sigset_t requests_to_end()
{
    sigset_t set;
    sigemptyset(&set);
    for (const int each : {SIGINT, SIGTERM, SIGHUP})
        sigaddset(&set, each);
    return set;
}

/// Takes a request to end that was held back; false when there is none.
bool take_request()
{
    const auto set = requests_to_end();
    const timespec at_once{};
    return sigtimedwait(&set, nullptr, &at_once) > 0;
}

} // namespace

TerminalProgress::TerminalProgress() : m_err(stderr), m_shown(isatty(STDERR_FILENO) != 0)
{
    const auto set = requests_to_end();
    sigprocmask(SIG_BLOCK, &set, &m_before);
}

TerminalProgress::~TerminalProgress()
{
    while (take_request()) { // It came too late; what was done is told.
    }
    sigprocmask(SIG_SETMASK, &m_before, nullptr);
}

void TerminalProgress::begin(const QString& what, int steps, const QString&)
{
    m_what = what;
    m_steps = std::max(steps, 1);
    m_done = 0;
    write_line(m_what);
}

bool TerminalProgress::step(const QString&)
{
    m_done = std::min(m_done + 1, m_steps);
    write_line(u"%1 %2 %"_s.arg(m_what).arg(m_done * whole / m_steps, 3));
    m_given_up = m_given_up || take_request();
    return !m_given_up;
}

void TerminalProgress::end()
{
    write_line(QString());
}

void TerminalProgress::write_line(const QString& line)
{
    constexpr auto clear_to_end = "\033[K";
    if (m_shown)
        m_err << '\r' << line << clear_to_end << '\r' << Qt::flush;
}

} // namespace kindrel::apps
