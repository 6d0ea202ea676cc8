#include "apps/ctl_terminal.h"

#include "core/files.h"

#include <array>
#include <cerrno>
#include <csignal>

#include <poll.h>
#include <sys/signalfd.h>
#include <termios.h>
#include <unistd.h>

namespace kindrel::apps {

using namespace Qt::StringLiterals;

namespace {

constexpr std::size_t read_at_once = 4096;

/// Nullopt for what is neither yes nor no.
std::optional<bool> yes_or_no(const QString& answer)
{
    const auto word = answer.trimmed().toLower();
    if (word == "y"_L1 || word == "yes"_L1)
        return true;
    return word == "n"_L1 || word == "no"_L1 ? std::optional(false) : std::nullopt;
}

/// Waits until something was typed, or can be read. False when Ctrl+C or a request to end came instead, where those are
/// held back.
bool somebody_typed()
{
    sigset_t held, wanted;
    sigprocmask(SIG_BLOCK, nullptr, &held);
    sigemptyset(&wanted);
    for (const int each : {SIGINT, SIGTERM, SIGHUP}) {
        if (sigismember(&held, each) == 1)
            sigaddset(&wanted, each);
    }
    const int requests = signalfd(-1, &wanted, SFD_CLOEXEC);
    std::array<pollfd, 2> waiting{pollfd{STDIN_FILENO, POLLIN, 0}, pollfd{requests, POLLIN, 0}};
    while (poll(waiting.data(), waiting.size(), -1) < 0 && errno == EINTR) {
    }
    signalfd_siginfo taken{};
    const bool ended = (waiting[1].revents & POLLIN) != 0 && read(requests, &taken, sizeof taken) > 0;
    close(requests);
    return !ended;
}

/// Keeps what is typed from being shown.
class Unseen
{
public:
    explicit Unseen(bool wanted) : m_changed(wanted && tcgetattr(STDIN_FILENO, &m_before) == 0)
    {
        if (!m_changed)
            return;
        auto quiet = m_before;
        quiet.c_lflag &= ~static_cast<tcflag_t>(ECHO);
        tcsetattr(STDIN_FILENO, TCSAFLUSH, &quiet);
    }
    ~Unseen()
    {
        if (m_changed)
            tcsetattr(STDIN_FILENO, TCSAFLUSH, &m_before);
    }
    Unseen(const Unseen&) = delete;
    Unseen& operator=(const Unseen&) = delete;

private:
    termios m_before{};
    bool m_changed;
};

} // namespace

TerminalDialogue::TerminalDialogue(QString password_file, Questions questions)
    : m_err(stderr), m_attended(isatty(STDIN_FILENO) != 0), m_password_file(std::move(password_file)),
      m_questions(questions)
{
}

void TerminalDialogue::show(const core::Message& message)
{
    m_err << message.text << Qt::endl;
    if (!message.more.isEmpty())
        m_err << message.more << Qt::endl;
}

std::optional<QString> TerminalDialogue::ask(const QString& prompt)
{
    if (m_attended)
        forget_typed();
    m_err << prompt << Qt::flush;
    auto answer = m_attended ? read_line() : std::nullopt;
    if (!answer)
        m_err << Qt::endl;
    return answer;
}

std::optional<QString> TerminalDialogue::read_line()
{
    std::array<char, read_at_once> piece{};
    while (!m_read.contains('\n')) {
        if (!somebody_typed())
            return std::nullopt;
        const auto count = read(STDIN_FILENO, piece.data(), piece.size());
        if (count > 0)
            m_read.append(piece.data(), count);
        else if (count == 0 || errno != EINTR)
            break;
    }
    const auto end = m_read.indexOf('\n');
    if (m_read.isEmpty() || (m_attended && end < 0)) // A line that nobody ended with Enter is no answer.
        return std::nullopt;
    const QByteArray line = end < 0 ? m_read : m_read.left(end);
    m_read.remove(0, line.size() + 1);
    return QString::fromUtf8(line.endsWith('\r') ? line.chopped(1) : line);
}

void TerminalDialogue::forget_typed()
{
    tcflush(STDIN_FILENO, TCIFLUSH);
    m_read.clear();
}

bool TerminalDialogue::confirm(const core::Message& message, core::Answer safe)
{
    show(message);
    if (m_questions == Questions::answered_yes && message.icon == core::Icon::question)
        return true;
    const bool safe_answer = safe == core::Answer::yes;
    const auto answer = ask(safe_answer ? u"[Y/n] "_s : u"[y/N] "_s);
    return answer ? yes_or_no(*answer).value_or(safe_answer) : safe_answer;
}

std::optional<bool> TerminalDialogue::confirm_or_cancel(const core::Message& message)
{
    show(message);
    const auto answer = ask(u"[y/n, Enter to go back] "_s);
    return answer ? yes_or_no(*answer) : std::nullopt;
}

std::optional<QString> TerminalDialogue::ask_text(const core::Message& message, bool secret)
{
    if (secret)
        return password();
    show(message);
    return ask(u"> "_s);
}

std::optional<QString> TerminalDialogue::password()
{
    if (!m_password_file.isEmpty()) {
        const auto content = core::read_file(m_password_file);
        if (!content)
            throw core::FileError(u"The password file '%1' is not there."_s.arg(m_password_file));
        return QString::fromUtf8(content->split('\n').first()).remove(u'\r');
    }
    const Unseen unseen(m_attended);
    if (m_attended) {
        forget_typed();
        m_err << u"Password: "_s << Qt::flush;
    }
    const auto typed = read_line();
    if (m_attended)
        m_err << Qt::endl;
    if (typed)
        return typed;
    show({u"This church asks for a password: name its file with --password-file, or give it on standard input."_s});
    return std::nullopt;
}

std::optional<int> TerminalDialogue::choose(const core::Message& message, const QStringList& from)
{
    show(message);
    for (int place = 0; place < from.size(); ++place)
        m_err << place + 1 << ". " << from[place] << '\n';
    const auto answer = ask(u"1 to %1, Enter for none: "_s.arg(from.size()));
    bool whole = false;
    const int number = answer.value_or(QString()).toInt(&whole);
    return whole && number >= 1 && number <= from.size() ? std::optional(number - 1) : std::nullopt;
}

std::optional<QString> TerminalDialogue::choose_file(const core::FileQuestion& question)
{
    show({question.title});
    const auto answer = ask(question.suggested.isEmpty() ? u"> "_s : u"[%1] > "_s.arg(question.suggested));
    if (answer && answer->isEmpty() && !question.suggested.isEmpty())
        return question.suggested;
    return answer && !answer->isEmpty() ? answer : std::nullopt;
}

void TerminalDialogue::play(const QString&)
{
    if (m_attended)
        m_err << '\a' << Qt::flush;
}

} // namespace kindrel::apps
